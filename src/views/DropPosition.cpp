// SPDX-License-Identifier: MIT
// Where in a row of items a drop lands.
#include "views/DropPosition.h"

namespace vx
{
int dropPosition(const QVector<QRect>& items, const QPoint& point, Qt::Orientation orientation)
{
    for (int i = 0; i < items.size(); ++i) {
        const QPoint centre = items.at(i).center();
        if (orientation == Qt::Horizontal ? point.x() < centre.x() : point.y() < centre.y()) {
            return i;
        }
    }
    return -1;
}
}
