// SPDX-License-Identifier: MIT
// Page "Counting lines": a form beside the picture in which its line is drawn.
#pragma once

#include "../Page.h"

namespace gallery
{
class LinePicture;

class CountingLinesPage : public Page
{
    Q_OBJECT

public:
    explicit CountingLinesPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    LinePicture* m_picture;
};
}
