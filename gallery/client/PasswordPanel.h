// SPDX-License-Identifier: MIT
// Asks for a new password of the present user.
#pragma once

#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

class QFrame;
class QLabel;
class QPushButton;
class QVBoxLayout;

namespace vx
{
class PasswordCheckWidget;
}

namespace client
{
class Session;

/// The library's password form with the list of its rules.
class PasswordPanel : public QWidget
{
    Q_OBJECT

public:
    explicit PasswordPanel(Session& session, QWidget* parent = nullptr);

    /// Begins anew, for the present user.
    void clear();

Q_SIGNALS:
    /// The new password holds.
    void saved();
    void cancelled();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();
    // The form keeps the style sheet that the program had when it was made.
    void makeForm();
    void showRules();
    void save();

    Session& m_session;
    QFrame* m_card;
    QLabel* m_title;
    QLabel* m_hint;
    QVBoxLayout* m_formPlace;
    QPointer<vx::PasswordCheckWidget> m_form;
    QVector<QLabel*> m_rules;
    QPushButton* m_save;
    QPushButton* m_cancel;
};
}
