// SPDX-License-Identifier: MIT
// Injects mouse events, step by step.
#include "Hand.h"

#include <utility>

#include <QtCore/QEvent>
#include <QtGui/QWindow>
#include <QtWidgets/QWidget>

// Qt's own way in for events of a test; declared there in a header of the test module only.
QT_BEGIN_NAMESPACE
Q_GUI_EXPORT void qt_handleMouseEvent(QWindow* window, const QPointF& local, const QPointF& global,
                                      Qt::MouseButtons state, Qt::MouseButton button, QEvent::Type type,
                                      Qt::KeyboardModifiers modifiers, int timestamp);
QT_END_NAMESPACE

namespace gallery
{
Hand::Hand(QWidget* window)
    : QObject(window), m_window(window)
{
    m_timer.setSingleShot(true);
    m_timer.setTimerType(Qt::PreciseTimer);
    connect(&m_timer, &QTimer::timeout, this, &Hand::next);
    m_clock.start();
}

Hand& Hand::step(int wait, const std::function<void()>& act)
{
    m_steps.append({wait, act});
    return *this;
}

Hand& Hand::moveTo(QWidget* widget, const QPoint& position)
{
    const QPointer<QWidget> target(widget);
    return step(0, [this, target, position] {
        if (target) {
            aim(target, position);
            send(QEvent::MouseMove);
        }
    });
}

Hand& Hand::glideTo(QWidget* widget, const QPoint& position, int millis)
{
    const QPointer<QWidget> target(widget);
    const int count = qMax(1, millis / 20);
    for (int i = 1; i <= count; ++i) {
        step(20, [this, target, position, i, count] {
            if (!target) {
                return;
            }
            if (i == 1) {
                m_glideStart = m_position;
            }
            const QPointF start = m_glideStart;
            aim(target, position);
            m_position = (start + (m_position - start) * i / count).toPoint();
            send(QEvent::MouseMove);
        });
    }
    return *this;
}

Hand& Hand::press()
{
    return step(10, [this] {
        m_down = true;
        send(QEvent::MouseButtonPress);
    });
}

Hand& Hand::release()
{
    return step(10, [this] {
        m_down = false;
        send(QEvent::MouseButtonRelease);
    });
}

Hand& Hand::wait(int millis)
{
    return step(millis, [] {});
}

Hand& Hand::click(QWidget* widget, const QPoint& position)
{
    return moveTo(widget, position).press().wait(30).release();
}

Hand& Hand::doubleClick(QWidget* widget, const QPoint& position)
{
    return click(widget, position).wait(60).press().wait(30).release();
}

Hand& Hand::call(QObject* context, const std::function<void()>& action)
{
    const QPointer<QObject> guard(context);
    return step(0, [guard, action] {
        if (guard) {
            action();
        }
    });
}

void Hand::play(const std::function<void()>& done)
{
    m_done = done;
    m_at = 0;
    m_timer.start(m_steps.isEmpty() ? 0 : m_steps.first().wait);
}

void Hand::next()
{
    if (m_at >= m_steps.size()) {
        m_steps.clear();
        const std::function<void()> done = std::exchange(m_done, nullptr);
        if (done) {
            done();
        }
        return;
    }
    const Step current = m_steps.at(m_at++);
    m_timer.start(m_at < m_steps.size() ? m_steps.at(m_at).wait : 0);
    current.act();
}

void Hand::aim(QWidget* widget, const QPoint& position)
{
    m_position = widget->mapTo(widget->window(), position);
}

void Hand::send(int type)
{
    QWindow* window = m_window ? m_window->windowHandle() : nullptr;
    if (!window) {
        return;
    }
    const bool isMove = type == QEvent::MouseMove;
    qt_handleMouseEvent(window, m_position, m_position + window->mapToGlobal(QPoint()),
                        m_down ? Qt::LeftButton : Qt::NoButton, isMove ? Qt::NoButton : Qt::LeftButton,
                        QEvent::Type(type), Qt::NoModifier, int(m_clock.elapsed()) + 1000);
}
}
