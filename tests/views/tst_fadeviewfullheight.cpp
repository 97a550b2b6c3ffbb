// SPDX-License-Identifier: MIT
// The sliding panel at the full height of its parent, and back.
#include "FadeScene.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>

#include <memory>

using fadescene::c_Bottom;
using fadescene::c_Top;
using fadescene::list;
using fadescene::OpenView;
using fadescene::Scene;

class TestFadeViewFullHeight : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<Qt::Orientation>(); }
    void fullHeightAndBackOnTop();
    void aPanelAtFullHeightFollowsItsParent();
    void inALayoutFullHeightIsOnlyASizeHint();
    void stillFullHeightIsNoState();
    void aSecondGoFullscreenForgetsTheHeight();
    void stillExitLeavesAStrip();
    void atTheBottomFullHeightTakesTimeAndNothingElse();
    void stillFullHeightAtTheBottomIsANullRectangle();
    void exitInALayoutCloses();
};

void TestFadeViewFullHeight::fullHeightAndBackOnTop()
{
    Scene scene(c_Top, false);
    scene.view->setSizeHint(80, true);
    scene.recorder.clear();
    scene.view->goFullscreen(true);
    QVERIFY(!scene.view->isFullscreen());
    QVERIFY(scene.view->m_fullscreenTransition);
    QCOMPARE(scene.view->getSizeHint(), 300);
    scene.wait("fullscreenAppeared");
    QCOMPARE(scene.folded(),
        list("geometryChanged appearingFullscreen changeViewOrientation geometryChanged fullscreenAppeared"));
    QVERIFY(scene.view->isFullscreen());
    QVERIFY(!scene.view->m_fullscreenTransition);
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 300));
    const auto orientation = [&] {
        for (const auto& entry : scene.recorder.entries()) {
            if (entry.name == QLatin1String("changeViewOrientation")) {
                return entry.arguments.first().value<Qt::Orientation>();
            }
        }
        return Qt::Orientation(0);
    };
    QCOMPARE(orientation(), Qt::Vertical);

    scene.recorder.clear();
    scene.view->exitFullscreen(true);
    QVERIFY(scene.view->isFullscreen());
    QVERIFY(scene.view->m_fullscreenTransition);
    QCOMPARE(scene.view->getSizeHint(), 80);
    scene.wait("fullscreenLeft");
    QCOMPARE(scene.folded(),
        list("geometryChanged leavingFullscreen geometryChanged changeViewOrientation fullscreenLeft"));
    QCOMPARE(orientation(), Qt::Horizontal);
    QVERIFY(!scene.view->isFullscreen());
    QVERIFY(!scene.view->m_fullscreenTransition);
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 80));
    QVERIFY(scene.view->isFadedIn());
}

void TestFadeViewFullHeight::aPanelAtFullHeightFollowsItsParent()
{
    Scene scene(c_Top, false);
    scene.view->goFullscreen(true);
    // Not during the transition.
    scene.view->setSizeHint(40, false);
    scene.view->resize(0, 350);
    QCOMPARE(scene.view->getSizeHint(), 40);
    scene.wait("fullscreenAppeared");
    scene.parent.resize(420, 260);
    scene.view->resize();
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 420, 260));
    QCOMPARE(scene.view->getSizeHint(), 260);
    scene.view->resize(0, 500);
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 420, 500));
}

void TestFadeViewFullHeight::inALayoutFullHeightIsOnlyASizeHint()
{
    Scene scene(c_Top, true);
    scene.view->setSizeHint(80, true);
    scene.recorder.clear();
    scene.view->goFullscreen(true);
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.view->getSizeHint(), 300);
    QCOMPARE(scene.view->m_preFullscreenSize, 80);
    QCOMPARE(scene.view->height(), 80);
    QVERIFY(!scene.view->isFullscreen());
    QVERIFY(!scene.view->m_fullscreenTransition);
}

