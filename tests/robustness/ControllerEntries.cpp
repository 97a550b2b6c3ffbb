// SPDX-License-Identifier: MIT
// The controller and the manager of popovers.
#include "popover/Manager.h"

#include <QtCore/QMimeData>
#include <QtGui/QDropEvent>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QPushButton>

#include "../popover/TestRow.h"
#include "popover/Balloon.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "Registry.h"

namespace zelkovtest
{
namespace
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;

Controller::EPopoverShowFlags popoverFlags(int flags)
{
    return Controller::EPopoverShowFlags(QFlag(flags));
}

void fillPopover(Controller* controller, int features)
{
    Container* const content = new Container(nullptr, QStringLiteral("content"), Qt::Vertical, Qt::AlignTop);
    content->addItem(new TestRow(1));
    content->addItem(new TestRow(2));
    controller->setContainer(content, QFlags<Balloon::EBalloonFeature>(QFlag(features)));
    controller->fader()->setFadingTimes(10, 10);
    controller->setPersistence(true);
}

// The manager is one for the process: it dies with the host, so that no entry meets the one of another.
Controller* popoverOfManager(QWidget* host)
{
    Manager::deleteInstance();
    Manager::init(1000);
    Manager::instance()->setParent(host);
    QPushButton* const target = new QPushButton(host);
    target->setGeometry(80, 5, 30, 20);
    const QPointer<Controller> controller = Manager::instance()->createController(
        Manager::instance()->getUniquePopoverID(), false, false, host, target, QStringLiteral("Title"),
        QStringLiteral("popover"), QFlags<Balloon::EArrowDirection>(QFlag(15)), QSizeF(120, 90),
        QFlags<Balloon::ESizeConstraint>(QFlag(3)));
    fillPopover(controller, 7);
    return controller;
}

Controller* controllerOf(const Subject& subject)
{
    return qobject_cast<Controller*>(subject.widget.data());
}

Step openPopover(int flags, bool animated)
{
    return [=](const Subject& subject) { controllerOf(subject)->setActive(true, popoverFlags(flags), animated); };
}

Step dismissPopover(bool animated)
{
    return [=](const Subject& subject) { controllerOf(subject)->dismiss(animated, true); };
}

Step releaseKey(int key)
{
    return [=](const Subject& subject) {
        QKeyEvent event(QEvent::KeyRelease, key, Qt::NoModifier);
        QApplication::sendEvent(subject.widget, &event);
    };
}

Entry controllerEntry()
{
    Entry entry;
    entry.name = "Controller";
    entry.header = "popover/Controller.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        Controller* const controller = popoverOfManager(host);
        return Subject {controller, controller};
    };
    const Step performSecond = [](const Subject& subject) {
        Item* const row = controllerOf(subject)->getContainer()->getItem(2);
        QMouseEvent event(
            QEvent::MouseButtonRelease, row->rect().center(), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
        QApplication::sendEvent(row, &event);
    };
    const Step dropItem = [](const Subject& subject) {
        QMimeData data;
        data.setData(Item::sPopoverWidgetItem, QByteArray("1"));
        QDropEvent event(QPoint(5, 5), Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        // The application delivers drops only within a drag.
        static_cast<QObject*>(subject.widget)->event(&event);
    };
    entry.exercise = {
        {"open and dismiss",
            {"popoverWillAppear", "popoverDidAppear", "balloonOpened", "balloonClosed", "popoverWillDisappear",
                "popoverDidDisappear"},
            {openPopover(5, true), dismissPopover(false)}},
        {"layout", {"layoutUpdated"}, {openPopover(5, true), call(&Controller::updateLayout, true)}},
        {"fade, click outside", {},
            {openPopover(1, true), waitFor("popoverDidAppear"), mousePress(QPoint(2, 148), 0),
                mouseRelease(QPoint(2, 148), 10), waitFor("popoverDidDisappear")}},
        {"grow and shrink", {},
            {openPopover(2, true), waitFor("popoverDidAppear"), dismissPopover(true),
                waitFor("popoverDidDisappear")}},
        {"margins", {"marginsChanged"},
            {openPopover(5, true), call(&Controller::setMargins, 3, 3, 3, 3),
                call(&Controller::adjustMargins, 1, 1, 1, 1)}},
        {"help", {"popoverWillHelp"}, {call(&Controller::help)}},
        {"keys", {"shouldReject", "shouldAccept"},
            {releaseKey(Qt::Key_Escape), openPopover(5, true), releaseKey(Qt::Key_Return)}},
        {"a row", {"itemPerformed"}, {openPopover(5, true), performSecond}},
        {"a drop", {"itemDropped"}, {openPopover(5, true), dropItem}},
        {"the end", {"controllerDestroyed"},
            {openPopover(5, true), call(&Controller::setPersistence, false), dismissPopover(false),
                waitFor("destroyed")}},
    };
    entry.farewells = {"controllerDestroyed"};
    entry.setters = {
        setter("setForRect", &Controller::setForRect),
        setter("setInWidget", &Controller::setInWidget),
        setter("setTitle", &Controller::setTitle),
        setter("setInsets", &Controller::setInsets),
        setter("adjustInsets", &Controller::adjustInsets),
        setter("setMargins", &Controller::setMargins),
        setter("adjustMargins", &Controller::adjustMargins),
        setter("setModal", &Controller::setModal),
        setter("setStayVisible", &Controller::setStayVisible),
        setter("setResultCode", &Controller::setResultCode),
        setter("updateLayout", &Controller::updateLayout),
        setter("setBalloonFeatures", &Controller::setBalloonFeatures),
        setter("setActive", &Controller::setActive),
    };
    return entry;
}

Entry managerEntry()
{
    Entry entry;
    entry.name = "Manager";
    entry.header = "popover/Manager.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        Controller* const controller = popoverOfManager(host);
        Manager::instance()->registerAcceptedDropMimeType(1001, QStringLiteral("3"));
        return Subject {Manager::instance(), controller};
    };
    entry.exercise = {
        {"open and dismiss",
            {"popoverWillOpen", "modalPopoverWillOpen", "popoverDidOpen", "modalPopoverDidOpen",
                "popoverWillClose", "popoverDidClose", "lastPopoverDidClose", "lastModalPopoverDidClose"},
            {openPopover(5, true), dismissPopover(false)}},
        // Only an overlay that is hidden already makes room for the last signals of this kind.
        {"dismiss what is hidden", {"lastPopoverWillClose", "lastModalPopoverWillClose"},
            {openPopover(5, true), [](const Subject& subject) { subject.widget->hide(); }, dismissPopover(false)}},
        {"help", {"popoverWillHelp"}, {[](const Subject& subject) { controllerOf(subject)->help(); }}},
    };
    entry.setters = {
        setter("dismiss", &Manager::dismiss),
        setter("dismissAll", &Manager::dismissAll),
        setter("dismissAllModal", &Manager::dismissAllModal),
        setter("adjustInsets", &Manager::adjustInsets),
        setter("registerAcceptedDropMimeType", &Manager::registerAcceptedDropMimeType),
        setter("raiseControllersForMimeType", &Manager::raiseControllersForMimeType),
        setter("restoreControllersForMimeType", &Manager::restoreControllersForMimeType),
    };
    return entry;
}
}

std::vector<Entry> controllerEntries()
{
    return {controllerEntry(), managerEntry()};
}
}
