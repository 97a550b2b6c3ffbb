// SPDX-License-Identifier: MIT
// A mouse with a clock of its own.
#include "Pointer.h"

#include <QtGui/QWindow>
#include <QtTest/QtTest>

namespace zelkovtest
{
Pointer::Pointer(QWidget* widget, ulong start)
    : m_widget(widget)
    , m_position(widget->mapFromGlobal(widget->window()->mapToGlobal(QPoint(0, 0))))
    , m_time(start)
{
    send(QEvent::MouseMove, Qt::NoButton, 0);
}

Pointer::~Pointer()
{
    for (const Qt::MouseButton button : {Qt::LeftButton, Qt::RightButton, Qt::MiddleButton}) {
        if (m_buttons.testFlag(button)) {
            release(button);
        }
    }
}

void Pointer::move(const QPoint& position, int afterMs)
{
    m_position = position;
    send(QEvent::MouseMove, Qt::NoButton, afterMs);
}

void Pointer::press(Qt::MouseButton button, int afterMs)
{
    m_buttons |= button;
    send(QEvent::MouseButtonPress, button, afterMs);
}

void Pointer::release(Qt::MouseButton button, int afterMs)
{
    m_buttons &= ~Qt::MouseButtons(button);
    send(QEvent::MouseButtonRelease, button, afterMs);
}

void Pointer::click(const QPoint& position, Qt::MouseButton button, int holdMs)
{
    move(position);
    press(button);
    release(button, holdMs);
}

void Pointer::send(QEvent::Type type, Qt::MouseButton button, int afterMs)
{
    m_time += static_cast<ulong>(afterMs);
    QWindow* const handle = m_widget ? m_widget->window()->windowHandle() : nullptr;
    if (handle == nullptr) {
        return;
    }
    const QPoint global = m_widget->mapToGlobal(m_position);
    qt_handleMouseEvent(handle, handle->mapFromGlobal(global), global, m_buttons, button, type, Qt::NoModifier,
        static_cast<int>(m_time));
    QCoreApplication::processEvents();
}
}
