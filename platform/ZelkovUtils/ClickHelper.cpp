// SPDX-License-Identifier: MIT
// Clicks and double clicks of any widget, as signals.
#include "ZelkovUtils/ClickHelper.h"

#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>

namespace vx
{
ClickHelper::ClickHelper(QWidget* parent, int features)
    : QObject(parent)
    , m_features(features)
{
}

ClickHelper::~ClickHelper() = default;

int ClickHelper::features() const
{
    return m_features;
}

QWidget* ClickHelper::receiver() const
{
    return m_receiver;
}

void ClickHelper::setReceiver(QWidget* receiver)
{
    if (m_receiver) {
        m_receiver->removeEventFilter(this);
    }
    m_receiver = receiver;
    m_pressed = false;
    if (m_receiver) {
        m_receiver->installEventFilter(this);
    }
}

bool ClickHelper::isActive() const
{
    return m_active;
}

void ClickHelper::setActive(bool active)
{
    m_active = active;
    m_pressed = false;
}

bool ClickHelper::eventFilter(QObject* watched, QEvent* event)
{
    if (!m_active || watched != m_receiver) {
        return false;
    }
    if (event->type() == QEvent::Hide) {
        m_pressed = false;
        return false;
    }
    const bool press = event->type() == QEvent::MouseButtonPress;
    const bool doubleClick = event->type() == QEvent::MouseButtonDblClick;
    const bool release = event->type() == QEvent::MouseButtonRelease;
    if (!press && !doubleClick && !release) {
        return false;
    }
    const auto* const mouse = static_cast<QMouseEvent*>(event);
    if (mouse->button() != Qt::LeftButton) {
        return false;
    }

    const QPointer<QObject> watchedGuard(watched);
    if (doubleClick && (m_features & efDoubleClick) != 0) {
        m_pressed = false;
        Q_EMIT doubleClicked(mouse->localPos());
    } else if (press || doubleClick) {
        m_pressed = true;
        m_pressPosition = mouse->screenPos();
    } else if (m_pressed) {
        m_pressed = false;
        const QPointF way = mouse->screenPos() - m_pressPosition;
        if ((m_features & efClick) != 0 && way.manhattanLength() < QApplication::startDragDistance()) {
            Q_EMIT clicked(mouse->localPos());
        }
    }
    // A slot may have deleted the receiver: then the event must not reach it any more.
    return watchedGuard.isNull();
}
}
