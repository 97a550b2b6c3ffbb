// SPDX-License-Identifier: MIT
// A window with a tool bar and a source of actions, for the tests of the bar.
#pragma once

#include "support/LogCapture.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "views/CustomToolBar.h"

#include <QtCore/QDataStream>
#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtGui/QContextMenuEvent>
#include <QtGui/QDrag>
#include <QtGui/QMouseEvent>
#include <QtGui/QWindow>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QMenu>

#include <functional>
#include <memory>

namespace toolbarscene
{
using vx::CustomToolBar;

const char c_Action[] = "application/action-id";
const char c_ToolBar[] = "application/toolbar-id";

/// Calls a private member function of the bar: nobody in the library does.
template <void (CustomToolBar::*function)()> struct AddSpacer
{
    friend void addSpacer(CustomToolBar& bar) { (bar.*function)(); }
};
void addSpacer(CustomToolBar& bar);
template struct AddSpacer<&CustomToolBar::addSpacer>;

inline QString word(const char* text)
{
    return QString::fromLatin1(text);
}

inline QByteArray packed(const QString& id)
{
    QByteArray result;
    QDataStream stream(&result, QIODevice::WriteOnly);
    stream << id;
    return result;
}

/// What a client's dialog does: a press and a move start the drag of an action.
class ActionSource : public QWidget
{
public:
    using QWidget::QWidget;
    Qt::DropAction result = Qt::IgnoreAction;
    QByteArray format = c_Action;

protected:
    void mousePressEvent(QMouseEvent*) override { }
    void mouseMoveEvent(QMouseEvent*) override
    {
        auto* const mimeData = new QMimeData;
        mimeData->setData(QString::fromLatin1(format), packed(word("zoom-in")));
        auto* const drag = new QDrag(this);
        drag->setMimeData(mimeData);
        const QPointer<ActionSource> alive(this);
        const Qt::DropAction action = drag->exec(Qt::MoveAction | Qt::CopyAction, Qt::MoveAction);
        if (alive) {
            result = action;
        }
    }
};

/// Takes drag events without the entering that Qt asks for.
class OpenBar : public CustomToolBar
{
public:
    using CustomToolBar::CustomToolBar;
    using CustomToolBar::dragEnterEvent;
    using CustomToolBar::dragLeaveEvent;
    using CustomToolBar::dragMoveEvent;
    using CustomToolBar::dropEvent;
};

class Host : public QWidget
{
    Q_OBJECT

public:
    int customized = 0;

public Q_SLOTS:
    void customizeToolBar() { ++customized; }
};

/// A window with a bar of three actions of 30 by 24 pixels and a source of actions.
struct Scene
{
    explicit Scene(Qt::Orientation orientation = Qt::Horizontal, bool draggable = true)
    {
        host.resize(220, 260);
        bar = new OpenBar(word("Tools"), &host, draggable, word("tools"));
        bar->setOrientation(orientation);
        bar->setIconSize(QSize(24, 24));
        for (const char* name : {"one", "two", "three"}) {
            actions << bar->addAction(word(name));
        }
        if (orientation == Qt::Horizontal) {
            bar->setGeometry(0, 0, 220, 40);
        } else {
            bar->setGeometry(0, 0, 60, 200);
        }
        source = new ActionSource(&host);
        source->setGeometry(100, 210, 60, 40);
        host.show();
        if (!QTest::qWaitForWindowExposed(&host)) {
            qFatal("no window");
        }
        recorder.add(bar);
    }

    QRect place(int index) const { return bar->widgetForAction(actions.at(index))->geometry(); }

    void send(QEvent::Type type, const QPoint& at, Qt::MouseButton button = Qt::LeftButton)
    {
        static int time = 1000;
        QWindow* const window = host.windowHandle();
        const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : button;
        qt_handleMouseEvent(window, at, window->mapToGlobal(at), buttons,
            type == QEvent::MouseMove ? Qt::NoButton : button, type, Qt::NoModifier, ++time);
        QCoreApplication::processEvents();
    }

    /// Presses, starts the drag by a move of 30 pixels, goes through the points and releases. Anything left over
    /// after three seconds is cancelled.
    void drag(const QPoint& from, const QVector<QPoint>& through, const std::function<void()>& inBetween = {})
    {
        QTimer guard;
        QObject::connect(&guard, &QTimer::timeout, [] { QDrag::cancel(); });
        guard.setSingleShot(true);
        guard.start(3000);
        int delay = 10;
        for (const QPoint& point : through) {
            QTimer::singleShot(delay, &host, [this, point] { send(QEvent::MouseMove, point); });
            delay += 10;
        }
        if (inBetween) {
            QTimer::singleShot(delay, &host, inBetween);
            delay += 10;
        }
        const QPoint last = through.isEmpty() ? from : through.last();
        QTimer::singleShot(delay, &host, [this, last] { send(QEvent::MouseButtonRelease, last); });
        send(QEvent::MouseMove, from);
        send(QEvent::MouseButtonPress, from);
        send(QEvent::MouseMove, from + QPoint(15, 15));
        QTRY_VERIFY(QGuiApplication::mouseButtons() == Qt::NoButton);
        QCoreApplication::processEvents();
    }

    Host host;
    OpenBar* bar;
    ActionSource* source;
    QList<QAction*> actions;
    zelkovtest::SignalRecorder recorder;
};

/// Runs an event handler of the bar with a drag event of its own.
struct Dragged
{
    Dragged(OpenBar* target, const QString& format, const QByteArray& bytes)
        : bar(target)
    {
        if (!format.isEmpty()) {
            data.setData(format, bytes);
        }
    }

    bool enter()
    {
        QDragEnterEvent event(QPoint(1, 1), Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        event.setAccepted(false);
        bar->dragEnterEvent(&event);
        return event.isAccepted();
    }
    bool move(const QPoint& at)
    {
        QDragMoveEvent event(at, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        event.setAccepted(false);
        bar->dragMoveEvent(&event);
        return event.isAccepted();
    }
    bool leave() const
    {
        QDragLeaveEvent event;
        event.setAccepted(false);
        bar->dragLeaveEvent(&event);
        return event.isAccepted();
    }
    bool drop(const QPoint& at)
    {
        QDropEvent event(at, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        event.setAccepted(false);
        bar->dropEvent(&event);
        return event.isAccepted() && event.dropAction() == Qt::MoveAction;
    }

    OpenBar* bar;
    QMimeData data;
};

const QPoint c_OnSource(120, 225);
}
