// SPDX-License-Identifier: MIT
// The content of a popover: finding its items and changing them by id.
#include "popover/Container.h"

#include "popover/ContainerLinks.h"
#include "popover/Item.h"

#include <QtWidgets/QBoxLayout>

namespace vx
{
namespace PopoverWidget
{

/// Calls visitor(item) for the whole tree until it returns true.
template <class Visitor> bool Container::walk(bool intoNoForward, const Visitor& visitor) const
{
    for (const QPointer<Item>& item : m_items) {
        if (!item) {
            continue;
        }
        if (visitor(item.data())) {
            return true;
        }
        if (intoNoForward || !item->itemFlags().testFlag(eifNoForward)) {
            const Container* const submenu = ContainerLinks::containerOf(item);
            if (submenu && submenu->walk(intoNoForward, visitor)) {
                return true;
            }
        }
    }
    if (m_header && m_header->walk(intoNoForward, visitor)) {
        return true;
    }
    if (m_footer && m_footer->walk(intoNoForward, visitor)) {
        return true;
    }
    for (const QPointer<Container>& container : m_containers) {
        if (container && container->walk(intoNoForward, visitor)) {
            return true;
        }
    }
    return false;
}

/// Changes one item; null means that there is none.
template <class Change> void Container::changeItem(Item* item, bool emitSignal, const Change& change)
{
    if (!item) {
        return;
    }
    const QPointer<Container> self(this);
    change(item);
    if (self && emitSignal) {
        emitLayoutChanged();
    }
}

/// Changes all items of the tree with that id.
template <class Change> void Container::changeItems(int id, bool emitSignal, const Change& change)
{
    QList<QPointer<Item>> found;
    walk(false, [id, &found](Item* item) {
        if (item->id() == id) {
            found.append(item);
        }
        return false;
    });
    if (found.isEmpty()) {
        return;
    }
    const QPointer<Container> self(this);
    for (const QPointer<Item>& item : found) {
        if (item) {
            change(item.data());
        }
    }
    if (self && emitSignal) {
        emitLayoutChanged();
    }
}

QList<Item*> Container::items() const
{
    QList<Item*> result;
    result.reserve(m_items.size());
    for (const QPointer<Item>& item : m_items) {
        if (item) {
            result.append(item);
        }
    }
    return result;
}

QList<Item*> Container::getItems() const
{
    QList<Item*> result;
    walk(true, [&result](Item* item) {
        result.append(item);
        return false;
    });
    return result;
}

QList<Item*> Container::getItems(int id) const
{
    QList<Item*> result;
    walk(false, [id, &result](Item* item) {
        if (item->id() == id) {
            result.append(item);
        }
        return false;
    });
    return result;
}

QList<Item*> Container::getItemsByUserData(const QVariant& userData) const
{
    QList<Item*> result;
    walk(true, [&userData, &result](Item* item) {
        if (item->userData() == userData) {
            result.append(item);
        }
        return false;
    });
    return result;
}

QList<Item*> Container::getItemsByValue(const QVariant& value) const
{
    QList<Item*> result;
    for (const QPointer<Item>& item : m_items) {
        if (!item) {
            continue;
        }
        if (item->value() == value) {
            result.append(item);
        }
        const Container* const submenu = ContainerLinks::containerOf(item);
        if (Item* const inner = submenu ? submenu->getItemByValue(value) : nullptr) {
            result.append(inner);
        }
    }
    for (const QPointer<Container>& part : {m_header, m_footer}) {
        if (part) {
            result += part->getItemsByValue(value);
        }
    }
    return result;
}

Item* Container::getItem(int id) const
{
    Item* result = nullptr;
    walk(false, [id, &result](Item* item) {
        result = item->id() == id ? item : nullptr;
        return result != nullptr;
    });
    return result;
}

Item* Container::getItemByUserData(const QVariant& userData) const
{
    Item* result = nullptr;
    walk(true, [&userData, &result](Item* item) {
        result = item->userData() == userData ? item : nullptr;
        return result != nullptr;
    });
    return result;
}

Item* Container::getItemByValue(const QVariant& value) const
{
    return getItemsByValue(value).value(0);
}

Item* Container::getSelectedItem(int id) const
{
    Item* result = nullptr;
    walk(false, [id, &result](Item* item) {
        result = item->id() == id && item->value().toBool() ? item : nullptr;
        return result != nullptr;
    });
    return result;
}

QList<int> Container::getItemIDs() const
{
    QList<int> result;
    walk(true, [&result](Item* item) {
        result.append(item->id());
        return false;
    });
    return result;
}

bool Container::itemExists(int id) const
{
    return getItem(id) != nullptr;
}

bool Container::hasItem(Item* item) const
{
    return item && m_items.contains(QPointer<Item>(item));
}

int Container::itemIndex(int id) const
{
    return itemIndex(getItem(id));
}

int Container::itemIndex(QWidget* widget) const
{
    // A spacer counts as the place of a null widget.
    return widget ? m_layout->indexOf(widget) : -1;
}

QString Container::getItemText(int id) const
{
    Item* const item = getItem(id);
    return item ? item->text() : QString();
}

QString Container::getItemCurrentText(int id) const
{
    Item* const item = getItem(id);
    return item ? item->currentText() : QString();
}

QVariant Container::getItemValue(int id) const
{
    Item* const item = getItem(id);
    return item ? item->value() : QVariant();
}

QVariant Container::getItemUserData(int id) const
{
    Item* const item = getItem(id);
    return item ? item->userData() : QVariant();
}

bool Container::getItemVisibility(int id) const
{
    const Item* const item = getItem(id);
    return item && item->isVisible();
}

void Container::setItemText(int id, const QString& text, bool emitSignal)
{
    changeItem(getItem(id), emitSignal, [&text](Item* item) { item->setText(text); });
}

void Container::setItemCurrentText(int id, const QString& text, bool emitSignal)
{
    changeItem(getItem(id), emitSignal, [&text](Item* item) { item->setCurrentText(text); });
}

void Container::setItemUserData(int id, const QVariant& userData)
{
    changeItem(getItem(id), false, [&userData](Item* item) { item->setUserData(userData); });
}

void Container::setItemBusy(int id, bool busy, bool hideLast, bool emitSignal)
{
    const QPointer<Container> self(this);
    const QList<QPointer<Item>> items = m_items;
    bool found = false;
    for (const QPointer<Item>& item : items) {
        if (item && item->id() == id) {
            found = true;
            item->setBusy(busy, hideLast);
        }
    }
    if (self && found && emitSignal) {
        emitLayoutChanged();
    }
}

void Container::setItemVisibility(int id, bool visible, bool emitSignal)
{
    const QPointer<Container> self(this);
    changeItem(getItem(id), emitSignal, [visible, &self](Item* item) {
        item->setVisible(visible);
        if (self) {
            self->updateTabOrder();
        }
    });
}

void Container::setItemVisibility(const QList<int>& ids, bool visible, bool emitSignal)
{
    const QPointer<Container> self(this);
    const QList<int> all = ids;
    for (const int id : all) {
        if (self) {
            setItemVisibility(id, visible, emitSignal);
        }
    }
}

void Container::setItemEnabled(int id, bool enabled, bool emitSignal)
{
    changeItem(getItem(id), emitSignal, [enabled](Item* item) { item->setEnabled(enabled); });
}

void Container::enableItem(int id, bool enabled, bool emitSignal)
{
    setItemEnabled(id, enabled, emitSignal);
}

void Container::setItemsChecked(int id, bool checked, bool emitSignal)
{
    changeItems(id, emitSignal, [checked](Item* item) { item->setChecked(checked); });
}

void Container::setItemsEnabled(int id, bool enabled, bool emitSignal)
{
    changeItems(id, emitSignal, [enabled](Item* item) { item->setEnabled(enabled); });
}

void Container::setItemsVisibility(int id, bool visible, bool emitSignal)
{
    changeItems(id, emitSignal, [visible](Item* item) { item->setVisible(visible); });
}

void Container::setContainerVisibility(Container* container, bool visible, bool emitSignal)
{
    if (!container || !m_containers.contains(QPointer<Container>(container))) {
        return;
    }
    const QPointer<Container> self(this);
    container->setVisible(visible);
    if (self) {
        updateTabOrder();
    }
    if (self && emitSignal) {
        emitLayoutChanged();
    }
}

bool Container::getContainerVisibility(Container* container) const
{
    return container && m_containers.contains(QPointer<Container>(container)) && container->isVisible();
}

void Container::setAutoFocusItem(int id)
{
    m_autoFocusItem = id;
}

void Container::setAutoFocus()
{
    Item* const item = m_autoFocusItem != -1 ? getItem(m_autoFocusItem) : nullptr;
    if (item) {
        item->setKeyboardFocus();
    }
}

void Container::onScrolled()
{
    const QList<QPointer<Item>> items = m_items;
    for (const QPointer<Item>& item : items) {
        if (item) {
            item->onItemScrolled();
        }
    }
}

void Container::updateTabOrder()
{
    QWidget* previous = nullptr;
    const QList<Item*> all = getItems();
    for (Item* const item : all) {
        QWidget* const widget = item->isVisible() ? item->getFocusItem() : nullptr;
        if (!widget) {
            continue;
        }
        // Between windows there is no order, and Qt would complain.
        if (previous && previous->window() == widget->window()) {
            setTabOrder(previous, widget);
        }
        previous = widget;
    }
}

} // namespace PopoverWidget
} // namespace vx
