// SPDX-License-Identifier: MIT
// A row with a number.
#include "popover/items/SpinItem.h"

#include "indicators/ElidedButton.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

SpinItem::SpinItem(const QString& text, const QString& objectName, int id, QSpinBox* spinBox, int value,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_spinBox(spinBox ? spinBox : new QSpinBox)
{
    m_spinBox->setValue(value);
    if (flags.testFlag(eifDisabled)) {
        m_spinBox->setEnabled(false);
    }
    (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_spinBox.get());
    m_lastElement = m_spinBox.get();
}

SpinItem::~SpinItem() = default;

void SpinItem::setValue(const QVariant& value)
{
    if (m_spinBox) {
        m_spinBox->setValue(value.toInt());
    }
}

QVariant SpinItem::value()
{
    return m_spinBox ? QVariant(m_spinBox->value()) : QVariant();
}

QSpinBox* SpinItem::spinBox() const
{
    return m_spinBox.get();
}

void SpinItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    const QPointer<SpinItem> self(this);
    if (rect().contains(event->pos()) && event->button() == Qt::LeftButton) {
        const QFlags<EItemPerformedFlag> flags = getItemPerformedFlag(event->pos(), event->button());
        if (m_iconElement) {
            m_iconElement->toggle();
        }
        if (self && m_textElement) {
            m_textElement->toggle();
        }
        if (self) {
            updateSelectionDrawing();
            Q_EMIT itemPerformed(m_id, isChecked(), userData(), flags);
        }
    }
    if (self) {
        Item::mouseReleaseEvent(event);
    }
}

} // namespace PopoverWidget
} // namespace vx
