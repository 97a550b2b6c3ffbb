// SPDX-License-Identifier: MIT
// A slider whose handle jumps to where its groove is pressed.
#include "sliders/JumpSlider.h"

#include "sliders/SliderGeometry.h"

#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionSlider>

namespace vx
{
JumpSlider::JumpSlider(QWidget* parent)
    : QSlider(parent)
{
}

JumpSlider::JumpSlider(Qt::Orientation orientation, QWidget* parent)
    : QSlider(orientation, parent)
{
}

JumpSlider::~JumpSlider() = default;

void JumpSlider::mousePressEvent(QMouseEvent* event)
{
    QStyleOptionSlider option;
    initStyleOption(&option);
    const QRect handle = style()->subControlRect(QStyle::CC_Slider, &option, QStyle::SC_SliderHandle, this);
    if (event->button() == Qt::LeftButton && !handle.contains(event->pos())) {
        const QPointer<JumpSlider> alive(this);
        Q_EMIT sliderPressed();
        if (!alive) {
            return;
        }
        const bool vertical = orientation() == Qt::Vertical;
        const int pressed = vertical ? height() - event->y() : event->x();
        setValue(SliderGeometry::jumpValue(minimum(), maximum(), invertedAppearance(), pressed,
            vertical ? height() : width(), vertical ? handle.height() : handle.width()));
        if (!alive) {
            return;
        }
        event->accept();
    }
    // After a jump the handle lies under the pointer, so this starts a drag.
    QSlider::mousePressEvent(event);
}
}
