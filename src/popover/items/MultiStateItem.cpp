// SPDX-License-Identifier: MIT
// A row with a button of several states.
#include "popover/items/MultiStateItem.h"

#include "popover/items/ControlRules.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

MultiStateItem::MultiStateItem(const QString& text, const QString& objectName, const QList<int>& states, int id,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_button(new vx::MultiStateCustomToolButton(states, QStringLiteral("multiStateWidget"), parent))
{
    if (flags.testFlag(eifDisabled)) {
        m_button->setEnabled(false);
    }
    (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_button.get());
    m_button->setVisible(flags.testFlag(eifControl));
    if (flags.testFlag(eifControl)) {
        m_lastElement = m_button.get();
    }
}

MultiStateItem::~MultiStateItem() = default;

void MultiStateItem::setValue(const QVariant& value)
{
    if (value.type() == QVariant::Int && m_button) {
        m_button->setState(value.toInt());
        update();
    }
}

QVariant MultiStateItem::value()
{
    return m_button ? QVariant(m_button->state()) : QVariant();
}

QFlags<EItemPerformedFlag> MultiStateItem::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_button && m_button->rect().contains(pos)) {
        return ControlRules::onControl(button);
    }
    return Item::getItemPerformedFlag(pos, button);
}

vx::MultiStateCustomToolButton* MultiStateItem::multiStateItem() const
{
    return m_button.get();
}

void MultiStateItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    if (ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        Q_EMIT itemPerformed(
            m_id, isChecked(), userData(), getItemPerformedFlag(event->pos(), event->button()));
    } else {
        Item::mouseReleaseEvent(event);
    }
}

} // namespace PopoverWidget
} // namespace vx
