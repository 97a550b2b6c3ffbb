// SPDX-License-Identifier: MIT
// Page "Scroll bars": the bars of an area beside the overlay ones, and sliders whose groove is clicked.
#pragma once

#include "../Page.h"

class NicerScrollBar;
class QScrollArea;
class QVBoxLayout;

namespace gallery
{
class ScrollBarsPage : public Page
{
    Q_OBJECT

public:
    explicit ScrollBarsPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QScrollArea* makeArea();
    QWidget* makeColumn(const QString& heading, const QString& hint, QScrollArea* area);
    QWidget* makeSettings();
    QWidget* makeSliders();

    NicerScrollBar* m_across = nullptr;
    NicerScrollBar* m_down = nullptr;
};
}
