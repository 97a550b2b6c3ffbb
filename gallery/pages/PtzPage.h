// SPDX-License-Identifier: MIT
// Page "Dial and joystick": two dials that spring back steer a camera, and a display follows.
#pragma once

#include "../Page.h"

class JoystickViewWidget;

namespace vx
{
class DialButton;
}

namespace gallery
{
class PtzView;

class PtzPage : public Page
{
    Q_OBJECT

public:
    explicit PtzPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    vx::DialButton* makeDial(const QString& name, int minimum, int maximum, int value);
    QWidget* makePanel();
    void steer();

    PtzView* m_view;
    JoystickViewWidget* m_stick = nullptr;
    vx::DialButton* m_pan = nullptr;
    vx::DialButton* m_tilt = nullptr;
    vx::DialButton* m_zoom = nullptr;
};
}
