// SPDX-License-Identifier: MIT
// The registry of popovers.
#include "popover/Manager.h"

#include <QtTest/QtTest>

#include "LogCapture.h"
#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::PopoverWidget::Manager;
using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::PopoverScene;
using zelkovtest::showFlags;
using zelkovtest::SignalRecorder;
using zelkovtest::TestContainer;
using zelkovtest::TestRow;

using ControllerPointer = vx::TPopoverControllerPointer;

namespace
{
QString word(const char* text)
{
    return QString::fromLatin1(text);
}
}

class TestManager : public zelkovtest::TestCase
{
    Q_OBJECT

    static Manager* manager() { return Manager::instance(); }

    static ControllerPointer create(PopoverScene& scene, int id, bool reuse = false)
    {
        return create(scene.window, scene.target, id, reuse);
    }
    static ControllerPointer create(QWidget* window, QWidget* target, int id, bool reuse = false)
    {
        const ControllerPointer controller = manager()->createController(id, reuse, false, window, target,
            word("title"), word("name"), QFlags<Balloon::EArrowDirection>(QFlag(15)), QSizeF(160, 120),
            QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        controller->fader()->setFadingTimes(40, 40);
        return controller;
    }
    static TestContainer* fill(const ControllerPointer& controller)
    {
        TestContainer* const container = new TestContainer;
        container->addItem(new TestRow(7));
        controller->setContainer(container, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        return container;
    }
    static ControllerPointer open(const ControllerPointer& controller)
    {
        fill(controller);
        controller->setActive();
        return controller;
    }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        Manager::init(1000);
    }
    void cleanup()
    {
        Manager::deleteInstance();
        TestCase::cleanup();
    }

    void thereIsOneInstance()
    {
        Manager* const first = manager();
        QVERIFY(first != nullptr);
        Manager::init(5);
        QCOMPARE(manager(), first);
        QCOMPARE(first->getUniquePopoverID(), 1001);
        QCOMPARE(first->getUniquePopoverID(), 1002);
        Manager::deleteInstance();
        QVERIFY(manager() == nullptr);
        Manager::deleteInstance();
        Manager::init(5);
        QCOMPARE(manager()->getUniquePopoverID(), 6);
        delete manager();
        QVERIFY(manager() == nullptr);
    }

    void namesAndConstants()
    {
        QCOMPARE(Manager::sDefaultControllerID, 0);
        QCOMPARE(
            QMetaType::typeName(qMetaTypeId<vx::TPopoverControllerPointer>()), "vx::TPopoverControllerPointer");
        QList<QByteArray> signalNames;
        QList<QByteArray> slotNames;
        const QMetaObject& meta = Manager::staticMetaObject;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            const QMetaMethod method = meta.method(i);
            (method.methodType() == QMetaMethod::Signal ? signalNames : slotNames) << method.methodSignature();
        }
        QCOMPARE(signalNames,
            QList<QByteArray>({"popoverWillOpen(vx::TPopoverControllerPointer)",
                "popoverDidOpen(vx::TPopoverControllerPointer)", "popoverWillClose(vx::TPopoverControllerPointer)",
                "popoverDidClose(vx::TPopoverControllerPointer)",
                "modalPopoverWillOpen(vx::TPopoverControllerPointer)",
                "modalPopoverDidOpen(vx::TPopoverControllerPointer)", "lastPopoverDidClose()",
                "lastModalPopoverDidClose()", "lastPopoverWillClose()", "lastModalPopoverWillClose()",
                "popoverWillHelp(vx::TPopoverControllerPointer)"}));
        QCOMPARE(slotNames,
            QList<QByteArray>({"onControllerDestroyed(vx::PopoverWidget::Controller*)", "onPopoverWillDisappear()",
                "onPopoverDidDisappear()", "onPopoverWillOpen()", "onPopoverDidOpen()", "onPopoverWillHelp()"}));
    }

