// SPDX-License-Identifier: MIT
// Every signal of controller, container, balloon and manager in one list, for the things that happen to a popover.
#include "popover/Manager.h"

#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QDialogButtonBox>

#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::PopoverWidget::Manager;
using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::Item;
using zelkovtest::PopoverScene;
using zelkovtest::showFlags;
using zelkovtest::SignalRecorder;
using zelkovtest::TestController;

namespace
{
// A popover whose signals are recorded ahead of what they cause, so that the list reads in the order of emission.
class RecordedPopover
{
public:
    RecordedPopover(PopoverScene& scene, SignalRecorder& recorder, int id = 1, int containerFlags = 0)
        : m_recorder(recorder)
    {
        scene.controller = new TestController(scene.window, scene.target);
        scene.controller->fader()->setFadingTimes(40, 40);
        recorder.add(scene.controller);
        Manager::instance()->addController(id, scene.controller);
        scene.makeContent(containerFlags);
        recorder.add(scene.container);
        scene.controller->setContainer(scene.container, QFlags<Balloon::EBalloonFeature>(QFlag(7)));
        // Connected behind the controller, so its signals stand after what they cause.
        recorder.add(scene.controller->balloon());
        add(scene.controller, "controller");
        add(scene.container, "container");
        add(scene.controller->balloon(), "balloon");
        add(Manager::instance(), "manager");
    }

    void add(QObject* object, const char* name) { m_names.insert(object, QString::fromLatin1(name)); }

    // The list so far, which is forgotten.
    QStringList take()
    {
        QStringList result;
        for (const SignalRecorder::Entry& entry : m_recorder.entries()) {
            result << m_names.value(entry.sender) + QLatin1Char('.') + entry.name;
        }
        m_recorder.clear();
        return result;
    }

private:
    SignalRecorder& m_recorder;
    QHash<QObject*, QString> m_names;
};

QStringList list(const char* text)
{
    const QString words = QString::fromLatin1(text).simplified();
    return words.isEmpty() ? QStringList() : words.split(QLatin1Char(' '));
}

const char c_opened[] = "controller.popoverWillAppear manager.popoverWillOpen manager.modalPopoverWillOpen "
                        "container.popoverAboutToOpen ";
const char c_appeared[] = "controller.popoverDidAppear manager.popoverDidOpen manager.modalPopoverDidOpen ";
// The first show gives the overlay its size, which is a layout pass of its own.
const char c_laidOut[] = "controller.layoutUpdated controller.layoutUpdated ";
const char c_closing[] = "controller.balloonClosed controller.popoverWillDisappear manager.popoverWillClose ";
const char c_gone[] = "controller.popoverDidDisappear manager.popoverDidClose manager.lastPopoverDidClose "
                      "manager.lastModalPopoverDidClose ";
const char c_aboutToClose[] = "container.popoverAboutToClose ";

QByteArray join(std::initializer_list<const char*> parts)
{
    QByteArray result;
    for (const char* part : parts) {
        result += part;
    }
    return result;
}
}

