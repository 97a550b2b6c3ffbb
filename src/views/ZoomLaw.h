// SPDX-License-Identifier: MIT
// What the notches of a wheel mean for a zoom, said with numbers alone.
#pragma once

#include <QtCore/QtGlobal>

namespace vx
{
/// The thinking of ZoomScrollArea. Steps are notches of the wheel, above 0 to zoom in.
namespace ZoomLaw
{
/// Whole notches in an angle of eighths of a degree; less than one notch is none.
constexpr int stepsOf(int angleDelta)
{
    return angleDelta / 8 / 15;
}

/// The steps owed after some more: added, but where the direction turns only the new ones count.
constexpr int scheduled(int owed, int steps)
{
    const qint64 sum = static_cast<qint64>(owed) + steps;
    if ((sum < 0 && steps > 0) || (sum > 0 && steps < 0)) {
        return steps;
    }
    return static_cast<int>(qBound<qint64>(-2147483647, sum, 2147483647));
}

/// The steps owed after one was done. 0 becomes 1: odd on purpose, clients rely on it.
constexpr int afterOne(int owed)
{
    return owed < 1 ? owed + 1 : owed - 1;
}

/// The full factor in the direction of the steps.
constexpr double factor(int owed)
{
    return qBound(-1.0, owed * 10.0, 1.0);
}
}
}
