// SPDX-License-Identifier: MIT
// A slider that is vertical from the start.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QSlider>

namespace vx
{
/// A vertical QSlider that can be made from a parent alone, as form builders and templates want it.
///
/// It adds nothing to QSlider and has no meta-object of its own: style sheets address it as QSlider.
class ZELKOV_WIDGETS_EXPORT VSlider : public QSlider
{
public:
    explicit VSlider(QWidget* parent = nullptr);
    ~VSlider() override;
};
}
