// SPDX-License-Identifier: MIT
// Qt's buttons with a pulse, an overlay picture and a badge.
#include "foundation/TFadingWidget.h"

#include "CoreQt/Connect.h"

#include <QContextMenuEvent>
#include <QGraphicsDropShadowEffect>

namespace vx
{
namespace
{
constexpr qreal c_ShadowBlurRadius = 10.0;
constexpr qreal c_ShadowOffset = 2.5;
}

template <typename T>
TFadingWidget<T>::TFadingWidget(
    QWidget* parent, int interval, int step, QColor color, int minAlpha, int maxAlpha, bool shadow)
    : T(parent)
    , FadingWidget(this, interval, step, color, minAlpha, maxAlpha)
{
    vx::connect(this, "2pressed()", &m_timer, "1stop()", Qt::AutoConnection);
    enableShadow(shadow);
}

template <typename T>
TFadingWidget<T>::~TFadingWidget() = default;

template <typename T>
void TFadingWidget<T>::enableShadow(bool on)
{
    if (!on) {
        this->setGraphicsEffect(nullptr);
        return;
    }
    auto* shadow = new QGraphicsDropShadowEffect(this);
    shadow->setBlurRadius(c_ShadowBlurRadius);
    shadow->setOffset(c_ShadowOffset, c_ShadowOffset);
    this->setGraphicsEffect(shadow);
}

template <typename T>
void TFadingWidget<T>::stopFading()
{
    FadingWidget::stopFading();
}

template <typename T>
void TFadingWidget<T>::paintEvent(QPaintEvent* event)
{
    if (!paintSelf(event)) {
        T::paintEvent(event);
    }
    FadingWidget::paintEvent(event);
}

template <typename T>
void TFadingWidget<T>::contextMenuEvent(QContextMenuEvent* event)
{
    if (auto* button = qobject_cast<QToolButton*>(this)) {
        button->showMenu();
    } else {
        QWidget::contextMenuEvent(event);
    }
}

template class TFadingWidget<QToolButton>;
template class TFadingWidget<QPushButton>;
template class TFadingWidget<QCheckBox>;
}
