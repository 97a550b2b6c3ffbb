// SPDX-License-Identifier: MIT
// The sliding panel: second calls, changes and deaths in mid-movement, subclasses.
#include "FadeScene.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>

#include <memory>

using fadescene::c_Bottom;
using fadescene::c_Top;
using fadescene::list;
using fadescene::OpenView;
using fadescene::Scene;

class TestFadeViewInterruptions : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aSecondCallTakesOver_data() { fadescene::waysAndEdges(); }
    void aSecondCallTakesOver();
    void fadeoutOverAFadeoutEndsOnce_data() { fadescene::waysAndEdges(); }
    void fadeoutOverAFadeoutEndsOnce();
    void switchingTheWayInMidMovementEndsWell();
    void theParentMayBeResizedInMidMovement_data() { fadescene::waysAndEdges(); }
    void theParentMayBeResizedInMidMovement();
    void thePanelMayDieInMidMovement_data() { fadescene::waysAndEdges(); }
    void thePanelMayDieInMidMovement();
    void slotsMayDeleteThePanel_data();
    void slotsMayDeleteThePanel();
    void hidingInMidMovementEndsWell();
    void aSubclassMayReplaceTheSlotsOfTheEnds();
    void withoutAParentNothingBreaks();
};

void TestFadeViewInterruptions::aSecondCallTakesOver()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    Scene scene(edge, inLayout);
    scene.recorder.clear();
    scene.view->fadein(true);
    QTRY_VERIFY(scene.view->height() > 40);
    scene.view->fadeout(true);
    scene.wait("fadingOutFinished");
    // The former movement never reports its end.
    QCOMPARE(scene.folded(),
        list("geometryChanged fadingIn geometryChanged fadingOut geometryChanged fadingOutFinished "
             "geometryChanged"));
    QCOMPARE(scene.view->height(), 15);
    QVERIFY(!scene.view->isFadedIn());
    QTest::qWait(350);
    QCOMPARE(scene.recorder.count(QStringLiteral("fadingInFinished")), 0);
}

void TestFadeViewInterruptions::fadeoutOverAFadeoutEndsOnce()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    Scene scene(edge, inLayout);
    scene.view->setSizeHint(99, true);
    scene.recorder.clear();
    scene.view->fadeout(true);
    QTRY_VERIFY(scene.view->height() < 60);
    scene.view->fadeout(true);
    scene.wait("fadingOutFinished");
    QTest::qWait(350);
    QCOMPARE(scene.recorder.count(QStringLiteral("fadingOut")), 2);
    QCOMPARE(scene.recorder.count(QStringLiteral("fadingOutFinished")), 1);
    QCOMPARE(scene.view->height(), 15);
}

void TestFadeViewInterruptions::switchingTheWayInMidMovementEndsWell()
{
    Scene scene(c_Top, false);
    scene.view->fadein(true);
    QTRY_VERIFY(scene.view->height() > 30);
    scene.view->setFadeStripeAsPartOfLayout(true);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), scene.view->getSizeHint());
    scene.recorder.clear();
    scene.view->fadeout(true);
    QTRY_VERIFY(scene.view->height() < 60);
    scene.view->setFadeStripeAsPartOfLayout(false);
    scene.view->fadein(true);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.recorder.count(QStringLiteral("fadingOutFinished")), 0);
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 99));
}

void TestFadeViewInterruptions::theParentMayBeResizedInMidMovement()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    Scene scene(edge, inLayout);
    scene.view->fadein(true);
    QTRY_VERIFY(scene.view->height() > 30);
    scene.parent.resize(500, 200);
    if (!inLayout) {
        scene.view->resize();
    }
    scene.wait("fadingInFinished");
    QCoreApplication::processEvents();
    // The end looks at the parent once more.
    QCOMPARE(scene.view->geometry(), QRect(0, edge == c_Top ? 0 : 101, 500, 99));
}

void TestFadeViewInterruptions::thePanelMayDieInMidMovement()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    for (const int victim : {0, 1, 2}) {
        auto scene = std::make_unique<Scene>(edge, inLayout);
        const QPointer<OpenView> view(scene->view);
        if (victim == 0) {
            view->fadein(true);
        } else {
            view->setSizeHint(80, true);
            view->fadeout(true);
        }
        QTest::qWait(60);
        if (victim == 2) {
            scene.reset();
        } else {
            delete view;
        }
        QVERIFY(!view);
        QTest::qWait(20);
    }
    // A new panel at the same address is not met by the old animation.
    Scene scene(edge, inLayout);
    scene.view->fadein(true);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), 99);
}

