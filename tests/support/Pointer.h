// SPDX-License-Identifier: MIT
// A mouse with a clock of its own: events go through the window system with chosen time stamps.
#pragma once

#include <QtCore/QEvent>
#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

namespace zelkovtest
{
/// Positions are in the coordinates of the widget given; times are milliseconds that pass on the virtual clock
/// before the event. What is still held is released by the destructor. The pointer is parked in the window's top
/// left corner first, since a move to where the pointer already was is swallowed by Qt.
class Pointer
{
public:
    explicit Pointer(QWidget* widget, ulong start = 10000);
    ~Pointer();
    Pointer(const Pointer&) = delete;
    Pointer& operator=(const Pointer&) = delete;

    void move(const QPoint& position, int afterMs = 10);
    void press(Qt::MouseButton button = Qt::LeftButton, int afterMs = 10);
    void release(Qt::MouseButton button = Qt::LeftButton, int afterMs = 10);
    void click(const QPoint& position, Qt::MouseButton button = Qt::LeftButton, int holdMs = 10);
    void wait(int ms) { m_time += static_cast<ulong>(ms); }
    ulong time() const { return m_time; }

private:
    void send(QEvent::Type type, Qt::MouseButton button, int afterMs);

    QPointer<QWidget> m_widget;
    QPoint m_position;
    Qt::MouseButtons m_buttons;
    ulong m_time;
};
}
