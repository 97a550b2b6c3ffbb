// SPDX-License-Identifier: MIT
// Rules that the rows with a control share.
#pragma once

#include "popover/ItemRules.h"
#include "popover/PopoverFlags.h"

#include <QtCore/QRect>

namespace vx
{
namespace PopoverWidget
{

/// Pure functions. Positions and rectangles are in the coordinates of one item.
namespace ControlRules
{

/// The flags of a click on a control.
inline EItemPerformedFlags onControl(Qt::MouseButton button)
{
    return ItemRules::hit({}, QPoint(-1, -1), button) | eipControl;
}

/// Whether a click is for the item: within it and with a button that performs.
inline bool isClick(const QRect& item, const QPoint& position, Qt::MouseButton button, EItemFlags flags)
{
    return item.contains(position) && ItemRules::performs(flags, button);
}

/// The states of a tristate box, in the order of its clicks: 0, 1, 2.
constexpr int nextInRing(int state)
{
    return (state + 1) % 3;
}
/// The step back.
constexpr int previousInRing(int state)
{
    return (state + 2) % 3;
}

} // namespace ControlRules
} // namespace PopoverWidget
} // namespace vx
