// SPDX-License-Identifier: MIT
// Page "Password form": two fields, rules beside them, and a button that waits for all of them.
#pragma once

#include "../Page.h"

#include <QtCore/QMap>

#include "controls/PasswordCheckWidget.h"

class QPushButton;

namespace gallery
{
class PasswordPage : public Page
{
    Q_OBJECT

public:
    explicit PasswordPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QWidget* makeForm();
    QWidget* makeRules();
    void showRules();

    vx::PasswordCheckWidget* m_form;
    QPushButton* m_save = nullptr;
    QMap<vx::PasswordCheckWidget::ESecurityRequirement, QLabel*> m_rules;
};
}
