// SPDX-License-Identifier: MIT
// Base of widgets that fade in and out as a whole.
#include "foundation/FadableThing.h"

#include "foundation/WidgetPrimitive.h"

#include <QAbstractButton>
#include <QEasingCurve>
#include <QPainter>
#include <QPushButton>
#include <QStyle>
#include <QStyleOption>

template <typename T>
FadableThing<T>::FadableThing(QWidget* parent)
    : T(parent)
    , m_fader(new OpacityAnimation(this))
{
    m_fader->setEasingCurve(QEasingCurve::Linear);
}

template <typename T>
FadableThing<T>::~FadableThing() = default;

template <typename T>
OpacityAnimation* FadableThing<T>::fader() const
{
    return m_fader;
}

template <typename T>
void FadableThing<T>::paintEvent(QPaintEvent* event)
{
    if (m_fader->fadeChildren()) {
        T::paintEvent(event);
        return;
    }
    QPainter painter(this);
    draw(event, painter);
}

template <typename T>
void FadableThing<T>::draw(QPaintEvent* /*event*/, QPainter& painter)
{
    painter.setOpacity(m_fader->getOpacity());
    if (!vx::WidgetPrimitive::isPaintedBy(*this->style())) {
        return;
    }
    QStyleOption option;
    option.initFrom(this);
    // The pointers are compared, so that subclasses of the push button do not qualify.
    const void* const ownName = this->metaObject()->className();
    if (ownName == static_cast<const void*>(QPushButton::staticMetaObject.className())) {
        if (const auto* button = qobject_cast<const QAbstractButton*>(this)) {
            option.state.setFlag(QStyle::State_On, button->isCheckable() && button->isChecked());
            option.state.setFlag(QStyle::State_Sunken, button->isDown());
        }
    }
    this->style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}

template class FadableThing<QWidget>;
