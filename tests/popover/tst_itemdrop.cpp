// SPDX-License-Identifier: MIT
// A row is dragged out of its balloon and dropped on the popover. The drags are real.
#include "DragTools.h"
#include "ItemTools.h"

#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Manager.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMimeData>
#include <QtGui/QDropEvent>
#include <QtTest/QtTest>

using itemtest::Row;
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
namespace pw = vx::PopoverWidget;

namespace
{
/// A window on the small screen of the minimal platform with popovers over it.
struct Scene
{
    Scene()
        : window(new QWidget)
        , target(new QWidget(window))
    {
        Manager::init(0);
        window->setGeometry(0, 0, 220, 300);
        target->setGeometry(90, 10, 30, 20);
        window->show();
        static_cast<void>(QTest::qWaitForWindowExposed(window));
        controller = open(1, row = new Row(pw::eifText, 7));
        row->setDragEnabled(true);
    }
    ~Scene()
    {
        delete window.data();
        Manager::deleteInstance();
    }

    QPointer<Controller> open(int id, Row* item)
    {
        const QPointer<Controller> result = Manager::instance()->createController(id, false, false, window, target,
            QString(), QStringLiteral("popover"), Balloon::eadTop, QSizeF(140, 80),
            QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        auto* const content = new Container(nullptr, QStringLiteral("content"), Qt::Vertical, Qt::AlignTop);
        item->setMinimumSize(60, 20);
        content->addItem(item);
        result->setContainer(content, Balloon::ebfNoHeader);
        result->setForWidget(*target, QPointF(-1, 0));
        result->setActive();
        return result;
    }

    void drag(const QPoint& to) { itemtest::drag(window, row->mapTo(window, QPoint(10, 10)), to); }

    QPointer<QWidget> window;
    QPointer<QWidget> target;
    QPointer<Controller> controller;
    QPointer<Row> row;
    const QPoint outside {60, 270};
};
}

class TestItemDrop : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QDropEvent*>("QDropEvent*"); }

    void theControllerReportsTheItemAndThePlace()
    {
        Scene scene;
        scene.row->setUserData(QStringLiteral("camera 3"));
        int drops = 0;
        connect(scene.controller.data(), &Controller::itemDropped, this,
            [&](Item* item, QDropEvent* event, const QPoint& position) {
                ++drops;
                QCOMPARE(item, static_cast<Item*>(scene.row.data()));
                QCOMPARE(position, scene.window->mapToGlobal(scene.outside + QPoint(1, 1)));
                QCOMPARE(event->mimeData()->data(Item::sPopoverWidgetItem), QByteArray("7"));
                QCOMPARE(event->mimeData()->text(), QStringLiteral("camera 3"));
                QVERIFY(event->isAccepted());
            });
        QSignalSpy performed(scene.controller.data(), &Controller::itemPerformed);
        scene.drag(scene.outside);
        QCOMPARE(drops, 1);
        QCOMPARE(performed.count(), 0);
        QVERIFY(scene.controller->isActive());
    }

    void whatIsNoItemIsNotDropped()
    {
        Scene scene;
        QSignalSpy dropped(scene.controller.data(), &Controller::itemDropped);
        auto* const plain = new QMimeData;
        plain->setText(QStringLiteral("camera 3"));
        auto* const other = new QDrag(scene.window.data());
        other->setMimeData(plain);
        QTimer::singleShot(0, scene.window, [&] {
            QTimer::singleShot(0, scene.window, [] { QDrag::cancel(); });
            zelkovtest::Pointer pointer(scene.window);
            pointer.move(scene.outside);
        });
        other->exec(Qt::MoveAction);
        QCOMPARE(dropped.count(), 0);
    }

    void theItemMayDieInTheDrop()
    {
        Scene scene;
        connect(scene.controller.data(), &Controller::itemDropped, this, [](Item* item) { delete item; });
        scene.drag(scene.outside);
        QVERIFY(!scene.row);
        QVERIFY(scene.controller);
    }

    void thePopoverMayDieInTheDrop()
    {
        Scene scene;
        connect(scene.controller.data(), &Controller::itemDropped, this, [&] { delete scene.controller.data(); });
        scene.drag(scene.outside);
        QVERIFY(!scene.controller && !scene.row);
        QVERIFY(scene.window);
    }

    void thePopoverMayCloseWhileItsItemIsDragged()
    {
        Scene scene;
        QSignalSpy dropped(scene.controller.data(), &Controller::itemDropped);
        itemtest::drag(scene.window, scene.row->mapTo(scene.window, QPoint(10, 10)), scene.outside,
            [&] { delete scene.controller.data(); });
        QVERIFY(!scene.row);
        QCOMPARE(dropped.count(), 0);
    }

    void balloonsForTheFormatAreOnTopWhileTheDragRuns()
    {
        Scene scene;
        const QPointer<Controller> second = scene.open(2, new Row(pw::eifText, 8));
        scene.controller->raise();
        Manager* const manager = Manager::instance();
        manager->registerAcceptedDropMimeType(2, Item::sPopoverWidgetItem);
        connect(scene.row.data(), &Item::itemDragStarted, manager,
            [manager] { manager->raiseControllersForMimeType(Item::sPopoverWidgetItem); });
        QPointer<QWidget> parent;
        itemtest::drag(scene.window, scene.row->mapTo(scene.window, QPoint(10, 10)), scene.outside,
            [&] { parent = second->balloon()->parentWidget(); });
        QCOMPARE(parent.data(), scene.window.data());
        QCOMPARE(scene.window->children().last(), static_cast<QObject*>(second->balloon()));
        manager->restoreControllersForMimeType(Item::sPopoverWidgetItem);
        QCOMPARE(second->balloon()->parentWidget(), static_cast<QWidget*>(second.data()));
    }
};

ZELKOV_TEST_MAIN(TestItemDrop)
#include "tst_itemdrop.moc"
