// SPDX-License-Identifier: MIT
// Where a balloon goes and how its outline runs, said with rectangles and points alone.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMargins>
#include <QtCore/QPoint>
#include <QtCore/QPointF>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/QSize>
#include <QtCore/QSizeF>
#include <QtGui/QPainterPath>

#include <initializer_list>

namespace vx
{
namespace PopoverWidget
{
/// The geometry of a Balloon as plain functions. All lengths are logical pixels. Sides are the numbers of
/// Balloon::EArrowDirection; values out of any range are cut to what a widget can have.
namespace BalloonGeometry
{
/// The edge of the balloon that carries the arrow.
enum Side : int
{
    sNone = 0, ///< no target: no arrow, no margins
    sTop = 1,
    sBottom = 2,
    sLeft = 4,
    sRight = 8,
    sAny = 15 ///< sides were asked for, but none of the four: the balloon lies over its anchor
};

/// One of the strips above and below the rows.
struct Strip
{
    bool shown = false; ///< whether it takes room
    QSize hint; ///< the size that it asks for
};

/// The place of @p node in the coordinates of @p parent, through their nearest common ancestor. Nodes have pos(),
/// relative to parentWidget(). Without a common ancestor both are counted from the same origin; without a parent
/// the result is relative to the outermost ancestor's.
template <class Node> QPoint positionIn(const Node* node, const Node* parent)
{
    QPoint position = node->pos();
    const Node* up = node->parentWidget();
    const Node* down = parent;
    while (up != nullptr) {
        while (down != nullptr) {
            if (up == down) {
                return position;
            }
            position -= down->pos();
            down = down->parentWidget();
        }
        position += up->pos();
        up = up->parentWidget();
    }
    return position;
}

/// The side for a target. Only the room along one axis is compared, the vertical one if both of its sides are
/// allowed; whether the balloon fits there is not asked. A tie gives sTop or sRight. The target is measured after
/// its centre was moved by @p position: its own offset counts twice, as clients rely on.
ZELKOV_WIDGETS_EXPORT int preferredSide(
    const QRect& parentRect, const QRect& target, const QPointF& position, int allowed);

/// The point that the tip of the arrow touches. @p position is the origin of the target; of @p target only the
/// size counts. Coordinates of @p relative count if greater than 0.
ZELKOV_WIDGETS_EXPORT QPointF anchorPoint(
    const QRect& target, const QPointF& relative, int side, const QPointF& position);

/// The size of the content within its limits; the lower one wins.
ZELKOV_WIDGETS_EXPORT QSize contentSize(const QSize& hint, const QSize& minimum, const QSize& maximum);

/// The size of a balloon around its content. Without one of the four sides there are no margins at all. Each shown
/// strip adds its height and @p spacing, and each adds the amount by which it is wider than the content.
ZELKOV_WIDGETS_EXPORT QSize sizeFromContent(const QSize& content, int side, int innerMargin, int arrowLength,
    int spacing, std::initializer_list<Strip> strips);

/// @p size with the sides that are fixed: @p constraints as Balloon::ESizeConstraint.
ZELKOV_WIDGETS_EXPORT QSizeF constrainedSize(const QSizeF& size, const QSizeF& fixed, int constraints);

/// What is left of the parent between its border margins.
ZELKOV_WIDGETS_EXPORT QRectF limits(const QRectF& parentRect, const QMargins& borders);

/// The balloon's rectangle: beside the anchor, then pushed into the limits from the left, right, top and bottom in
/// this order, then cut. What is too large for them ends at the right and at the bottom.
ZELKOV_WIDGETS_EXPORT QRectF frame(
    const QRectF& limits, const QSizeF& size, const QPointF& anchor, int side, int innerMargin);

/// The body: the rectangle without the strip of the arrow.
ZELKOV_WIDGETS_EXPORT QRectF innerRect(const QRectF& rect, int side, int arrowLength);

/// The margins that keep the content @p innerMargin away from the body's edges.
ZELKOV_WIDGETS_EXPORT QMargins contentsMargins(const QRectF& inner, const QRect& rect, int innerMargin);

/// Whether the arrow is drawn: it is not if its tip, rounded, lies on or in the body. @p anchor is relative to the
/// balloon, as in outline().
ZELKOV_WIDGETS_EXPORT bool arrowDrawn(int allowed, const QRectF& inner, const QPointF& anchor);

/// Body and arrow as one outline. @p arrowWidth is half the base of the arrow. Near a corner, arrows of the upper
/// and lower side are right-angled, with the straight side towards the corner; those of the other sides are not.
ZELKOV_WIDGETS_EXPORT QPainterPath outline(
    const QRectF& inner, int radius, bool arrow, int arrowWidth, int side, const QPointF& anchor);

// To whole pixels; edges beyond any widget's are cut.
ZELKOV_WIDGETS_EXPORT QRect toRect(const QRectF& rect);
ZELKOV_WIDGETS_EXPORT QPoint toPoint(const QPointF& point);
}
}
}
