// SPDX-License-Identifier: MIT
// Page "Click variants": buttons that tell kinds of clicks apart, with a switch for the rights of the user.
#pragma once

#include "../Page.h"
#include "input/TCustomClickWidget.h"

class QCheckBox;
class QLabel;

namespace gallery
{
class ClickVariantsPage : public Page
{
    Q_OBJECT

public:
    explicit ClickVariantsPage(SignalLog& log, QWidget* parent = nullptr);
    ~ClickVariantsPage() override;

    void rehearse(Hand& hand) override;

private:
    using Button = vx::TCustomClickWidget<QToolButton>;

    QWidget* makeKinds();
    QWidget* makeRights();
    QWidget* makePlain();
    QWidget* cell(Button* button, const QString& text, const QString& hint);
    void show(Button* button);

    QLabel* m_kind = nullptr;
    QLabel* m_hint = nullptr;
    Button* m_hold = nullptr;
    Button* m_guarded = nullptr;
    QCheckBox* m_allowed = nullptr;
};
}
