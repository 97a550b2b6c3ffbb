// SPDX-License-Identifier: MIT
// Where the views of a wall stand.
#pragma once

#include <QtCore/QRect>

namespace client
{
/// How many rows, and columns, a wall of so many views has: 2 to 8.
inline int wallColumns(int count)
{
    int columns = 2;
    while (columns < 8 && columns * columns < count) {
        ++columns;
    }
    return columns;
}

/// The count of views that comes next: 4, 9, 16, 25, 36, 49 or 64.
inline int wallViewCount(int count)
{
    return wallColumns(count) * wallColumns(count);
}

/// The cell of a view, counted from the top left in reading order. Pixels that do not divide go to the cells one by
/// one: the wall is filled to its edges and the gaps are all alike.
inline QRect wallCell(const QRect& wall, int columns, int index, int gap)
{
    const int column = index % columns;
    const int row = index / columns;
    const auto start = [=](int length, int number) { return (length + gap) * number / columns; };
    const int left = start(wall.width(), column);
    const int top = start(wall.height(), row);
    return QRect(wall.left() + left, wall.top() + top, start(wall.width(), column + 1) - left - gap,
        start(wall.height(), row + 1) - top - gap);
}
}
