// SPDX-License-Identifier: MIT
// The few operations of a container that depend on the class of a row.
#include "popover/ContainerLinks.h"

#include "popover/Container.h"
#include "popover/WidgetItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/SliderItem.h"
#include "popover/items/Submenu.h"

#include <QtWidgets/QButtonGroup>

namespace vx
{
namespace PopoverWidget
{
namespace
{
/// Handles are cared for in the footer first, then in the header, then in the direct items.
QList<QPointer<SliderItem>> sliderItems(const Container* header, const Container* footer, const QList<Item*>& direct)
{
    QList<Item*> all;
    if (footer) {
        all += footer->getItems();
    }
    if (header) {
        all += header->getItems();
    }
    all += direct;
    QList<QPointer<SliderItem>> result;
    for (Item* const item : all) {
        if (auto* const sliderItem = qobject_cast<SliderItem*>(item)) {
            result.append(sliderItem);
        }
    }
    return result;
}
}

Container* ContainerLinks::containerOf(Item* item)
{
    const auto* const submenu = qobject_cast<Submenu*>(item);
    return submenu ? submenu->container() : nullptr;
}

void Container::setSubmenuRadioList(
    int submenuId, int itemId, const QStringList& texts, int selected, const QString& objectName)
{
    auto* const submenu = submenuId == -1 ? nullptr : qobject_cast<Submenu*>(getItem(submenuId));
    const QPointer<Container> list = submenu ? submenu->container() : nullptr;
    if (!list) {
        return;
    }
    const QPointer<Container> self(this);
    list->resetLayout(true, false);
    if (!self || !list) {
        return;
    }
    auto* const group = new QButtonGroup(this);
    for (int index = 0; index < texts.size() && list; ++index) {
        list->addItem(new RadioItem(
            texts.at(index), objectName, itemId, index == selected, group, eifControl | eifText, nullptr));
    }
    if (self) {
        emitLayoutChanged();
    }
}

void Container::setItemValue(int id, const QVariant& value, bool emitSignal)
{
    Item* const item = getItem(id);
    if (!item) {
        return;
    }
    const QPointer<Container> self(this);
    if (qobject_cast<SliderItem*>(item)) {
        if (value.type() != QVariant::List) {
            return;
        }
        item->setValue(value);
    } else if (qobject_cast<WidgetItem*>(item)) {
        if (value.type() != QVariant::UserType || !value.canConvert<QWidget*>()) {
            return;
        }
        const QPointer<QWidget> widget = value.value<QWidget*>();
        if (widget && isAncestorOf(widget)) {
            // It shall not go down with the item that holds it.
            widget->setParent(nullptr);
        }
        resetLayout(true, false);
        if (self) {
            addWidgetItem(widget, QString(), -1);
        }
    } else {
        item->setValue(value);
    }
    if (self && emitSignal) {
        emitLayoutChanged();
    }
}

void Container::updateItems()
{
    const QList<QPointer<SliderItem>> all = sliderItems(m_header, m_footer, items());
    for (const QPointer<SliderItem>& item : all) {
        if (item && item->slider()) {
            item->slider()->cancelAnimations();
        }
        if (item && item->slider()) {
            item->slider()->updateNubsiePositions(false);
        }
    }
}

void Container::stackNubsiesOver(QWidget* over)
{
    const QList<QPointer<SliderItem>> all = sliderItems(m_header, m_footer, items());
    for (const QPointer<SliderItem>& item : all) {
        if (!item || !item->slider()) {
            continue;
        }
        if (over) {
            item->slider()->stackNubsiesOver(over);
        } else {
            item->slider()->raiseNubsies();
        }
    }
}

void Container::raiseContainer(QWidget* over)
{
    raise();
    stackNubsiesOver(over);
}

} // namespace PopoverWidget
} // namespace vx
