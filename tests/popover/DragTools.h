// SPDX-License-Identifier: MIT
// A drag with real events, its steps run in the drag's own event loop. For the platform "minimal".
#pragma once

#include "support/Pointer.h"

#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtGui/QDrag>
#include <QtTest/QtTest>
#include <QtWidgets/QWidget>

#include <functional>

namespace itemtest
{
/// Presses at @p from, pulls to the right until a drag begins, calls @p during, goes to @p to and releases.
/// Positions are those of @p host, which may die on the way.
inline void drag(QWidget* host, const QPoint& from, const QPoint& to, const std::function<void()>& during = {})
{
    const QPointer<QWidget> window(host);
    zelkovtest::Pointer pointer(host);
    pointer.move(from);
    pointer.press();
    QTimer patience;
    QObject::connect(&patience, &QTimer::timeout, &patience, [] { QDrag::cancel(); });
    patience.start(5000);
    // Each step schedules the next one before it runs.
    QTimer::singleShot(0, host, [&] {
        QTimer::singleShot(0, host, [&] {
            QTimer::singleShot(0, host, [&] {
                if (window) {
                    pointer.release();
                }
            });
            pointer.move(to + QPoint(1, 1));
        });
        if (during) {
            during();
        }
        pointer.move(to);
    });
    pointer.move(from + QPoint(20, 0));
    if (!window) {
        // The button goes up over another window.
        QWidget other;
        other.show();
        static_cast<void>(QTest::qWaitForWindowExposed(&other));
        qt_handleMouseEvent(other.windowHandle(), QPointF(5, 5), QPointF(5, 5), Qt::NoButton, Qt::LeftButton,
            QEvent::MouseButtonRelease, Qt::NoModifier, 20000);
        QCoreApplication::processEvents();
    }
    // Without a drag the steps still wait.
    QTRY_COMPARE(QGuiApplication::mouseButtons(), Qt::MouseButtons(Qt::NoButton));
}
}