void TestFadeViewFullHeight::stillFullHeightIsNoState()
{
    Scene scene(c_Top, false);
    scene.view->setVerticalOffset(20);
    scene.recorder.clear();
    scene.view->goFullscreen(false);
    QCOMPARE(scene.recorder.names(), list("fullscreenAppeared"));
    QCOMPARE(scene.view->geometry(), QRect(0, 20, 400, 300));
    QVERIFY(!scene.view->isFullscreen());
    QVERIFY(scene.view->m_fullscreenTransition);
    // So there is nothing to leave.
    scene.recorder.clear();
    scene.view->exitFullscreen(true);
    scene.view->exitFullscreen(false);
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.view->geometry(), QRect(0, 20, 400, 300));
}

void TestFadeViewFullHeight::aSecondGoFullscreenForgetsTheHeight()
{
    Scene scene(c_Top, false);
    scene.view->setSizeHint(80, true);
    scene.view->goFullscreen(true);
    QCOMPARE(scene.view->m_preFullscreenSize, 80);
    scene.view->goFullscreen(true);
    QCOMPARE(scene.view->m_preFullscreenSize, 300);
    scene.wait("fullscreenAppeared");
    // Only the later movement ends.
    QCOMPARE(scene.recorder.count(QStringLiteral("fullscreenAppeared")), 1);
    QCOMPARE(scene.recorder.count(QStringLiteral("appearingFullscreen")), 2);
}

void TestFadeViewFullHeight::stillExitLeavesAStrip()
{
    Scene scene(c_Top, false);
    scene.view->setSizeHint(80, true);
    scene.view->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.recorder.clear();
    scene.view->exitFullscreen(false);
    QCOMPARE(scene.recorder.names(), list("fullscreenLeft"));
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 15));
    QCOMPARE(scene.view->getSizeHint(), 80);
    QVERIFY(!scene.view->isFullscreen());
    QVERIFY(scene.view->m_fullscreenTransition);
}

void TestFadeViewFullHeight::atTheBottomFullHeightTakesTimeAndNothingElse()
{
    Scene scene(c_Bottom, false);
    scene.view->setSizeHint(80, true);
    const QRect before = scene.view->geometry();
    scene.recorder.clear();
    QElapsedTimer clock;
    clock.start();
    scene.view->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    QVERIFY(clock.elapsed() >= 290);
    QCOMPARE(scene.recorder.names(), list("appearingFullscreen changeViewOrientation fullscreenAppeared"));
    QCOMPARE(scene.view->geometry(), before);
    QVERIFY(scene.view->isFullscreen());
    scene.recorder.clear();
    scene.view->exitFullscreen(true);
    scene.wait("fullscreenLeft");
    QCOMPARE(scene.recorder.names(), list("leavingFullscreen changeViewOrientation fullscreenLeft"));
    QCOMPARE(scene.view->geometry(), before);
    QVERIFY(!scene.view->isFullscreen());
}

void TestFadeViewFullHeight::stillFullHeightAtTheBottomIsANullRectangle()
{
    Scene scene(c_Bottom, false);
    scene.view->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.recorder.clear();
    scene.view->exitFullscreen(false);
    QCOMPARE(scene.recorder.names(), list("fullscreenLeft"));
    QVERIFY(scene.view->geometry().isNull());
    // Here the state stays.
    QVERIFY(scene.view->isFullscreen());
    scene.recorder.clear();
    scene.view->goFullscreen(false);
    QCOMPARE(scene.recorder.names(), list("fullscreenAppeared"));
    QVERIFY(scene.view->geometry().isNull());
}

void TestFadeViewFullHeight::exitInALayoutCloses()
{
    Scene scene(c_Top, false);
    scene.view->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.view->setFadeStripeAsPartOfLayout(true);
    scene.recorder.clear();
    scene.view->exitFullscreen(true);
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    QCOMPARE(scene.view->height(), 15);
    QVERIFY(!scene.view->isFadedIn());
    QVERIFY(scene.view->isFullscreen());
}

ZELKOV_TEST_MAIN(TestFadeViewFullHeight)
#include "tst_fadeviewfullheight.moc"
