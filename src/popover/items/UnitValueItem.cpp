// SPDX-License-Identifier: MIT
// A row with a number and its unit.
#include "popover/items/UnitValueItem.h"

#include "CoreQt/Connect.h"
#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

UnitValueItem::UnitValueItem(const QString& text, const QStringList& units, const QString& objectName,
    QButtonGroup* group, int id, QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_number(new QSpinBox)
    , m_unit(new QComboBox)
    , m_radioButton(group ? new QRadioButton : nullptr)
{
    m_number->setObjectName(QStringLiteral("edit"));
    m_unit->setObjectName(QStringLiteral("edit"));
    m_unit->addItems(units);
    if (flags.testFlag(eifDisabled)) {
        m_number->setEnabled(false);
        m_unit->setEnabled(false);
    }
    QHBoxLayout* const right = m_rightLayout ? m_rightLayout : m_mainLayout;
    right->addWidget(m_number.get());
    right->addWidget(m_unit.get());
    m_lastElement = m_number.get();
    if (m_radioButton) {
        m_radioButton->setAttribute(Qt::WA_TransparentForMouseEvents);
        group->addButton(m_radioButton.get());
        (m_leftLayout ? m_leftLayout : m_mainLayout)->insertWidget(0, m_radioButton.get());
        vx::connect(m_radioButton.get(), "2toggled(bool)", this, "1radioToggled(bool)", Qt::AutoConnection);
    }
    vx::connect(m_number.get(), "2valueChanged(int)", this, "1itemClicked()", Qt::AutoConnection);
    vx::connect(m_unit.get(), "2currentIndexChanged(int)", this, "1itemClicked()", Qt::AutoConnection);
}

UnitValueItem::~UnitValueItem() = default;

void UnitValueItem::setChecked(bool checked)
{
    const QPointer<UnitValueItem> self(this);
    const auto reporting = m_radioButton.report();
    if (m_radioButton) {
        m_radioButton->setChecked(checked);
    }
    if (self) {
        Item::setChecked(checked);
    }
}

QSpinBox* UnitValueItem::valueItem() const
{
    return m_number.get();
}

QComboBox* UnitValueItem::unitItem() const
{
    return m_unit.get();
}

QRadioButton* UnitValueItem::radioButton() const
{
    return m_radioButton.get();
}

void UnitValueItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<UnitValueItem> self(this);
    if (ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
        setChecked(true);
        if (self) {
            Q_EMIT itemPerformed(m_id, value(), userData(), flags);
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

void UnitValueItem::itemClicked()
{
    const auto reportingNumber = m_number.report();
    const auto reportingUnit = m_unit.report();
    setChecked(true);
}

// Another row of the group was chosen.
void UnitValueItem::radioToggled(bool checked)
{
    if (!checked) {
        const auto reporting = m_radioButton.report();
        Item::setChecked(false);
    }
}

} // namespace PopoverWidget
} // namespace vx
