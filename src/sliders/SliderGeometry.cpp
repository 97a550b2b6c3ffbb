// SPDX-License-Identifier: MIT
// The arithmetic of the plain sliders and the overlay bar.
#include "sliders/SliderGeometry.h"

#include <algorithm>
#include <limits>

namespace vx
{
namespace SliderGeometry
{
int jumpValue(int minimum, int maximum, bool inverted, int pressed, int length, int handleLength)
{
    const double half = (handleLength + 1.0) * 0.5;
    const double room = length - half - half;
    double ratio = 0.0;
    if (room > 0.0) {
        ratio = (std::clamp(static_cast<double>(pressed), half, length - half) - half) / room;
    }
    // 64 bits, since the extent of a range of int may not fit into one.
    const qint64 extent = static_cast<qint64>(maximum) - minimum;
    qint64 value = static_cast<qint64>(static_cast<double>(extent) * ratio) + minimum;
    if (inverted) {
        value = maximum - value;
    }
    return static_cast<int>(
        std::clamp<qint64>(value, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()));
}

QRect overlayBarRect(Qt::Orientation orientation, bool leading, const QSize& area, int thickness)
{
    if (orientation == Qt::Horizontal) {
        return {0, leading ? 0 : area.height() - thickness, area.width(), thickness};
    }
    return {leading ? 0 : area.width() - thickness, 0, thickness, area.height()};
}
}
}
