// SPDX-License-Identifier: MIT
// Asks who is there.
#pragma once

#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

class QFrame;
class QLabel;
class QLineEdit;
class QPropertyAnimation;
class QPushButton;

namespace client
{
class Session;

/// Name, password and the way to a new password.
class LoginPanel : public QWidget
{
    Q_OBJECT

public:
    explicit LoginPanel(Session& session, QWidget* parent = nullptr);

    /// Empties the fields and waits for a name.
    void clear();

Q_SIGNALS:
    /// After the session has taken the user.
    void loggedIn();
    /// The same, and the user wants another password first.
    void newPasswordWanted();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();
    bool tryLogIn();
    void refuse();
    void shake();

    Session& m_session;
    QFrame* m_card;
    QLabel* m_title;
    QLabel* m_hint;
    QLabel* m_userLabel;
    QLabel* m_passwordLabel;
    QLineEdit* m_user;
    QLineEdit* m_password;
    QLabel* m_message;
    QPushButton* m_logIn;
    QPushButton* m_newPassword;
    QLabel* m_note;
    QPointer<QPropertyAnimation> m_shake;
};
}
