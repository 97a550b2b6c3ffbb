// SPDX-License-Identifier: MIT
// The content of a popover's header or footer.
#pragma once

#include "foundation/Export.h"
#include "popover/Container.h"

namespace vx
{
namespace PopoverWidget
{

/// A container for the header or the footer of another one: it takes the width that there is, and its items keep
/// their preferred size. It differs from Container in small ways that clients rely on; each is told below.
class ZELKOV_WIDGETS_EXPORT HeaderContainer : public Container
{
    Q_OBJECT

public:
    /// As Container.
    HeaderContainer(QWidget* parent, const QString& objectName, Qt::Orientation orientation,
        QFlags<Qt::AlignmentFlag> alignment);
    ~HeaderContainer() override;

    /// Emits nothing.
    void addStretch(int stretch) override;
    /// Emits nothing.
    Item* insertItem(Item* item, QFlags<EContainerFlag> flags, int index) override;
    /// Gives the item the size policy preferred in both directions.
    Item* insertItem(Item* item, int index) override;
    /// Lays the widget itself out; the WidgetItem that is found in its place is never shown.
    void insertWidgetItem(QWidget* widget, int index, const QString& objectName, int id) override;
    /// Empties the layout, spacers included, and the list of items. With @p deleteItems only every second item,
    /// from the second on, is deleted; the others stay behind as hidden children. Odd on purpose.
    void resetLayout(bool deleteItems, bool withHeaderAndFooter) override;
};

} // namespace PopoverWidget
} // namespace vx
