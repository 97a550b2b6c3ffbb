// SPDX-License-Identifier: MIT
// A row with a radio button.
#include "popover/items/RadioItem.h"

#include "CoreQt/Connect.h"
#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

RadioItem::RadioItem(const QString& text, const QString& objectName, int id, bool checked, QButtonGroup* group,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_button(new QRadioButton(parent))
    , m_group(group)
{
    m_button->setAttribute(Qt::WA_TransparentForMouseEvents);
    if (m_group) {
        m_group->addButton(m_button.get());
    }
    m_button->setChecked(checked);
    Item::setChecked(checked);
    setUserData(text);
    if (flags.testFlag(eifDisabled)) {
        m_button->setEnabled(false);
    }
    if (flags.testFlag(eifControl)) {
        (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_button.get());
        m_lastElement = m_button.get();
    } else {
        m_button->hide();
    }
    vx::connect(m_button.get(), "2toggled(bool)", this, "1stateChanged(bool)", Qt::AutoConnection);
}

RadioItem::~RadioItem() = default;

void RadioItem::setValue(const QVariant& value)
{
    if (value.type() == QVariant::Bool) {
        setChecked(value.toBool());
    }
}

QVariant RadioItem::value()
{
    return m_button ? QVariant(m_button->isChecked()) : QVariant();
}

void RadioItem::setChecked(bool checked)
{
    const QPointer<RadioItem> self(this);
    const auto reporting = m_button.report();
    if (m_button) {
        m_button->setChecked(checked);
    }
    if (self) {
        Item::setChecked(checked);
    }
}

QFlags<EItemPerformedFlag> RadioItem::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_button && m_button->rect().contains(pos)) {
        return ControlRules::onControl(button);
    }
    return Item::getItemPerformedFlag(pos, button);
}

QRadioButton* RadioItem::radioButton() const
{
    return m_button.get();
}

QButtonGroup* RadioItem::buttonGroup() const
{
    return m_group;
}

void RadioItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<RadioItem> self(this);
    const bool chosenAlready
        = m_group && m_group->exclusive() && m_button && m_group->checkedButton() == m_button.get();
    if (!chosenAlready && ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
        setValue(true);
        if (self) {
            Q_EMIT itemPerformed(m_id, value(), userData(), flags);
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

void RadioItem::stateChanged(bool checked)
{
    const auto reporting = m_button.report();
    Item::setChecked(checked);
}

} // namespace PopoverWidget
} // namespace vx
