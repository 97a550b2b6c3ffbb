// SPDX-License-Identifier: MIT
// vx::GeometryUtils: angles, clamping, directions and table look-ups for code that handles a pointer.
#include "input/GeometryUtils.h"

#include <QAbstractSlider>
#include <QGuiApplication>
#include <QMouseEvent>
#include <QScreen>
#include <QTableView>
#include <QWindow>

#include <cmath>

namespace vx
{

namespace
{

constexpr double degreesPerRadian = 57.29577951308232;

Direction directionOf(qint64 x, qint64 y)
{
    const bool aboveFallingDiagonal = y < x;
    const bool belowRisingDiagonal = -y < x;
    if (aboveFallingDiagonal)
        return belowRisingDiagonal ? dRight : dUp;
    return belowRisingDiagonal ? dDown : dLeft;
}

const QScreen* screenOf(const QTableView* view)
{
    const QWindow* window = view->windowHandle();
    if (!window)
        window = view->window()->windowHandle();
    return window ? window->screen() : QGuiApplication::primaryScreen();
}

} // namespace

double GeometryUtils::angle(const QPoint& p)
{
    return std::atan2(p.y(), p.x()) * degreesPerRadian;
}

int GeometryUtils::between(int v, int min, int max)
{
    if (v < min)
        return min;
    return v > max ? max : v;
}

int GeometryUtils::between(int v, const QAbstractSlider* s)
{
    return s ? between(v, s->minimum(), s->maximum()) : v;
}

Direction GeometryUtils::direction(const QPoint& p)
{
    return directionOf(p.x(), p.y());
}

Direction GeometryUtils::direction(const QMouseEvent& from, const QMouseEvent& to)
{
    const QPoint start = from.globalPos();
    const QPoint end = to.globalPos();
    return directionOf(qint64(end.x()) - start.x(), qint64(end.y()) - start.y());
}

QModelIndex GeometryUtils::indexAt(const QTableView* view, QEvent* event)
{
    return indexAt(view, dynamic_cast<QMouseEvent*>(event));
}

QModelIndex GeometryUtils::indexAt(const QTableView* view, QMouseEvent* event)
{
    return event ? indexAtGlobalPos(view, event->globalPos()) : QModelIndex();
}

QModelIndex GeometryUtils::indexAtGlobalPos(const QTableView* view, const QPoint& p)
{
    return view ? view->indexAt(view->mapFromGlobal(p)) : QModelIndex();
}

QModelIndex GeometryUtils::indexAtPoint(const QTableView* view, const QPoint& p)
{
    return view ? view->indexAt(p) : QModelIndex();
}

QModelIndex GeometryUtils::indexAtScreenPos(const QTableView* view, const QPointF& p)
{
    if (!view)
        return QModelIndex();
    const QScreen* screen = screenOf(view);
    const QPoint origin = screen ? screen->geometry().topLeft() : QPoint();
    return indexAtGlobalPos(view, origin + p.toPoint());
}

QModelIndex GeometryUtils::indexAtWindowPos(const QTableView* view, const QPointF& p)
{
    return view ? view->indexAt(view->mapFrom(view->window(), p.toPoint())) : QModelIndex();
}

} // namespace vx
