// SPDX-License-Identifier: MIT
// A row with a number and its unit.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QRadioButton>
#include <QtWidgets/QSpinBox>

namespace vx
{
namespace PopoverWidget
{

/// A row with a number and a choice of units at its right end, and with a radio button at the left if it is one of a
/// group. A click on the row checks and performs it, with the base class's value. A change of number or unit checks
/// it and does not perform.
class ZELKOV_WIDGETS_EXPORT UnitValueItem : public Item
{
    Q_OBJECT

public:
    /// \a group is not owned; null for a row without a radio button.
    UnitValueItem(const QString& text, const QStringList& units, const QString& objectName, QButtonGroup* group,
        int id, QFlags<EItemFlag> flags, QWidget* parent);
    ~UnitValueItem() override;

    /// Sets radio button and elements. Emits layoutChanged().
    void setChecked(bool checked) override;

    // The number, then the unit; both have the object name "edit".
    QSpinBox* valueItem() const;
    QComboBox* unitItem() const;
    /// Null without a group.
    QRadioButton* radioButton() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void itemClicked();
    void radioToggled(bool checked);

private:
    ControlHolder<QSpinBox> m_number;
    ControlHolder<QComboBox> m_unit;
    ControlHolder<QRadioButton> m_radioButton;
};

} // namespace PopoverWidget
} // namespace vx
