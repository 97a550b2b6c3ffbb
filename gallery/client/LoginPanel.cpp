// SPDX-License-Identifier: MIT
// Asks who is there.
#include "LoginPanel.h"

#include "Session.h"

#include <QtCore/QEvent>
#include <QtCore/QPropertyAnimation>
#include <QtWidgets/QFrame>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
constexpr int c_cardWidth = 380;
constexpr int c_shakeMs = 360;

QLabel* labelOf(const char* role)
{
    auto* label = new QLabel;
    label->setProperty("role", QLatin1String(role));
    label->setWordWrap(true);
    return label;
}
}

LoginPanel::LoginPanel(Session& session, QWidget* parent)
    : QWidget(parent)
    , m_session(session)
    , m_card(new QFrame)
    , m_title(labelOf("title"))
    , m_hint(labelOf("hint"))
    , m_userLabel(new QLabel)
    , m_passwordLabel(new QLabel)
    , m_user(new QLineEdit)
    , m_password(new QLineEdit)
    , m_message(labelOf("error"))
    , m_logIn(new QPushButton)
    , m_newPassword(new QPushButton)
    , m_note(labelOf("hint"))
{
    setObjectName(QStringLiteral("loginPanel"));
    m_card->setObjectName(QStringLiteral("loginCard"));
    m_card->setProperty("role", QStringLiteral("panel"));
    m_card->setFrameShape(QFrame::StyledPanel);
    m_card->setFixedWidth(c_cardWidth);
    m_user->setObjectName(QStringLiteral("userEdit"));
    m_password->setObjectName(QStringLiteral("passwordEdit"));
    m_password->setEchoMode(QLineEdit::Password);
    m_userLabel->setBuddy(m_user);
    m_passwordLabel->setBuddy(m_password);
    m_message->setObjectName(QStringLiteral("loginMessage"));
    m_logIn->setObjectName(QStringLiteral("logInButton"));
    m_logIn->setProperty("role", QStringLiteral("primary"));
    m_newPassword->setObjectName(QStringLiteral("newPasswordButton"));
    m_newPassword->setProperty("role", QStringLiteral("link"));
    m_newPassword->setFlat(true);

    auto* buttons = new QHBoxLayout;
    buttons->addWidget(m_newPassword);
    buttons->addStretch(1);
    buttons->addWidget(m_logIn);
    auto* card = new QVBoxLayout(m_card);
    card->setContentsMargins(28, 24, 28, 24);
    card->setSpacing(6);
    card->addWidget(m_title);
    card->addWidget(m_hint);
    card->addSpacing(12);
    card->addWidget(m_userLabel);
    card->addWidget(m_user);
    card->addSpacing(4);
    card->addWidget(m_passwordLabel);
    card->addWidget(m_password);
    card->addWidget(m_message);
    card->addSpacing(8);
    card->addLayout(buttons);
    card->addSpacing(12);
    card->addWidget(m_note);

    auto* row = new QHBoxLayout;
    row->addStretch(1);
    row->addWidget(m_card);
    row->addStretch(1);
    auto* layout = new QVBoxLayout(this);
    layout->addStretch(2);
    layout->addLayout(row);
    layout->addStretch(3);

    const auto enter = [this] {
        if (tryLogIn()) {
            Q_EMIT loggedIn();
        }
    };
    connect(m_logIn, &QPushButton::clicked, this, enter);
    connect(m_password, &QLineEdit::returnPressed, this, enter);
    connect(m_user, &QLineEdit::returnPressed, this, [this, enter] {
        if (m_password->text().isEmpty()) {
            m_password->setFocus();
        } else {
            enter();
        }
    });
    connect(m_newPassword, &QPushButton::clicked, this, [this] {
        if (tryLogIn()) {
            Q_EMIT newPasswordWanted();
        }
    });
    for (const QLineEdit* field : {m_user, m_password}) {
        connect(field, &QLineEdit::textEdited, m_message, &QLabel::clear);
    }
    setFocusProxy(m_user);
    retranslate();
}

void LoginPanel::clear()
{
    m_user->clear();
    m_password->clear();
    m_message->clear();
    m_user->setFocus();
}

void LoginPanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void LoginPanel::retranslate()
{
    m_title->setText(tr("Camera client"));
    m_hint->setText(tr("Log in to see the cameras."));
    m_userLabel->setText(tr("Name"));
    m_passwordLabel->setText(tr("Password"));
    m_logIn->setText(tr("Log in"));
    m_newPassword->setText(tr("New password..."));
    m_note->setText(tr("For a look around: user with camera1!, or admin with camera2!"));
    if (!m_message->text().isEmpty()) {
        m_message->setText(tr("Name and password do not match."));
    }
}

bool LoginPanel::tryLogIn()
{
    if (m_session.logIn(m_user->text().trimmed(), m_password->text())) {
        m_message->clear();
        return true;
    }
    refuse();
    return false;
}

void LoginPanel::refuse()
{
    m_message->setText(tr("Name and password do not match."));
    QLineEdit* const wrong = m_user->text().trimmed().isEmpty() ? m_user : m_password;
    wrong->setFocus();
    wrong->selectAll();
    shake();
}

void LoginPanel::shake()
{
    if (m_shake) {
        return;
    }
    // The message may have made the card higher.
    layout()->activate();
    const QPoint place = m_card->pos();
    m_shake = new QPropertyAnimation(m_card, QByteArrayLiteral("pos"), m_card);
    m_shake->setDuration(c_shakeMs);
    const int steps[] = {0, -9, 9, -6, 6, -3, 0};
    for (int i = 0; i < 7; ++i) {
        m_shake->setKeyValueAt(i / 6.0, place + QPoint(steps[i], 0));
    }
    m_shake->start(QAbstractAnimation::DeleteWhenStopped);
}
}
