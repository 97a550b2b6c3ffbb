// SPDX-License-Identifier: MIT
#include "controls/DateTimeEdit.h"

#include <QtCore/QEvent>
#include <QtCore/QPointer>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QLineEdit>

namespace vx
{
DateTimeEdit::DateTimeEdit(QWidget* parent)
    : QDateTimeEdit(parent)
{
    setAttribute(Qt::WA_MacShowFocusRect, false);
    m_lineEdit = QDateTimeEdit::lineEdit();
}

DateTimeEdit::~DateTimeEdit() = default;

void DateTimeEdit::changeFont(QFont font)
{
    lineEdit()->setFont(font);
}

QFont DateTimeEdit::getFont()
{
    return lineEdit()->font();
}

QLineEdit* DateTimeEdit::lineEdit() const
{
    return QDateTimeEdit::lineEdit();
}

void DateTimeEdit::setLineEdit(QLineEdit* edit)
{
    if (!edit) {
        return;
    }
    QDateTimeEdit::setLineEdit(edit);
    m_lineEdit = edit;
    letMouseThrough();
}

void DateTimeEdit::letMouseThrough()
{
    if (m_lineEdit) {
        m_lineEdit->setAttribute(Qt::WA_TransparentForMouseEvents, isReadOnly());
    }
}

bool DateTimeEdit::event(QEvent* event)
{
    if (isReadOnly() && m_lineEdit && m_lineEdit->hasSelectedText()) { // deselecting comes back here with a query
        m_lineEdit->deselect();
    }
    if (event->type() == QEvent::ReadOnlyChange) {
        letMouseThrough();
    }
    if (event->type() == QEvent::MouseButtonPress) {
        const QPointer<DateTimeEdit> alive(this);
        Q_EMIT anchorTimeClicked(dateTime());
        if (!alive) {
            return true;
        }
    }
    return QDateTimeEdit::event(event);
}

void DateTimeEdit::keyPressEvent(QKeyEvent* event)
{
    if (m_returnLeavesField && (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)) {
        event->accept();
        if (QWidget* const owner = parentWidget()) {
            owner->setFocus();
        }
        return;
    }
    QDateTimeEdit::keyPressEvent(event);
}
}
