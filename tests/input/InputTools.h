// SPDX-License-Identifier: MIT
// Pointer events with chosen time stamps, and subclasses that open what is protected.
#pragma once

#include "input/MouseAdapter.h"
#include "input/MouseGesture.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QHash>
#include <QtCore/QTimer>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QWidget>

namespace inputtest
{
/// A mouse event at a global position; local and window position are made different on purpose.
inline QMouseEvent mouse(QEvent::Type type, const QPoint& global, ulong ms,
    Qt::MouseButtons buttons = Qt::LeftButton, Qt::MouseButton button = Qt::LeftButton)
{
    QMouseEvent event(
        type, global - QPoint(100, 100), global - QPoint(50, 50), global, button, buttons, Qt::NoModifier);
    event.setTimestamp(ms);
    return event;
}

inline QMouseEvent press(const QPoint& global, ulong ms, Qt::MouseButton button = Qt::LeftButton)
{
    return mouse(QEvent::MouseButtonPress, global, ms, button, button);
}

inline QMouseEvent doublePress(const QPoint& global, ulong ms, Qt::MouseButton button = Qt::LeftButton)
{
    return mouse(QEvent::MouseButtonDblClick, global, ms, button, button);
}

inline QMouseEvent release(const QPoint& global, ulong ms, Qt::MouseButton button = Qt::LeftButton)
{
    return mouse(QEvent::MouseButtonRelease, global, ms, Qt::NoButton, button);
}

inline QMouseEvent move(const QPoint& global, ulong ms, Qt::MouseButtons buttons = Qt::LeftButton)
{
    return mouse(QEvent::MouseMove, global, ms, buttons, Qt::NoButton);
}

inline QEnterEvent enter(const QPoint& global)
{
    return QEnterEvent(global - QPoint(100, 100), global - QPoint(50, 50), global);
}

/// Sends the event if the widget still lives.
template <typename Event> bool send(QWidget* widget, Event event)
{
    return widget ? QCoreApplication::sendEvent(widget, &event) : false;
}

class OpenGesture : public vx::MouseGesture
{
public:
    explicit OpenGesture(qint64 doubleClick = 400, qint64 longClick = 1000, qint64 swipe = 1000, int radius = 8,
        int doubleRadius = 8)
        : vx::MouseGesture(doubleClick, longClick, swipe, radius, doubleRadius)
    {
    }
    using vx::MouseGesture::add;
    using vx::MouseGesture::count;
    using vx::MouseGesture::indexOf;

    /// Adds in the order of the arguments.
    template <typename... Events> OpenGesture& feed(Events... events)
    {
        (add(&events, nullptr), ...);
        return *this;
    }
};

class OpenAdapter : public vx::MouseAdapter
{
public:
    using vx::MouseAdapter::canFinishGesture;
    using vx::MouseAdapter::finishGesture;
    using vx::MouseAdapter::MouseAdapter;
    using vx::MouseAdapter::notify;
    using vx::MouseAdapter::onAutoClickTimeout;
    using vx::MouseAdapter::onDoubleClickTimeout;
    using vx::MouseAdapter::onLongClickTimeout;
    using vx::MouseAdapter::startNewGesture;
};

/// Counts how often timers without a parent have fired, by their interval: lets a test wait for a timer whose slot
/// has no visible effect.
class TimerWatch : public QObject
{
public:
    TimerWatch() { QCoreApplication::instance()->installEventFilter(this); }
    int fired(int interval) const { return m_fired.value(interval); }

    bool eventFilter(QObject* object, QEvent* event) override
    {
        if (event->type() == QEvent::Timer) {
            if (auto* timer = qobject_cast<QTimer*>(object); timer && !timer->parent()) {
                ++m_fired[timer->interval()];
            }
        }
        return false;
    }

private:
    QHash<int, int> m_fired;
};
}
