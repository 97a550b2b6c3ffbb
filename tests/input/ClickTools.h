// SPDX-License-Identifier: MIT
// What the tests of click buttons share: a security manager that writes down what it is asked, and a listener.
#pragma once

#include "input/CustomClickAdapter.h"
#include "ZelkovUtils/ISecurityManager.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QStringList>
#include <QtGui/QContextMenuEvent>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QToolButton>

#include <functional>
#include <memory>

namespace clicktest
{
constexpr int c_Never = 600000; ///< a span that no test waits for

class Guard : public vx::ISecurityManager
{
public:
    bool refuses = false;
    bool administrator = true;
    QStringList questions;
    std::function<void()> whenAsked;

    bool isRightRefused(const QString& right, bool first, bool second, bool third) override
    {
        questions << QStringLiteral("right %1 %2 %3 %4").arg(right).arg(first).arg(second).arg(third);
        return answer(refuses);
    }
    bool isAdministrator(bool first, bool second) override
    {
        questions << QStringLiteral("administrator %1 %2").arg(first).arg(second);
        return answer(administrator);
    }

private:
    bool answer(bool is)
    {
        if (whenAsked) {
            whenAsked();
        }
        return is;
    }
};

/// Makes a guard the security manager of all buttons as long as it lives.
class OnDuty
{
public:
    OnDuty()
        : guard(std::make_shared<Guard>())
    {
        vx::CustomClickAdapter::setSecurityManager(guard);
    }
    ~OnDuty() { vx::CustomClickAdapter::setSecurityManager(nullptr); }
    OnDuty(const OnDuty&) = delete;
    OnDuty& operator=(const OnDuty&) = delete;

    Guard* operator->() const { return guard.get(); }

    std::shared_ptr<Guard> guard;
};

/// Comes back after at least so many milliseconds, with the event loop running.
inline void letPass(int milliseconds)
{
    QElapsedTimer clock;
    clock.start();
    QTRY_VERIFY(clock.elapsed() > milliseconds);
}

inline void rightClick(QWidget* widget, const QPoint& position)
{
    QContextMenuEvent event(QContextMenuEvent::Mouse, position, widget->mapToGlobal(position));
    QApplication::sendEvent(widget, &event);
}

/// Sends a mouse event straight to the widget and says whether it was accepted there.
inline bool mouse(
    QWidget* widget, QEvent::Type type, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    const bool isRelease = type == QEvent::MouseButtonRelease;
    const bool isMove = type == QEvent::MouseMove;
    QMouseEvent event(type, position, widget->mapTo(widget->window(), position), widget->mapToGlobal(position),
        isMove ? Qt::NoButton : button, isRelease ? Qt::NoButton : button, Qt::NoModifier);
    QApplication::sendEvent(widget, &event);
    return event.isAccepted();
}
}
