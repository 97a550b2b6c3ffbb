// SPDX-License-Identifier: MIT
// The panel with handle, slider and rows under the pointer: clicks, drags, double clicks.
#include "StripeScene.h"
#include "support/TestMain.h"

using stripescene::c_Bottom;
using stripescene::c_Top;
using stripescene::list;
using stripescene::OpenStripe;
using stripescene::Scene;
using stripescene::word;

class TestFadeStripeViewMouse : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QPointer<QObject>>(); }
    void aClickOnTheHandleToggles_data();
    void aClickOnTheHandleToggles();
    void aClickOnAnInactivePanelIsReported();
    void aPressTellsItsPlace_data();
    void aPressTellsItsPlace();
    void aReleaseTellsItsPlace();
    void aReleaseOnAClosedPanelIsTold();
    void aMoveOfOnePixelSpoilsTheClick();
    void aDragFollowsThePointer_data();
    void aDragFollowsThePointer();
    void aDragTellsAtLeastOneRow();
    void aDragOpensAndClosesOnTheWay();
    void theDragIsClamped();
    void theReleaseSnaps_data();
    void theReleaseSnaps();
    void anInactivePanelIsNotDragged();
    void nothingHappensInATransition();
    void aDoubleClickOnTopTakesTheFullHeightAndBack();
    void aDoubleClickAtTheBottomTakesOneRow();
    void aDoubleClickElsewhereOrClosedDoesNothing();
    void aClickAtFullHeightLeavesIt();
    void atFullHeightTheStripeFollowsItsParent();
    void theStripeMayDieOfItsSignals_data();
    void theStripeMayDieOfItsSignals();
};

void TestFadeStripeViewMouse::aClickOnTheHandleToggles_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::newRow("top") << c_Top;
    QTest::newRow("bottom") << c_Bottom;
}

void TestFadeStripeViewMouse::aClickOnTheHandleToggles()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    // Only after the time in which a double click could come.
    QCOMPARE(scene.without(list("headerPressed footerPressed")), QStringList());
    scene.wait("fadingOutFinished");
    QVERIFY(!scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->height(), 15);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.wait("fadingInFinished");
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.count(word("headerReleased")) + scene.recorder.count(word("footerReleased")), 0);
}

void TestFadeStripeViewMouse::aClickOnAnInactivePanelIsReported()
{
    Scene scene;
    scene.stripe->setActive(false);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.wait("inactiveClicked");
    QCOMPARE(scene.recorder.names(), list("footerPressed inactiveClicked"));
    QVERIFY(scene.stripe->isFadedIn());
}

void TestFadeStripeViewMouse::aPressTellsItsPlace_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<QPoint>("at");
    QTest::addColumn<QStringList>("told");
    QTest::newRow("top, header") << c_Top << QPoint(100, 5) << list("headerPressed");
    QTest::newRow("top, contents") << c_Top << QPoint(100, 60) << QStringList();
    QTest::newRow("top, footer") << c_Top << QPoint(100, 120) << list("footerPressed");
    QTest::newRow("bottom, header") << c_Bottom << QPoint(100, 5) << list("headerPressed");
    QTest::newRow("bottom, footer") << c_Bottom << QPoint(100, 120) << list("footerPressed");
}

void TestFadeStripeViewMouse::aPressTellsItsPlace()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(QPoint, at);
    Scene scene(edge);
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonPress, at);
    QTEST(scene.recorder.names(), "told");
    if (!scene.recorder.entries().isEmpty()) {
        QCOMPARE(scene.recorder.entries().first().arguments.first().toFloat(), 0.25F);
    }
    const bool onMoving = scene.movingBar()->geometry().contains(at);
    QCOMPARE(scene.stripe->cursor().shape() == Qt::OpenHandCursor, onMoving);
    scene.send(QEvent::MouseButtonRelease, at);
    QCOMPARE(scene.stripe->cursor().shape(), Qt::ArrowCursor);
}

void TestFadeStripeViewMouse::aReleaseTellsItsPlace()
{
    Scene scene;
    scene.recorder.clear();
    scene.click(QPoint(100, 5));
    scene.click(QPoint(300, 120));
    scene.click(QPoint(300, 60));
    QCOMPARE(scene.recorder.names(), list("headerPressed headerReleased footerPressed footerReleased"));
    QCOMPARE(scene.recorder.entries().at(1).arguments.first().toFloat(), 0.25F);
    QCOMPARE(scene.recorder.entries().at(3).arguments.first().toFloat(), 0.75F);
}

