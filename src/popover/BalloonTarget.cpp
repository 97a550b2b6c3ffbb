// SPDX-License-Identifier: MIT
// The extent and the place of what a balloon points at.
#include "popover/BalloonTarget.h"

#include "popover/BalloonGeometry.h"

#include <QtWidgets/QGraphicsProxyWidget>
#include <QtWidgets/QGraphicsScene>
#include <QtWidgets/QGraphicsView>
#include <QtWidgets/QWidget>

namespace vx
{
namespace PopoverWidget
{
namespace BalloonTarget
{
namespace
{
QPoint fromGlobal(const QWidget* parent, const QPoint& point)
{
    return parent != nullptr ? parent->mapFromGlobal(point) : point;
}

QPoint proxiedPosition(const QWidget* widget)
{
    const QWidget* const window = widget->window();
    const QGraphicsProxyWidget* const proxy = window->graphicsProxyWidget();
    const QGraphicsScene* const scene = proxy->scene();
    if (scene == nullptr) {
        return window->mapToGlobal(widget->pos());
    }
    const QList<QGraphicsView*> views = scene->views();
    if (views.isEmpty()) {
        return {};
    }
    const QGraphicsView* const view = views.first();
    const QTransform toView = proxy->deviceTransform(view->viewportTransform());
    return view->mapToGlobal(BalloonGeometry::toPoint(toView.mapRect(proxy->subWidgetRect(widget)).topLeft()));
}
}

bool isProxied(const QWidget* widget)
{
    return widget->window()->graphicsProxyWidget() != nullptr;
}

QPoint mapToGlobal(const QWidget* widget, const QPoint& point)
{
    const QWidget* top = widget;
    while (top->parentWidget() != nullptr) {
        top = top->parentWidget();
    }
    const QGraphicsProxyWidget* const proxy = top->graphicsProxyWidget();
    if (proxy == nullptr || proxy->scene() == nullptr) {
        return widget->mapToGlobal(point);
    }
    const QList<QGraphicsView*> views = proxy->scene()->views();
    if (views.size() != 1) {
        return {};
    }
    const QGraphicsView* const view = views.first();
    const QPointF inScene = proxy->mapToScene(QPointF(widget->mapTo(top, point)));
    return view->viewport()->mapToGlobal(view->mapFromScene(inScene));
}

QRect extent(const QWidget* parent, const QWidget* widget, const QRect& rect)
{
    if (rect.isValid()) {
        return rect;
    }
    if (widget == nullptr) {
        return {};
    }
    const QRect geometry = widget->geometry();
    if (!isProxied(widget)) {
        return geometry;
    }
    return QRect(fromGlobal(parent, mapToGlobal(widget, geometry.topLeft())),
        fromGlobal(parent, mapToGlobal(widget, geometry.bottomRight())));
}

QPointF position(const QWidget* parent, const QWidget* widget, const QRect& rect)
{
    if (widget != nullptr) {
        return isProxied(widget) ? fromGlobal(parent, proxiedPosition(widget))
                                 : BalloonGeometry::positionIn(widget, parent);
    }
    if (rect.isValid()) {
        return rect.topLeft();
    }
    return parent != nullptr ? QPointF(parent->rect().center()) : QPointF();
}
}
}
}
