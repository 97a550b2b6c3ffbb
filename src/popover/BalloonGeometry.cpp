// SPDX-License-Identifier: MIT
// Where a balloon goes and how its outline runs.
#include "popover/BalloonGeometry.h"

namespace vx
{
namespace PopoverWidget
{
namespace BalloonGeometry
{
namespace
{
// Far beyond the largest widget, far below what would overflow.
constexpr int c_Furthest = 1 << 28;
constexpr int c_LargestWidget = (1 << 24) - 1;
// Control points of a quarter circle.
constexpr qreal c_Kappa = 0.5522847498;

int cut(qint64 value, int limit)
{
    return static_cast<int>(qBound<qint64>(-limit, value, limit));
}

int rounded(qreal value)
{
    return qRound(qBound<qreal>(-c_Furthest, value, c_Furthest)); // NaN comes out as a number, too
}

bool isOneSide(int side)
{
    return side == sTop || side == sBottom || side == sLeft || side == sRight;
}

// The ends of the arrow's base along the edge, in the order in which the arrow is drawn.
void arrowBase(const QRectF& inner, int side, qreal width, const QPointF& anchor, QPointF& from, QPointF& to)
{
    if (side == sTop || side == sBottom) {
        const qreal y = side == sTop ? inner.top() : inner.bottom();
        const qreal x = anchor.x();
        from = QPointF(x - width, y);
        to = QPointF(x + width, y);
        if (!(x > inner.left() + 2 * width && x < inner.right() - 2 * width)) {
            if (x < inner.center().x()) {
                from.setX(x);
            } else {
                to.setX(x);
            }
        }
    } else {
        const qreal x = side == sLeft ? inner.left() : inner.right();
        from = QPointF(x, anchor.y() - width);
        to = QPointF(x, anchor.y() + width);
    }
}

void addBody(QPainterPath& path, const QRectF& inner, int radius)
{
    if (radius == 0) {
        path.addRect(inner);
    } else {
        path.addRoundedRect(inner, radius, radius, Qt::AbsoluteSize);
    }
}

// Whether base and tip of the arrow lie so that one walk round the body gives the union of both.
bool standsOnStraightEdge(const QRectF& inner, qreal rx, qreal ry, int side, const QPointF& anchor,
    const QPointF& from, const QPointF& to)
{
    if (side == sTop || side == sBottom) {
        const bool outside = side == sTop ? anchor.y() < inner.top() : anchor.y() > inner.bottom();
        return outside && from.x() < to.x() && from.x() >= inner.left() + rx && to.x() <= inner.right() - rx;
    }
    const bool outside = side == sLeft ? anchor.x() < inner.left() : anchor.x() > inner.right();
    return outside && from.y() < to.y() && from.y() >= inner.top() + ry && to.y() <= inner.bottom() - ry;
}

// Clockwise from the upper left; the corner's curves are those of QPainterPath::addRoundedRect().
QPainterPath bodyWithArrow(const QRectF& inner, qreal rx, qreal ry, int side, const QPointF& anchor,
    const QPointF& from, const QPointF& to)
{
    const qreal left = inner.left();
    const qreal top = inner.top();
    const qreal right = inner.right();
    const qreal bottom = inner.bottom();
    const qreal kx = rx * (1 - c_Kappa);
    const qreal ky = ry * (1 - c_Kappa);
    const bool round = rx > 0 && ry > 0;

    QPainterPath path;
#if QT_VERSION >= QT_VERSION_CHECK(5, 13, 0)
    path.reserve(24);
#endif
    const auto arrow = [&path, &anchor](const QPointF& first, const QPointF& second) {
        path.lineTo(first);
        path.lineTo(anchor);
        path.lineTo(second);
    };
    path.moveTo(left + rx, top);
    if (side == sTop) {
        arrow(from, to);
    }
    path.lineTo(right - rx, top);
    if (round) {
        path.cubicTo(right - kx, top, right, top + ky, right, top + ry);
    }
    if (side == sRight) {
        arrow(from, to);
    }
    path.lineTo(right, bottom - ry);
    if (round) {
        path.cubicTo(right, bottom - ky, right - kx, bottom, right - rx, bottom);
    }
    if (side == sBottom) {
        arrow(to, from);
    }
    path.lineTo(left + rx, bottom);
    if (round) {
        path.cubicTo(left + kx, bottom, left, bottom - ky, left, bottom - ry);
    }
    if (side == sLeft) {
        arrow(to, from);
    }
    path.lineTo(left, top + ry);
    if (round) {
        path.cubicTo(left, top + ky, left + kx, top, left + rx, top);
    }
    path.closeSubpath();
    return path;
}
}

int preferredSide(const QRect& parentRect, const QRect& target, const QPointF& position, int allowed)
{
    if (allowed == 0) {
        return sNone;
    }
    // As QRect::moveCenter() does it, in numbers that hold every sum.
    const QPoint offset = toPoint(position);
    const QPoint center = target.center();
    const qint64 width = qint64(target.right()) - target.left();
    const qint64 height = qint64(target.bottom()) - target.top();
    const qint64 left = qint64(center.x()) + offset.x() - width / 2;
    const qint64 top = qint64(center.y()) + offset.y() - height / 2;

    const qint64 roomAbove = top - parentRect.top();
    const qint64 roomBelow = parentRect.bottom() - (top + height);
    const qint64 roomLeft = left - parentRect.left();
    const qint64 roomRight = parentRect.right() - (left + width);

    if ((allowed & sTop) != 0 && (allowed & sBottom) != 0) {
        return roomAbove > roomBelow ? sBottom : sTop;
    }
    if ((allowed & sLeft) != 0 && (allowed & sRight) != 0) {
        return roomRight > roomLeft ? sLeft : sRight;
    }
    for (const int side : {int(sBottom), int(sTop), int(sLeft), int(sRight)}) {
        if ((allowed & side) != 0) {
            return side;
        }
    }
    return sAny;
}

QPointF anchorPoint(const QRect& target, const QPointF& relative, int side, const QPointF& position)
{
    if (!target.isValid() || !isOneSide(side)) {
        return position;
    }
    const qint64 right = qint64(target.right()) - target.left();
    const qint64 bottom = qint64(target.bottom()) - target.top();
    qint64 x = right / 2;
    qint64 y = bottom / 2;
    switch (side) {
    case sTop:
        y = bottom;
        break;
    case sBottom:
        y = 0;
        break;
    case sLeft:
        x = right;
        break;
    default:
        x = 0;
        break;
    }
    return position
        + QPointF(relative.x() > 0 ? relative.x() : static_cast<qreal>(x),
            relative.y() > 0 ? relative.y() : static_cast<qreal>(y));
}

QSize contentSize(const QSize& hint, const QSize& minimum, const QSize& maximum)
{
    return hint.boundedTo(maximum).expandedTo(minimum);
}

QSize sizeFromContent(const QSize& content, int side, int innerMargin, int arrowLength, int spacing,
    std::initializer_list<Strip> strips)
{
    qint64 width = content.width();
    qint64 height = content.height();
    if (isOneSide(side)) {
        width += 2 * qint64(innerMargin);
        height += 2 * qint64(innerMargin);
        (side == sTop || side == sBottom ? height : width) += arrowLength;
    }
    for (const Strip& strip : strips) {
        if (strip.shown) {
            height += qint64(strip.hint.height()) + spacing;
            width += qMax<qint64>(0, qint64(strip.hint.width()) - content.width());
        }
    }
    return {cut(width, c_LargestWidget), cut(height, c_LargestWidget)};
}

QSizeF constrainedSize(const QSizeF& size, const QSizeF& fixed, int constraints)
{
    QSizeF result = size;
    if (!fixed.isNull() && fixed.isValid()) {
        if ((constraints & 2) != 0) {
            result.setHeight(fixed.height());
        }
        if ((constraints & 1) != 0) {
            result.setWidth(fixed.width());
        }
    }
    return result;
}

QRectF limits(const QRectF& parentRect, const QMargins& borders)
{
    return parentRect.adjusted(borders.left(), borders.top(), -qreal(borders.right()), -qreal(borders.bottom()));
}

QRectF frame(const QRectF& limits, const QSizeF& size, const QPointF& anchor, int side, int innerMargin)
{
    QRectF rect(QPointF(0, 0), size);
    rect.moveCenter(anchor);
    switch (side) {
    case sTop:
        rect.moveTop(anchor.y());
        break;
    case sBottom:
        rect.moveBottom(anchor.y());
        break;
    case sLeft:
        rect.moveLeft(anchor.x());
        break;
    case sRight:
        rect.moveRight(anchor.x());
        break;
    case sNone:
        rect.adjust(-qreal(innerMargin), -qreal(innerMargin), innerMargin, innerMargin);
        break;
    default:
        break;
    }
    if (!limits.contains(rect)) {
        if (rect.left() < limits.left()) {
            rect.moveLeft(limits.left());
        }
        if (rect.right() > limits.right()) {
            rect.moveRight(limits.right());
        }
        if (rect.top() < limits.top()) {
            rect.moveTop(limits.top());
        }
        if (rect.bottom() > limits.bottom()) {
            rect.moveBottom(limits.bottom());
        }
        rect = rect.intersected(limits);
    }
    return rect;
}

QRectF innerRect(const QRectF& rect, int side, int arrowLength)
{
    QRectF inner = rect;
    switch (side) {
    case sTop:
        inner.setTop(inner.top() + arrowLength);
        break;
    case sBottom:
        inner.setBottom(inner.bottom() - arrowLength);
        break;
    case sLeft:
        inner.setLeft(inner.left() + arrowLength);
        break;
    case sRight:
        inner.setRight(inner.right() - arrowLength);
        break;
    default:
        break;
    }
    return inner;
}

QMargins contentsMargins(const QRectF& inner, const QRect& rect, int innerMargin)
{
    const QRect body = toRect(inner);
    return {cut(qint64(body.left()) + innerMargin, c_LargestWidget),
        cut(qint64(body.top()) + innerMargin, c_LargestWidget),
        cut(qint64(innerMargin) - body.right() + rect.right(), c_LargestWidget),
        cut(qint64(innerMargin) - body.bottom() + rect.bottom(), c_LargestWidget)};
}

bool arrowDrawn(int allowed, const QRectF& inner, const QPointF& anchor)
{
    return allowed != 0 && !inner.contains(toPoint(anchor));
}

QPainterPath outline(const QRectF& inner, int radius, bool arrow, int arrowWidth, int side, const QPointF& anchor)
{
    QPainterPath path;
    if (!arrow || !isOneSide(side)) {
        addBody(path, inner, radius);
        return path;
    }
    QPointF from;
    QPointF to;
    arrowBase(inner, side, arrowWidth, anchor, from, to);

    const qreal rx = qBound<qreal>(0, radius, inner.width() / 2);
    const qreal ry = qBound<qreal>(0, radius, inner.height() / 2);
    if (inner.isValid() && standsOnStraightEdge(inner, rx, ry, side, anchor, from, to)) {
        // The same as the union below in a fiftieth of the time.
        return bodyWithArrow(inner, rx, ry, side, anchor, from, to);
    }
    addBody(path, inner, radius);
    path.moveTo(anchor);
    path.lineTo(from);
    path.lineTo(to);
    path.lineTo(anchor);
    return path.simplified();
}

QRect toRect(const QRectF& rect)
{
    return QRect(QPoint(rounded(rect.left()), rounded(rect.top())),
        QPoint(rounded(rect.right()) - 1, rounded(rect.bottom()) - 1));
}

QPoint toPoint(const QPointF& point)
{
    return {rounded(point.x()), rounded(point.y())};
}
}
}
}
