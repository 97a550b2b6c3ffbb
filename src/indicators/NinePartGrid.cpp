// SPDX-License-Identifier: MIT
#include "indicators/NinePartGrid.h"

namespace vx
{
namespace
{
struct NinePartAxis
{
    int source[4];
    int target[4];
};

// Extents are one less than the sizes, as right() - left() gives them.
NinePartAxis ninePartAxis(int first, int last, int sourceExtent, int sourceLow, int sourceHigh, bool growing)
{
    int low = sourceLow;
    int high = sourceHigh;
    const int sum = sourceLow + sourceHigh;
    if (growing && sum != 0) {
        const int extent = last - first;
        const qint64 times = (static_cast<qint64>(extent) - sourceExtent) / sum + 1;
        low = static_cast<int>(times * sourceLow);
        high = static_cast<int>(extent - times * sourceLow - sourceExtent + sum);
    }
    return {{0, sourceLow, sourceExtent - sourceHigh, sourceExtent}, {first, first + low, last - high, last}};
}

NinePartGrid ninePartGridOf(const QRect& target, const QSize& picture, const QMargins& margins, bool growing)
{
    NinePartGrid grid;
    if (picture.isEmpty()) {
        return grid;
    }
    const NinePartAxis columns = ninePartAxis(
        target.left(), target.right(), picture.width() - 1, margins.left(), margins.right(), growing);
    const NinePartAxis rows = ninePartAxis(
        target.top(), target.bottom(), picture.height() - 1, margins.top(), margins.bottom(), growing);
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            const QRect to(QPoint(columns.target[column], rows.target[row]),
                QPoint(columns.target[column + 1], rows.target[row + 1]));
            const QRect from(QPoint(columns.source[column], rows.source[row]),
                QPoint(columns.source[column + 1], rows.source[row + 1]));
            if (to.isEmpty() || from.isEmpty()) {
                continue;
            }
            grid.parts[static_cast<std::size_t>(grid.count++)] = {to, from, row == 1 && column == 1};
        }
    }
    return grid;
}
}

NinePartGrid ninePartGrid(const QRect& target, const QSize& picture, const QMargins& margins)
{
    return ninePartGridOf(target, picture, margins, false);
}

NinePartGrid ninePartGridWithGrowingBorder(const QRect& target, const QSize& picture, const QMargins& margins)
{
    return ninePartGridOf(target, picture, margins, true);
}
}
