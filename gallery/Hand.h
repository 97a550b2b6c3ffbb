// SPDX-License-Identifier: MIT
// A hand that uses the mouse by a script.
#pragma once

#include <functional>

#include <QtCore/QElapsedTimer>
#include <QtCore/QObject>
#include <QtCore/QPointF>
#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtCore/QVector>

class QWidget;

namespace gallery
{
/// Plays a list of steps with real mouse events, which enter where those of the window system do. Positions
/// are those of the widget and are looked up when the step is played; a step whose widget has died is
/// skipped. Times are in milliseconds and real, because the timers of the widgets are.
class Hand : public QObject
{
    Q_OBJECT

public:
    explicit Hand(QWidget* window);

    Hand& moveTo(QWidget* widget, const QPoint& position);
    /// In a straight line from where the pointer is, in steps of 20 ms.
    Hand& glideTo(QWidget* widget, const QPoint& position, int millis);
    Hand& press();
    Hand& release();
    Hand& wait(int millis);
    Hand& click(QWidget* widget, const QPoint& position);
    Hand& doubleClick(QWidget* widget, const QPoint& position);
    Hand& call(QObject* context, const std::function<void()>& action);

    /// Plays the steps, forgets them and then calls done.
    void play(const std::function<void()>& done);

private:
    struct Step
    {
        int wait;
        std::function<void()> act;
    };

    Hand& step(int wait, const std::function<void()>& act);
    void next();
    void send(int type);
    void aim(QWidget* widget, const QPoint& position);

    QPointer<QWidget> m_window;
    QVector<Step> m_steps;
    int m_at = 0;
    QTimer m_timer;
    QElapsedTimer m_clock;
    QPointF m_position;
    QPointF m_glideStart;
    bool m_down = false;
    std::function<void()> m_done;
};
}
