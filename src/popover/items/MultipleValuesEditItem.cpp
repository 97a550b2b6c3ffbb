// SPDX-License-Identifier: MIT
// A text row that can stand for several texts.
#include "popover/items/MultipleValuesEditItem.h"

#include "CoreQt/Connect.h"

#include <QtCore/QSignalBlocker>
#include <QtGui/QIcon>
#include <QtWidgets/QAction>

namespace vx
{
namespace PopoverWidget
{

MultipleValuesEditItem::MultipleValuesEditItem(const QString& text, const QString& placeholder,
    const QString& objectName, const QString& clearedText, const QString& multipleValuesText, int id,
    QFlags<EItemFlag> flags, QWidget* parent)
    : EditItem(text, placeholder, objectName, id, flags, parent, nullptr)
    , m_placeholder(placeholder)
    , m_clearedText(clearedText)
    , m_multipleValuesText(multipleValuesText)
    , m_clearAction(new QAction(QIcon(QStringLiteral(":/SearchItem/searchClear.png")), QString(), this))
{
    lineEdit()->addAction(m_clearAction, QLineEdit::TrailingPosition);
    m_clearAction->setVisible(false);
    vx::connect(lineEdit(), "2editingFinished()", this, "1showClearAction()", Qt::AutoConnection);
    vx::connect(lineEdit(), "2textChanged(const QString&)", this, "1showClearAction()", Qt::AutoConnection);
    vx::connect(m_clearAction, "2triggered(bool)", this, "1clear()", Qt::AutoConnection);
    if (text == m_clearedText) {
        clear();
    }
}

MultipleValuesEditItem::~MultipleValuesEditItem() = default;

void MultipleValuesEditItem::setMultipleValues(bool multiple)
{
    m_multipleValues = multiple;
    if (multiple) {
        clear();
    } else if (m_lineEdit) {
        m_lineEdit->setPlaceholderText(m_placeholder);
    }
}

bool MultipleValuesEditItem::hasMultipleValues() const
{
    return m_multipleValues;
}

bool MultipleValuesEditItem::isCleared() const
{
    return m_cleared;
}

void MultipleValuesEditItem::setClearedText(const QString& text)
{
    m_clearedText = text;
}

void MultipleValuesEditItem::clear()
{
    if (!m_lineEdit) {
        return;
    }
    const auto reporting = m_lineEdit.report();
    const QSignalBlocker blocker(m_lineEdit.get());
    if (m_multipleValues) {
        m_lineEdit->setText(QString());
        m_lineEdit->setPlaceholderText(m_multipleValuesText);
    } else {
        m_lineEdit->setText(m_clearedText);
    }
    m_lineEdit->clearFocus();
    m_clearAction->setVisible(false);
    m_cleared = true;
}

void MultipleValuesEditItem::showClearAction()
{
    const auto reporting = m_lineEdit.report();
    const QSignalBlocker blocker(m_lineEdit.get());
    if (m_multipleValues) {
        // At once, whatever the text: an empty one is a value for all, too.
        m_lineEdit->setPlaceholderText(m_placeholder);
    } else if (m_lineEdit->text() == m_clearedText) {
        return;
    }
    m_clearAction->setVisible(true);
    m_cleared = false;
}

} // namespace PopoverWidget
} // namespace vx
