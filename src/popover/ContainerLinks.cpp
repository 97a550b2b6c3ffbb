// SPDX-License-Identifier: MIT
// The few operations of a container that depend on the class of a row.
#include "popover/ContainerLinks.h"

#include "popover/Container.h"
#include "popover/WidgetItem.h"

namespace vx
{
namespace PopoverWidget
{
namespace
{
bool isSliderItem(const Item* item)
{
    return item->inherits("vx::PopoverWidget::SliderItem");
}

/// Handles are cared for in the footer first, then in the header, then in the direct items.
QList<QPointer<Item>> sliderItems(const Container* header, const Container* footer, const QList<Item*>& direct)
{
    QList<Item*> all;
    if (footer) {
        all += footer->getItems();
    }
    if (header) {
        all += header->getItems();
    }
    all += direct;
    QList<QPointer<Item>> result;
    for (Item* const item : all) {
        if (isSliderItem(item)) {
            result.append(item);
        }
    }
    return result;
}
}

Container* ContainerLinks::containerOf(Item* /*item*/)
{
    return nullptr;
}

void Container::setItemValue(int id, const QVariant& value, bool emitSignal)
{
    Item* const item = getItem(id);
    if (!item) {
        return;
    }
    const QPointer<Container> self(this);
    if (isSliderItem(item)) {
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
    const QList<QPointer<Item>> all = sliderItems(m_header, m_footer, items());
    for (const QPointer<Item>& item : all) {
        if (item) {
            item->cancelAnimations();
        }
        if (item) {
            // A scrolled slider item brings its handles to their places.
            item->onItemScrolled();
        }
    }
}

void Container::stackNubsiesOver(QWidget* /*over*/)
{
}

void Container::raiseContainer(QWidget* over)
{
    raise();
    stackNubsiesOver(over);
}

} // namespace PopoverWidget
} // namespace vx
