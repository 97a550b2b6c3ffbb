// SPDX-License-Identifier: MIT
// The row of a popover that holds any widget.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"

namespace vx
{
namespace PopoverWidget
{

/// A row without elements that holds one foreign widget and is never performed. Container::addWidgetItem() makes
/// it; its signals go nowhere. The item owns the widget as its parent.
class ZELKOV_WIDGETS_EXPORT WidgetItem : public Item
{
    Q_OBJECT

public:
    /// Takes \a widget over; null gives an empty row.
    WidgetItem(QWidget* widget, const QString& objectName, int id, QWidget* parent);
    ~WidgetItem() override;

    /// That of the base class, which without elements is a null variant.
    QVariant value() override;
    /// The widget, also after it was put elsewhere; null when it has died.
    QWidget* getFocusItem() override;
    QWidget* widget() const { return m_widget; } //!< null when it has died

private:
    QPointer<QWidget> m_widget;
};

} // namespace PopoverWidget
} // namespace vx
