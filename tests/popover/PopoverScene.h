// SPDX-License-Identifier: MIT
// A window with a target and a popover over it, for the tests of controller and manager.
#pragma once

#include "popover/Balloon.h"
#include "popover/Container.h"
#include "popover/Controller.h"

#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtGui/QDropEvent>
#include <QtGui/QKeyEvent>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>

#include "SignalRecorder.h"
#include "TestRow.h"

namespace zelkovtest
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;

inline Controller::EPopoverShowFlags showFlags(int flags)
{
    return Controller::EPopoverShowFlags(QFlag(flags));
}

/// The constructors for everybody.
class TestController : public Controller
{
public:
    TestController(QWidget* inWidget, QWidget* forWidget, int directions = Balloon::eadTop,
        const QSizeF& size = QSizeF(160, 120), int constraints = 3, bool isSubController = false)
        : Controller(inWidget, forWidget, isSubController, QStringLiteral("popover"),
            QFlags<Balloon::EArrowDirection>(QFlag(directions)), size,
            QFlags<Balloon::ESizeConstraint>(QFlag(constraints)))
    {
    }
    explicit TestController(QWidget* inWidget)
        : Controller(
            inWidget, true, QStringLiteral("plain"), QSizeF(160, 120), QFlags<Balloon::ESizeConstraint>(QFlag(3)))
    {
    }
    using Controller::controllerRect;
};

/// Says whether it may be closed, and counts what it is told.
class TestContainer : public Container
{
public:
    TestContainer()
        : Container(nullptr, QStringLiteral("content"), Qt::Vertical, Qt::AlignTop)
    {
    }
    bool canBeClosed() override
    {
        ++asked;
        return closable;
    }
    void popoverOpened() override
    {
        ++opened;
        Container::popoverOpened();
    }
    bool closable = true;
    int asked = 0;
    int opened = 0;
};

/// A shown window of 400 by 300 with a target, and what build() puts over it. Everything dies with the window.
class PopoverScene
{
public:
    PopoverScene()
        : window(new QWidget)
        , target(new QPushButton(window))
    {
        window->resize(400, 300);
        target->setGeometry(180, 20, 40, 20);
        window->show();
    }
    ~PopoverScene() { delete window.data(); }

    /// A popover below the target, with one row, fades of 40 ms.
    TestController* build(int features = Balloon::ebfNoHeader, int containerFlags = 0)
    {
        TestController* const made = new TestController(window, target);
        controller = made;
        controller->fader()->setFadingTimes(40, 40);
        fill(features, containerFlags);
        return made;
    }

    void makeContent(int containerFlags = 0)
    {
        container = new TestContainer;
        row = new TestRow(7);
        container->addItem(row, QFlags<vx::PopoverWidget::EContainerFlag>(QFlag(containerFlags)));
    }

    void fill(int features = Balloon::ebfNoHeader, int containerFlags = 0)
    {
        makeContent(containerFlags);
        controller->setContainer(container, QFlags<Balloon::EBalloonFeature>(QFlag(features)));
    }

    /// A click by events at a point of the controller.
    static void press(QWidget* widget, const QPoint& position)
    {
        send(widget, QEvent::MouseButtonPress, position, Qt::LeftButton);
    }
    static void release(QWidget* widget, const QPoint& position)
    {
        send(widget, QEvent::MouseButtonRelease, position, Qt::NoButton);
    }
    static void click(QWidget* widget, const QPoint& position)
    {
        const QPointer<QWidget> guard(widget);
        press(widget, position);
        if (guard != nullptr) {
            release(widget, position);
        }
    }
    /// The release of a key; true if it was accepted by the widget itself.
    static bool releaseKey(QWidget* widget, int key)
    {
        QKeyEvent event(QEvent::KeyRelease, key, Qt::NoModifier);
        event.setAccepted(true);
        // Not through the application, which would go on to the parents.
        static_cast<QObject*>(widget)->event(&event);
        return event.isAccepted();
    }
    static bool drop(QWidget* widget, const QPoint& position, const QString& format)
    {
        QMimeData data;
        data.setData(format, QByteArray("7"));
        QDropEvent event(position, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        event.setAccepted(false);
        // The application delivers drops only within a drag.
        static_cast<QObject*>(widget)->event(&event);
        return event.isAccepted();
    }

    QPointer<QWidget> window;
    QPointer<QPushButton> target;
    QPointer<Controller> controller;
    QPointer<TestContainer> container;
    QPointer<TestRow> row;

private:
    static void send(QWidget* widget, QEvent::Type type, const QPoint& position, Qt::MouseButtons buttons)
    {
        QMouseEvent event(type, position, widget->mapTo(widget->window(), position), widget->mapToGlobal(position),
            Qt::LeftButton, buttons, Qt::NoModifier);
        QCoreApplication::sendEvent(widget, &event);
    }
};
}
