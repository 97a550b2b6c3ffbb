// SPDX-License-Identifier: MIT
// The words that entries and scripts are written in.
#include "Registry.h"

#include <QtCore/QMetaMethod>
#include <QtGui/QEnterEvent>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include "Saboteur.h"

namespace zelkovtest
{
namespace
{
int g_patience = 5000;

void sendMouse(const Subject& subject, QEvent::Type type, const QPoint& position, Qt::MouseButton button,
    Qt::MouseButtons buttons, int milliseconds)
{
    QWidget* const widget = subject.widget;
    QMouseEvent event(type, position, widget->mapTo(widget->window(), position), widget->mapToGlobal(position), button,
        buttons, Qt::NoModifier);
    // A time of zero means "no time" to Qt.
    event.setTimestamp(static_cast<ulong>(100000 + milliseconds));
    QApplication::sendEvent(widget, &event);
}
}

QList<QByteArray> Entry::expectedSignals() const
{
    QList<QByteArray> result;
    for (const Script& script : exercise) {
        for (const QByteArray& signal : script.fires) {
            if (!result.contains(signal)) {
                result << signal;
            }
        }
    }
    return result;
}

Entry valueClass(const char* name, const char* header)
{
    Entry entry;
    entry.name = name;
    entry.header = header;
    return entry;
}

Step mousePress(const QPoint& position, int milliseconds, Qt::MouseButton button)
{
    return [=](const Subject& subject) {
        sendMouse(subject, QEvent::MouseButtonPress, position, button, button, milliseconds);
    };
}

Step mouseMove(const QPoint& position, int milliseconds, Qt::MouseButtons buttons)
{
    return [=](const Subject& subject) {
        sendMouse(subject, QEvent::MouseMove, position, Qt::NoButton, buttons, milliseconds);
    };
}

Step mouseRelease(const QPoint& position, int milliseconds, Qt::MouseButton button)
{
    return [=](const Subject& subject) {
        sendMouse(subject, QEvent::MouseButtonRelease, position, button, Qt::NoButton, milliseconds);
    };
}

Step mouseDoubleClick(const QPoint& position, int milliseconds, Qt::MouseButton button)
{
    return [=](const Subject& subject) {
        sendMouse(subject, QEvent::MouseButtonDblClick, position, button, button, milliseconds);
    };
}

Step enter(const QPoint& position)
{
    return [=](const Subject& subject) {
        QWidget* const widget = subject.widget;
        QEnterEvent event(position, widget->mapTo(widget->window(), position), widget->mapToGlobal(position));
        QApplication::sendEvent(widget, &event);
    };
}

Step leave()
{
    return [](const Subject& subject) {
        QEvent event(QEvent::Leave);
        QApplication::sendEvent(subject.widget, &event);
    };
}

Step waitFor(const char* signal)
{
    return [signal](const Subject& subject) {
        const Subject watched = subject;
        const int index = signalIndex(subject.object, signal);
        if (index < 0) {
            qWarning("no signal %s in %s", signal, subject.object->metaObject()->className());
            return;
        }
        bool fired = false;
        Saboteur listener(subject.object, index, [&fired] { fired = true; });
        static_cast<void>(QTest::qWaitFor([&] { return fired || !watched.alive(); }, patience()));
    };
}

void setPatience(int milliseconds)
{
    g_patience = milliseconds;
}

int patience()
{
    return g_patience;
}
}
