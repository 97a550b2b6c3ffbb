// SPDX-License-Identifier: MIT
// A row with a check box.
#include "popover/items/CheckItem.h"

#include "CoreQt/Connect.h"
#include "indicators/ElidedButton.h"
#include "popover/items/ControlRules.h"

#include <QtCore/QSignalBlocker>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

CheckItem::CheckItem(const QString& text, const QString& objectName, int id, bool checked,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_box(new QCheckBox(parent))
{
    m_box->setChecked(checked);
    Item::setChecked(checked);
    if (flags.testFlag(eifDisabled)) {
        m_box->setEnabled(false);
    }
    if (flags.testFlag(eifControl)) {
        (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_box.get());
        m_lastElement = m_box.get();
    } else {
        m_box->hide();
    }
    vx::connect(m_box.get(), "2toggled(bool)", this, "1receiveToggled(bool)", Qt::AutoConnection);
}

CheckItem::~CheckItem() = default;

void CheckItem::setValue(const QVariant& value)
{
    if (value.type() == QVariant::Bool) {
        setChecked(value.toBool());
    }
}

QVariant CheckItem::value()
{
    return m_box ? QVariant(m_box->isChecked()) : QVariant();
}

bool CheckItem::isChecked() const
{
    return m_box ? m_box->isChecked() : Item::isChecked();
}

void CheckItem::setChecked(bool checked)
{
    if (m_box) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setChecked(checked);
    }
    Item::setChecked(checked);
}

QFlags<EItemPerformedFlag> CheckItem::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_box && m_box->rect().contains(pos)) {
        return ControlRules::onControl(button);
    }
    return Item::getItemPerformedFlag(pos, button);
}

void CheckItem::setSecurityCheckStates(bool onChecking, bool onUnchecking)
{
    m_checkOnChecking = onChecking;
    m_checkOnUnchecking = onUnchecking;
}

QCheckBox* CheckItem::checkBox() const
{
    return m_box.get();
}

void CheckItem::mouseReleaseEvent(QMouseEvent* event)
{
    const QPointer<CheckItem> self(this);
    const bool onBox = m_box && m_box->isVisible() && m_box->rect().contains(event->pos());
    if (m_box && !onBox && ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        m_performedFlags = getItemPerformedFlag(event->pos(), event->button());
        const auto reporting = m_box.report();
        m_box->toggle();
        if (self) {
            m_performedFlags = eipControl;
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

void CheckItem::receiveToggled(bool checked)
{
    const auto reporting = m_box.report();
    m_refusing = (checked ? m_checkOnChecking : m_checkOnUnchecking) && isProtected();
    if (m_refusing) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setChecked(!checked);
        return;
    }
    const QPointer<CheckItem> self(this);
    if (m_textElement) {
        m_textElement->setChecked(checked);
    }
    if (self && m_iconElement) {
        m_iconElement->setChecked(checked);
    }
    if (self) {
        updateSelectionDrawing();
        Q_EMIT toggled(checked, m_box ? objectName() : QString());
    }
    if (self) {
        emitItemPerformed();
    }
}

void CheckItem::emitItemPerformed()
{
    if (!m_protected) {
        Q_EMIT itemPerformed(m_id, value(), userData(), m_performedFlags);
    }
}

} // namespace PopoverWidget
} // namespace vx
