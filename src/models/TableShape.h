// SPDX-License-Identifier: MIT
// How a flat list of cells wraps into rows and columns.
#pragma once

#include <utility>

#include <QtCore/Qt>

#include "foundation/Export.h"

namespace vx
{
/// The shape of a table that shows a flat list of cells: one long row (Qt::Horizontal), or a fixed number of columns
/// into which the cells wrap row by row (Qt::Vertical). Pairs are (row, column).
struct ZELKOV_WIDGETS_EXPORT TableShape
{
    Qt::Orientation orientation = Qt::Horizontal; ///< Qt::Horizontal: one long row
    int dimension = 1; ///< number of columns of the vertical form; always 1 in the horizontal one

    /// A shape with a dimension that is allowed: at least 1, and exactly 1 if horizontal.
    static TableShape of(Qt::Orientation orientation, int dimension);

    int rows(int cellCount) const;    ///< never negative; 1 in the horizontal form even without cells
    int columns(int cellCount) const; ///< never negative; the dimension in the vertical form even without cells
    // The place of a cell, and the cell at a place. Nothing is checked against a number of cells.
    std::pair<int, int> position(int cell) const;
    int cell(const std::pair<int, int>& position) const;

    bool operator==(const TableShape& other) const
    {
        return orientation == other.orientation && dimension == other.dimension;
    }
    bool operator!=(const TableShape& other) const { return !(*this == other); }
};
}
