// SPDX-License-Identifier: MIT
// A popover that runs in a loop of its own.
#include "popover/Controller.h"

#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QDialogButtonBox>

#include "PopoverScene.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Controller;
using zelkovtest::PopoverScene;
using zelkovtest::SignalRecorder;
using zelkovtest::TestController;

class TestControllerExec : public zelkovtest::TestCase
{
    Q_OBJECT

    // Runs the popover with OK and Cancel and does something in its loop.
    static int run(PopoverScene& scene, const std::function<void()>& deed)
    {
        QTimer::singleShot(0, scene.window, deed);
        return scene.controller->exec(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    }

    static void press(const PopoverScene& scene, QDialogButtonBox::StandardButton button)
    {
        scene.container->findChild<QDialogButtonBox*>()->button(button)->click();
    }

private Q_SLOTS:
    void theButtonsStandBelowTheContent()
    {
        PopoverScene scene;
        scene.build();
        run(scene, [&] {
            QVERIFY(scene.controller->isVisible());
            QVERIFY(scene.controller->balloon()->isVisible());
            QDialogButtonBox* const box = scene.container->findChild<QDialogButtonBox*>();
            QVERIFY(box != nullptr);
            QVERIFY(box->centerButtons());
            QCOMPARE(int(box->standardButtons()), int(QDialogButtonBox::Ok | QDialogButtonBox::Cancel));
            QCOMPARE(scene.container->getItems().last()->objectName(), QStringLiteral("buttonBox"));
            QCOMPARE(scene.container->getItems().last()->id(), -1);
            QBoxLayout* const layout = qobject_cast<QBoxLayout*>(scene.container->layout());
            QVERIFY(layout != nullptr);
            QCOMPARE(layout->itemAt(1)->spacerItem()->sizeHint().height(), 8);
            scene.controller->close();
        });
    }

    void acceptingGivesOneAndRejectingZero()
    {
        for (const bool accepts : {true, false}) {
            PopoverScene scene;
            scene.build();
            scene.controller->setResultCode(17);
            int atClose = -1;
            connect(scene.controller, &Controller::balloonClosed, scene.controller,
                [&] { atClose = scene.controller->resultCode(); });
            const int result
                = run(scene, [&] { press(scene, accepts ? QDialogButtonBox::Ok : QDialogButtonBox::Cancel); });
            QCOMPARE(result, accepts ? 1 : 0);
            QCOMPARE(atClose, result);
        }
    }

    void theResultComesBeforeTheFadeEnds()
    {
        PopoverScene scene;
        scene.build();
        SignalRecorder recorder(scene.controller);
        run(scene, [&] { press(scene, QDialogButtonBox::Ok); });
        QVERIFY(scene.controller != nullptr);
        QVERIFY(scene.controller->isVisible());
        QVERIFY(!scene.controller->isActive());
        QCOMPARE(recorder.count(QStringLiteral("popoverDidDisappear")), 0);
        QTRY_VERIFY(scene.controller == nullptr);
    }

    void aClickOutsideReturnsTheResultThatWasThere()
    {
        for (const int preset : {0, 5}) {
            PopoverScene scene;
            scene.build();
            scene.controller->setResultCode(preset);
            const int result = run(scene, [&] { PopoverScene::click(scene.controller, QPoint(10, 290)); });
            QCOMPARE(result, preset);
        }
    }

    void refusedButtonsKeepTheResultAndTheLoop()
    {
        PopoverScene scene;
        scene.build();
        scene.container->closable = false;
        bool wentOn = false;
        const int result = run(scene, [&] {
            press(scene, QDialogButtonBox::Ok);
            QVERIFY(scene.controller->isActive());
            QTimer::singleShot(0, scene.window, [&] {
                wentOn = true;
                scene.controller->dismiss(false, true);
            });
        });
        QVERIFY(wentOn);
        QCOMPARE(result, 1);
    }

    void aPopoverClosedWhileItOpensReturnsAtOnce()
    {
        PopoverScene scene;
        scene.build();
        connect(scene.controller, &Controller::balloonOpened, scene.controller, [&] {
            scene.controller->setResultCode(3);
            scene.controller->dismiss(true, true);
        });
        QCOMPARE(scene.controller->exec(QDialogButtonBox::Ok), 3);
    }

    void aPopoverDeletedInItsLoopReturnsZero()
    {
        PopoverScene scene;
        scene.build();
        scene.controller->setResultCode(3);
        QCOMPARE(run(scene, [&] { delete scene.controller.data(); }), 0);
        scene.build();
        scene.controller->setResultCode(3);
        QCOMPARE(run(scene, [&] { delete scene.window.data(); }), 0);
    }

    void aPersistentPopoverCanRunAgain()
    {
        PopoverScene scene;
        scene.build();
        scene.controller->setPersistence(true);
        QCOMPARE(run(scene, [&] { press(scene, QDialogButtonBox::Ok); }), 1);
        QTRY_VERIFY(scene.controller->isHidden());
        QCOMPARE(run(scene, [&] { press(scene, QDialogButtonBox::Cancel); }), 0);
        // Each run adds its own buttons.
        QCOMPARE(scene.container->findChildren<QDialogButtonBox*>().size(), 2);
    }

    void withoutAContainerItReturnsAtOnce()
    {
        PopoverScene scene;
        TestController controller(scene.window, nullptr);
        controller.setResultCode(2);
        QCOMPARE(controller.exec(QDialogButtonBox::Ok), 2);
        QVERIFY(!controller.isActive());
    }
};

ZELKOV_TEST_MAIN(TestControllerExec)
#include "tst_controllerexec.moc"