void TestFadeStripeViewMouse::aReleaseOnAClosedPanelIsTold()
{
    for (const bool active : {true, false}) {
        Scene scene(c_Top, false);
        scene.stripe->setActive(active);
        QCoreApplication::processEvents();
        scene.recorder.clear();
        scene.click(scene.besideHandle());
        QCOMPARE(scene.recorder.names(),
            active ? list("footerPressed footerReleasedFadedOut") : list("footerPressed inactiveClicked"));
        Scene below(c_Bottom, false);
        below.stripe->setActive(active);
        below.recorder.clear();
        below.click(below.besideHandle());
        QCOMPARE(below.recorder.names(),
            active ? list("headerPressed headerReleasedFadedOut") : list("headerPressed inactiveClicked"));
    }
}

void TestFadeStripeViewMouse::aMoveOfOnePixelSpoilsTheClick()
{
    Scene scene;
    scene.recorder.clear();
    const QPoint handle = scene.onHandle();
    scene.send(QEvent::MouseButtonPress, handle);
    scene.send(QEvent::MouseMove, handle + QPoint(1, 0));
    scene.send(QEvent::MouseButtonRelease, handle + QPoint(1, 0));
    // No click, but a snap: the pixel that the drag has cost is made good.
    QCOMPARE(scene.stripe->height(), 129);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.stripe->height(), 130);
    QTest::qWait(QApplication::doubleClickInterval() + 100);
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingOut")), 0);
}

void TestFadeStripeViewMouse::aDragFollowsThePointer_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::newRow("top") << c_Top;
    QTest::newRow("bottom") << c_Bottom;
}

void TestFadeStripeViewMouse::aDragFollowsThePointer()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge);
    for (const int height : {180, 90, 222}) {
        scene.dragTo(height);
        QCOMPARE(scene.stripe->height(), height);
        QCOMPARE(scene.stripe->geometry(), QRect(0, edge == c_Top ? 0 : 600 - height, 400, height));
        QCOMPARE(scene.stripe->cursor().shape(), Qt::ClosedHandCursor);
    }
    scene.letGo();
    QCOMPARE(scene.stripe->cursor().shape(), Qt::ArrowCursor);
    QCOMPARE(scene.stripe->height(), 222);
}

void TestFadeStripeViewMouse::aDragTellsAtLeastOneRow()
{
    Scene scene;
    scene.recorder.clear();
    scene.dragTo(60);
    for (const auto& entry : scene.recorder.entries()) {
        if (entry.name == word("sizeChanged")) {
            QCOMPARE(entry.arguments.first().toInt(), 100);
        }
    }
    QVERIFY(scene.recorder.count(word("sizeChanged")) > 0);
    scene.recorder.clear();
    scene.dragTo(190, 1);
    QCOMPARE(scene.without(list("geometryChanged")), list("footerPressed sizeChanged"));
    QCOMPARE(scene.recorder.entries().at(1).arguments.first().toInt(), 160);
    scene.letGo();
}

void TestFadeStripeViewMouse::aDragOpensAndClosesOnTheWay()
{
    Scene scene(c_Top, false);
    QCoreApplication::processEvents();
    scene.recorder.clear();
    scene.dragTo(16, 1);
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingIn")), 1);
    scene.dragTo(15, 1);
    QVERIFY(!scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingOut")), 1);
    scene.letGo();
    scene.wait("fadingOutFinished");
}

void TestFadeStripeViewMouse::theDragIsClamped()
{
    Scene scene;
    scene.stripe->setMaximumHeight(300);
    scene.dragTo(450);
    QCOMPARE(scene.stripe->height(), 300);
    scene.dragTo(-100);
    QCOMPARE(scene.stripe->height(), 15);
    scene.letGo();
    scene.wait("fadingOutFinished");
}

void TestFadeStripeViewMouse::theReleaseSnaps_data()
{
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("result");
    QTest::newRow("below 0.66 of a row") << 65 << 15;
    QTest::newRow("at 0.66") << 66 << 130;
    QTest::newRow("nearly a row") << 129 << 130;
    QTest::newRow("a row") << 131 << 131;
    QTest::newRow("more") << 177 << 177;
}

void TestFadeStripeViewMouse::theReleaseSnaps()
{
    QFETCH(int, height);
    QFETCH(int, result);
    for (const auto edge : {c_Top, c_Bottom}) {
        Scene scene(edge);
        scene.dragTo(height);
        scene.recorder.clear();
        scene.letGo();
        if (result == height) {
            QCOMPARE(scene.without(list("geometryChanged")), list("sizeChanged heightChanged fadingInFinished"));
        } else if (result == 15) {
            scene.wait("fadingOutFinished");
        } else {
            scene.wait("fadingInFinished");
        }
        QCOMPARE(scene.stripe->height(), result);
        QCOMPARE(scene.stripe->isFadedIn(), result > 15);
    }
}

void TestFadeStripeViewMouse::anInactivePanelIsNotDragged()
{
    Scene scene;
    scene.stripe->setActive(false);
    scene.recorder.clear();
    scene.dragTo(180);
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.names(), list("footerPressed"));
    scene.send(QEvent::MouseButtonRelease, QPoint(50, 120));
}

