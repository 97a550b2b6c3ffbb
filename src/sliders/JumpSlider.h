// SPDX-License-Identifier: MIT
// A slider whose handle jumps to where its groove is pressed.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QSlider>

namespace vx
{
/// A QSlider whose handle moves to the pointer at once when the groove is pressed with the left button, where
/// QSlider would move it by a page. The same press goes on as a drag of the handle.
///
/// A jump emits sliderPressed() first, while isSliderDown() is still false and value() is the old one, then what
/// setValue() emits; the drag that follows emits sliderPressed() again. Presses on the handle and of other buttons
/// are QSlider's.
///
/// The low end is on the left or at the bottom in every layout direction. With invertedAppearance() the jump leads
/// to maximum() minus the value, which is the expected one only if minimum() is 0: on other ranges it is off by
/// minimum(), and clients rely on that.
class ZELKOV_WIDGETS_EXPORT JumpSlider : public QSlider
{
    Q_OBJECT

public:
    /// A vertical slider, as QSlider makes it.
    explicit JumpSlider(QWidget* parent = nullptr);
    /// With that orientation.
    explicit JumpSlider(Qt::Orientation orientation, QWidget* parent = nullptr);
    ~JumpSlider() override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
};
}
