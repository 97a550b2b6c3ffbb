// SPDX-License-Identifier: MIT
// Where the point of a joystick display stands: the law that keeps it inside a circle.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QSize>

namespace vx
{
/// The limits of a joystick axis: \a value within -1 to 1; 0 for what is not a number.
ZELKOV_WIDGETS_EXPORT float joystickAxis(float value);

/// Pixel of the point for the stick at \a x (right) and \a y (up), both within -1 to 1, in a widget of \a size
/// pixels whose circle lies \a circleInset pixels inside the left and right edge. The height does not change the
/// circle's radius but for x = 0.
///
/// At x = 0 the law is not the limit of its neighbours: (0, -0.5) of 100 by 100 pixels with an inset of 20 stands at
/// y = 55, and upwards it is the top of the circle or the place itself. Clients rely on it. The null point for an
/// empty size.
ZELKOV_WIDGETS_EXPORT QPoint joystickPoint(float x, float y, const QSize& size, float circleInset);
}
