// SPDX-License-Identifier: MIT
// The flags that items and containers of a popover are made and reported with.
#pragma once

#include <QtCore/QFlags>
#include <QtCore/QMetaType>

namespace vx
{
namespace PopoverWidget
{

/// What an item is made of and how it answers clicks.
enum EItemFlag : int
{
    eifControl = 1, ///< the control of the item's class stands at the right end and is its last element
    eifDisabled = 2, ///< that control is created disabled
    eifText = 4, ///< with a text element, if the text is not empty
    eifIcon = 8, ///< with an icon element
    eifAdditionalText = 16, ///< with an additional-text element
    eifCentered = 32, ///< the elements stand in the middle of the row
    eifBoldSelection = 64, ///< the text is bold while the item is checked
    eifDisclosureOnly = 128, ///< a submenu opens only by a click on its disclosure icon
    eifRightClick = 256, ///< the right mouse button performs the item as the left one does
    eifDoubleClick = 512, ///< a double click is told from a single click, which is then reported late
    eifNoForward = 1024, ///< the container does not forward itemPerformed(); searches by id do not enter a submenu
};
Q_DECLARE_FLAGS(EItemFlags, EItemFlag)
Q_DECLARE_OPERATORS_FOR_FLAGS(EItemFlags)

/// How an item was performed: the part that was hit, the button, and whether it was a double click.
enum EItemPerformedFlag : int
{
    eipIcon = 1,
    eipText = 2,
    eipAdditionalText = 4,
    eipControl = 8, ///< on the item's own control, or the control changed by itself
    eipLeftButton = 16,
    eipRightButton = 32,
    eipDoubleClick = 64,
    eipDisclosure = 128, ///< on the disclosure icon of a submenu
};
Q_DECLARE_FLAGS(EItemPerformedFlags, EItemPerformedFlag)
Q_DECLARE_OPERATORS_FOR_FLAGS(EItemPerformedFlags)

/// What else a container does when one of its items is performed.
enum EContainerFlag : int
{
    ecfDismiss = 1, ///< emits Container::dismissPopover()
    ecfDismissAll = 2, ///< emits Container::dismissAllPopover()
};
Q_DECLARE_FLAGS(EContainerFlags, EContainerFlag)
Q_DECLARE_OPERATORS_FOR_FLAGS(EContainerFlags)

} // namespace PopoverWidget
} // namespace vx

Q_DECLARE_METATYPE(vx::PopoverWidget::EItemPerformedFlags)
