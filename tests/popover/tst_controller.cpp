// SPDX-License-Identifier: MIT
// Content, place, opening and closing of a popover's controller.
#include "popover/Controller.h"

#include <QtCore/QPropertyAnimation>
#include <QtTest/QtTest>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QVBoxLayout>

#include "LogCapture.h"
#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::PopoverScene;
using zelkovtest::showFlags;
using zelkovtest::SignalRecorder;
using zelkovtest::TestContainer;
using zelkovtest::TestController;
using zelkovtest::TestRow;

class TestControllerLife : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void valuesOfTheShowFlags()
    {
        QCOMPARE(int(Controller::epsBalloon), 1);
        QCOMPARE(int(Controller::epsGrow), 2);
        QCOMPARE(int(Controller::epsNoFade), 4);
        QCOMPARE(int(Controller::epsMouseTransparent), 8);
    }

    void signalsAndSlotsStandInTheirOrder()
    {
        const QMetaObject& meta = Controller::staticMetaObject;
        QList<QByteArray> signalNames;
        QList<QByteArray> slotNames;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            const QMetaMethod method = meta.method(i);
            (method.methodType() == QMetaMethod::Signal ? signalNames : slotNames) << method.methodSignature();
        }
        QCOMPARE(signalNames,
            QList<QByteArray>({"balloonOpened()", "balloonClosed()", "popoverWillAppear()", "popoverDidAppear()",
                "popoverWillDisappear()", "popoverDidDisappear()", "popoverWillHelp()", "shouldAccept()",
                "shouldReject()", "itemPerformed(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)",
                "marginsChanged(int,int,int,int)", "layoutUpdated()",
                "controllerDestroyed(vx::PopoverWidget::Controller*)",
                "itemDropped(vx::PopoverWidget::Item*,QDropEvent*,QPoint)"}));
        QCOMPARE(slotNames,
            QList<QByteArray>({"setActive(bool,EPopoverShowFlags,bool)", "setActive(bool,EPopoverShowFlags)",
                "setActive(bool)", "setActive()", "setForRect(QRect)", "updateLayout(bool)", "updateLayout()",
                "dismiss(bool,bool)", "dismiss(bool)", "dismiss()", "help()", "close()", "setResultCode(int)",
                "setAccepted()", "setRejected()", "setMargins(int,int,int,int)", "adjustMargins(int,int,int,int)",
                "fadedOut()", "appeared()", "disappeared()"}));
    }

    void aNewControllerIsHiddenAndHasItsDefaults()
    {
        PopoverScene scene;
        TestController controller(scene.window, scene.target);
        QCOMPARE(controller.objectName(), QStringLiteral("popover"));
        QVERIFY(controller.isHidden());
        QVERIFY(!controller.isActive());
        QVERIFY(!controller.isSubController());
        QCOMPARE(controller.resultCode(), 0);
        QVERIFY(controller.balloon() == nullptr);
        QVERIFY(controller.getContainer() == nullptr);
        QVERIFY(controller.isModal());
        QVERIFY(!controller.hasPersistence());
        QCOMPARE(controller.title(), QString());
        QVERIFY(controller.acceptDrops());
        QCOMPARE(controller.fader()->getOpacity(), 0.0);
        int a = 1;
        int b = 1;
        int c = 1;
        int d = 1;
        controller.getMargins(a, b, c, d);
        QCOMPARE(QMargins(a, b, c, d), QMargins());
        a = 1;
        controller.getInsets(a, b, c, d);
        QCOMPARE(QMargins(a, b, c, d), QMargins());
        QVERIFY(TestController(scene.window).isSubController());
    }

    void theOverlayBelongsToTheFirstWindowOrControllerAbove()
    {
        PopoverScene scene;
        QWidget deep(scene.target);
        TestController* const outer = new TestController(&deep, nullptr);
        QCOMPARE(outer->inWidget(), scene.window.data());
        QCOMPARE(outer->parentWidget(), scene.window.data());
        QWidget* const within = new QWidget(outer);
        TestController* const inner = new TestController(within, nullptr);
        QCOMPARE(inner->inWidget(), static_cast<QWidget*>(outer));
        QCOMPARE(inner->parentWidget(), static_cast<QWidget*>(outer));
        TestController itself(outer, nullptr);
        QCOMPARE(itself.inWidget(), static_cast<QWidget*>(outer));
    }

    void anotherPlaceHidesTheOverlayAndTheSameDoesNot()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        QWidget* const other = new QWidget(scene.window, Qt::Window);
        controller->setActive();
        QVERIFY(controller->isVisible());
        controller->setInWidget(scene.window);
        QVERIFY(controller->isVisible());
        controller->fader()->setOpacity(0.5);
        controller->setInWidget(nullptr);
        QVERIFY(controller->isHidden());
        QCOMPARE(controller->fader()->getOpacity(), 0.0);
        QCOMPARE(controller->inWidget(), scene.window.data());
        controller->setInWidget(other);
        QCOMPARE(controller->parentWidget(), other);
        QCOMPARE(controller->inWidget(), other);
    }

    void connectionsOfTheFaderAreMadeOnce()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        QWidget* const other = new QWidget(scene.window, Qt::Window);
        controller->setInWidget(other);
        controller->setInWidget(scene.window);
        SignalRecorder recorder(controller);
        controller->setActive();
        QCOMPARE(recorder.count(QStringLiteral("popoverDidAppear")), 1);
    }

    void contentIsTakenOnce()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        Balloon* const balloon = controller->balloon();
        QVERIFY(balloon != nullptr);
        QCOMPARE(balloon->parentWidget(), static_cast<QWidget*>(controller));
        QVERIFY(balloon->isHidden());
        QCOMPARE(balloon->contentWidget(), static_cast<zelkovtest::Container*>(scene.container));
        QCOMPARE(balloon->forWidget(), static_cast<const QWidget*>(scene.target));
        QCOMPARE(int(balloon->getFeatures()), 8);
        TestContainer second;
        controller->setContainer(&second, QFlags<Balloon::EBalloonFeature>());
        QCOMPARE(controller->getContainer(), static_cast<zelkovtest::Container*>(scene.container));
        QCOMPARE(controller->balloon(), balloon);
    }

    void titleReachesABalloonThatComesLater()
    {
        PopoverScene scene;
        scene.controller = new TestController(scene.window, scene.target);
        scene.controller->setTitle(QStringLiteral("before"));
        QCOMPARE(scene.controller->title(), QStringLiteral("before"));
        scene.fill(Balloon::ebfTitle);
        QLabel* const label = scene.controller->balloon()->findChild<QLabel*>(QStringLiteral("popoverTitle"));
        QVERIFY(label != nullptr);
        QCOMPARE(label->text(), QStringLiteral("before"));
        scene.controller->setTitle(QStringLiteral("after"));
        QCOMPARE(label->text(), QStringLiteral("after"));
    }

    void withoutAWidgetToCoverTheControllerHoldsTheContentItself()
    {
        TestController controller(nullptr);
        auto* const container = new TestContainer;
        auto* const header = new TestContainer;
        auto* const footer = new TestContainer;
        container->addHeader(header);
        container->addFooter(footer);
        controller.setContainer(container, QFlags<Balloon::EBalloonFeature>());
        QVERIFY(controller.balloon() == nullptr);
        QVERIFY(controller.inWidget() == nullptr);
        QVBoxLayout* const box = qobject_cast<QVBoxLayout*>(controller.layout());
        QVERIFY(box != nullptr);
        QCOMPARE(box->contentsMargins(), QMargins());
        QCOMPARE(box->count(), 3);
        QCOMPARE(box->itemAt(0)->widget(), static_cast<QWidget*>(header));
        QScrollArea* const area = qobject_cast<QScrollArea*>(box->itemAt(1)->widget());
        QVERIFY(area != nullptr);
        QCOMPARE(area->widget(), static_cast<QWidget*>(container));
        QVERIFY(area->widgetResizable());
        QCOMPARE(area->frameShape(), QFrame::NoFrame);
        QCOMPARE(box->itemAt(2)->widget(), static_cast<QWidget*>(footer));
        // Now it has a layout, and a second content is refused.
        TestContainer second;
        controller.setContainer(&second, QFlags<Balloon::EBalloonFeature>());
        QCOMPARE(controller.getContainer(), static_cast<zelkovtest::Container*>(container));
    }

    void theCoveredAreaIsTheWindowLessInsetsAndMargins()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        SignalRecorder recorder(controller);
        QCOMPARE(controller->controllerRect(), QRect(0, 0, 400, 300));
        controller->setInsets(10, 20, -30, -40);
        controller->adjustInsets(1, 1, -1, -1);
        QCOMPARE(controller->controllerRect(), QRect(11, 21, 358, 238));
        QCOMPARE(recorder.names(), QStringList());
        controller->setMargins(1, 2, 3, 4);
        controller->adjustMargins(4, 3, 2, 1);
        QCOMPARE(controller->controllerRect(), QRect(16, 26, 348, 228));
        QCOMPARE(
            recorder.names(), QStringList({QStringLiteral("marginsChanged"), QStringLiteral("marginsChanged")}));
        QCOMPARE(recorder.entries().at(0).arguments, QVariantList({1, 2, 3, 4}));
        QCOMPARE(recorder.entries().at(1).arguments, QVariantList({5, 5, 5, 5}));
        int left = 0;
        int top = 0;
        int right = 0;
        int bottom = 0;
        controller->getInsets(left, top, right, bottom);
        QCOMPARE(QMargins(left, top, right, bottom), QMargins(11, 21, -31, -41));
        controller->getMargins(left, top, right, bottom);
        QCOMPARE(QMargins(left, top, right, bottom), QMargins(5, 5, 5, 5));
        controller->setActive();
        QCOMPARE(controller->geometry(), QRect(16, 26, 348, 228));
        recorder.clear();
        controller->setInsets(0, 0, 0, 0);
        QCOMPARE(controller->geometry(), QRect(5, 5, 390, 290));
        QVERIFY(recorder.count(QStringLiteral("layoutUpdated")) >= 1);
        recorder.clear();
        controller->setMargins(0, 0, 0, 0);
        QCOMPARE(recorder.names().first(), QStringLiteral("marginsChanged"));
        QCOMPARE(recorder.names().last(), QStringLiteral("layoutUpdated"));
        QCOMPARE(controller->geometry(), QRect(0, 0, 400, 300));
    }

    void overAnotherControllerItsGeometryIsCoveredAndInsetsDoNotCount()
    {
        PopoverScene scene;
        TestController* const outer = scene.build();
        outer->setMargins(10, 20, 30, 40);
        outer->setActive();
        QCOMPARE(outer->geometry(), QRect(10, 20, 360, 240));
        TestController* const inner = new TestController(outer, nullptr);
        inner->setInsets(7, 7, 7, 7);
        inner->setMargins(1, 1, 1, 1);
        // The geometry stands in the coordinates of the window and is used as it is: clients rely on it.
        QCOMPARE(inner->controllerRect(), QRect(11, 21, 358, 238));
    }

    void layoutRunsOnlyWhileVisibleUnlessForced()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        SignalRecorder recorder(controller);
        controller->updateLayout();
        QCOMPARE(recorder.names(), QStringList());
        controller->updateLayout(true);
        QCOMPARE(recorder.names(), QStringList(QStringLiteral("layoutUpdated")));
        QCOMPARE(controller->geometry(), QRect(0, 0, 400, 300));
        QVERIFY(controller->balloon()->geometry().contains(QPoint(200, 100)));
        TestController free(nullptr);
        SignalRecorder none(&free);
        free.updateLayout(true);
        QCOMPARE(none.names(), QStringList());
    }

    void pointingWithoutABalloonIsLogged()
    {
        PopoverScene scene;
        TestController controller(scene.window, nullptr);
        zelkovtest::LogCapture log(3);
        controller.setForWidget(*scene.target, QPointF(-1, 0));
        QCOMPARE(log.messages(),
            QStringList(QStringLiteral("[vx::PopoverWidget::Controller::setForWidget] no PopoverWidget set!")));
    }

    void growingWithoutABalloonIsLogged()
    {
        TestController controller(nullptr);
        controller.setContainer(new TestContainer, QFlags<Balloon::EBalloonFeature>());
        zelkovtest::LogCapture log(3);
        controller.setPersistence(true);
        controller.setActive(true, showFlags(Controller::epsGrow | Controller::epsNoFade));
        QVERIFY(controller.isVisible());
        controller.dismiss(false, false);
        QVERIFY(controller.isHidden());
        QMetaObject::invokeMethod(&controller, "appeared");
        QMetaObject::invokeMethod(&controller, "disappeared");
        QCOMPARE(log.messages(),
            QStringList({QStringLiteral("[vx::PopoverWidget::Controller::appear] no PopoverWidget set!"),
                QStringLiteral("[vx::PopoverWidget::Controller::disappear] no PopoverWidget set!"),
                QStringLiteral("[vx::PopoverWidget::Controller::appeared] no PopoverWidget set!"),
                QStringLiteral("[vx::PopoverWidget::Controller::disappeared] no PopoverWidget set!")}));
    }

    void aTargetAndARectangleReachTheBalloon()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        QPushButton* const other = new QPushButton(scene.window);
        other->setGeometry(300, 20, 20, 20);
        other->show();
        controller->setActive();
        const QRect before = controller->balloon()->geometry();
        controller->setForWidget(*other, QPointF(-1, 0));
        QCOMPARE(controller->balloon()->forWidget(), static_cast<const QWidget*>(other));
        const QRect after = controller->balloon()->geometry();
        QVERIFY(before != after);
        controller->setForRect(QRect(0, 0, 30, 30));
        QVERIFY(controller->balloon()->geometry() != after);
        controller->setBalloonFeatures(QFlags<Balloon::EBalloonFeature>(QFlag(5)));
        QCOMPARE(int(controller->balloon()->getFeatures()), 5);
    }

    // --- Opening
    // -------------------------------------------------------------------------------------------------

    void openingByFlags_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<bool>("animated");
        for (int flags = 0; flags < 16; ++flags) {
            QTest::newRow(QByteArray::number(flags) + " animated") << flags << true;
            QTest::newRow(QByteArray::number(flags) + " plain") << flags << false;
        }
    }

    void openingByFlags()
    {
        QFETCH(int, flags);
        QFETCH(bool, animated);
        const bool balloonAtOnce = (flags & 1) != 0;
        const bool grows = !balloonAtOnce && (flags & 2) != 0;
        const bool fades = animated && (flags & 4) == 0;
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->balloon()->findChild<QPropertyAnimation*>()->setDuration(60);
        SignalRecorder recorder(controller);
        controller->setActive(true, showFlags(flags), animated);
        QVERIFY(controller->isActive());
        QVERIFY(controller->isVisible());
        QCOMPARE(controller->testAttribute(Qt::WA_TransparentForMouseEvents), (flags & 8) != 0);
        QVERIFY(!controller->testAttribute(Qt::WA_DontShowOnScreen));
        QCOMPARE(controller->balloon()->isVisible(), balloonAtOnce || grows);
        QCOMPARE(controller->balloon()->content()->isHidden(), grows);
        QCOMPARE(scene.container->opened, balloonAtOnce ? 1 : 0);
        QCOMPARE(recorder.count(QStringLiteral("popoverDidAppear")), fades ? 0 : 1);
        QCOMPARE(controller->fader()->state() == QAbstractAnimation::Running, fades);
        // Without a fade the overlay keeps the opacity it had: nothing sets it. Odd on purpose.
        if (!fades) {
            QCOMPARE(controller->fader()->getOpacity(), (flags & 4) != 0 ? 0.0 : 1.0);
        }
        if (fades) {
            QTRY_COMPARE(controller->fader()->getOpacity(), 1.0);
        }
        const int total = 1 + (grows ? 1 : 0);
        QTRY_COMPARE(recorder.count(QStringLiteral("popoverDidAppear")), total);
        QCOMPARE(scene.container->opened, balloonAtOnce || grows ? 1 : 0);
        QVERIFY(!controller->balloon()->content()->isHidden());
        if (balloonAtOnce || grows) {
            QCOMPARE(controller->balloon()->geometry(), QRect(119, 39, 160, 120));
        }
    }

    void growingStartsAtTheCentreAndEndsAtTheFullSize()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive(true, showFlags(Controller::epsGrow | Controller::epsNoFade));
        QPropertyAnimation* const animation = controller->balloon()->findChild<QPropertyAnimation*>();
        QVERIFY(animation != nullptr);
        QCOMPARE(animation->parent(), static_cast<QObject*>(controller->balloon()));
        QCOMPARE(animation->propertyName(), QByteArray("geometry"));
        QCOMPARE(animation->duration(), 400);
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::OutBack);
        QCOMPARE(animation->startValue().toRect(), QRect(QPoint(199, 149), QSize()));
        QCOMPARE(animation->endValue().toRect(), QRect(119, 39, 160, 120));
        QCOMPARE(animation->state(), QAbstractAnimation::Running);
        QTRY_VERIFY(scene.container->opened == 1);
        QCOMPARE(controller->balloon()->geometry(), QRect(119, 39, 160, 120));
        controller->setPersistence(true);
        controller->dismiss(true, false);
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::Linear);
        QCOMPARE(animation->startValue().toRect(), QRect(119, 39, 160, 120));
        QCOMPARE(animation->endValue().toRect(), QRect(QPoint(199, 149), QSize()));
        QVERIFY(!controller->balloon()->layout()->isEnabled());
        QVERIFY(controller->balloon()->content()->isHidden());
        QTRY_VERIFY(controller->balloon()->layout()->isEnabled());
        QVERIFY(controller->isHidden());
    }

    void focusGoesToTheOverlayOrToTheGrownBalloon()
    {
        PopoverScene scene;
        scene.window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        TestController* const controller = scene.build();
        controller->setActive();
        QCOMPARE(scene.window->focusWidget(), static_cast<QWidget*>(controller));
        controller->setPersistence(true);
        controller->dismiss(false, false);
        controller->setActive(true, showFlags(Controller::epsGrow | Controller::epsNoFade));
        QTRY_COMPARE(scene.window->focusWidget(), static_cast<QWidget*>(controller->balloon()));
    }

    void theAutoFocusItemGetsTheFocusLast()
    {
        PopoverScene scene;
        QVERIFY(QTest::qWaitForWindowActive(scene.window));
        TestController* const controller = scene.build();
        QLineEdit* const edit = new QLineEdit(scene.row);
        edit->show();
        scene.row->setFocusItem(edit);
        scene.container->setAutoFocusItem(7);
        controller->setActive();
        QCOMPARE(scene.window->focusWidget(), static_cast<QWidget*>(edit));
    }

    void anUnknownAutoFocusItemIsNoHarm()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        scene.container->setAutoFocusItem(4711);
        controller->setActive();
        QVERIFY(controller->isVisible());
    }

    // --- Closing
    // -------------------------------------------------------------------------------------------------

    void closingByFlags_data() { openingByFlags_data(); }

    void closingByFlags()
    {
        QFETCH(int, flags);
        QFETCH(bool, animated);
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->balloon()->findChild<QPropertyAnimation*>()->setDuration(60);
        controller->setPersistence(true);
        controller->setActive(true, showFlags(flags), false);
        QTRY_VERIFY(!controller->balloon()->content()->isHidden());
        SignalRecorder recorder(controller);
        controller->dismiss(animated, false);
        QVERIFY(!controller->isActive());
        QCOMPARE(recorder.names().mid(0, 2),
            QStringList({QStringLiteral("balloonClosed"), QStringLiteral("popoverWillDisappear")}));
        const bool atOnce = (flags & 1) != 0;
        const bool shrinks = !atOnce && (flags & 2) != 0;
        if (!atOnce && !shrinks) {
            // Nothing is hidden, no fade runs: the popover stays on the screen, no longer active.
            QVERIFY(!QTest::qWaitFor([&] { return !controller->isVisible(); }, 100));
            QCOMPARE(controller->fader()->state(), QAbstractAnimation::Stopped);
            QCOMPARE(recorder.names().size(), 2);
            return;
        }
        QCOMPARE(controller->isVisible(), animated);
        QCOMPARE(controller->balloon()->isHidden(), atOnce);
        QTRY_VERIFY(controller->testAttribute(Qt::WA_DontShowOnScreen));
        QVERIFY(controller->isHidden());
        QTRY_COMPARE(recorder.count(QStringLiteral("popoverDidDisappear")), shrinks ? 2 : 1);
    }

    void theFlagsGivenAtTheCloseDecide()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive(true, showFlags(5));
        controller->setActive(false, showFlags(0), false);
        QVERIFY(controller->isVisible());
        QVERIFY(controller->balloon()->isVisible());
        controller->setActive(false, showFlags(1), false);
        QVERIFY(controller->isHidden());
        QVERIFY(controller->balloon()->isHidden());
    }

    void closingBySetActiveAsksAndTellsNobody()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive();
        scene.container->closable = false;
        SignalRecorder recorder(scene.container);
        zelkovtest::LogCapture log(1);
        controller->setActive(false, showFlags(1), false);
        QVERIFY(!controller->isActive());
        QCOMPARE(scene.container->asked, 0);
        QCOMPARE(recorder.count(QStringLiteral("popoverAboutToClose")), 0);
        QCOMPARE(log.messages().filter(QStringLiteral("::dismiss]")), QStringList());
        QCOMPARE(log.messages().filter(QStringLiteral("::fadedOut]")).size(), 1);
    }

    void dismissIsRefusedAndLogged_data()
    {
        QTest::addColumn<bool>("stays");
        QTest::addColumn<bool>("closable");
        QTest::addColumn<bool>("force");
        QTest::addColumn<bool>("closes");
        QTest::addColumn<int>("asked");
        QTest::newRow("free") << false << true << false << true << 1;
        QTest::newRow("container says no") << false << false << false << false << 1;
        QTest::newRow("stays visible") << true << true << false << false << 0;
        QTest::newRow("both") << true << false << false << false << 0;
        QTest::newRow("forced against the container") << false << false << true << true << 0;
        QTest::newRow("forced though it stays") << true << true << true << true << 0;
    }

    void dismissIsRefusedAndLogged()
    {
        QFETCH(bool, stays);
        QFETCH(bool, closable);
        QFETCH(bool, force);
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        controller->setStayVisible(stays);
        scene.container->closable = closable;
        SignalRecorder recorder(controller);
        SignalRecorder content(scene.container);
        QStringList lines;
        {
            zelkovtest::LogCapture log(1);
            controller->dismiss(true, force);
            lines = log.messages();
        }
        QTEST(!recorder.names().isEmpty(), "closes");
        QTEST(!controller->isActive(), "closes");
        QTEST(content.count(QStringLiteral("popoverAboutToClose")) == 1, "closes");
        QTEST(scene.container->asked, "asked");
        const QString prefix = QStringLiteral("[vx::PopoverWidget::Controller::dismiss] ");
        QCOMPARE(lines.contains(prefix + QStringLiteral("closing of controller prohibited by Container!")),
            controller->isActive());
        // The address comes last in any case.
        QVERIFY(lines.last().startsWith(prefix + QStringLiteral("0x")));
    }

    void withoutAContainerAnUnforcedDismissalIsRefused()
    {
        PopoverScene scene;
        TestController controller(scene.window, nullptr);
        SignalRecorder recorder(&controller);
        zelkovtest::LogCapture log(1);
        controller.dismiss(false, false);
        QCOMPARE(recorder.names(), QStringList());
        QCOMPARE(log.messages().size(), 2);
        QVERIFY(log.messages().first().endsWith(QLatin1String("closing of controller prohibited by Container!")));
    }

    void closeIsAnUnforcedDismissalWithoutAnimation()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        scene.container->closable = false;
        controller->close();
        QVERIFY(controller->isActive());
        scene.container->closable = true;
        controller->close();
        QVERIFY(controller->isHidden());
        QCOMPARE(scene.container->asked, 2);
    }

    void aClosedControllerIsDeletedUnlessPersistent()
    {
        PopoverScene scene;
        scene.build();
        scene.controller->setActive();
        SignalRecorder recorder(scene.controller);
        scene.controller->dismiss(true, false);
        QVERIFY(scene.controller->isVisible());
        QTRY_VERIFY(scene.controller == nullptr);
        QVERIFY(scene.container == nullptr);
        QVERIFY(scene.row == nullptr);
        QCOMPARE(recorder.names().last(), QStringLiteral("controllerDestroyed"));
    }

    void aPersistentControllerOpensAgain()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        QVERIFY(controller->hasPersistence());
        Balloon* const balloon = controller->balloon();
        for (int i = 0; i < 3; ++i) {
            controller->setActive();
            QVERIFY(!controller->testAttribute(Qt::WA_DontShowOnScreen));
            QVERIFY(balloon->isVisible());
            controller->dismiss(true, false);
            QTRY_VERIFY(controller->testAttribute(Qt::WA_DontShowOnScreen));
            QVERIFY(controller->isHidden());
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(scene.controller != nullptr);
        QCOMPARE(controller->balloon(), balloon);
    }

    void fullScreenIsTakenFromTheStateOfTheOverlay()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setWindowState(Qt::WindowFullScreen);
        controller->setActive(true, showFlags(Controller::epsBalloon), false);
        QVERIFY(!controller->windowState().testFlag(Qt::WindowFullScreen));
    }

    // --- Interruptions
    // -------------------------------------------------------------------------------------------

    void openingDuringTheFadeOutKeepsThePopover()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        controller->dismiss(true, false);
        SignalRecorder recorder(controller);
        controller->setActive();
        QVERIFY(
            !QTest::qWaitFor([&] { return scene.controller == nullptr || !scene.controller->isVisible(); }, 150));
        QCOMPARE(recorder.count(QStringLiteral("popoverDidDisappear")), 0);
    }

    void closingWithoutAnimationEndsARunningFadeIn()
    {
        for (const int flags : {1, 2}) {
            PopoverScene scene;
            TestController* const controller = scene.build();
            controller->setPersistence(true);
            controller->setActive(true, showFlags(flags), true);
            SignalRecorder recorder(controller);
            controller->dismiss(false, false);
            QVERIFY(
                !QTest::qWaitFor([&] { return recorder.count(QStringLiteral("popoverDidAppear")) != 0; }, 150));
            QCOMPARE(recorder.count(QStringLiteral("popoverDidDisappear")), 1);
            QVERIFY(controller->isHidden());
        }
    }

    void openingAtOnceAfterShrinkingShowsTheContent()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive(true, showFlags(6));
        controller->dismiss(false, false);
        controller->setActive(true, showFlags(5));
        QVERIFY(controller->balloon()->content()->isVisible());
        QVERIFY(controller->balloon()->layout()->isEnabled());
        // The end of the shrinking that was left does not catch up.
        QVERIFY(!QTest::qWaitFor([&] { return !controller->isVisible(); }, 500));
        QCOMPARE(controller->balloon()->geometry(), QRect(119, 39, 160, 120));
    }

    void closingAtOnceEndsTheGrowth()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setPersistence(true);
        controller->setActive(true, showFlags(6));
        controller->setActive(false, showFlags(1), false);
        SignalRecorder recorder(controller);
        QVERIFY(!QTest::qWaitFor([&] { return !recorder.names().isEmpty(); }, 500));
        QCOMPARE(scene.container->opened, 0);
    }

    // --- What passes through
    // -------------------------------------------------------------------------------------

    void aPerformedItemIsReportedAndDismissesIfItShould()
    {
        PopoverScene scene;
        TestController* const controller = scene.build(Balloon::ebfNoHeader, vx::PopoverWidget::ecfDismiss);
        scene.row->setValue(42);
        scene.row->setUserData(QStringLiteral("data"));
        controller->setActive();
        QCoreApplication::processEvents();
        SignalRecorder recorder(controller);
        PopoverScene::click(scene.row, scene.row->rect().center());
        QCOMPARE(recorder.names(),
            QStringList({QStringLiteral("balloonClosed"), QStringLiteral("popoverWillDisappear"),
                QStringLiteral("itemPerformed")}));
        const QVariantList arguments = recorder.entries().last().arguments;
        QCOMPARE(arguments.at(0).toInt(), 7);
        QCOMPARE(arguments.at(1).value<QVariant>().toInt(), 42);
    }

    void balloonButtonsHelpAndDismiss()
    {
        PopoverScene scene;
        TestController* const controller = scene.build(7);
        controller->setActive();
        SignalRecorder recorder(controller);
        controller->balloon()->findChild<QPushButton*>(QStringLiteral("popoverHelpButton"))->click();
        QCOMPARE(recorder.names(), QStringList(QStringLiteral("popoverWillHelp")));
        recorder.clear();
        controller->balloon()->findChild<QPushButton*>(QStringLiteral("popoverCloseButton"))->click();
        QCOMPARE(recorder.names(),
            QStringList({QStringLiteral("balloonClosed"), QStringLiteral("popoverWillDisappear")}));
    }

    void aChangedLayoutOfTheContentIsLaidOutAtOnce()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setActive();
        QCoreApplication::processEvents();
        SignalRecorder recorder(controller);
        scene.container->addSpacing(8);
        QCOMPARE(recorder.names(), QStringList(QStringLiteral("layoutUpdated")));
    }

    void resultCodes()
    {
        PopoverScene scene;
        TestController* const controller = scene.build();
        controller->setAccepted();
        QCOMPARE(controller->resultCode(), 1);
        controller->setRejected();
        QCOMPARE(controller->resultCode(), 0);
        controller->setResultCode(-5);
        QCOMPARE(controller->resultCode(), -5);
        controller->setModal(false);
        QVERIFY(!controller->isModal());
    }
};

ZELKOV_TEST_MAIN(TestControllerLife)
#include "tst_controller.moc"
