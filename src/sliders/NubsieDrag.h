// SPDX-License-Identifier: MIT
// How a handle follows the pointer: the law of fine scrubbing and the way from the pointer to a value.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QtGlobal>

namespace vx
{
/// All functions are pure. Places on the scale run from 0 to 1, lengths are logical pixels.
namespace NubsieDrag
{
/// The slowest speed of a handle that does not stand for a date.
constexpr double s_MinimumSpeed = 0.05;
/// A handle with discrete steps takes this many of its lengths of travel for each step.
constexpr double s_StepFactor = 1.2;

/// The place, from 0 at its start, of a handle whose centre is @p along pixels from the start of a bar of this
/// length. Where the handle leaves no room the result is an end, or @p present right on the centre.
ZELKOV_WIDGETS_EXPORT double placeUnder(double along, double barLength, double size, double present);

/// The farthest that the pointer can go sideways inside a window: a slider at @p origin in a window of this
/// length, both across the bar.
ZELKOV_WIDGETS_EXPORT double reach(double origin, double windowLength);

/// The slowest speed of a handle that stands for a date in a range of so many seconds: one pixel for about a
/// second. Ranges that make no sense have the speed of other handles.
ZELKOV_WIDGETS_EXPORT double dateSpeed(double barLength, qint64 seconds);

/// The speed of the handle for a pointer @p side pixels off the centre line (the sign does not count), as a share
/// of the pointer's: 1 near the bar, less from @p border on, least at @p reach and beyond. Never above 1.
ZELKOV_WIDGETS_EXPORT double speed(double side, double border, double reach, double minimumSpeed);

/// Where the handle at @p display goes at less than full speed, when the pointer has moved by @p step and stands
/// at
/// @p target: by its share of the step, but never farther behind the pointer than 1 - @p speed.
ZELKOV_WIDGETS_EXPORT double laggedTarget(double speed, double step, double display, double target);

/// What a drag has begun with.
struct Anchor
{
    double display; ///< where the handle was drawn at the press
    double value; ///< its true place at the press
    bool mapped; ///< whether the two ends are still mapped
};

/// What a step of a drag comes to: where the handle is drawn, its value, and whether the ends are still mapped.
struct Mapped
{
    double display; ///< where the handle is drawn
    double value; ///< its true place
    bool mapped; ///< whether the two ends are still mapped
};

/// From the place where the handle is drawn to its value. A handle that was pushed aside starts with the two
/// apart; each side of the scale is stretched so that the value runs smoothly from there to the ends. Once the
/// handle has touched an end the mapping is one to one.
ZELKOV_WIDGETS_EXPORT Mapped mapped(double target, const Anchor& anchor);

/// The pixels of travel from one end of the range to the other of a handle with discrete steps.
ZELKOV_WIDGETS_EXPORT double stepTravel(int sliderLength, int draggedLength, int minimum, int maximum);

/// The value, 0 to 1, after @p way pixels toward the high end.
ZELKOV_WIDGETS_EXPORT double steppedValue(double way, double travel, double anchor);

/// In units of the scale per second, positive toward the low end. Without time between the two it counts as 1 ms.
ZELKOV_WIDGETS_EXPORT double velocity(double before, double now, qint64 milliseconds);
}
}
