// SPDX-License-Identifier: MIT
// Places and times of a sliding switch.
#pragma once

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QSize>

namespace vx
{
/// Pure functions. A control is the rectangle of a switch in its own coordinates; positions are those of the top left
/// corner of its strip, in pixels.
namespace SwitchGeometry
{
/// A third of the control's width, truncated.
inline int iconOffset(const QRect& control)
{
    return control.width() / 3;
}

/// Where the strip stands when the switch is on.
inline QPoint onPosition(const QRect& control)
{
    return {control.x() + 9, control.y()};
}

/// The size that the strip is drawn in: a third wider than the control.
inline QSize stripSize(const QRect& control)
{
    return {static_cast<int>(control.width() * qint64(4) / 3), control.height()};
}

/// A position within the two ends; the left end wins where they are the wrong way round.
inline double limited(double x, double leftEnd, double rightEnd)
{
    const double notTooFar = x > rightEnd ? rightEnd : x;
    return notTooFar < leftEnd ? leftEnd : notTooFar;
}

/// Whether a strip that is let go at \a x belongs to the on side. \a offset is halved as integers are; exactly there
/// is off.
inline bool snapsToOn(double x, int offset)
{
    return x > -(offset / 2);
}

/// Milliseconds from \a from to \a to, at \a whole milliseconds for half of the control's width; never negative. The
/// factor 2 belongs to the rule. \a toTheRight says which way is forward.
inline int duration(double from, double to, bool toTheRight, int whole, int controlWidth)
{
    const double way = (to - from) * (toTheRight ? 2.0 : -2.0);
    const double time = controlWidth == 0 ? 0.0 : whole * way / controlWidth;
    // Written so that what is not a number gives 0.
    return time > 0.0 ? (time < 2147483647.0 ? static_cast<int>(time) : 2147483647) : 0;
}
}
}
