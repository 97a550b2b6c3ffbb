// SPDX-License-Identifier: MIT
// Everything that a popover is made of is deleted at the worst moments: inside each of its signals, in a fade, in
// a loop. One row a case, for a sanitizer ends the process at its first finding. That the popover does not crash
// is all that is asked.
#include "popover/Manager.h"

#include <QtCore/QPropertyAnimation>
#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QDialogButtonBox>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

#include "../robustness/Saboteur.h"
#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::PopoverWidget::Manager;
using zelkovtest::Balloon;
using zelkovtest::Controller;
using zelkovtest::Item;
using zelkovtest::PopoverScene;
using zelkovtest::showFlags;
using zelkovtest::TestContainer;
using zelkovtest::TestController;
using zelkovtest::TestRow;

namespace
{
enum class Victim
{
    Controller,
    Target,
    Window,
    Items,
    Row,
    Container,
    Balloon,
    Manager
};

const QList<QPair<QByteArray, Victim>>& victims()
{
    static const QList<QPair<QByteArray, Victim>> all {{"controller", Victim::Controller},
        {"target", Victim::Target}, {"window", Victim::Window}, {"items", Victim::Items}, {"row", Victim::Row},
        {"container", Victim::Container}, {"balloon", Victim::Balloon}, {"manager", Victim::Manager}};
    return all;
}

// A scene with a manager, more rows than fit, and a popover inside the popover.
struct Stage
{
    Stage()
    {
        Manager::init(0);
        scene.controller = new TestController(scene.window, scene.target);
        Manager::instance()->addController(1, scene.controller);
        scene.makeContent(vx::PopoverWidget::ecfDismissAll);
        for (int i = 0; i < 12; ++i) {
            scene.container->addItem(new TestRow(100 + i));
        }
        scene.controller->setContainer(scene.container, QFlags<Balloon::EBalloonFeature>(QFlag(7)));
        setTimes(10);
    }
    // Of fades, growth and shrinking, in ms.
    void setTimes(int ms) const
    {
        scene.controller->fader()->setFadingTimes(ms, ms);
        scene.controller->balloon()->findChild<QPropertyAnimation*>()->setDuration(ms);
    }
    ~Stage()
    {
        delete scene.window.data();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        Manager::deleteInstance();
    }

    QObject* sender(const QByteArray& name) const
    {
        if (name == "controller") {
            return scene.controller;
        }
        if (name == "container") {
            return scene.container;
        }
        if (name == "balloon") {
            return scene.controller->balloon();
        }
        return Manager::instance();
    }

    void destroy(Victim victim)
    {
        switch (victim) {
        case Victim::Controller:
            delete scene.controller.data();
            return;
        case Victim::Target:
            delete scene.target.data();
            return;
        case Victim::Window:
            delete scene.window.data();
            return;
        case Victim::Items:
            if (scene.container != nullptr) {
                scene.container->clear();
            }
            return;
        case Victim::Row:
            delete scene.row.data();
            return;
        case Victim::Container:
            delete scene.container.data();
            return;
        case Victim::Balloon:
            if (scene.controller != nullptr) {
                delete scene.controller->balloon();
            }
            return;
        case Victim::Manager:
            Manager::deleteInstance();
            return;
        }
    }

    // Each step only while what it needs is there.
    void ifOpen(const std::function<void(Controller*)>& step) const
    {
        if (scene.controller != nullptr && scene.controller->isVisible()) {
            step(scene.controller);
        }
    }
    void clickButton(const char* name) const
    {
        ifOpen([&](Controller* controller) {
            if (controller->balloon() == nullptr) {
                return;
            }
            if (QPushButton* button = controller->balloon()->findChild<QPushButton*>(QLatin1String(name))) {
                button->click();
            }
        });
    }
    static void settle(int ms = 0) { QTest::qWait(ms); }

