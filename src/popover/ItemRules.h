// SPDX-License-Identifier: MIT
// The rules of a popover's row that need no widget: which part was hit, when a drag begins, how a text is escaped.
#pragma once

#include "foundation/Export.h"
#include "popover/PopoverFlags.h"

#include <Qt>
#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QString>

namespace vx
{
namespace PopoverWidget
{

/// Pure functions. Positions and rectangles are in the coordinates of one item.
namespace ItemRules
{

/// Where the elements of an item lie. An element that the item does not have is a null rectangle.
struct Elements
{
    QRect icon; ///< of the icon element
    QRect text; ///< of the text element
    QRect additionalText; ///< of the element at the right
};

/// The first of icon, text and additional text that contains @p position, or 0, and the bit of the button; buttons
/// other than left and right have none.
ZELKOV_WIDGETS_EXPORT EItemPerformedFlags hit(
    const Elements& elements, const QPoint& position, Qt::MouseButton button);

/// Whether a click with @p button performs an item with these flags: left, or right with eifRightClick.
ZELKOV_WIDGETS_EXPORT bool performs(EItemFlags flags, Qt::MouseButton button);

/// Whether a move with these buttons, @p from the press to @p position, begins a drag: left held, and a Manhattan
/// length of @p startDistance or more.
ZELKOV_WIDGETS_EXPORT bool startsDrag(
    Qt::MouseButtons buttons, const QPoint& from, const QPoint& position, int startDistance);

/// The text as a button needs it to show what is meant: " & " becomes " && ". An ampersand without a blank on both
/// sides stays, and marks a mnemonic.
ZELKOV_WIDGETS_EXPORT QString escaped(const QString& text);

} // namespace ItemRules
} // namespace PopoverWidget
} // namespace vx
