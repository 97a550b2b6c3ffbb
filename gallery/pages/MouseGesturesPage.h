// SPDX-License-Identifier: MIT
// Page "Mouse gestures": MouseAdapter on a pad and on a scroll area.
#pragma once

#include "../Page.h"
#include "input/MouseAdapter.h"

class QScrollArea;

namespace gallery
{
class GesturePad;

class MouseGesturesPage : public Page
{
    Q_OBJECT

public:
    explicit MouseGesturesPage(SignalLog& log, QWidget* parent = nullptr);
    ~MouseGesturesPage() override;

    void rehearse(Hand& hand) override;

private:
    void connectPad();
    QWidget* makeSettings();
    QWidget* makeMap();

    GesturePad* m_pad;
    vx::MouseAdapter* m_mouse;
    vx::MouseAdapter* m_mapMouse = nullptr;
    QScrollArea* m_map = nullptr;
};
}
