// SPDX-License-Identifier: MIT
// A text row that can be set back.
#include "popover/items/ClearEditItem.h"

#include "CoreQt/Connect.h"

#include <QtCore/QSignalBlocker>
#include <QtGui/QIcon>
#include <QtWidgets/QAction>

namespace vx
{
namespace PopoverWidget
{

ClearEditItem::ClearEditItem(const QString& text, const QString& placeholder, const QString& objectName,
    const QString& clearedText, int id, QFlags<EItemFlag> flags, QWidget* parent)
    : EditItem(text, placeholder, objectName, id, flags, parent, nullptr)
    , m_clearedText(clearedText)
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

ClearEditItem::~ClearEditItem() = default;

bool ClearEditItem::isCleared() const
{
    return m_cleared;
}

void ClearEditItem::setClearedText(const QString& text)
{
    m_clearedText = text;
}

void ClearEditItem::clear()
{
    if (!m_lineEdit) {
        return;
    }
    const auto reporting = m_lineEdit.report();
    const QSignalBlocker blocker(m_lineEdit.get());
    m_lineEdit->setText(m_clearedText);
    m_lineEdit->clearFocus();
    m_clearAction->setVisible(false);
    m_cleared = true;
}

void ClearEditItem::showClearAction()
{
    const auto reporting = m_lineEdit.report();
    const QSignalBlocker blocker(m_lineEdit.get());
    if (m_lineEdit->text() != m_clearedText) {
        m_clearAction->setVisible(true);
        m_cleared = false;
    }
}

} // namespace PopoverWidget
} // namespace vx
