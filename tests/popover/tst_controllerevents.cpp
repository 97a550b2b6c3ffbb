// SPDX-License-Identifier: MIT
// What the user does to an open popover: clicks outside, keys, drops, a window and a target that move.
#include "popover/Controller.h"

#include <QtTest/QtTest>

#include "Pointer.h"
#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::Item;
using zelkovtest::PopoverScene;
using zelkovtest::showFlags;
using zelkovtest::SignalRecorder;
using zelkovtest::TestController;

namespace
{
// The balloon covers (119, 39) to (278, 158).
constexpr QPoint c_inside(200, 100);
constexpr QPoint c_outside(20, 280);
}

class TestControllerEvents : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aClickCountsWherePressAndReleaseFall_data()
    {
        QTest::addColumn<QPoint>("press");
        QTest::addColumn<QPoint>("release");
        QTest::addColumn<bool>("dismisses");
        QTest::newRow("both outside") << c_outside << QPoint(380, 10) << true;
        QTest::newRow("press inside") << c_inside << c_outside << false;
        QTest::newRow("release inside") << c_outside << c_inside << false;
        QTest::newRow("both inside") << c_inside << c_inside << false;
        QTest::newRow("first pixel inside") << QPoint(119, 39) << QPoint(119, 39) << false;
        QTest::newRow("last pixel inside") << QPoint(278, 158) << QPoint(278, 158) << false;
        QTest::newRow("left of the first") << QPoint(118, 100) << QPoint(118, 100) << true;
        QTest::newRow("right of the last") << QPoint(279, 100) << QPoint(279, 100) << true;
        QTest::newRow("above") << QPoint(200, 38) << QPoint(200, 38) << true;
        QTest::newRow("below") << QPoint(200, 159) << QPoint(200, 159) << true;
    }

    void aClickCountsWherePressAndReleaseFall()
    {
        QFETCH(QPoint, press);
        QFETCH(QPoint, release);
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        QCOMPARE(controller->balloon()->geometry(), QRect(QPoint(119, 39), QPoint(278, 158)));
        PopoverScene::press(controller, press);
        QVERIFY(controller->isActive());
        PopoverScene::release(controller, release);
        QTEST(!controller->isActive(), "dismisses");
        QVERIFY2(controller->isVisible(), "the overlay fades out, it is not hidden at once");
    }

    void aRealClickBesideTheBalloonDismisses()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        zelkovtest::Pointer pointer(scene.window);
        pointer.click(c_inside);
        QVERIFY(controller->isActive());
        pointer.click(c_outside);
        QVERIFY(!controller->isActive());
        QTRY_VERIFY(scene.controller == nullptr);
    }

    void aReleaseAloneIsNoClick()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        PopoverScene::release(controller, c_outside);
        QVERIFY(controller->isActive());
    }

    void aPressIsForgottenAfterTheRelease()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        PopoverScene::press(controller, c_outside);
        PopoverScene::release(controller, c_inside);
        PopoverScene::release(controller, c_outside);
        QVERIFY(controller->isActive());
        // Also after a click that the container refused.
        scene.container->closable = false;
        PopoverScene::click(controller, c_outside);
        QCOMPARE(scene.container->asked, 1);
        scene.container->closable = true;
        PopoverScene::press(controller, c_inside);
        PopoverScene::release(controller, c_outside);
        QVERIFY(controller->isActive());
    }

    void aClickBesideANestedPopoverIsNoBusinessOfTheOuterOne()
    {
        PopoverScene scene;
        TestController* const outer = scene.build();
        outer->setActive();
        TestController* const inner = new TestController(outer, scene.row);
        inner->setContainer(new zelkovtest::TestContainer, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        inner->setActive();
        PopoverScene::click(inner, c_outside);
        QVERIFY(!inner->isActive());
        QVERIFY(outer->isActive());
        // The press reached the outer one, too, and must not make a click of the next release.
        PopoverScene::press(outer, c_inside);
        PopoverScene::release(outer, c_outside);
        QVERIFY(outer->isActive());
    }

    void aPopoverThatStaysTakesNoClick()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        controller->setStayVisible(true);
        PopoverScene::click(controller, c_outside);
        QVERIFY(controller->isActive());
        QCOMPARE(scene.container->asked, 0);
        // A press from before is no use either.
        controller->setStayVisible(false);
        PopoverScene::press(controller, c_outside);
        controller->setStayVisible(true);
        PopoverScene::release(controller, c_outside);
        controller->setStayVisible(false);
        PopoverScene::release(controller, c_outside);
        QVERIFY(controller->isActive());
    }

    void aSecondClickDuringTheFadeDoesNothing()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive();
        SignalRecorder recorder(controller);
        PopoverScene::click(controller, c_outside);
        PopoverScene::click(controller, c_outside);
        QCOMPARE(recorder.count(QStringLiteral("balloonClosed")), 1);
    }

    void withoutABalloonNoClickDismisses()
    {
        TestController controller(nullptr);
        controller.setContainer(new zelkovtest::TestContainer, QFlags<Balloon::EBalloonFeature>());
        controller.setActive();
        PopoverScene::click(&controller, QPoint(1, 1));
        QVERIFY(controller.isActive());
    }

    void clicksGoThroughATransparentOverlay()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        QSignalSpy clicked(scene.target, &QPushButton::clicked);
        zelkovtest::Pointer pointer(scene.window);
        controller->setPersistence(true);
        controller->setActive(true, showFlags(13));
        pointer.click(scene.target->geometry().center());
        QCOMPARE(clicked.size(), 1);
        QVERIFY(controller->isActive());
        controller->setActive(true, showFlags(5));
        pointer.click(scene.target->geometry().center());
        QCOMPARE(clicked.size(), 1);
        QVERIFY(!controller->isActive());
    }

    // --- Keys
    // ----------------------------------------------------------------------------------------------------

    void escapeClosesWithoutAskingAndWithoutAnimation()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        scene.container->closable = false;
        SignalRecorder recorder(controller);
        QVERIFY(PopoverScene::releaseKey(controller, Qt::Key_Escape));
        QCOMPARE(scene.container->asked, 0);
        QVERIFY(controller->isHidden());
        QCOMPARE(recorder.names(),
            QStringList({QStringLiteral("balloonClosed"), QStringLiteral("popoverWillDisappear"),
                QStringLiteral("popoverDidDisappear")}));
    }

    void escapeRejectsAPopoverThatStaysOrIsNotShown()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        SignalRecorder recorder(controller);
        QVERIFY(PopoverScene::releaseKey(controller, Qt::Key_Escape));
        QCOMPARE(recorder.names(), QStringList(QStringLiteral("shouldReject")));
        controller->setStayVisible(true);
        controller->setActive();
        recorder.clear();
        QVERIFY(PopoverScene::releaseKey(controller, Qt::Key_Escape));
        QCOMPARE(recorder.names(), QStringList(QStringLiteral("shouldReject")));
        QVERIFY(controller->isActive());
    }

    void escapeIsNotAcceptedWhileClosing()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        controller->dismiss(true, false);
        SignalRecorder recorder(controller);
        QVERIFY(!PopoverScene::releaseKey(controller, Qt::Key_Escape));
        QCOMPARE(recorder.names(), QStringList());
    }

    void returnAndEnterAccept()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        SignalRecorder recorder(controller);
        QVERIFY(PopoverScene::releaseKey(controller, Qt::Key_Return));
        QVERIFY(PopoverScene::releaseKey(controller, Qt::Key_Enter));
        QCOMPARE(recorder.names(), QStringList({QStringLiteral("shouldAccept"), QStringLiteral("shouldAccept")}));
        QVERIFY(controller->isActive());
        QVERIFY2(!PopoverScene::releaseKey(controller, Qt::Key_A), "the base class does not accept");
    }

    void aRealEscapeReachesThePopover()
    {
        PopoverScene scene;
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        const QPointer<TestController> controller = scene.build();
        controller->setActive();
        QVERIFY(controller->isActive());
        QTest::keyClick(scene.window->windowHandle(), Qt::Key_Escape);
        QVERIFY(!controller || !controller->isActive()); // on a slow machine it has faded out by now
    }

    // --- Window and target
    // ---------------------------------------------------------------------------------------

    void theOverlayFollowsTheWindow()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        scene.window->resize(410, 310);
        QVERIFY2(controller->size() != scene.window->size(), "hidden overlays wait for their show");
        controller->setActive();
        QCOMPARE(controller->size(), QSize(410, 310));
        SignalRecorder recorder(controller);
        scene.window->resize(500, 250);
        QCOMPARE(controller->geometry(), QRect(0, 0, 500, 250));
        // Once for the resize of the overlay itself, once for the window's.
        QCOMPARE(
            recorder.names(), QStringList({QStringLiteral("layoutUpdated"), QStringLiteral("layoutUpdated")}));
        controller->setActive(false, showFlags(1), false);
        recorder.clear();
        scene.window->resize(300, 200);
        QCOMPARE(recorder.names(), QStringList());
        QCOMPARE(controller->size(), QSize(500, 250));
    }

    void nestedPopoversFollowTheWindow()
    {
        PopoverScene scene;
        TestController* const outer = scene.build();
        outer->setActive();
        TestController* const inner = new TestController(outer, nullptr);
        inner->setContainer(new zelkovtest::TestContainer, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        inner->setActive();
        QCOMPARE(inner->geometry(), QRect(0, 0, 400, 300));
        scene.window->resize(500, 350);
        QCOMPARE(inner->geometry(), QRect(0, 0, 500, 350));
        // Also without a resize of what they cover: each descendant is handed the event once.
        TestController* const innermost = new TestController(inner, nullptr);
        innermost->setContainer(new zelkovtest::TestContainer, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        innermost->setActive();
        SignalRecorder innerRecorder(inner);
        SignalRecorder innermostRecorder(innermost);
        QResizeEvent event(QSize(500, 350), QSize(400, 300));
        static_cast<QObject*>(inner)->event(&event);
        QCOMPARE(innerRecorder.count(QStringLiteral("layoutUpdated")), 1);
        QCOMPARE(innermostRecorder.count(QStringLiteral("layoutUpdated")), 1);
    }

    void theBalloonFollowsItsTarget()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        SignalRecorder recorder(controller);
        scene.target->move(100, 60);
        QCOMPARE(controller->balloon()->geometry(), QRect(39, 79, 160, 120));
        scene.target->resize(60, 30);
        // The centre of a rectangle of 60 is at 29.
        QCOMPARE(controller->balloon()->geometry(), QRect(49, 89, 160, 120));
        QCOMPARE(recorder.names(), QStringList());
    }

    void theBalloonOfAHiddenPopoverDoesNotFollow()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive();
        controller->setActive(false, showFlags(1), false);
        scene.target->move(100, 60);
        QCOMPARE(controller->balloon()->geometry(), QRect(119, 39, 160, 120));
    }

    void aNewTargetIsFollowedAndTheOldIsNot()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        QPushButton* const other = new QPushButton(scene.window);
        other->setGeometry(100, 20, 40, 20);
        other->show();
        controller->setForWidget(*other, QPointF(-1, 0));
        QCOMPARE(controller->balloon()->geometry(), QRect(39, 39, 160, 120));
        other->move(110, 20);
        QCOMPARE(controller->balloon()->geometry(), QRect(49, 39, 160, 120));
        scene.target->move(0, 0);
        QCOMPARE(controller->balloon()->geometry(), QRect(49, 39, 160, 120));
    }

    void aTargetMayDieWhileThePopoverIsOpen()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        delete scene.target.data();
        controller->updateLayout(true);
        QVERIFY(controller->isActive());
        QVERIFY(controller->balloon()->forWidget() == nullptr);
        controller->setInWidget(new QWidget(scene.window, Qt::Window));
    }

    void theFilterConsumesNothing()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        QResizeEvent resize(QSize(10, 10), QSize(20, 20));
        QMoveEvent move(QPoint(1, 1), QPoint(2, 2));
        QVERIFY(!controller->eventFilter(scene.window, &resize));
        QVERIFY(!controller->eventFilter(scene.target, &resize));
        QVERIFY(!controller->eventFilter(scene.target, &move));
        QVERIFY(!controller->eventFilter(scene.window, &move));
    }

    // --- Drops
    // ---------------------------------------------------------------------------------------------------

    void dragsOfItemsAreAccepted_data()
    {
        QTest::addColumn<QString>("format");
        QTest::addColumn<bool>("accepted");
        QTest::newRow("item") << Item::sPopoverWidgetItem << true;
        QTest::newRow("text") << QStringLiteral("text/plain") << false;
        QTest::newRow("other case") << QStringLiteral("popoverwidgetitem ") << false;
    }

    void dragsOfItemsAreAccepted()
    {
        QFETCH(QString, format);
        QFETCH(bool, accepted);
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        SignalRecorder recorder(controller);
        QMimeData data;
        data.setData(format, QByteArray("7"));
        QDragEnterEvent enter(QPoint(5, 6), Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        enter.setAccepted(false);
        static_cast<QObject*>(controller)->event(&enter);
        QCOMPARE(enter.isAccepted(), accepted);
        QDragMoveEvent move(QPoint(5, 6), Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        move.setAccepted(false);
        static_cast<QObject*>(controller)->event(&move);
        QCOMPARE(move.isAccepted(), accepted);
        QDragLeaveEvent leave;
        static_cast<QObject*>(controller)->event(&leave);
        QCOMPARE(recorder.names(), QStringList());

        QPoint where;
        QDropEvent* seen = nullptr;
        int drops = 0;
        connect(
            controller, &Controller::itemDropped, controller, [&](Item* item, QDropEvent* event, QPoint position) {
                ++drops;
                seen = event;
                where = position;
                QVERIFY(item == nullptr);
            });
        QDropEvent drop(QPoint(5, 6), Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        drop.setAccepted(false);
        static_cast<QObject*>(controller)->event(&drop);
        QCOMPARE(drop.isAccepted(), accepted);
        QCOMPARE(drops, accepted ? 1 : 0);
        if (accepted) {
            QCOMPARE(where, controller->mapToGlobal(QPoint(5, 6)));
            QCOMPARE(seen, &drop);
        }
    }
};

ZELKOV_TEST_MAIN(TestControllerEvents)
#include "tst_controllerevents.moc"
