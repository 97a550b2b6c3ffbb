// SPDX-License-Identifier: MIT
// A row with a sliding switch.
#include "popover/items/iOSCheckItem.h"

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

iOSCheckItem::iOSCheckItem(const QString& text, const QString& objectName, int id, bool checked,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_box(new iOSCheckBox(parent, checked, QStringLiteral(":/iOSCheckBox/iOSCheckBox.png")))
{
    Item::setChecked(checked);
    if (flags.testFlag(eifDisabled)) {
        m_box->setAnimationMode(false);
        m_box->setEnabled(false);
        m_box->setAnimationMode(true);
    }
    if (flags.testFlag(eifControl)) {
        (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_box.get());
        m_lastElement = m_box.get();
    } else {
        m_box->hide();
    }
    // Direct, both: the flags of the click hold no longer than the click.
    vx::connect(m_box.get(), "2toggled(bool)", this, "1receiveToggled(bool)", Qt::DirectConnection);
    vx::connect(m_box.get(), "2toggled(bool)", this, "1emitItemPerformed()", Qt::DirectConnection);
}

iOSCheckItem::~iOSCheckItem() = default;

void iOSCheckItem::setValue(const QVariant& value)
{
    if (value.type() != QVariant::Bool || !m_box) {
        return;
    }
    const QPointer<iOSCheckItem> self(this);
    m_box->setAnimationMode(false);
    setChecked(value.toBool());
    if (self && m_box) {
        m_box->setAnimationMode(true);
    }
}

QVariant iOSCheckItem::value()
{
    return m_box ? QVariant(m_box->isChecked()) : QVariant();
}

bool iOSCheckItem::isChecked() const
{
    return m_box ? m_box->isChecked() : Item::isChecked();
}

void iOSCheckItem::setChecked(bool checked)
{
    if (m_box) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setChecked(checked);
    }
    Item::setChecked(checked);
}

QFlags<EItemPerformedFlag> iOSCheckItem::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_box && m_box->rect().contains(pos)) {
        return ControlRules::onControl(button);
    }
    return Item::getItemPerformedFlag(pos, button);
}

iOSCheckBox* iOSCheckItem::checkBox() const
{
    return m_box.get();
}

void iOSCheckItem::mouseReleaseEvent(QMouseEvent* event)
{
    const QPointer<iOSCheckItem> self(this);
    const bool onSwitch = m_box && m_box->isVisible() && m_box->rect().contains(event->pos());
    if (m_box && !onSwitch && ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        m_performedFlags = getItemPerformedFlag(event->pos(), event->button());
        const auto reporting = m_box.report();
        m_box->setAnimationMode(true);
        m_box->toggle();
        if (self && m_box) {
            m_box->setAnimationMode(false);
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

void iOSCheckItem::receiveToggled(bool checked)
{
    const auto reporting = m_box.report();
    if (isProtected()) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setChecked(!checked);
        return;
    }
    const QPointer<iOSCheckItem> self(this);
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
}

void iOSCheckItem::emitItemPerformed()
{
    if (!m_protected) {
        const auto reporting = m_box.report();
        Q_EMIT itemPerformed(m_id, value(), userData(), m_performedFlags);
    }
}

} // namespace PopoverWidget
} // namespace vx
