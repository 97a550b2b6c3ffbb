// SPDX-License-Identifier: MIT
// Page "Overlays": a spinner over a lost picture, and signs for a moment.
#pragma once

#include "../Page.h"

namespace vx
{
class BusyOverlayView;
class Label;
}

namespace gallery
{
class OverlaysPage : public Page
{
    Q_OBJECT

public:
    explicit OverlaysPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QWidget* makeConnection();
    QWidget* makeSigns();
    void centreBusy();

    vx::Label* m_picture;
    vx::BusyOverlayView* m_busy;
    QWidget* m_cut = nullptr;
};
}