    // Uses the popover in every way, opened with these flags.
    void play(int flags, bool animated)
    {
        const int wait = (flags & 2) != 0 || animated ? 25 : 0;
        if (scene.controller == nullptr) {
            return;
        }
        scene.controller->setPersistence(true);
        scene.controller->setActive(true, showFlags(flags), animated);
        settle(wait);
        ifOpen([](Controller* controller) { controller->setMargins(1, 2, 3, 4); });
        ifOpen([](Controller* controller) { controller->adjustInsets(1, 1, -1, -1); });
        clickButton("popoverHelpButton");
        ifOpen([](Controller* controller) { PopoverScene::releaseKey(controller, Qt::Key_Return); });
        ifOpen([](Controller* controller) { controller->setStayVisible(true); });
        ifOpen([](Controller* controller) { PopoverScene::releaseKey(controller, Qt::Key_Escape); });
        ifOpen([](Controller* controller) { controller->setStayVisible(false); });
        ifOpen([](Controller* controller) {
            PopoverScene::drop(controller, QPoint(5, 5), Item::sPopoverWidgetItem);
        });
        ifOpen([](Controller* controller) {
            if (controller->balloon() != nullptr && controller->getContainer() != nullptr) {
                controller->balloon()->content()->verticalScrollBar()->triggerAction(
                    QAbstractSlider::SliderPageStepAdd);
            }
        });
        settle();
        if (scene.container != nullptr) {
            scene.container->addSpacing(3);
        }
        settle();
        if (scene.row != nullptr && scene.row->isVisible()) {
            PopoverScene::click(scene.row, scene.row->rect().center());
        }
        ifOpen([](Controller* controller) { PopoverScene::click(controller, QPoint(10, 290)); });
        settle(25);
        if (scene.controller != nullptr) {
            scene.controller->setActive(true, showFlags(flags), animated);
        }
        settle(wait);
        clickButton("popoverCloseButton");
        settle(25);
        // Dismissed by a row, and hidden beforehand.
        if (scene.controller != nullptr && scene.container != nullptr) {
            if (scene.row != nullptr) {
                scene.container->applyFlags(scene.row, vx::PopoverWidget::ecfDismiss);
            }
        }
        if (scene.controller != nullptr) {
            scene.controller->setActive(true, showFlags(flags), false);
        }
        settle(wait);
        if (scene.row != nullptr && scene.row->isVisible()) {
            PopoverScene::click(scene.row, scene.row->rect().center());
        }
        if (scene.controller != nullptr) {
            scene.controller->hide();
        }
        if (scene.controller != nullptr) {
            scene.controller->dismiss(false, true);
        }
        if (scene.controller != nullptr) {
            scene.controller->setPersistence(false);
            scene.controller->setActive(true, showFlags(flags), false);
        }
        if (scene.controller != nullptr) {
            PopoverScene::releaseKey(scene.controller, Qt::Key_Escape);
        }
        settle();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    PopoverScene scene;
};

// Signals that a play fires; controllerDestroyed() is the farewell of a controller that is dying already.
const QList<QPair<QByteArray, QByteArrayList>>& signalTable()
{
    static const QList<QPair<QByteArray, QByteArrayList>> table {
        {"controller",
            {"balloonOpened", "balloonClosed", "popoverWillAppear", "popoverDidAppear", "popoverWillDisappear",
                "popoverDidDisappear", "popoverWillHelp", "shouldAccept", "shouldReject", "itemPerformed",
                "marginsChanged", "layoutUpdated", "itemDropped", "controllerDestroyed"}},
        {"container",
            {"layoutChanged", "dismissPopover", "dismissAllPopover", "itemPerformed", "popoverAboutToClose",
                "popoverAboutToOpen"}},
        {"balloon", {"dismiss", "help", "contentScrolled"}},
        {"manager",
            {"popoverWillOpen", "popoverDidOpen", "popoverWillClose", "popoverDidClose", "modalPopoverWillOpen",
                "modalPopoverDidOpen", "lastPopoverDidClose", "lastModalPopoverDidClose", "lastPopoverWillClose",
                "lastModalPopoverWillClose", "popoverWillHelp"}}};
    return table;
}
}

Q_DECLARE_METATYPE(Victim)

class TestPopoverDeletion : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void insideASignal_data()
    {
        QTest::addColumn<QByteArray>("sender");
        QTest::addColumn<QByteArray>("signal");
        QTest::addColumn<Victim>("victim");
        QTest::addColumn<int>("flags");
        for (const auto& source : signalTable()) {
            for (const QByteArray& signal : source.second) {
                for (const auto& victim : victims()) {
                    const bool dying = signal == "controllerDestroyed"
                        && (victim.second == Victim::Controller || victim.second == Victim::Window);
                    if (dying) {
                        continue;
                    }
                    for (const int flags : {5, 2}) {
                        // The long way round only for what depends on the way.
                        const bool depends = signal.startsWith("popover") || signal.startsWith("balloon")
                            || signal.startsWith("layout");
                        if (flags == 5 || depends) {
                            QTest::newRow(source.first + "." + signal + " kills " + victim.first
                                + (flags == 2 ? ", growing" : ""))
                                << source.first << signal << victim.second << flags;
                        }
                    }
                }
            }
        }
    }

