// SPDX-License-Identifier: MIT
// Where a rubber band can be gripped, and what a drag of a grip does to its rectangle. No widgets.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/Qt>
#include <QtGui/QPolygon>

namespace vx
{
class CoordinateSystem;

/// The thinking of RubberBandWidget. Grips are the numbers of RubberBandWidget::Grip.
namespace RubberBandGeometry
{
// The sides, which corners add up, and the inside.
constexpr int c_Left = 1;
constexpr int c_Right = 4;
constexpr int c_Top = 16;
constexpr int c_Bottom = 64;
constexpr int c_Inside = 34;

// Bits of the modes of gripAt().
constexpr int c_EdgesMode = 1;
constexpr int c_InsideMode = 2;

/// By how many pixels the widget is larger than the marked area on each side, so that the edges can be reached
/// from outside.
constexpr int c_Margin = 4;

/// The edges that stay when a ratio is enforced, whichever edge was dragged.
constexpr int c_Anchor = 33; // Qt::AlignLeft | Qt::AlignTop

/// The rectangle with all sides moved outwards by a number of pixels, or inwards by a negative one. Sides
/// beyond any widget are brought in to where their distances fit an int.
ZELKOV_WIDGETS_EXPORT QRect grown(const QRect& rect, int by);

/// The grip at a point. An edge reaches \a margin pixels to both sides of the outermost pixels of the rectangle;
/// left goes before right and top before bottom where the bands overlap. 0 outside, and where the modes allow
/// nothing.
ZELKOV_WIDGETS_EXPORT int gripAt(const QRect& rect, const QPoint& point, int margin, int modes);

/// c_Inside if the point lies in the polygon (odd-even rule) or on its outline, 0 otherwise. The polygon is closed
/// whether or not its last point repeats the first; fewer than three points enclose nothing.
ZELKOV_WIDGETS_EXPORT int gripAt(const QPolygon& polygon, const QPoint& point);

/// The cursor over a grip, and while it is dragged.
ZELKOV_WIDGETS_EXPORT Qt::CursorShape cursorFor(int grip, bool dragging);

/// Drags the grip by an offset in pixels. \a screen and \a geometry are the rectangle at the press, in pixels and
/// in the application's units; they become the dragged one, normalised, so that an edge pulled past the opposite
/// one flips the rectangle. A move keeps the size whatever the ratio. Grip 0 changes nothing; combinations that
/// are no grip only normalise.
ZELKOV_WIDGETS_EXPORT void drag(const CoordinateSystem& system, int grip, QRect& screen, QRectF& geometry,
    double ratio, const QPoint& offset, const QRectF& original);
}
}