void TestFadeViewInterruptions::slotsMayDeleteThePanel_data()
{
    QTest::addColumn<bool>("inLayout");
    QTest::addColumn<bool>("animated");
    QTest::addColumn<int>("call");
    QTest::addColumn<int>("nth");
    for (const bool inLayout : {true, false}) {
        for (const bool animated : {true, false}) {
            for (int call = 0; call < 4; ++call) {
                for (const int nth : {1, 2, 3}) {
                    QTest::addRow("%d %d %d %d", inLayout, animated, call, nth)
                        << inLayout << animated << call << nth;
                }
            }
        }
    }
}

void TestFadeViewInterruptions::slotsMayDeleteThePanel()
{
    QFETCH(bool, inLayout);
    QFETCH(bool, animated);
    QFETCH(int, call);
    QFETCH(int, nth);
    Scene scene(c_Top, inLayout);
    const QPointer<OpenView> view(scene.view);
    if (call == 3 && !inLayout) {
        scene.view->goFullscreen(true);
        QTRY_VERIFY(scene.view->isFullscreen());
    }
    int left = nth;
    const auto die = [&] {
        if (--left == 0) {
            delete view;
        }
    };
    connect(view, &FadeView::geometryChanged, this, die);
    connect(view, &FadeView::fadingIn, this, die);
    connect(view, &FadeView::fadingOut, this, die);
    connect(view, &FadeView::fadingInFinished, this, die);
    connect(view, &FadeView::fadingOutFinished, this, die);
    connect(view, &FadeView::appearingFullscreen, this, die);
    connect(view, &FadeView::leavingFullscreen, this, die);
    connect(view, &FadeView::changeViewOrientation, this, die);
    switch (call) {
    case 0:
        view->fadein(animated, true);
        break;
    case 1:
        view->setSizeHint(80, false);
        view->fadeout(animated, true);
        break;
    case 2:
        view->goFullscreen(animated);
        break;
    default:
        view->exitFullscreen(animated);
        break;
    }
    QTest::qWait(30);
}

void TestFadeViewInterruptions::hidingInMidMovementEndsWell()
{
    Scene scene(c_Top, false);
    scene.view->fadein(true);
    QTRY_VERIFY(scene.view->height() > 30);
    scene.view->hide();
    scene.wait("fadingInFinished");
    // The end of an opening shows the panel.
    QVERIFY(scene.view->isVisible());
    QCOMPARE(scene.view->height(), 99);
}

class ReplacingView : public FadeView
{
    Q_OBJECT

public:
    using FadeView::FadeView;
    QStringList called;

private Q_SLOTS:
    void fadedIn()
    {
        called << QStringLiteral("in");
        FadeView::fadedIn();
    }
    void fadedOut()
    {
        called << QStringLiteral("out");
        FadeView::fadedOut();
    }
};

void TestFadeViewInterruptions::aSubclassMayReplaceTheSlotsOfTheEnds()
{
    QWidget parent;
    parent.resize(400, 300);
    ReplacingView view(c_Top, nullptr, &parent);
    parent.show();
    view.fadein(true);
    QTRY_COMPARE(view.called, list("in"));
    view.fadeout(true);
    QTRY_COMPARE(view.called, list("in out"));
    view.fadein(false);
    QCOMPARE(view.called, list("in out in"));
    QVERIFY(view.isFadedIn());
}

void TestFadeViewInterruptions::withoutAParentNothingBreaks()
{
    OpenView view(c_Top, nullptr);
    view.resize(300, 200);
    view.fadein(false, false, 50);
    QCOMPARE(view.height(), 50);
    view.setFadeStripeAsPartOfLayout(false);
    view.resize(300, 200);
    view.goFullscreen(false);
    view.fadeout(false);
    QCOMPARE(view.geometry().height(), 15);
}

ZELKOV_TEST_MAIN(TestFadeViewInterruptions)
#include "tst_fadeviewinterruptions.moc"
