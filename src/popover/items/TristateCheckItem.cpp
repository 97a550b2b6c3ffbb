// SPDX-License-Identifier: MIT
// A row with a check box of three states.
#include "popover/items/TristateCheckItem.h"

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

TristateCheckItem::TristateCheckItem(const QString& text, const QString& objectName, int id, bool tristate,
    int state, QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_box(new QCheckBox(parent))
    , m_tristate(tristate)
{
    m_box->setObjectName(QStringLiteral("tristate"));
    m_box->setTristate(tristate);
    TristateCheckItem::setCheckState(state);
    if (flags.testFlag(eifDisabled)) {
        m_box->setEnabled(false);
    }
    if (flags.testFlag(eifControl)) {
        (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_box.get());
        m_lastElement = m_box.get();
    } else {
        m_box->hide();
    }
    // Direct, both: the flags of the click hold no longer than the click.
    vx::connect(m_box.get(), "2stateChanged(int)", this, "1receiveStateChanged(int)", Qt::DirectConnection);
    vx::connect(m_box.get(), "2stateChanged(int)", this, "1emitItemPerformed()", Qt::DirectConnection);
}

TristateCheckItem::~TristateCheckItem() = default;

void TristateCheckItem::setValue(const QVariant& value)
{
    if (value.type() == QVariant::Int) {
        setCheckState(value.toInt());
    } else if (value.type() == QVariant::Bool) {
        setCheckState(value.toBool() ? Qt::Checked : Qt::Unchecked);
    }
}

QVariant TristateCheckItem::value()
{
    return m_box ? QVariant(checkState()) : QVariant();
}

bool TristateCheckItem::isChecked() const
{
    return m_box ? m_box->checkState() == Qt::Checked : Item::isChecked();
}

void TristateCheckItem::setChecked(bool checked)
{
    setCheckState(checked ? Qt::Checked : Qt::Unchecked);
}

QFlags<EItemPerformedFlag> TristateCheckItem::getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button)
{
    if (m_box && m_box->rect().contains(pos)) {
        return ControlRules::onControl(button);
    }
    return Item::getItemPerformedFlag(pos, button);
}

void TristateCheckItem::setCheckState(int state)
{
    if (state < Qt::Unchecked || state > Qt::Checked) {
        return;
    }
    if (m_box) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setCheckState(static_cast<Qt::CheckState>(state));
    }
    Item::setChecked(state == Qt::Checked);
}

int TristateCheckItem::checkState() const
{
    return m_box ? m_box->checkState() : Qt::Unchecked;
}

void TristateCheckItem::setTristate(bool tristate)
{
    const QPointer<TristateCheckItem> self(this);
    if (!tristate && checkState() == Qt::PartiallyChecked) {
        setCheckState(Qt::Unchecked);
    }
    if (self) {
        m_tristate = tristate;
        if (m_box) {
            m_box->setTristate(tristate);
        }
    }
}

bool TristateCheckItem::isTristate() const
{
    return m_tristate;
}

QCheckBox* TristateCheckItem::checkBox() const
{
    return m_box.get();
}

void TristateCheckItem::mouseReleaseEvent(QMouseEvent* event)
{
    const QPointer<TristateCheckItem> self(this);
    const bool onBox = m_box && m_box->isVisible() && m_box->rect().contains(event->pos());
    if (m_box && !onBox && ControlRules::isClick(rect(), event->pos(), event->button(), m_flags)) {
        m_performedFlags = getItemPerformedFlag(event->pos(), event->button());
        const auto reporting = m_box.report();
        m_box->setCheckState(static_cast<Qt::CheckState>(ControlRules::nextInRing(m_box->checkState())));
        if (self) {
            m_performedFlags = eipControl;
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

void TristateCheckItem::receiveStateChanged(int state)
{
    const auto reporting = m_box.report();
    if (isProtected()) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setCheckState(static_cast<Qt::CheckState>(ControlRules::previousInRing(state)));
        return;
    }
    const QPointer<TristateCheckItem> self(this);
    if (m_textElement) {
        m_textElement->setChecked(state == Qt::Checked);
    }
    if (self && m_iconElement) {
        m_iconElement->setChecked(state == Qt::Checked);
    }
    if (self) {
        updateSelectionDrawing();
        Q_EMIT stateChanged(state, m_box ? objectName() : QString());
    }
}

void TristateCheckItem::emitItemPerformed()
{
    if (!m_protected) {
        const auto reporting = m_box.report();
        Q_EMIT itemPerformed(m_id, value(), userData(), m_performedFlags);
    }
}

} // namespace PopoverWidget
} // namespace vx
