// SPDX-License-Identifier: MIT
// A slider that is vertical from the start.
#include "sliders/VSlider.h"

namespace vx
{
VSlider::VSlider(QWidget* parent)
    : QSlider(Qt::Vertical, parent)
{
}

VSlider::~VSlider() = default;
}