    void aNewControllerIsEntered()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        QCOMPARE(controller->objectName(), word("name"));
        QCOMPARE(controller->title(), word("title"));
        QCOMPARE(controller->inWidget(), scene.window.data());
        QVERIFY(!controller->isSubController());
        QCOMPARE(manager()->getController(7), controller);
        QCOMPARE(manager()->getController(controller.data()), controller);
        QCOMPARE(manager()->getControllerID(controller), 7);
        QCOMPARE(manager()->getControllerID(controller.data()), 7);
        const ControllerPointer plain = manager()->createController(8, false, true, scene.window, word("t"),
            word("plain"), QSizeF(100, 80), QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        QVERIFY(plain->isSubController());
        QCOMPARE(manager()->getController(8), plain);
        open(plain);
        QVERIFY(plain->balloon()->forWidget() == nullptr);
        // No side for an arrow: the inner margin on all sides.
        QCOMPARE(plain->balloon()->size(), QSize(108, 88));
    }

    void idsAreReusedOnlyIfAskedKnownAndNotZero()
    {
        PopoverScene scene;
        const ControllerPointer first = create(scene, 7);
        QCOMPARE(create(scene, 7, true), first);
        QVERIFY(create(scene, 7, false) != first);
        QCOMPARE(manager()->getControllers(7).size(), 2);
        const ControllerPointer zero = create(scene, 0);
        QVERIFY(create(scene, 0, true) != zero);
        QVERIFY(create(scene, 8, true) != first);
    }

    void aReusedControllerGetsNewNamesTargetAndPlace()
    {
        PopoverScene scene;
        PopoverScene other;
        const ControllerPointer controller = create(scene, 7);
        fill(controller);
        const auto again = [&](QWidget* target) {
            return manager()->createController(7, true, true, other.window, target, word("second title"),
                word("second"), QFlags<Balloon::EArrowDirection>(), QSizeF(), QFlags<Balloon::ESizeConstraint>());
        };
        QCOMPARE(again(nullptr), controller);
        QCOMPARE(controller->objectName(), word("second"));
        QCOMPARE(controller->title(), word("second title"));
        QCOMPARE(controller->inWidget(), other.window.data());
        QCOMPARE(controller->balloon()->forWidget(), static_cast<const QWidget*>(scene.target));
        again(other.target);
        QCOMPARE(controller->balloon()->forWidget(), static_cast<const QWidget*>(other.target));
        QVERIFY(!controller->isSubController());
        const ControllerPointer plain = manager()->createController(7, true, true, scene.window,
            word("third title"), word("third"), QSizeF(), QFlags<Balloon::ESizeConstraint>());
        QCOMPARE(plain, controller);
        QCOMPARE(controller->objectName(), word("third"));
        QCOMPARE(controller->inWidget(), scene.window.data());
        QCOMPARE(controller->balloon()->forWidget(), static_cast<const QWidget*>(other.target));
    }

    void theFirstOfAnIdIsTheOneEnteredLast()
    {
        PopoverScene scene;
        const ControllerPointer older = create(scene, 7);
        const ControllerPointer newer = create(scene, 7);
        QCOMPARE(manager()->getController(7), newer);
        QCOMPARE(manager()->getControllers(7), QList<ControllerPointer>({newer, older}));
        open(older);
        QVERIFY2(!manager()->isPopoverOpen(7), "only the first is asked");
        QCOMPARE(manager()->currentPopover(), older);
        open(newer);
        QVERIFY(manager()->isPopoverOpen(7));
        manager()->dismiss(7, false, false);
        QVERIFY(!older->isActive());
        QVERIFY(!newer->isActive());
    }

    void unknownIdsGiveNothing()
    {
        QVERIFY(manager()->getController(99).isNull());
        QVERIFY(manager()->getController(nullptr).isNull());
        QCOMPARE(manager()->getControllers(99).size(), 0);
        QCOMPARE(manager()->getControllerID(static_cast<Controller*>(nullptr)), 0);
        QCOMPARE(manager()->getControllerID(ControllerPointer()), 0);
        QVERIFY(manager()->getContainer(99) == nullptr);
        QVERIFY(manager()->getItem(99, 1) == nullptr);
        QVERIFY(manager()->getSelectedItem(99, 1) == nullptr);
        QVERIFY(!manager()->getItemValue(99, 1).isValid());
        QVERIFY(!manager()->getItemUserData(99, 1).isValid());
        QVERIFY(!manager()->isPopoverOpen(99));
        QVERIFY(manager()->currentPopover().isNull());
        QVERIFY(manager()->currentModalPopover().isNull());
        QCOMPARE(manager()->currentPopoverID(), 0);
        QVERIFY(!manager()->anyPopoverOpen(nullptr));
        QVERIFY(!manager()->anyModalPopoverOpen(nullptr));
        manager()->dismiss(99, true, true);
        manager()->dismissAll(nullptr, true, true);
        manager()->raiseControllersForMimeType(word("x"));
        manager()->restoreControllersForMimeType(word("x"));
    }

