// SPDX-License-Identifier: MIT
// Page "Frames": one small picture, cut in nine parts, fills rectangles of any size.
#pragma once

#include "../Page.h"

namespace gallery
{
class FramesPage : public Page
{
    Q_OBJECT

public:
    explicit FramesPage(SignalLog& log, QWidget* parent = nullptr);
};
}
