// SPDX-License-Identifier: MIT
// Where the bar of a time line and the handles on it stand: rectangles, points and numbers, no widgets.
#include "sliders/NubsieGeometry.h"

#include <QtCore/QLineF>

#include <algorithm>
#include <cmath>

namespace vx
{
namespace NubsieGeometry
{
namespace
{
double onScreen(double coordinate)
{
    constexpr double farthest = 16777215.0; // the largest size of a widget
    return std::isnan(coordinate) ? 0.0 : std::min(farthest, std::max(-farthest, coordinate));
}
}

QRectF barRect(const QRect& area, double barExtent, Qt::Orientation orientation)
{
    if (area.width() == 0 || area.height() == 0) {
        return QRectF(area);
    }
    const double thickness = std::max(barExtent * 0.5, 1.0);
    if (orientation == Qt::Horizontal) {
        return QRectF(0.0, area.height() * 0.5 - barExtent * 0.5, area.width(), thickness);
    }
    return QRectF(area.width() * 0.5 - barExtent * 0.5, 0.0, thickness, area.height());
}

double extent(const QRectF& bar, const QSize& size, Qt::Orientation orientation)
{
    return orientation == Qt::Horizontal ? bar.width() - size.width() : bar.height() - size.height();
}

QPointF position(
    const QRectF& bar, const QPointF& origin, const QSize& size, double display, Qt::Orientation orientation)
{
    const double way = extent(bar, size, orientation) * display;
    if (orientation == Qt::Horizontal) {
        return QPointF(bar.left() + origin.x() + size.width() * 0.5 + way - 1.0, bar.top() + origin.y());
    }
    return QPointF(bar.left() + origin.x(), bar.bottom() + origin.y() - size.height() * 0.5 - way - 1.0);
}

QPointF positionInMotion(const QRectF& bar, const QPointF& origin, const QSize& size, const QSize& draggedSize,
    bool current, double display, Qt::Orientation orientation)
{
    if (orientation == Qt::Horizontal) {
        const double x = current ? draggedSize.width() / 2 + (bar.width() - draggedSize.width()) * display
                                 : size.width() * 0.5 + (bar.width() - size.width()) * display;
        return QPointF(origin.x() + x, bar.top() + origin.y());
    }
    if (current) {
        return QPointF(bar.left() + origin.x(),
            origin.y() + draggedSize.width() / 2 + (bar.height() - draggedSize.width()) * (1.0 - display));
    }
    return QPointF(bar.left() + origin.x() + (draggedSize.width() - size.height()) * 0.5,
        origin.y() + size.height() * 0.5 + (bar.height() - size.height()) * (1.0 - display));
}

QPoint rounded(const QPointF& point)
{
    return QPointF(onScreen(point.x()), onScreen(point.y())).toPoint();
}

QPoint truncated(const QPointF& point)
{
    return QPoint(static_cast<int>(onScreen(point.x())), static_cast<int>(onScreen(point.y())));
}

bool discContains(const QRectF& rect, const QPointF& point)
{
    return QLineF(rect.center(), point).length() < rect.width() * 0.5;
}
}
}
