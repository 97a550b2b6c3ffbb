// SPDX-License-Identifier: MIT
// A row to choose from a list.
#include "popover/items/ComboBoxItem.h"

#include "CoreQt/Connect.h"

#include <QtCore/QSignalBlocker>
#include <QtGui/QMouseEvent>
#include <QtGui/QStandardItemModel>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

ComboBoxItem::ComboBoxItem(const QString& text, const QString& objectName, int id, const QStringList& entries,
    QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_box(new QComboBox(parent))
{
    m_box->setObjectName(QStringLiteral("combo"));
    m_box->addItems(entries);
    if (flags.testFlag(eifDisabled)) {
        m_box->setEnabled(false);
    }
    if (flags.testFlag(eifControl)) {
        (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_box.get());
        m_lastElement = m_box.get();
    } else {
        m_box->hide();
    }
    vx::connect(m_box.get(), "2currentIndexChanged(int)", this, "1currentIndexChanged(int)", Qt::AutoConnection);
    vx::connect(m_box.get(), "2currentTextChanged(const QString&)", this, "1currentTextChanged(const QString&)",
        Qt::AutoConnection);
}

ComboBoxItem::~ComboBoxItem() = default;

void ComboBoxItem::setValue(const QVariant& value)
{
    if (!m_box || value.isNull()) {
        return;
    }
    if (value.type() == QVariant::Int) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setCurrentIndex(value.toInt());
    } else if (value.type() == QVariant::String) {
        setCurrentText(value.toString());
    } else {
        return;
    }
    Q_EMIT layoutChanged();
}

QVariant ComboBoxItem::value()
{
    return m_box ? QVariant(m_box->currentIndex()) : QVariant();
}

void ComboBoxItem::setCurrentText(const QString& text)
{
    if (m_box) {
        const QSignalBlocker blocker(m_box.get());
        m_box->setCurrentText(text);
    }
}

QString ComboBoxItem::currentText()
{
    return m_box ? m_box->currentText() : QString();
}

QVariant ComboBoxItem::userData()
{
    return m_box ? m_box->currentData(Qt::UserRole) : QVariant();
}

void ComboBoxItem::setValueByUserData(const QVariant& userData)
{
    const int index = getValueForUserData(userData).toInt();
    if (index >= 0) {
        setValue(index);
    }
}

QVariant ComboBoxItem::getUserDataForValue(const QVariant& value)
{
    if (!m_box) {
        return {};
    }
    const int index = value.type() == QVariant::String ? m_box->findText(value.toString())
        : value.type() == QVariant::Int                ? value.toInt()
                                                       : -1;
    return m_box->itemData(index, Qt::UserRole);
}

QVariant ComboBoxItem::getValueForUserData(const QVariant& userData)
{
    return m_box ? m_box->findData(userData, Qt::UserRole) : -1;
}

void ComboBoxItem::enableItem(int index, bool enabled)
{
    const auto* const model = m_box ? qobject_cast<QStandardItemModel*>(m_box->model()) : nullptr;
    QStandardItem* const item = model ? model->item(index) : nullptr;
    if (item) {
        item->setFlags(enabled ? item->flags() | Qt::ItemIsEnabled : item->flags() & ~Qt::ItemIsEnabled);
    }
}

void ComboBoxItem::enableItemByUserData(const QVariant& userData, bool enabled)
{
    const int index = getValueForUserData(userData).toInt();
    if (index >= 0) {
        enableItem(index, enabled);
    }
}

QComboBox* ComboBoxItem::comboBox() const
{
    return m_box.get();
}

void ComboBoxItem::mouseReleaseEvent(QMouseEvent* event)
{
    if (isProtected()) {
        event->accept();
    } else {
        Item::mouseReleaseEvent(event);
    }
}

void ComboBoxItem::currentIndexChanged(int index)
{
    if (m_box && !m_box->isEditable()) {
        const auto reporting = m_box.report();
        Q_EMIT itemPerformed(m_id, index, userData(), eipControl);
    }
}

void ComboBoxItem::currentTextChanged(const QString& text)
{
    if (m_box && m_box->isEditable()) {
        const auto reporting = m_box.report();
        Q_EMIT itemPerformed(m_id, text, userData(), eipControl);
    }
}

} // namespace PopoverWidget
} // namespace vx