class TestPopoverOrder : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        Manager::init(0);
    }
    void cleanup()
    {
        Manager::deleteInstance();
        TestCase::cleanup();
    }

    void opening_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<bool>("animated");
        QTest::addColumn<QByteArray>("atOnce");
        QTest::addColumn<QByteArray>("later");
        const QByteArray atOnce = join({c_opened, c_laidOut, c_appeared, "controller.balloonOpened"});
        const QByteArray fading = join({c_opened, c_laidOut, "controller.balloonOpened"});
        const QByteArray growing
            = join({c_opened, c_laidOut, c_appeared, "controller.layoutUpdated ", "controller.balloonOpened"});
        const QByteArray growingAndFading
            = join({c_opened, c_laidOut, "controller.layoutUpdated ", "controller.balloonOpened"});
        const QByteArray grown = join({"controller.layoutUpdated ", c_appeared});
        for (const bool mouse : {false, true}) {
            const int more = mouse ? 8 : 0;
            const QByteArray suffix = mouse ? " transparent" : "";
            QTest::newRow("nothing" + suffix) << more << false << atOnce << QByteArray();
            QTest::newRow("nothing, fading" + suffix) << more << true << fading << QByteArray(c_appeared);
            QTest::newRow("balloon" + suffix) << (1 | more) << false << atOnce << QByteArray();
            QTest::newRow("balloon, fading" + suffix) << (1 | more) << true << fading << QByteArray(c_appeared);
            QTest::newRow("no fade" + suffix) << (4 | more) << true << atOnce << QByteArray();
            QTest::newRow("balloon, no fade" + suffix) << (5 | more) << true << atOnce << QByteArray();
            QTest::newRow("balloon, no fade, plain" + suffix) << (5 | more) << false << atOnce << QByteArray();
            QTest::newRow("balloon beats growing" + suffix) << (7 | more) << true << atOnce << QByteArray();
            // The second popoverDidAppear is the end of the growth.
            QTest::newRow("growing" + suffix) << (2 | more) << false << growing << grown;
            QTest::newRow("growing, no fade" + suffix) << (6 | more) << true << growing << grown;
            QTest::newRow("growing, fading" + suffix)
                << (2 | more) << true << growingAndFading << c_appeared + grown;
        }
    }

    void opening()
    {
        QFETCH(int, flags);
        QFETCH(bool, animated);
        QFETCH(QByteArray, atOnce);
        QFETCH(QByteArray, later);
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive(true, showFlags(flags), animated);
        QCOMPARE(popover.take(), list(atOnce));
        const int expected = list(later).size();
        QTRY_VERIFY(recorder.entries().size() >= expected);
        QCOMPARE(popover.take(), list(later));
    }

    void closing_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<bool>("animated");
        QTest::addColumn<QByteArray>("atOnce");
        QTest::addColumn<QByteArray>("later");
        const QByteArray closing = join({c_aboutToClose, c_closing});
        const QByteArray closed = join({c_aboutToClose, c_closing, c_gone});
        QTest::newRow("nothing") << 0 << false << closing << QByteArray();
        QTest::newRow("nothing, animated") << 0 << true << closing << QByteArray();
        QTest::newRow("no fade alone") << 4 << true << closing << QByteArray();
        QTest::newRow("balloon") << 1 << false << closed << QByteArray();
        QTest::newRow("balloon, fading") << 1 << true << closing << QByteArray(c_gone);
        QTest::newRow("no fade does not count") << 5 << true << closing << QByteArray(c_gone);
        QTest::newRow("transparent does not count") << 13 << true << closing << QByteArray(c_gone);
        QTest::newRow("balloon beats growing") << 7 << true << closing << QByteArray(c_gone);
        // The end of the fade, or of the hiding, and then the end of the shrinking.
        QTest::newRow("growing") << 2 << false << closed << QByteArray(c_gone);
        QTest::newRow("growing, fading") << 2 << true << closing << join({c_gone, c_gone});
    }

    void closing()
    {
        QFETCH(int, flags);
        QFETCH(bool, animated);
        QFETCH(QByteArray, atOnce);
        QFETCH(QByteArray, later);
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setPersistence(true);
        scene.controller->setActive(true, showFlags(flags), false);
        QTRY_VERIFY(!scene.controller->balloon()->content()->isHidden());
        popover.take();
        scene.controller->dismiss(animated, false);
        QCOMPARE(popover.take(), list(atOnce));
        const int expected = list(later).size();
        QTRY_VERIFY(recorder.entries().size() >= expected);
        QCOMPARE(popover.take(), list(later));
    }

    void closingForGoodEndsWithTheDestruction()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        popover.take();
        scene.controller->setActive(false, showFlags(1), true);
        QCOMPARE(popover.take(), list(c_closing));
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(popover.take(), list(join({c_gone, "controller.controllerDestroyed"})));
    }

    void aShrinkingPopoverThatIsNotPersistentIsToldOfOnce()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive(true, showFlags(2), false);
        QTRY_VERIFY(!scene.controller->balloon()->content()->isHidden());
        popover.take();
        scene.controller->dismiss(true, false);
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(
            popover.take(), list(join({c_aboutToClose, c_closing, c_gone, "controller.controllerDestroyed"})));
    }

    void aDismissingRowClosesBeforeTheClientHearsOfIt()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder, 1, 3);
        scene.controller->setActive();
        QCoreApplication::processEvents();
        popover.take();
        PopoverScene::click(scene.row, scene.row->rect().center());
        QCOMPARE(popover.take(),
            list(join({"container.dismissPopover ", c_aboutToClose, c_closing,
                "container.dismissAllPopover container.itemPerformed controller.itemPerformed"})));
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(popover.take(), list(join({c_gone, "controller.controllerDestroyed"})));
    }

    void aClickOutside()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        popover.take();
        PopoverScene::press(scene.controller, QPoint(10, 290));
        QCOMPARE(popover.take(), QStringList());
        PopoverScene::release(scene.controller, QPoint(10, 290));
        QCOMPARE(popover.take(), list(join({c_aboutToClose, c_closing})));
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(popover.take(), list(join({c_gone, "controller.controllerDestroyed"})));
    }

    void escape()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        popover.take();
        PopoverScene::releaseKey(scene.controller, Qt::Key_Escape);
        // The overlay is gone at once; the container is told, not asked.
        QCOMPARE(popover.take(), list(join({c_aboutToClose, c_closing, c_gone})));
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(popover.take(), list("controller.controllerDestroyed"));
    }

    void theButtonsOfTheTitleBar()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        popover.take();
        Balloon* const balloon = scene.controller->balloon();
        balloon->findChild<QPushButton*>(QStringLiteral("popoverHelpButton"))->click();
        QCOMPARE(popover.take(), list("controller.popoverWillHelp manager.popoverWillHelp balloon.help"));
        balloon->findChild<QPushButton*>(QStringLiteral("popoverCloseButton"))->click();
        QCOMPARE(popover.take(), list(join({c_aboutToClose, c_closing, "balloon.dismiss"})));
    }

    void aModalRun_data()
    {
        QTest::addColumn<int>("button");
        QTest::newRow("accepted") << int(QDialogButtonBox::Ok);
        QTest::newRow("rejected") << int(QDialogButtonBox::Cancel);
    }

    void aModalRun()
    {
        QFETCH(int, button);
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        QStringList opened;
        QTimer::singleShot(0, scene.window, [&] {
            // What the layout asks for in the first turn of the loop is no business of this test.
            QTimer::singleShot(0, scene.window, [&] {
                opened = popover.take();
                scene.container->findChild<QDialogButtonBox*>()
                    ->button(static_cast<QDialogButtonBox::StandardButton>(button))
                    ->click();
            });
        });
        scene.controller->exec(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
        QCOMPARE(popover.take(), list(join({c_aboutToClose, c_closing})));
        opened.removeAll(QStringLiteral("controller.layoutUpdated"));
        QCOMPARE(opened, list(join({c_opened, c_appeared, "controller.balloonOpened"})));
        QTRY_VERIFY(scene.controller == nullptr);
        QCOMPARE(popover.take(), list(join({c_gone, "controller.controllerDestroyed"})));
    }

    void aPersistentPopoverOpensAgainWithOneLayoutPass()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setPersistence(true);
        scene.controller->setActive();
        scene.controller->dismiss(false, false);
        QCOMPARE(popover.take(),
            list(join({c_opened, c_laidOut, c_appeared, "controller.balloonOpened ", c_aboutToClose, c_closing,
                c_gone})));
        scene.controller->setActive();
        QCOMPARE(popover.take(),
            list(join({c_opened, "controller.layoutUpdated ", c_appeared, "controller.balloonOpened"})));
        // Opened once more while it is open: the visible overlay is laid out on the way.
        scene.controller->setActive();
        QCOMPARE(popover.take(),
            list(join({c_opened, "controller.layoutUpdated ", c_appeared, "controller.balloonOpened"})));
    }

    void theTargetMovesResizesAndDies()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        QCoreApplication::processEvents();
        popover.take();
        scene.target->move(10, 10);
        scene.target->resize(50, 50);
        delete scene.target.data();
        QCoreApplication::processEvents();
        QCOMPARE(popover.take(), QStringList());
        QVERIFY(scene.controller->isActive());
    }

    void theWindowIsResized()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        QCoreApplication::processEvents();
        popover.take();
        scene.window->resize(500, 400);
        QCOMPARE(popover.take(), list("controller.layoutUpdated controller.layoutUpdated"));
        scene.controller->setMargins(1, 1, 1, 1);
        QCOMPARE(
            popover.take(), list("controller.marginsChanged controller.layoutUpdated controller.layoutUpdated"));
    }

    void twoPopoversAndDismissAll()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover first(scene, recorder, 1);
        const QPointer<Controller> lower = scene.controller;
        lower->setActive();
        RecordedPopover second(scene, recorder, 2);
        first.add(scene.controller, "second");
        first.add(scene.container, "secondContainer");
        scene.controller->setActive();
        first.take();
        Manager::instance()->dismissAll(nullptr, false, false);
        QCOMPARE(first.take(),
            list("container.popoverAboutToClose controller.balloonClosed controller.popoverWillDisappear "
                 "manager.popoverWillClose controller.popoverDidDisappear manager.popoverDidClose "
                 "secondContainer.popoverAboutToClose second.balloonClosed second.popoverWillDisappear "
                 "manager.popoverWillClose second.popoverDidDisappear manager.popoverDidClose "
                 "manager.lastPopoverDidClose manager.lastModalPopoverDidClose"));
        QTRY_VERIFY(scene.controller == nullptr && lower == nullptr);
        QCOMPARE(first.take(), list("controller.controllerDestroyed second.controllerDestroyed"));
    }

    void aDrop()
    {
        PopoverScene scene;
        SignalRecorder recorder(Manager::instance());
        RecordedPopover popover(scene, recorder);
        scene.controller->setActive();
        popover.take();
        PopoverScene::drop(scene.controller, QPoint(5, 5), Item::sPopoverWidgetItem);
        QCOMPARE(popover.take(), list("controller.itemDropped"));
    }
};

ZELKOV_TEST_MAIN(TestPopoverOrder)
#include "tst_popoverorder.moc"
