// SPDX-License-Identifier: MIT
// The extent and the place of what a balloon points at, also where widgets are embedded in a graphics scene.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QPointF>
#include <QtCore/QRect>

class QWidget;

namespace vx
{
namespace PopoverWidget
{
/// Where the target of a Balloon is. @p parent is the balloon's parent, @p widget the target widget, @p rect the
/// target rectangle; each may be missing (null or invalid).
namespace BalloonTarget
{
/// Whether the window of the widget sits in a graphics scene.
ZELKOV_WIDGETS_EXPORT bool isProxied(const QWidget* widget);

/// Global coordinates of a point of the widget, through the graphics view if it is embedded in one. A scene with
/// no view or several gives (0, 0), since the point has no one place then.
ZELKOV_WIDGETS_EXPORT QPoint mapToGlobal(const QWidget* widget, const QPoint& point);

/// The extent of the target. A valid rectangle wins over a widget; without either the result is invalid.
ZELKOV_WIDGETS_EXPORT QRect extent(const QWidget* parent, const QWidget* widget, const QRect& rect);

/// The origin of the target in coordinates of the parent. Here a widget wins over the rectangle; without either it
/// is the centre of the parent.
ZELKOV_WIDGETS_EXPORT QPointF position(const QWidget* parent, const QWidget* widget, const QRect& rect);
}
}
}
