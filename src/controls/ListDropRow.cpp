// SPDX-License-Identifier: MIT
#include "controls/ListDropRow.h"

#include <QtCore/QtGlobal>

namespace vx
{
int listDropRow(int sourceRow, int rowAtDrop, ListDropSide side, int count)
{
    int offset = 0;
    if (side == ListDropSide::Above) {
        offset = sourceRow < rowAtDrop ? -1 : 0;
    } else if (side == ListDropSide::Below) {
        offset = sourceRow > rowAtDrop ? 1 : 0;
    }
    return qMax(0, qMin(rowAtDrop + offset, count - 1));
}
}
