// SPDX-License-Identifier: MIT
// The row of a popover that holds any widget.
#include "popover/WidgetItem.h"

#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

WidgetItem::WidgetItem(QWidget* widget, const QString& objectName, int id, QWidget* parent)
    : Item(parent, QFlags<EItemFlag>(), id, objectName, QString(), QString())
    , m_widget(widget)
{
    if (widget) {
        m_mainLayout->insertWidget(0, widget);
    }
}

WidgetItem::~WidgetItem() = default;

QVariant WidgetItem::value()
{
    return Item::value();
}

QWidget* WidgetItem::getFocusItem()
{
    return m_widget;
}

} // namespace PopoverWidget
} // namespace vx
