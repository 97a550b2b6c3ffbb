// SPDX-License-Identifier: MIT
// Page "Fades and pulses": FadableThing with its fader, and buttons that pulse.
#pragma once

#include "../Page.h"

#include <QtCore/QVector>

class OpacityAnimation;
class QPushButton;
class QVBoxLayout;

namespace vx
{
class FadingWidget;
}

namespace gallery
{
class FadesPage : public Page
{
    Q_OBJECT

public:
    explicit FadesPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QWidget* makeFades();
    QWidget* makePulses();
    QWidget* makeExtras();

    OpacityAnimation* m_fader = nullptr;
    QPushButton* m_fadeIn = nullptr;
    QPushButton* m_start = nullptr;
    QVector<vx::FadingWidget*> m_pulses;
};
}
