// SPDX-License-Identifier: MIT
// A slider that is horizontal from the start.
#include "sliders/HSlider.h"

namespace vx
{
HSlider::HSlider(QWidget* parent)
    : QSlider(Qt::Horizontal, parent)
{
}

HSlider::~HSlider() = default;
}
