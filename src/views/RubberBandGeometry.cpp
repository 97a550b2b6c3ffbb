// SPDX-License-Identifier: MIT
// Where a rubber band can be gripped, and what a drag of a grip does to its rectangle.
#include "views/RubberBandGeometry.h"

#include "ZelkovUtils/CoordinateSystem.h"

#include <QtCore/QtGlobal>

namespace vx
{
namespace RubberBandGeometry
{
namespace
{
// Far beyond any widget, near enough that widths and sums still fit an int.
constexpr qint64 c_Far = 1 << 29;

int rubberBandPixel(qint64 value)
{
    return static_cast<int>(qBound(-c_Far, value, c_Far));
}

// Whether the point lies on the straight line from a to b.
bool isOnSegment(const QPoint& a, const QPoint& b, const QPoint& point)
{
    const qint64 turn = (qint64(b.x()) - a.x()) * (qint64(point.y()) - a.y())
        - (qint64(b.y()) - a.y()) * (qint64(point.x()) - a.x());
    return turn == 0 && point.x() >= qMin(a.x(), b.x()) && point.x() <= qMax(a.x(), b.x())
        && point.y() >= qMin(a.y(), b.y()) && point.y() <= qMax(a.y(), b.y());
}
}

QRect grown(const QRect& rect, int by)
{
    return {QPoint(rubberBandPixel(qint64(rect.left()) - by), rubberBandPixel(qint64(rect.top()) - by)),
        QPoint(rubberBandPixel(qint64(rect.right()) + by), rubberBandPixel(qint64(rect.bottom()) + by))};
}

int gripAt(const QRect& rect, const QPoint& point, int margin, int modes)
{
    const qint64 x = point.x();
    const qint64 y = point.y();
    const qint64 reach = margin;
    if (x < rect.left() - reach || x > rect.right() + reach || y < rect.top() - reach
        || y > rect.bottom() + reach) {
        return 0;
    }
    if ((modes & c_EdgesMode) != 0) {
        int grip = 0;
        if (qAbs(x - rect.left()) <= reach) {
            grip = c_Left;
        } else if (qAbs(x - rect.right()) <= reach) {
            grip = c_Right;
        }
        if (qAbs(y - rect.top()) <= reach) {
            grip += c_Top;
        } else if (qAbs(y - rect.bottom()) <= reach) {
            grip += c_Bottom;
        }
        if (grip != 0) {
            return grip;
        }
    }
    return (modes & c_InsideMode) != 0 ? c_Inside : 0;
}

int gripAt(const QPolygon& polygon, const QPoint& point)
{
    if (polygon.size() < 3) {
        return 0;
    }
    if (polygon.containsPoint(point, Qt::OddEvenFill)) {
        return c_Inside;
    }
    for (int i = 0; i < polygon.size(); ++i) {
        if (isOnSegment(polygon.at(i), polygon.at((i + 1) % polygon.size()), point)) {
            return c_Inside;
        }
    }
    return 0;
}

Qt::CursorShape cursorFor(int grip, bool dragging)
{
    switch (grip) {
    case 0:
        return Qt::OpenHandCursor;
    case c_Inside:
        return dragging ? Qt::ClosedHandCursor : Qt::OpenHandCursor;
    case c_Left:
    case c_Right:
        return Qt::SizeHorCursor;
    case c_Top:
    case c_Bottom:
        return Qt::SizeVerCursor;
    case c_Left + c_Top:
    case c_Right + c_Bottom:
        return Qt::SizeFDiagCursor;
    case c_Right + c_Top:
    case c_Left + c_Bottom:
        return Qt::SizeBDiagCursor;
    default:
        return Qt::ArrowCursor;
    }
}

void drag(const CoordinateSystem& system, int grip, QRect& screen, QRectF& geometry, double ratio,
    const QPoint& offset, const QRectF& original)
{
    if (grip == 0) {
        return;
    }
    const Qt::Alignment anchor(QFlag(static_cast<int>(c_Anchor)));
    if (grip == c_Inside) {
        system.move(geometry, offset, anchor);
    } else {
        const bool isCorner = grip == c_Left + c_Top || grip == c_Right + c_Top || grip == c_Left + c_Bottom
            || grip == c_Right + c_Bottom;
        const auto pulls = [grip, isCorner](int side) { return grip == side || (isCorner && (grip & side) != 0); };
        if (pulls(c_Left)) {
            system.setLeft(geometry, rubberBandPixel(qint64(screen.left()) + offset.x()));
        }
        if (pulls(c_Right)) {
            system.setRight(geometry, rubberBandPixel(qint64(screen.right()) + offset.x()));
        }
        if (pulls(c_Top)) {
            system.setTop(geometry, rubberBandPixel(qint64(screen.top()) + offset.y()));
        }
        if (pulls(c_Bottom)) {
            system.setBottom(geometry, rubberBandPixel(qint64(screen.bottom()) + offset.y()));
        }
        if (isCorner || grip == c_Left || grip == c_Right || grip == c_Top || grip == c_Bottom) {
            system.adjustToAspectRatio(geometry, ratio, anchor, original);
        }
    }
    geometry = geometry.normalized();
    screen = system.mapToScreen(geometry).normalized();
}
}
}
