// SPDX-License-Identifier: MIT
// Arithmetic of a wrapped table.
#include "models/TableShape.h"

#include <algorithm>

namespace vx
{
TableShape TableShape::of(Qt::Orientation orientation, int dimension)
{
    return TableShape {orientation, orientation == Qt::Horizontal ? 1 : std::max(dimension, 1)};
}

int TableShape::rows(int cellCount) const
{
    if (orientation == Qt::Horizontal) {
        return dimension;
    }
    return cellCount < 1 ? 0 : (cellCount - 1) / dimension + 1;
}

int TableShape::columns(int cellCount) const
{
    return orientation == Qt::Horizontal ? std::max(cellCount, 0) / dimension : dimension;
}

std::pair<int, int> TableShape::position(int cell) const
{
    return orientation == Qt::Horizontal ? std::make_pair(0, cell) : std::make_pair(cell / dimension, cell % dimension);
}

int TableShape::cell(const std::pair<int, int>& position) const
{
    return orientation == Qt::Horizontal ? position.second : dimension * position.first + position.second;
}
}
