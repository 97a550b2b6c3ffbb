// SPDX-License-Identifier: MIT
// A slider that is horizontal from the start.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QSlider>

namespace vx
{
/// A horizontal QSlider that can be made from a parent alone, as form builders and templates want it.
///
/// It adds nothing to QSlider and has no meta-object of its own: style sheets address it as QSlider.
class ZELKOV_WIDGETS_EXPORT HSlider : public QSlider
{
public:
    explicit HSlider(QWidget* parent = nullptr);
    ~HSlider() override;
};
}
