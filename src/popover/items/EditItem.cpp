// SPDX-License-Identifier: MIT
// A row that takes a text.
#include "popover/items/EditItem.h"

#include "CoreQt/Connect.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

EditItem::EditItem(const QString& text, const QString& placeholder, const QString& objectName, int id,
    QFlags<EItemFlag> flags, QWidget* parent, QLineEdit* lineEdit)
    : Item(parent, flags, id, objectName, text, QString())
    , m_lineEdit(lineEdit ? lineEdit : new QLineEdit)
{
    m_lineEdit->setObjectName(QStringLiteral("edit"));
    m_lineEdit->setMouseTracking(true);
    m_lineEdit->setAttribute(Qt::WA_MacShowFocusRect, false);
    m_lineEdit->setProperty("placeholderText", placeholder);
    if (flags.testFlag(eifDisabled)) {
        m_lineEdit->setEnabled(false);
    }
    (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_lineEdit.get());
    m_lastElement = m_lineEdit.get();
    vx::connect(m_lineEdit.get(), "2editingFinished()", this, "1onEditingFinished()", Qt::AutoConnection);
}

EditItem::~EditItem() = default;

void EditItem::setValue(const QVariant& value)
{
    if (value.type() != QVariant::String || !m_lineEdit) {
        return;
    }
    const QPointer<EditItem> self(this);
    m_lineEdit->setText(value.toString());
    if (self) {
        Q_EMIT layoutChanged();
    }
}

QVariant EditItem::value()
{
    return m_lineEdit ? QVariant(m_lineEdit->text()) : QVariant();
}

QWidget* EditItem::getFocusItem()
{
    return m_lineEdit.get();
}

QLineEdit* EditItem::lineEdit() const
{
    return m_lineEdit.get();
}

QColor EditItem::placeholderColor() const
{
    return m_placeholderColor;
}

void EditItem::setPlaceholderColor(const QColor& color)
{
    m_placeholderColor = color;
}

QColor EditItem::textColor() const
{
    return m_textColor;
}

void EditItem::setTextColor(const QColor& color)
{
    m_textColor = color;
}

void EditItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (!isProtected()) {
        Item::mouseReleaseEvent(event);
    }
}

void EditItem::onEditingFinished()
{
    const auto reporting = m_lineEdit.report();
    Q_EMIT itemPerformed(m_id, m_lineEdit->text(), userData(), eipControl);
}

} // namespace PopoverWidget
} // namespace vx
