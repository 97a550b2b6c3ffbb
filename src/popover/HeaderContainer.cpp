// SPDX-License-Identifier: MIT
// The content of a popover's header or footer.
#include "popover/HeaderContainer.h"

#include "popover/WidgetItem.h"

#include <QtWidgets/QBoxLayout>

namespace vx
{
namespace PopoverWidget
{

HeaderContainer::HeaderContainer(
    QWidget* parent, const QString& objectName, Qt::Orientation orientation, QFlags<Qt::AlignmentFlag> alignment)
    : Container(parent, objectName, orientation, alignment)
{
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
}

HeaderContainer::~HeaderContainer() = default;

void HeaderContainer::addStretch(int stretch)
{
    m_layout->addStretch(stretch);
}

Item* HeaderContainer::insertItem(Item* item, QFlags<EContainerFlag> flags, int index)
{
    if (!item) {
        return nullptr;
    }
    m_layout->insertWidget(index, item);
    append(item);
    applyFlags(item, flags);
    applyDefaultConnects(item);
    return item;
}

Item* HeaderContainer::insertItem(Item* item, int index)
{
    if (!item) {
        return nullptr;
    }
    const QPointer<Item> added(item);
    item->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
    m_layout->insertWidget(index, item);
    append(item);
    applyFlags(item, item->defaultItemFlags());
    applyDefaultConnects(item);
    emitLayoutChanged();
    return added;
}

void HeaderContainer::insertWidgetItem(QWidget* widget, int index, const QString& objectName, int id)
{
    auto* const item = new WidgetItem(widget, objectName, id, nullptr);
    // The widget leaves the item again: the row is found, but what is seen is the widget.
    if (widget) {
        m_layout->insertWidget(index, widget);
    }
    append(item);
    emitLayoutChanged();
}

void HeaderContainer::resetLayout(bool deleteItems, bool withHeaderAndFooter)
{
    while (QLayoutItem* const entry = m_layout->takeAt(0)) {
        delete entry;
    }
    // With an empty layout only every second item is deleted. The rest is kept, out of sight.
    const QList<Item*> all = items();
    for (int i = 0; i < all.size(); ++i) {
        Item* const item = all.at(i);
        const bool kept = !deleteItems || i % 2 == 0;
        if (kept && !item->parent()) {
            // The item of a widget; nobody else knows it.
            item->setParent(this);
            item->hide();
        } else if (kept && deleteItems && item->parent() == this) {
            item->hide();
        }
    }
    Container::resetLayout(deleteItems, withHeaderAndFooter);
}

} // namespace PopoverWidget
} // namespace vx
