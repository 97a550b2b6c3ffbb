// SPDX-License-Identifier: MIT
// Page "Badges and spinners": BadgeWidget in all its looks.
#pragma once

#include "../Page.h"

namespace vx
{
class BadgeWidget;
}

class QVBoxLayout;

namespace gallery
{
class BadgesPage : public Page
{
    Q_OBJECT

public:
    explicit BadgesPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QWidget* makeLooks();
    QWidget* makePills();
    QWidget* makeAlignments();
    QWidget* makeRows();
    QWidget* makeTry();

    vx::BadgeWidget* m_badge = nullptr;
    QWidget* m_busyButton = nullptr;
};
}
