// SPDX-License-Identifier: MIT
// Where a dragged row of a list arrives.
#pragma once

#include "foundation/Export.h"

namespace vx
{
/// Where the drop indicator stands at the row under the pointer.
enum class ListDropSide : int
{
    Above,
    Below,
    Other ///< on the row or beside all rows
};

/// The row that a row dragged from \a sourceRow has after a drop at \a rowAtDrop (-1 beside all rows) of \a count rows.
/// A drop beside all rows arrives at row 0: clients rely on it.
ZELKOV_WIDGETS_EXPORT int listDropRow(int sourceRow, int rowAtDrop, ListDropSide side, int count);
}
