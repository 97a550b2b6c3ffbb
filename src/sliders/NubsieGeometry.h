// SPDX-License-Identifier: MIT
// Where the bar of a time line and the handles on it stand: rectangles, points and numbers, no widgets.
#pragma once

#include "foundation/Export.h"

#include <Qt>
#include <QtCore/QPointF>
#include <QtCore/QRectF>
#include <QtCore/QSize>

namespace vx
{
/// All functions are pure. A display value is a place on the scale, 0 to 1; 0 is on the left or at the bottom.
namespace NubsieGeometry
{
/// The bar of a slider with the rectangle @p area, in the slider's coordinates; @p area itself if that is empty.
/// The thickness is half of @p barExtent and at least one pixel, the offset is measured with the whole of it: the
/// bar lies off the centre line by a quarter of it, on purpose.
ZELKOV_WIDGETS_EXPORT QRectF barRect(const QRect& area, double barExtent, Qt::Orientation orientation);

/// The length that the display values of a handle of this size run through.
ZELKOV_WIDGETS_EXPORT double extent(const QRectF& bar, const QSize& size, Qt::Orientation orientation);

/// The centre of a handle at rest, for a slider at @p origin; one pixel less than where it is seen, since handles
/// place themselves one pixel farther. Across the bar it is the bar's top or left edge.
ZELKOV_WIDGETS_EXPORT QPointF position(
    const QRectF& bar, const QPointF& origin, const QSize& size, double display, Qt::Orientation orientation);

/// The centre of a handle in motion. @p current: the handle in use, which has its dragged size. The vertical form
/// uses the width of the dragged size for its height: clients rely on it.
ZELKOV_WIDGETS_EXPORT QPointF positionInMotion(const QRectF& bar, const QPointF& origin, const QSize& size,
    const QSize& draggedSize, bool current, double display, Qt::Orientation orientation);

// To the nearest whole pixel, and toward 0. Points that no widget can have are taken to where one can be.
ZELKOV_WIDGETS_EXPORT QPoint rounded(const QPointF& point);
ZELKOV_WIDGETS_EXPORT QPoint truncated(const QPointF& point);

/// Whether a point lies within the disc that is as wide as the rectangle.
ZELKOV_WIDGETS_EXPORT bool discContains(const QRectF& rect, const QPointF& point);
}
}