    void insideASignal()
    {
        QFETCH(QByteArray, sender);
        QFETCH(QByteArray, signal);
        QFETCH(Victim, victim);
        QFETCH(int, flags);
        Stage stage;
        QObject* const object = stage.sender(sender);
        QVERIFY(object != nullptr);
        const int index = zelkovtest::signalIndex(object, signal);
        QVERIFY(index >= 0);
        int fired = 0;
        zelkovtest::Saboteur saboteur(object, index, [&] {
            if (++fired == 1) {
                stage.destroy(victim);
            }
        });
        stage.play(flags, flags != 5);
        QVERIFY2(fired > 0, "the play does not fire this signal");
    }

    void insideTheRun_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<bool>("opening");
        QTest::addColumn<Victim>("victim");
        for (const auto& victim : victims()) {
            QTest::newRow("fading in, " + victim.first) << 1 << true << victim.second;
            QTest::newRow("fading out, " + victim.first) << 1 << false << victim.second;
            QTest::newRow("growing, " + victim.first) << 6 << true << victim.second;
            QTest::newRow("shrinking, " + victim.first) << 6 << false << victim.second;
            QTest::newRow("growing and fading, " + victim.first) << 2 << true << victim.second;
            QTest::newRow("shrinking and fading, " + victim.first) << 2 << false << victim.second;
        }
    }

    void insideTheRun()
    {
        QFETCH(int, flags);
        QFETCH(bool, opening);
        QFETCH(Victim, victim);
        Stage stage;
        Controller* const controller = stage.scene.controller;
        stage.setTimes(100);
        controller->setPersistence(true);
        controller->setActive(true, showFlags(flags), opening);
        if (!opening) {
            QTRY_VERIFY(!controller->balloon()->content()->isHidden());
            controller->dismiss(true, true);
        }
        // In the midst of it.
        QTest::qWait(40);
        stage.destroy(victim);
        QTest::qWait(120);
        if (stage.scene.controller != nullptr) {
            stage.scene.controller->setActive(true, showFlags(flags), true);
        }
        QTest::qWait(20);
    }

    void insideALoop_data()
    {
        QTest::addColumn<Victim>("victim");
        QTest::addColumn<bool>("bySlot");
        for (const auto& victim : victims()) {
            QTest::newRow(victim.first + " by a timer") << victim.second << false;
            QTest::newRow(victim.first + " by a slot of the button") << victim.second << true;
        }
    }

    void insideALoop()
    {
        QFETCH(Victim, victim);
        QFETCH(bool, bySlot);
        Stage stage;
        QObject context;
        QTimer::singleShot(0, &context, [&] {
            QDialogButtonBox* const box = stage.scene.container->findChild<QDialogButtonBox*>();
            if (!bySlot) {
                stage.destroy(victim);
            } else {
                connect(box, &QDialogButtonBox::accepted, &context, [&] { stage.destroy(victim); });
                box->button(QDialogButtonBox::Ok)->click();
            }
        });
        // What is left of it is closed, so that the loop ends.
        QTimer::singleShot(40, &context, [&] {
            if (stage.scene.controller != nullptr) {
                stage.scene.controller->setActive(false, showFlags(5), false);
            }
        });
        stage.scene.controller->exec(QDialogButtonBox::Ok);
        QTest::qWait(20);
    }

    void aNestedPopoverGoesWithItsOuterOne_data()
    {
        QTest::addColumn<QByteArray>("signal");
        for (const char* signal : {"popoverWillAppear", "layoutUpdated", "popoverDidAppear", "balloonOpened",
                 "balloonClosed", "popoverWillDisappear", "popoverDidDisappear"}) {
            QTest::newRow(signal) << QByteArray(signal);
        }
    }

    void aNestedPopoverGoesWithItsOuterOne()
    {
        QFETCH(QByteArray, signal);
        Stage stage;
        Controller* const outer = stage.scene.controller;
        outer->setActive();
        const QPointer<TestController> inner = new TestController(outer, outer->balloon());
        Manager::instance()->addController(2, inner.data());
        inner->setContainer(new TestContainer, QFlags<Balloon::EBalloonFeature>(QFlag(7)));
        zelkovtest::Saboteur saboteur(
            inner, zelkovtest::signalIndex(inner, signal), [&] { delete stage.scene.controller.data(); });
        inner->setActive();
        if (inner != nullptr) {
            inner->dismiss(false, false);
        }
        QVERIFY(inner == nullptr);
        QVERIFY(stage.scene.controller == nullptr);
    }
};

ZELKOV_TEST_MAIN(TestPopoverDeletion)
#include "tst_popoverdeletion.moc"
