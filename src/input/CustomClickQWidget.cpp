// SPDX-License-Identifier: MIT
// A plain widget with the signals of a button.
#include "input/CustomClickQWidget.h"

#include <QMouseEvent>
#include <QPointer>

namespace vx
{
CustomClickQWidget::CustomClickQWidget(QWidget* parent)
    : QWidget(parent)
{
}

CustomClickQWidget::~CustomClickQWidget() = default;

void CustomClickQWidget::click()
{
    Q_EMIT clicked(false);
}

void CustomClickQWidget::clicked()
{
    Q_EMIT clicked(false);
}

void CustomClickQWidget::checkStateSet()
{
}

void CustomClickQWidget::nextCheckState()
{
}

void CustomClickQWidget::mousePressEvent(QMouseEvent* /*event*/)
{
    const QPointer<CustomClickQWidget> guard = this;
    Q_EMIT pressed();
    if (!guard.isNull()) {
        m_pressed = true;
    }
}

void CustomClickQWidget::mouseReleaseEvent(QMouseEvent* /*event*/)
{
    const QPointer<CustomClickQWidget> guard = this;
    if (m_pressed) {
        Q_EMIT clicked(false);
        if (guard.isNull()) {
            return;
        }
    }
    m_pressed = false;
    Q_EMIT released();
}
}