void TestFadeStripeViewMouse::nothingHappensInATransition()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.recorder.clear();
    const int height = scene.stripe->height();
    scene.click(scene.onHandle());
    scene.send(QEvent::MouseButtonPress, scene.besideHandle());
    scene.send(QEvent::MouseMove, QPoint(50, 300));
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.stripe->height(), height);
    scene.wait("fullscreenAppeared");
}

void TestFadeStripeViewMouse::aDoubleClickOnTopTakesTheFullHeightAndBack()
{
    Scene scene;
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    scene.send(QEvent::MouseButtonRelease, scene.onHandle());
    scene.wait("fullscreenAppeared");
    QVERIFY(scene.stripe->isFullscreen());
    QCOMPARE(scene.stripe->geometry(), QRect(0, 0, 400, 600));
    // The single click was taken back.
    QTest::qWait(QApplication::doubleClickInterval() + 100);
    QCOMPARE(scene.recorder.count(word("leavingFullscreen")), 0);
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    scene.wait("fullscreenLeft");
    QCOMPARE(scene.stripe->height(), 130);
}

void TestFadeStripeViewMouse::aDoubleClickAtTheBottomTakesOneRow()
{
    Scene scene(c_Bottom);
    scene.stripe->setSizeHint(200, true);
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.names(), list("sizeChanged heightChanged geometryChanged"));
    QVERIFY(!scene.stripe->isFullscreen());
}

void TestFadeStripeViewMouse::aDoubleClickElsewhereOrClosedDoesNothing()
{
    Scene scene;
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonDblClick, scene.besideHandle());
    QCOMPARE(scene.recorder.names(), QStringList());
    Scene closed(c_Top, false);
    closed.recorder.clear();
    closed.send(QEvent::MouseButtonDblClick, closed.onHandle());
    QCOMPARE(closed.recorder.names(), QStringList());
}

void TestFadeStripeViewMouse::aClickAtFullHeightLeavesIt()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.click(scene.onHandle());
    scene.wait("fullscreenLeft");
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->height(), 130);
}

void TestFadeStripeViewMouse::atFullHeightTheStripeFollowsItsParent()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.view.resize(420, 500);
    scene.stripe->resize();
    QCOMPARE(scene.stripe->height(), 500);
    // At full height the bar is not dragged.
    scene.recorder.clear();
    scene.dragTo(300);
    QCOMPARE(scene.stripe->height(), 500);
    QCOMPARE(scene.recorder.names(), list("footerPressed"));
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonRelease, scene.besideHandle());
}

void TestFadeStripeViewMouse::theStripeMayDieOfItsSignals_data()
{
    QTest::addColumn<int>("nth");
    QTest::addColumn<int>("use");
    for (int use = 0; use < 4; ++use) {
        for (int nth = 1; nth <= 5; ++nth) {
            QTest::addRow("%d %d", use, nth) << nth << use;
        }
    }
}

void TestFadeStripeViewMouse::theStripeMayDieOfItsSignals()
{
    QFETCH(int, nth);
    QFETCH(int, use);
    Scene scene(c_Top, use != 1);
    const QPointer<OpenStripe> stripe(scene.stripe);
    int left = nth;
    const auto die = [&] {
        if (--left == 0) {
            delete stripe;
        }
    };
    connect(stripe, &FadeView::geometryChanged, this, die);
    connect(stripe, &FadeView::fadingIn, this, die);
    connect(stripe, &FadeView::fadingOut, this, die);
    connect(stripe, &FadeView::fadingInFinished, this, die);
    connect(stripe, &FadeView::fadingOutFinished, this, die);
    connect(stripe, &FadeStripeView::headerPressed, this, die);
    connect(stripe, &FadeStripeView::footerPressed, this, die);
    connect(stripe, &FadeStripeView::sizeChanged, this, die);
    connect(stripe, &FadeStripeView::heightChanged, this, die);
    const QPoint press = scene.besideHandle();
    const auto send = [&](QEvent::Type type, const QPoint& at) {
        if (stripe) {
            scene.send(type, at);
        }
    };
    switch (use) {
    case 0:
        stripe->setSizeHint(15, true);
        break;
    case 1:
        send(QEvent::MouseButtonPress, press);
        send(QEvent::MouseMove, press + QPoint(0, 100));
        send(QEvent::MouseButtonRelease, press + QPoint(0, 100));
        break;
    case 2:
        send(QEvent::MouseButtonPress, press);
        send(QEvent::MouseMove, press + QPoint(0, 70));
        send(QEvent::MouseButtonRelease, press + QPoint(0, 70));
        break;
    default:
        stripe->fadeout(true);
        break;
    }
    QTest::qWait(20);
}

ZELKOV_TEST_MAIN(TestFadeStripeViewMouse)
#include "tst_fadestripeviewmouse.moc"