    void contentsAreFoundById()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        QVERIFY(manager()->getContainer(7) == nullptr);
        QVERIFY(manager()->getItem(7, 1) == nullptr);
        TestContainer* const container = new TestContainer;
        TestRow* const off = new TestRow(1);
        TestRow* const on = new TestRow(1);
        off->setValue(false);
        off->setUserData(word("mine"));
        on->setValue(true);
        container->addItem(off);
        container->addItem(on);
        controller->setContainer(container, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        QCOMPARE(manager()->getContainer(7), static_cast<zelkovtest::Container*>(container));
        QCOMPARE(manager()->getItem(7, 1), static_cast<zelkovtest::Item*>(off));
        QVERIFY(manager()->getItem(7, 2) == nullptr);
        QCOMPARE(manager()->getSelectedItem(7, 1), static_cast<zelkovtest::Item*>(on));
        on->setValue(0);
        QVERIFY(manager()->getSelectedItem(7, 1) == nullptr);
        QCOMPARE(manager()->getItemValue(7, 1), QVariant(false));
        QCOMPARE(manager()->getItemUserData(7, 1), QVariant(word("mine")));
    }

    void aNewIdReplacesAllOthers()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        manager()->addController(8, controller);
        manager()->addController(8, controller);
        manager()->setControllerID(controller, 9);
        QVERIFY(manager()->getController(7).isNull());
        QVERIFY(manager()->getController(8).isNull());
        QCOMPARE(manager()->getControllers(9), QList<ControllerPointer>({controller}));
        manager()->setControllerID(ControllerPointer(), 10);
        QCOMPARE(manager()->getControllers(10).size(), 0);
        SignalRecorder recorder(manager());
        open(controller);
        QCOMPARE(recorder.count(word("popoverWillOpen")), 1);
    }

    // --- Removal
    // -------------------------------------------------------------------------------------------------

    void aDestroyedControllerIsRemoved()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        const ControllerPointer other = create(scene, 7);
        manager()->registerAcceptedDropMimeType(7, word("x"));
        zelkovtest::LogCapture log(1);
        delete controller.data();
        QCOMPARE(log.messages(),
            QStringList(word("[vx::PopoverWidget::Manager::onControllerDestroyed] controller 7 removed!")));
        QCOMPARE(manager()->getControllers(7), QList<ControllerPointer>({other}));
        // The drop type went with it, though another controller has the same id.
        fill(other);
        manager()->raiseControllersForMimeType(word("x"));
        QVERIFY(other->balloon()->isHidden());
    }

    void aControllerEnteredTwiceStaysInTheList()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        manager()->addController(8, controller);
        zelkovtest::LogCapture log(1);
        delete controller.data();
        QCOMPARE(log.messages(),
            QStringList(word("[vx::PopoverWidget::Manager::onControllerDestroyed] multiple entries in list!")));
        QCOMPARE(manager()->getControllers(7).size(), 1);
        QVERIFY(manager()->getController(7).isNull());
        // Reusing such an id gives null.
        QVERIFY(manager()
                    ->createController(8, true, false, scene.window, word("t"), word("n"), QSizeF(),
                        QFlags<Balloon::ESizeConstraint>())
                    .isNull());
        QVERIFY(!manager()->anyPopoverOpen(nullptr));
        manager()->dismissAll(nullptr, false, true);
        manager()->dismissAllModal(nullptr, false, true);
        manager()->adjustInsets(1, 1, 1, 1, scene.window);
    }

    void aControllerThatIsNotEnteredIsNoBusinessOfTheManager()
    {
        PopoverScene scene;
        zelkovtest::LogCapture log(1);
        {
            zelkovtest::TestController controller(scene.window, nullptr);
        }
        QCOMPARE(log.messages(), QStringList());
    }

    // --- What is open
    // --------------------------------------------------------------------------------------------

    void theCurrentPopoverIsTheOpenOneWithTheLowestId()
    {
        PopoverScene scene;
        const ControllerPointer nine = create(scene, 9);
        const ControllerPointer five = create(scene, 5);
        const ControllerPointer seven = create(scene, 7);
        open(nine);
        QCOMPARE(manager()->currentPopover(), nine);
        QCOMPARE(manager()->currentPopoverID(), 9);
        open(five)->setModal(false);
        QCOMPARE(manager()->currentPopover(), five);
        QCOMPARE(manager()->currentPopoverID(), 5);
        QCOMPARE(manager()->currentModalPopover(), nine);
        open(seven);
        QCOMPARE(manager()->currentPopover(), five);
        QCOMPARE(manager()->currentModalPopover(), seven);
        // While it fades it is still open.
        five->dismiss(true, false);
        QVERIFY(manager()->isPopoverOpen(5));
        QCOMPARE(manager()->currentPopover(), five);
        QTRY_COMPARE(manager()->currentPopover(), seven);
    }

    void anActivePopoverIsOpenEvenIfHidden()
    {
        PopoverScene scene;
        const ControllerPointer controller = open(create(scene, 7));
        controller->hide();
        QVERIFY(manager()->isPopoverOpen(7));
        controller->setActive(false, showFlags(0), false);
        QVERIFY(!manager()->isPopoverOpen(7));
        controller->show();
        QVERIFY(manager()->isPopoverOpen(7));
    }

    void onlyTheCurrentPopoverIsAskedForItsWindow()
    {
        PopoverScene scene;
        PopoverScene other;
        open(create(scene, 5));
        open(create(other, 7));
        QVERIFY(manager()->anyPopoverOpen(nullptr));
        QVERIFY(manager()->anyPopoverOpen(scene.window));
        QVERIFY2(!manager()->anyPopoverOpen(other.window), "odd on purpose");
        QVERIFY(manager()->anyModalPopoverOpen(scene.window));
        QVERIFY(!manager()->anyModalPopoverOpen(other.window));
        manager()->getController(5)->setModal(false);
        QVERIFY(!manager()->anyPopoverOpen(other.window));
        QVERIFY(manager()->anyModalPopoverOpen(other.window));
        QVERIFY(!manager()->anyModalPopoverOpen(scene.window));
    }

    // --- All at once
    // ---------------------------------------------------------------------------------------------

    void dismissAllTakesAllOrThoseOfAWindow_data()
    {
        QTest::addColumn<bool>("ofWindow");
        QTest::addColumn<bool>("modalOnly");
        QTest::addColumn<QList<bool>>("active");
        QTest::newRow("all") << false << false << QList<bool> {false, false, false, false};
        QTest::newRow("of a window") << true << false << QList<bool> {false, false, true, true};
        QTest::newRow("modal") << false << true << QList<bool> {false, true, false, true};
        QTest::newRow("modal of a window") << true << true << QList<bool> {false, true, true, true};
    }

    void dismissAllTakesAllOrThoseOfAWindow()
    {
        QFETCH(bool, ofWindow);
        QFETCH(bool, modalOnly);
        PopoverScene scene;
        PopoverScene other;
        QList<ControllerPointer> controllers;
        for (int i = 0; i < 4; ++i) {
            controllers << open(create(i < 2 ? scene : other, i == 3 ? 0 : 5));
            controllers.last()->setModal(i % 2 == 0);
        }
        QWidget* const window = ofWindow ? scene.window.data() : nullptr;
        if (modalOnly) {
            manager()->dismissAllModal(window, false, false);
        } else {
            manager()->dismissAll(window, false, false);
        }
        QList<bool> active;
        for (const ControllerPointer& controller : controllers) {
            active << controller->isActive();
            QCOMPARE(controller->isVisible(), controller->isActive());
        }
        QTEST(active, "active");
    }

    void dismissAllHandsItsWishesOn()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 7);
        TestContainer* const container = fill(controller);
        controller->setActive();
        container->closable = false;
        manager()->dismissAll(nullptr, true, false);
        QVERIFY(controller->isActive());
        manager()->dismissAll(nullptr, true, true);
        QVERIFY(!controller->isActive());
        QVERIFY(controller->isVisible());
        manager()->dismiss(7, false, true);
        QVERIFY(controller->isHidden());
    }

    void slotsMayDeleteControllersDuringTheWalk()
    {
        PopoverScene scene;
        QList<ControllerPointer> controllers;
        for (int id = 1; id <= 5; ++id) {
            controllers << open(create(scene, id));
        }
        connect(controllers.at(1), &Controller::balloonClosed, this, [&] {
            delete controllers.at(0).data();
            delete controllers.at(2).data();
            delete controllers.at(1).data();
        });
        manager()->dismissAll(nullptr, false, false);
        QVERIFY(!controllers.at(3)->isActive());
        QVERIFY(!controllers.at(4)->isActive());
        QCOMPARE(manager()->getControllers(3).size(), 0);
    }

    void insetsAreAddedForActivePopoversOfTheWidget()
    {
        PopoverScene scene;
        PopoverScene other;
        const ControllerPointer active = open(create(scene, 1));
        const ControllerPointer waiting = create(scene, 2);
        const ControllerPointer elsewhere = open(create(other, 3));
        fill(waiting);
        QCoreApplication::processEvents();
        SignalRecorder recorder(active);
        manager()->adjustInsets(1, 2, -3, -4, scene.window);
        QCOMPARE(active->geometry(), QRect(QPoint(1, 2), QPoint(396, 295)));
        // Its own layout pass and the manager's, and one more for the size that changed.
        QCOMPARE(
            recorder.names(), QStringList({word("layoutUpdated"), word("layoutUpdated"), word("layoutUpdated")}));
        int left = 0;
        int top = 0;
        int right = 0;
        int bottom = 0;
        waiting->getInsets(left, top, right, bottom);
        QCOMPARE(left, 0);
        elsewhere->getInsets(left, top, right, bottom);
        QCOMPARE(left, 0);
    }

    // --- Drops
    // ---------------------------------------------------------------------------------------------------

    void balloonsAreLiftedForADragAndPutBack()
    {
        PopoverScene scene;
        const ControllerPointer first = open(create(scene, 1));
        const ControllerPointer second = create(scene, 2);
        const ControllerPointer third = open(create(scene, 3));
        fill(second);
        manager()->registerAcceptedDropMimeType(1, word("a"));
        manager()->registerAcceptedDropMimeType(2, word("a"));
        manager()->registerAcceptedDropMimeType(3, word("b"));
        manager()->registerAcceptedDropMimeType(4, word("a"));
        manager()->raiseControllersForMimeType(word("a"));
        QCOMPARE(first->balloon()->parentWidget(), scene.window.data());
        QVERIFY(first->balloon()->isVisible());
        QCOMPARE(second->balloon()->parentWidget(), scene.window.data());
        QVERIFY2(second->balloon()->isVisible(), "open or not");
        QCOMPARE(third->balloon()->parentWidget(), static_cast<QWidget*>(third));
        QCOMPARE(scene.window->children().last(), static_cast<QObject*>(second->balloon()));
        manager()->restoreControllersForMimeType(word("a"));
        QCOMPARE(first->balloon()->parentWidget(), static_cast<QWidget*>(first));
        QVERIFY(first->balloon()->isVisible());
        QVERIFY(!second->balloon()->isVisible());
        QVERIFY(!second->balloon()->isHidden());
    }

    void theLastFormatOfAnIdCounts()
    {
        PopoverScene scene;
        const ControllerPointer controller = open(create(scene, 1));
        manager()->registerAcceptedDropMimeType(1, word("a"));
        manager()->registerAcceptedDropMimeType(1, word("b"));
        manager()->raiseControllersForMimeType(word("a"));
        QCOMPARE(controller->balloon()->parentWidget(), static_cast<QWidget*>(controller));
        manager()->raiseControllersForMimeType(word("b"));
        QCOMPARE(controller->balloon()->parentWidget(), scene.window.data());
    }

    void aLiftedBalloonDiesWithItsController()
    {
        PopoverScene scene;
        const ControllerPointer controller = open(create(scene, 1));
        manager()->registerAcceptedDropMimeType(1, word("a"));
        manager()->raiseControllersForMimeType(word("a"));
        const QPointer<Balloon> balloon = controller->balloon();
        delete controller.data();
        QVERIFY(balloon == nullptr);
    }

    // --- Signals
    // -------------------------------------------------------------------------------------------------

    void aModalPopoverIsToldOfTwice()
    {
        PopoverScene scene;
        const ControllerPointer controller = create(scene, 1);
        SignalRecorder recorder(manager());
        open(controller);
        QCOMPARE(recorder.names(),
            QStringList({word("popoverWillOpen"), word("modalPopoverWillOpen"), word("popoverDidOpen"),
                word("modalPopoverDidOpen")}));
        for (const SignalRecorder::Entry& entry : recorder.entries()) {
            QCOMPARE(entry.arguments.first().value<vx::TPopoverControllerPointer>(), controller);
        }
        recorder.clear();
        controller->help();
        QCOMPARE(recorder.names(), QStringList(word("popoverWillHelp")));
        const ControllerPointer plain = create(scene, 2);
        plain->setModal(false);
        recorder.clear();
        open(plain);
        QCOMPARE(recorder.names(), QStringList({word("popoverWillOpen"), word("popoverDidOpen")}));
    }

    void theLastOneIsToldOfAtTheEndNotAtTheBeginning()
    {
        PopoverScene scene;
        const ControllerPointer first = open(create(scene, 1));
        const ControllerPointer second = open(create(scene, 2));
        SignalRecorder recorder(manager());
        first->dismiss(false, false);
        QCOMPARE(recorder.names(), QStringList({word("popoverWillClose"), word("popoverDidClose")}));
        recorder.clear();
        second->dismiss(false, false);
        QCOMPARE(recorder.names(),
            QStringList({word("popoverWillClose"), word("popoverDidClose"), word("lastPopoverDidClose"),
                word("lastModalPopoverDidClose")}));
    }

    void thePlainOneThatStaysOpenDoesNotHoldBackTheModalSignal()
    {
        PopoverScene scene;
        const ControllerPointer modal = open(create(scene, 1));
        const ControllerPointer plain = create(scene, 2);
        plain->setModal(false);
        open(plain);
        SignalRecorder recorder(manager());
        modal->dismiss(false, false);
        QCOMPARE(recorder.names(),
            QStringList({word("popoverWillClose"), word("popoverDidClose"), word("lastModalPopoverDidClose")}));
        recorder.clear();
        // No modal popover is open when the plain one goes, so both are told.
        plain->dismiss(false, false);
        QCOMPARE(recorder.names(),
            QStringList({word("popoverWillClose"), word("lastModalPopoverWillClose"), word("popoverDidClose"),
                word("lastPopoverDidClose"), word("lastModalPopoverDidClose")}));
    }

    void theLastWillCloseComesForAnOverlayThatIsHiddenAlready()
    {
        PopoverScene scene;
        const ControllerPointer controller = open(create(scene, 1));
        controller->hide();
        SignalRecorder recorder(manager());
        controller->dismiss(false, false);
        QCOMPARE(recorder.names(),
            QStringList({word("popoverWillClose"), word("lastPopoverWillClose"), word("lastModalPopoverWillClose"),
                word("popoverDidClose"), word("lastPopoverDidClose"), word("lastModalPopoverDidClose")}));
    }

    void aManagerThatIsGoneHearsNothing()
    {
        PopoverScene scene;
        const ControllerPointer controller = open(create(scene, 1));
        connect(manager(), &Manager::popoverWillClose, this, [] { Manager::deleteInstance(); });
        controller->dismiss(false, false);
        QVERIFY(manager() == nullptr);
        QVERIFY(controller->isHidden());
    }
};

ZELKOV_TEST_MAIN(TestManager)
#include "tst_manager.moc"
