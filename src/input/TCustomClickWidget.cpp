// SPDX-License-Identifier: MIT
// A tool button that tells short, long and context clicks apart and asks for the right to click.
#include "input/TCustomClickWidget.h"

#include "CoreQt/Connect.h"

#include <QContextMenuEvent>
#include <QMouseEvent>

namespace vx
{
namespace
{
constexpr int c_FadingInterval = 100;
constexpr int c_FadingStep = 16;
constexpr int c_FadingMinAlpha = 0;
constexpr int c_FadingMaxAlpha = 128;
}

template <typename T>
TCustomClickWidget<T>::TCustomClickWidget(QWidget* parent, int longClickSpan, bool shadow)
    : TFadingWidget<T>(parent, c_FadingInterval, c_FadingStep, QColor(191, 191, 191, 255), c_FadingMinAlpha,
        c_FadingMaxAlpha, false)
    , CustomClickAdapter(this, longClickSpan)
{
    this->setFocusPolicy(Qt::NoFocus);
    vx::connect(&m_longClickTimer, "2timeout()", this, "1click()", Qt::AutoConnection);
    this->enableShadow(shadow);
}

template <typename T> TCustomClickWidget<T>::~TCustomClickWidget() = default;

template <typename T> void TCustomClickWidget<T>::setListener(QObject* listener)
{
    m_listener = listener;
}

template <typename T> void TCustomClickWidget<T>::mousePressEvent(QMouseEvent* event)
{
    if (isProtected()) {
        return;
    }
    if (m_listener != nullptr) {
        const QPointer<QWidget> guard = this;
        T* button = this;
        // "T *" to the letter: listeners have slots with that type.
        QMetaObject::invokeMethod(m_listener.data(), "mousePress", Qt::DirectConnection,
            QGenericArgument("QMouseEvent *", &event), QGenericArgument("T *", &button));
        if (guard.isNull()) {
            return;
        }
    }
    startClickTimer();
    T::mousePressEvent(event);
}

template <typename T> void TCustomClickWidget<T>::mouseReleaseEvent(QMouseEvent* event)
{
    stopClickTimer();
    if (m_protected) {
        return;
    }
    const QPointer<QWidget> guard = this;
    T::mouseReleaseEvent(event);
    if (!guard.isNull() && m_listener != nullptr) {
        T* button = this;
        QMetaObject::invokeMethod(m_listener.data(), "mouseRelease", Qt::DirectConnection,
            QGenericArgument("QMouseEvent *", &event), QGenericArgument("T*", &button));
    }
}

template <typename T> void TCustomClickWidget<T>::mouseMoveEvent(QMouseEvent* event)
{
    // After the automatic click a move would push the button down again, and its release would click once more.
    if (m_longClickTimer.isActive()) {
        T::mouseMoveEvent(event);
    }
}

template <typename T> void TCustomClickWidget<T>::contextMenuEvent(QContextMenuEvent* /*event*/)
{
    if (isProtected()) {
        return;
    }
    m_clickType = ectContext;
    m_longClickTimer.stop();
    Q_EMIT this->clicked(false);
}

template <typename T> void TCustomClickWidget<T>::enterEvent(QEvent* event)
{
    T::enterEvent(event);
}

template <typename T> void TCustomClickWidget<T>::leaveEvent(QEvent* event)
{
    m_longClickTimer.stop();
    T::leaveEvent(event);
}

template <typename T> void TCustomClickWidget<T>::changeEvent(QEvent* event)
{
    T::changeEvent(event);
}

template <typename T> void TCustomClickWidget<T>::checkStateSet()
{
    T::checkStateSet();
}

template <typename T> void TCustomClickWidget<T>::nextCheckState()
{
    stopClickTimer();
    if (isProtected()) {
        return;
    }
    if (m_clickType == ectLong && this->isCheckable()) {
        Q_EMIT this->toggled(this->isChecked());
        return;
    }
    T::nextCheckState();
}

template class TCustomClickWidget<QToolButton>;
}
