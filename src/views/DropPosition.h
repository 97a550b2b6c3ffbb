// SPDX-License-Identifier: MIT
// Where in a row of items a drop lands. No widgets.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/Qt>
#include <QtCore/QVector>

namespace vx
{
/// The number of the item before which a drop at \a point lands: the first in order whose centre lies past the
/// point, to the right in a horizontal row, below in a vertical one. -1: after all of them. On the centre itself
/// is past it.
ZELKOV_WIDGETS_EXPORT int dropPosition(
    const QVector<QRect>& items, const QPoint& point, Qt::Orientation orientation);
}
