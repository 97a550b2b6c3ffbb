// SPDX-License-Identifier: MIT
// The laws of the dial button: value to angle, and a horizontal drag to a value.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPointF>

namespace vx
{
/// Range and mapping of a dial.
struct DialRange
{
    int minimum = 0; ///< as QDial::minimum()
    int maximum = 99; ///< as QDial::maximum()
    bool wrapping = false; ///< the value goes round
    bool inverted = false; ///< the user sees the maximum at the start
};

/// Angle of a value in radians, clockwise on the screen: (cos, sin) is the direction with y pointing down. Not
/// wrapping the dial covers 300 degrees from the lower left over the top to the lower right; wrapping it starts at the
/// bottom and goes round. These are QDial's own angles, so that it finds the value back.
///
/// Inverted, the value is taken from the maximum alone: a range that does not start at 0 shifts. Clients rely on it.
/// A range of one value is at its start.
ZELKOV_WIDGETS_EXPORT double dialAngle(double value, const DialRange& range);

/// The value after a drag by \a dx pixels that began at \a value: three widths cover the whole range; parts of a
/// step are cut off towards 0. Kept within the range unless the dial wraps.
ZELKOV_WIDGETS_EXPORT int dialValueAfterDrag(int value, int dx, int width, const DialRange& range);

/// The point at \a radius from \a centre in the direction of \a angle.
ZELKOV_WIDGETS_EXPORT QPointF dialPoint(const QPointF& centre, double angle, double radius);
}
