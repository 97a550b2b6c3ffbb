// SPDX-License-Identifier: MIT
#include "controls/DialLaw.h"

#include <QtCore/QtGlobal>

#include <cmath>
#include <limits>

namespace vx
{
namespace
{
constexpr double dialPi = 3.141592653589793;
}

double dialAngle(double value, const DialRange& range)
{
    const double minimum = range.minimum;
    const double maximum = range.maximum;
    if (range.inverted) {
        value = maximum - value; // not maximum + minimum: clients rely on it
    }
    const double ratio = maximum > minimum ? (value - minimum) / (maximum - minimum) : 0.0;
    return range.wrapping ? ratio * 2.0 * dialPi - 3.0 * dialPi / 2.0 : ratio * 5.0 * dialPi / 3.0 - 4.0 * dialPi / 3.0;
}

int dialValueAfterDrag(int value, int dx, int width, const DialRange& range)
{
    const double extent = static_cast<double>(range.maximum) - range.minimum;
    const double steps = width > 0 ? std::trunc(dx * extent / (3.0 * width)) : 0.0;
    double result = value + steps;
    if (!range.wrapping) {
        result = qMax(static_cast<double>(range.minimum), qMin(result, static_cast<double>(range.maximum)));
    }
    return static_cast<int>(qBound(static_cast<double>(std::numeric_limits<int>::min()), result,
        static_cast<double>(std::numeric_limits<int>::max())));
}

QPointF dialPoint(const QPointF& centre, double angle, double radius)
{
    return centre + QPointF(std::cos(angle) * radius, std::sin(angle) * radius);
}
}
