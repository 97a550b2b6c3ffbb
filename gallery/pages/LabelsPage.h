// SPDX-License-Identifier: MIT
// Page "Labels": pictures that keep their proportions, and texts that are shortened to the room they have.
#pragma once

#include "../Page.h"

class QSlider;
class QSplitter;

namespace gallery
{
class LabelsPage : public Page
{
    Q_OBJECT

public:
    explicit LabelsPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QWidget* makeTexts();
    QWidget* makePictures();

    QSplitter* m_texts = nullptr;
};
}
