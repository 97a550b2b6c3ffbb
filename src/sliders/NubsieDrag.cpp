// SPDX-License-Identifier: MIT
// How a handle follows the pointer: the law of fine scrubbing and the way from the pointer to a value.
#include "sliders/NubsieDrag.h"

#include <algorithm>
#include <cmath>

namespace vx
{
namespace NubsieDrag
{
namespace
{
constexpr double millisPerSecond = 1000.0;
constexpr qint64 dateSlack = 100; // s, added to the length of a range of dates

// A quotient whose divisor may be 0: an end of the scale, or what was there.
double quotient(double way, double length, double present)
{
    if (length == 0.0) {
        return way > 0.0 ? 1.0 : way < 0.0 ? 0.0 : present;
    }
    return way / length;
}
}

double placeUnder(double along, double barLength, double size, double present)
{
    return quotient(along - size * 0.5, barLength - size, present);
}

double reach(double origin, double windowLength)
{
    return std::max(origin, windowLength - origin);
}

double dateSpeed(double barLength, qint64 seconds)
{
    const qint64 length = seconds + dateSlack;
    return length > 0 ? barLength / static_cast<double>(length) : s_MinimumSpeed;
}

double speed(double side, double border, double reach, double minimumSpeed)
{
    const double distance = std::abs(side);
    if (distance < border) {
        return 1.0;
    }
    const double share = reach > 0.0 ? std::min(reach, distance) / reach : 1.0;
    // A range of few seconds may have a slowest speed above that of the pointer.
    return std::min(1.0, std::max(minimumSpeed, share * minimumSpeed + (1.0 - share)));
}

double laggedTarget(double speed, double step, double display, double target)
{
    const double lag = 1.0 - speed;
    const double place = speed * step + display;
    if (place - target > lag) {
        return target + lag;
    }
    if (target - place > lag) {
        return target - lag;
    }
    return place;
}

Mapped mapped(double target, const Anchor& anchor)
{
    if (target <= 0.0) {
        return {0.0, 0.0, false};
    }
    if (target >= 1.0) {
        return {1.0, 1.0, false};
    }
    if (!anchor.mapped) {
        return {target, target, false};
    }
    if (target > anchor.display) {
        const double share = (target - anchor.display) / (1.0 - anchor.display);
        return {target, (1.0 - share) * anchor.value + share, true};
    }
    return {target, target / anchor.display * anchor.value, true};
}

double stepTravel(int sliderLength, int draggedLength, int minimum, int maximum)
{
    const double steps = static_cast<double>(maximum) - minimum + 1.0;
    return std::min(static_cast<double>(sliderLength), draggedLength * steps * s_StepFactor);
}

double steppedValue(double way, double travel, double anchor)
{
    if (travel == 0.0) {
        return quotient(way, travel, anchor);
    }
    return std::min(1.0, std::max(0.0, way / travel + anchor));
}

double velocity(double before, double now, qint64 milliseconds)
{
    const double elapsed = milliseconds > 0 ? static_cast<double>(milliseconds) : 1.0;
    return (before - now) * millisPerSecond / elapsed;
}
}
}
