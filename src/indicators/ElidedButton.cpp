// SPDX-License-Identifier: MIT
// A push button that shortens its text to the room it has.
#include "indicators/ElidedButton.h"

#include <QFontMetrics>
#include <QPainter>
#include <QStyle>
#include <QStyleOptionButton>

ElidedButton::ElidedButton(QWidget* parent)
    : QPushButton(parent)
{
}

ElidedButton::ElidedButton(const QString& text, QWidget* parent)
    : QPushButton(text, parent)
{
}

ElidedButton::~ElidedButton() = default;

Qt::TextElideMode ElidedButton::getElideMode() const
{
    return m_elideMode;
}

void ElidedButton::setElideMode(Qt::TextElideMode mode)
{
    if (m_elideMode == mode) {
        return;
    }
    m_elideMode = mode;
    QStyleOptionButton option;
    initStyleOption(&option);
    // Unlike in a paint, mnemonics are not looked for.
    m_elidedText = fontMetrics().elidedText(text(), m_elideMode, textRect(option).width());
    repaint();
}

QRect ElidedButton::textRect(const QStyleOptionButton& option) const
{
    const QStyle* const look = style();
    if (look == nullptr) {
        return QRect();
    }
    return look->subElementRect(QStyle::SE_PushButtonContents, &option, this)
        .adjusted(0, 0, -look->pixelMetric(QStyle::PM_MenuButtonIndicator, &option, this), 0);
}

void ElidedButton::paintEvent(QPaintEvent* /*event*/)
{
    QStyleOptionButton option;
    initStyleOption(&option);
    const QRect room = textRect(option);
    const QString whole = text();
    if (room != m_lastRect || whole != m_originalText || font() != m_lastFont) {
        m_lastRect = room;
        m_originalText = whole;
        m_lastFont = font();
        m_elidedText = fontMetrics().elidedText(whole, m_elideMode, room.width(), Qt::TextShowMnemonic);
    }
    option.text = m_elidedText;
    QPainter painter(this);
    style()->drawControl(QStyle::CE_PushButton, &option, &painter, this);
}
