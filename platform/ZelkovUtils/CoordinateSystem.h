// SPDX-License-Identifier: MIT
// Converts between an application's own rectangles and screen pixels.
#pragma once

#include "ZelkovUtils/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/Qt>

namespace vx
{
/// Lets a widget edit a rectangle in units that only the application knows: parts of a picture, metres, seconds.
/// The editor turns each movement of the pointer into one of the operations below and then asks mapToScreen()
/// where the result stands.
///
/// "Screen" coordinates are logical pixels of the widget that shows the application's area. As in QRect, a right or
/// bottom coordinate is that of the last pixel inside, so `setRight(r, mapToScreen(r).right())` leaves \a r as it is
/// but for rounding. The operations never normalise: dragging an edge past the opposite one gives a negative size.
/// An aspect ratio is width / height in application units.
class ZELKOV_UTILS_EXPORT CoordinateSystem
{
public:
    /// As a ratio: any proportions will do.
    static constexpr double IGNORE_ASPECT_RATIO = 0.0;
    /// As a ratio: the proportions that the rectangle had before it was edited.
    static constexpr double CALC_ASPECT_RATIO = -1.0;

    CoordinateSystem() = default;
    virtual ~CoordinateSystem();

    /// The pixels of a rectangle of the application.
    virtual QRect mapToScreen(const QRectF& rect) const = 0;

    // Moves one edge of \a rect, a rectangle of the application, to a pixel. The opposite edge stays.
    virtual void setLeft(QRectF& rect, int screenX) const = 0;
    virtual void setTop(QRectF& rect, int screenY) const = 0;
    virtual void setRight(QRectF& rect, int screenX) const = 0;
    virtual void setBottom(QRectF& rect, int screenY) const = 0;

    /// Moves \a rect by pixels and keeps its size. Where the scale is not the same everywhere, \a alignment names
    /// the point of the rectangle that follows the pointer exactly.
    virtual void move(QRectF& rect, const QPoint& screenOffset, Qt::Alignment alignment) const = 0;

    /// Gives \a rect the ratio; the side that was changed the more leads and the other follows. \a alignment names
    /// the edges, or the centre, that stay. \a original is the rectangle before the edit: it tells which side leads
    /// and what CALC_ASPECT_RATIO means; without it the width leads and CALC_ASPECT_RATIO does nothing. Nothing
    /// happens for IGNORE_ASPECT_RATIO and for other ratios that are not above 0.
    virtual void adjustToAspectRatio(QRectF& rect, double ratio, Qt::Alignment alignment,
        const QRectF& original = QRectF()) const = 0;

protected:
    CoordinateSystem(const CoordinateSystem&) = default;
    CoordinateSystem& operator=(const CoordinateSystem&) = default;
};
}
