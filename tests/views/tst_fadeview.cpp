// SPDX-License-Identifier: MIT
// The sliding panel: both ways, both edges, animated or not, and the order of its signals.
#include "FadeScene.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>

#include <memory>

using fadescene::c_Bottom;
using fadescene::c_Top;
using fadescene::list;
using fadescene::OpenView;
using fadescene::Scene;

class TestFadeView : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNumbersStand();
    void aNewPanelIsSetUpAsTold();
    void statesEventsSignals_data();
    void statesEventsSignals();
    void anAnimationTakesItsTime();
    void geometryFollowsEveryStep_data() { fadescene::waysAndEdges(); }
    void geometryFollowsEveryStep();
    void fadeinOpensToTheSizeLastGiven_data() { fadescene::waysAndEdges(); }
    void fadeinOpensToTheSizeLastGiven();
    void sizesOfNoughtAndBelowKeepTheFormerOne();
    void sixteenIsOpenAndFifteenIsNot_data();
    void sixteenIsOpenAndFifteenIsNot();
    void theMinimumIsTheFloorOfTheOpenedHeight();
    void aStillFadeinByGeometryStaysAStrip_data();
    void aStillFadeinByGeometryStaysAStrip();
    void forceStartsAtTheStrip();
    void withoutForceTheMovementStartsWhereThePanelIs();
    void forcedFadeoutStartsAtTheFullHeight();
    void fadeinIndependentDoesNothingInALayout();
    void fadeoutIndependentInALayoutClosesAtOnce();
    void reopeningByGeometryTakesTheHeightItHad();
    void reopeningInALayoutTakesTheSizeGiven();
    void inALayoutOnlyTheHeightIsSet();
    void theMaximumBoundsTheHeightInALayout();
    void changeSizeWantsAValidRectangle();
    void resizeLooksAtTheParentAndTheLargerSize();
    void resizeLocksTheHeightOnTopOnly();
    void theSizeHintCanBeSetWithAndWithoutResizing();
    void theVerticalOffsetCountsByGeometryOnly();
    void neighboursCountWhereTheyAreInTheWay_data();
    void neighboursCountWhereTheyAreInTheWay();
    void anInactivePanelIgnoresFades();
    void deactivatingDoesNotStopAMovement();
    void showingReportsTheGeometry();
};

void TestFadeView::theNumbersStand()
{
    QCOMPARE(int(FadeView::ePositionTop), 0);
    QCOMPARE(int(FadeView::ePositionBottom), 1);
    QCOMPARE(c_Duration, 300);
    QCOMPARE(c_Bordersize, 15);
    QCOMPARE(FadeView::c_Duration, 300);
    QCOMPARE(FadeView::c_Bordersize, 15);
    const QMetaObject& meta = FadeView::staticMetaObject;
    QStringList signalNames;
    QStringList slotNames;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        const QMetaMethod method = meta.method(i);
        const QString name = QString::fromLatin1(method.name());
        QStringList& names = method.methodType() == QMetaMethod::Signal ? signalNames : slotNames;
        if (!names.contains(name)) {
            names << name;
        }
    }
    QCOMPARE(signalNames,
        list("fadingInFinished fadingOutFinished fadingIn fadingOut appearingFullscreen leavingFullscreen "
             "fullscreenAppeared fullscreenLeft changeViewOrientation geometryChanged"));
    QCOMPARE(slotNames,
        list("resize emitGeometryChange changeSize fadein fadeout goFullscreen exitFullscreen setVerticalOffset "
             "fadedIn fadedOut fullscreenEntered fullscreenExited"));
}

void TestFadeView::aNewPanelIsSetUpAsTold()
{
    QWidget parent;
    parent.resize(400, 300);
    OpenView view(c_Top, &parent);
    QVERIFY(view.autoFillBackground());
    QVERIFY(view.isActive());
    // Open by name, though it has the size hint of the strip.
    QVERIFY(view.isFadedIn());
    QVERIFY(!view.isFullscreen());
    QCOMPARE(view.getSizeHint(), 15);
    QCOMPARE(view.m_fadeInSize, 99);
    QCOMPARE(view.m_preFullscreenSize, 99);
    QCOMPARE(view.m_minimumSize, 15);
    QCOMPARE(view.m_parentWidth, 400);
    QCOMPARE(view.m_parentHeight, 300);
    QCOMPARE(view.m_maximumHeight, QWIDGETSIZE_MAX);
    QCOMPARE(view.m_stripeMinimumHeight, 0);
    QCOMPARE(view.m_layoutVerticalOffset, 0);
}

void TestFadeView::statesEventsSignals_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<bool>("inLayout");
    QTest::addColumn<int>("state");
    QTest::addColumn<int>("event");
    QTest::addColumn<QStringList>("expected");
    QTest::addColumn<int>("height");
    QTest::addColumn<bool>("open");
    // States: 0 closed, 1 open. Events: 0 fadein animated, 1 fadein still, 2 fadeout animated, 3 fadeout still.
    // The start value of a movement is reported before the movement is announced.
    const QStringList in = list("geometryChanged fadingIn geometryChanged fadingInFinished geometryChanged");
    const QStringList out = list("geometryChanged fadingOut geometryChanged fadingOutFinished geometryChanged");
    const QStringList inWithoutSteps = list("geometryChanged fadingIn fadingInFinished geometryChanged");
    const QStringList outWithoutSteps = list("geometryChanged fadingOut fadingOutFinished geometryChanged");
    for (const auto edge : {c_Top, c_Bottom}) {
        const char* const name = edge == c_Top ? "top" : "bottom";
        for (const bool inLayout : {true, false}) {
            const char* const way = inLayout ? "layout" : "geometry";
            for (const int state : {0, 1}) {
                const char* const from = state == 0 ? "closed" : "open";
                // By geometry a movement starts where the panel is, so an open panel has no steps to open.
                const bool stepsIn = inLayout || state == 0;
                QTest::addRow("%s, %s, %s, fadein animated", name, way, from)
                    << edge << inLayout << state << 0 << (stepsIn ? in : inWithoutSteps) << 99 << true;
                QTest::addRow("%s, %s, %s, fadeout animated", name, way, from)
                    << edge << inLayout << state << 2 << (state == 1 ? out : outWithoutSteps) << 15 << false;
                QTest::addRow("%s, %s, %s, fadein still", name, way, from)
                    << edge << inLayout << state << 1
                    << (inLayout ? list("fadingIn geometryChanged fadingInFinished geometryChanged")
                                 : QStringList())
                    << (inLayout ? 99 : 15) << true;
                QTest::addRow("%s, %s, %s, fadeout still", name, way, from)
                    << edge << inLayout << state << 3
                    << (inLayout ? list("fadingOut geometryChanged fadingOutFinished geometryChanged")
                                 : QStringList())
                    << 15 << false;
            }
        }
    }
}

void TestFadeView::statesEventsSignals()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    QFETCH(int, state);
    QFETCH(int, event);
    Scene scene(edge, inLayout);
    scene.view->setSizeHint(state == 0 ? 15 : 99, true);
    QCOMPARE(scene.view->isFadedIn(), state == 1);
    QCoreApplication::processEvents();
    scene.recorder.clear();
    switch (event) {
    case 0:
        scene.view->fadein(true);
        break;
    case 1:
        scene.view->fadein(false);
        break;
    case 2:
        scene.view->fadeout(true);
        break;
    default:
        scene.view->fadeout(false);
        break;
    }
    if (event == 0) {
        scene.wait("fadingInFinished");
    } else if (event == 2) {
        scene.wait("fadingOutFinished");
    }
    QTEST(scene.folded(), "expected");
    QTEST(scene.view->height(), "height");
    QTEST(scene.view->isFadedIn(), "open");
    for (const auto& entry : scene.recorder.entries()) {
        if (entry.name.startsWith(QLatin1String("fading"))) {
            QCOMPARE(entry.arguments.size(), 1);
        }
    }
    const int height = scene.view->height();
    if (!inLayout) {
        QCOMPARE(scene.view->geometry(), QRect(0, edge == c_Top ? 0 : 300 - height, 400, height));
    }
    QCOMPARE(scene.view->geometryOffsetFree(), scene.view->geometry());
}

void TestFadeView::anAnimationTakesItsTime()
{
    Scene scene(c_Top, false);
    QElapsedTimer clock;
    clock.start();
    scene.view->fadein(true);
    QVERIFY(scene.view->height() < 99);
    scene.wait("fadingInFinished");
    QVERIFY2(clock.elapsed() >= 290, qPrintable(QString::number(clock.elapsed())));
}

void TestFadeView::geometryFollowsEveryStep()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    Scene scene(edge, inLayout);
    scene.recorder.clear();
    QVector<int> heights;
    connect(scene.view, &FadeView::geometryChanged, this, [&](const QRect& geometry) {
        heights << geometry.height();
        QCOMPARE(geometry, scene.view->geometry());
    });
    scene.view->fadein(true, true);
    scene.wait("fadingInFinished");
    QVERIFY(heights.size() > 3);
    QCOMPARE(heights.first(), 15);
    QCOMPARE(heights.last(), 99);
    for (int i = 1; i < heights.size(); ++i) {
        QVERIFY(heights.at(i) >= heights.at(i - 1));
    }
    // A layout moves the panel only after its height has been reported.
    QCOMPARE(scene.lastGeometry().size(), scene.view->size());
    QVERIFY(inLayout || scene.lastGeometry() == scene.view->geometry());
}

void TestFadeView::fadeinOpensToTheSizeLastGiven()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    Scene scene(edge, inLayout);
    scene.view->fadein(true, false, 140);
    QCOMPARE(scene.view->getSizeHint(), 140);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), 140);
}

void TestFadeView::sizesOfNoughtAndBelowKeepTheFormerOne()
{
    Scene scene(c_Top, true);
    scene.view->fadein(false, false, 77);
    QCOMPARE(scene.view->m_fadeInSize, 77);
    scene.view->fadein(false, false, 0);
    QCOMPARE(scene.view->m_fadeInSize, 77);
    scene.view->fadein(false, false, -1);
    QCOMPARE(scene.view->m_fadeInSize, 77);
    scene.view->fadein(false, false, 1);
    QCOMPARE(scene.view->m_fadeInSize, 1);
}

void TestFadeView::sixteenIsOpenAndFifteenIsNot_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<bool>("inLayout");
    QTest::addColumn<bool>("open");
    for (const bool inLayout : {true, false}) {
        QTest::addRow("15, %d", inLayout) << 15 << inLayout << false;
        QTest::addRow("16, %d", inLayout) << 16 << inLayout << true;
        QTest::addRow("3, %d", inLayout) << 3 << inLayout << false;
    }
}

void TestFadeView::sixteenIsOpenAndFifteenIsNot()
{
    QFETCH(int, size);
    QFETCH(bool, inLayout);
    QFETCH(bool, open);
    Scene scene(c_Top, inLayout);
    scene.view->fadein(true, false, size);
    QCOMPARE(scene.view->isFadedIn(), open);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->isFadedIn(), open);
    scene.view->setSizeHint(size, false);
    QCOMPARE(scene.view->isFadedIn(), open);
}

void TestFadeView::theMinimumIsTheFloorOfTheOpenedHeight()
{
    Scene scene(c_Top, true);
    scene.view->m_minimumSize = 60;
    scene.view->fadein(false, false, 20);
    QCOMPARE(scene.view->height(), 60);
    QCOMPARE(scene.view->m_fadeInSize, 20);
}

void TestFadeView::aStillFadeinByGeometryStaysAStrip_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<QRect>("geometry");
    // A neighbour of 40 pixels and an offset of 10: on top the neighbour does not count, by either rule.
    QTest::newRow("top") << c_Top << QRect(0, 10, 400, 15);
    QTest::newRow("bottom") << c_Bottom << QRect(0, 245, 400, 15);
}

void TestFadeView::aStillFadeinByGeometryStaysAStrip()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge, false);
    scene.view->setNeighbourSize(40);
    scene.view->setVerticalOffset(10);
    scene.view->setSizeHint(50, true);
    for (const bool in : {true, false}) {
        scene.view->setGeometry(0, 50, 400, 80);
        scene.recorder.clear();
        if (in) {
            scene.view->fadein(false);
        } else {
            scene.view->fadeout(false);
        }
        QCOMPARE(scene.recorder.names(), QStringList());
        QTEST(scene.view->geometry(), "geometry");
        QCOMPARE(scene.view->isFadedIn(), in);
        // The lock is lifted.
        QCOMPARE(scene.view->maximumHeight(), QWIDGETSIZE_MAX);
        QCOMPARE(scene.view->minimumHeight(), 0);
    }
}

void TestFadeView::forceStartsAtTheStrip()
{
    for (const auto edge : {c_Top, c_Bottom}) {
        Scene scene(edge, false);
        scene.view->setSizeHint(70, true);
        scene.view->fadein(true, true);
        // The first step is set at once.
        QCOMPARE(scene.view->geometry(), QRect(0, edge == c_Top ? 0 : 285, 400, 15));
        scene.wait("fadingInFinished");
        QCOMPARE(scene.view->height(), 99);
    }
}

void TestFadeView::withoutForceTheMovementStartsWhereThePanelIs()
{
    Scene scene(c_Bottom, false);
    scene.view->setSizeHint(70, true);
    QCOMPARE(scene.view->geometry(), QRect(0, 230, 400, 70));
    scene.view->fadein(true, false);
    QCOMPARE(scene.view->geometry(), QRect(0, 230, 400, 70));
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->geometry(), QRect(0, 201, 400, 99));
}

void TestFadeView::forcedFadeoutStartsAtTheFullHeight()
{
    Scene scene(c_Top, false);
    scene.view->setSizeHint(70, true);
    scene.view->setGeometry(0, 0, 400, 30);
    scene.view->fadeout(true, true);
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 70));
    scene.wait("fadingOutFinished");
    QCOMPARE(scene.view->geometry(), QRect(0, 0, 400, 15));
}

void TestFadeView::fadeinIndependentDoesNothingInALayout()
{
    Scene scene(c_Top, true);
    scene.view->setSizeHint(15, true);
    scene.recorder.clear();
    scene.view->fadeinIndependent(true, true);
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.view->getSizeHint(), 15);
    QVERIFY(!scene.view->isFadedIn());
}

void TestFadeView::fadeoutIndependentInALayoutClosesAtOnce()
{
    Scene scene(c_Top, true);
    scene.view->setSizeHint(80, true);
    scene.recorder.clear();
    scene.view->fadeoutIndependent(true, false);
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    QCOMPARE(scene.view->height(), 15);
    QCOMPARE(scene.view->getSizeHint(), 15);
    QCOMPARE(scene.view->m_fadeInSize, 80);
    QVERIFY(!scene.view->isFadedIn());
}

void TestFadeView::reopeningByGeometryTakesTheHeightItHad()
{
    Scene scene(c_Bottom, false);
    scene.view->setSizeHint(123, true);
    scene.view->fadeout(true);
    scene.wait("fadingOutFinished");
    QCOMPARE(scene.view->height(), 15);
    scene.view->fadein(true);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), 123);
}

void TestFadeView::reopeningInALayoutTakesTheSizeGiven()
{
    Scene scene(c_Bottom, true);
    scene.view->fadein(false, false, 70);
    scene.view->setSizeHint(123, true);
    scene.view->fadeout(false);
    QCOMPARE(scene.view->m_fadeInSize, 70);
    scene.view->fadein(false);
    QCOMPARE(scene.view->height(), 70);
}

void TestFadeView::inALayoutOnlyTheHeightIsSet()
{
    Scene scene(c_Top, true);
    // Not at the parent's edge: the layout has the panel elsewhere.
    scene.parent.layout()->setContentsMargins(30, 50, 30, 50);
    scene.parent.layout()->activate();
    bool moved = false;
    connect(scene.view, &FadeView::geometryChanged, this, [&](const QRect& geometry) {
        moved = moved || geometry.topLeft() != QPoint(30, 50) || geometry.width() != 340;
    });
    scene.view->fadein(true);
    scene.wait("fadingInFinished");
    QVERIFY(!moved);
    QCOMPARE(scene.view->minimumHeight(), 99);
    QCOMPARE(scene.view->maximumHeight(), 99);
}

void TestFadeView::theMaximumBoundsTheHeightInALayout()
{
    Scene scene(c_Top, true);
    scene.view->m_maximumHeight = 60;
    scene.view->setSizeHint(61, true);
    QCOMPARE(scene.view->height(), 60);
    scene.view->setSizeHint(60, true);
    QCOMPARE(scene.view->height(), 60);
    scene.view->setSizeHint(59, true);
    QCOMPARE(scene.view->height(), 59);
    // The end of a movement is bounded, too.
    scene.view->fadein(true, false, 200);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), 60);
    // By geometry it is not.
    Scene free(c_Top, false);
    free.view->m_maximumHeight = 60;
    free.view->setSizeHint(100, true);
    QCOMPARE(free.view->height(), 100);
}

void TestFadeView::changeSizeWantsAValidRectangle()
{
    Scene scene(c_Top, true);
    scene.recorder.clear();
    scene.view->changeSize(QRect());
    scene.view->changeSize(QRect(0, 0, 0, 50));
    scene.view->changeSize(QVariant());
    scene.view->changeSize(QStringLiteral("no rectangle"));
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.view->height(), 15);
    scene.view->changeSize(QRect(7, 7, 1, 50));
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    QCOMPARE(scene.view->height(), 50);
    QCOMPARE(scene.view->width(), 400);
}

void TestFadeView::resizeLooksAtTheParentAndTheLargerSize()
{
    Scene scene(c_Bottom, false);
    scene.parent.resize(500, 200);
    scene.recorder.clear();
    scene.view->resize();
    QCOMPARE(scene.view->geometry(), QRect(0, 185, 500, 15));
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    QCOMPARE(scene.lastGeometry(), QRect(0, 185, 500, 15));
    scene.view->resize(600, 250);
    QCOMPARE(scene.view->geometry(), QRect(0, 235, 600, 15));
    scene.view->resize(10, 10);
    QCOMPARE(scene.view->geometry(), QRect(0, 185, 500, 15));
    // Reported even if nothing is new.
    scene.recorder.clear();
    scene.view->resize(-1, -1);
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
}

void TestFadeView::resizeLocksTheHeightOnTopOnly()
{
    Scene top(c_Top, false);
    top.view->setSizeHint(50, true);
    QCOMPARE(top.view->minimumHeight(), 50);
    QCOMPARE(top.view->maximumHeight(), 50);
    Scene bottom(c_Bottom, false);
    bottom.view->setSizeHint(50, true);
    QCOMPARE(bottom.view->height(), 50);
    QCOMPARE(bottom.view->maximumHeight(), QWIDGETSIZE_MAX);
}

void TestFadeView::theSizeHintCanBeSetWithAndWithoutResizing()
{
    Scene scene(c_Top, false);
    scene.recorder.clear();
    scene.view->setSizeHint(50, false);
    QCOMPARE(scene.view->getSizeHint(), 50);
    QCOMPARE(scene.view->height(), 15);
    QCOMPARE(scene.recorder.names(), QStringList());
    scene.view->setSizeHint(60, true);
    QCOMPARE(scene.view->height(), 60);
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    // Nonsense is no reason to complain.
    scene.view->setSizeHint(-5, true);
    QCOMPARE(scene.view->height(), 0);
    QCOMPARE(scene.view->getSizeHint(), -5);
}

void TestFadeView::theVerticalOffsetCountsByGeometryOnly()
{
    Scene scene(c_Top, false);
    scene.view->setVerticalOffset(25);
    QCOMPARE(scene.view->geometry().top(), 0);
    scene.view->resize();
    QCOMPARE(scene.view->geometry(), QRect(0, 25, 400, 15));
    scene.view->fadein(true);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->geometry(), QRect(0, 25, 400, 99));
    scene.view->setFadeStripeAsPartOfLayout(true);
    scene.view->setVerticalOffset(77);
    QCOMPARE(scene.view->m_verticalOffset, 25);
    QCOMPARE(scene.view->m_layoutVerticalOffset, 77);
}

void TestFadeView::neighboursCountWhereTheyAreInTheWay_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<bool>("inLayout");
    QTest::addColumn<int>("offset");
    QTest::addColumn<bool>("shown");
    QTest::newRow("top, in a layout") << c_Top << true << 40 << true;
    QTest::newRow("top, by geometry") << c_Top << false << 0 << false;
    QTest::newRow("bottom, in a layout") << c_Bottom << true << 0 << true;
    QTest::newRow("bottom, by geometry") << c_Bottom << false << 40 << false;
}

void TestFadeView::neighboursCountWhereTheyAreInTheWay()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(bool, inLayout);
    for (const bool sizeLast : {true, false}) {
        Scene scene(edge, true);
        scene.view->hide();
        if (sizeLast) {
            scene.view->setFadeStripeAsPartOfLayout(inLayout);
            scene.view->hide();
        }
        scene.recorder.clear();
        scene.view->setNeighbourSize(40);
        if (!sizeLast) {
            scene.view->hide();
            scene.recorder.clear();
            scene.view->setFadeStripeAsPartOfLayout(inLayout);
        }
        QTEST(scene.view->m_neighbourOffset, "offset");
        QTEST(scene.view->isVisible(), "shown");
        // Once for being shown, once for the resize.
        QCOMPARE(scene.recorder.count(QStringLiteral("geometryChanged")), scene.view->isVisible() ? 2 : 1);
        if (!inLayout && edge == c_Bottom) {
            QCOMPARE(scene.view->geometry(), QRect(0, 245, 400, 15));
        }
    }
}

void TestFadeView::anInactivePanelIgnoresFades()
{
    Scene scene(c_Top, true);
    scene.view->setActive(false);
    QVERIFY(!scene.view->isActive());
    scene.recorder.clear();
    for (const bool animated : {true, false}) {
        scene.view->fadein(animated, false, 50);
        scene.view->fadeout(animated);
    }
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.view->m_fadeInSize, 99);
    QVERIFY(scene.view->isFadedIn());
}

void TestFadeView::deactivatingDoesNotStopAMovement()
{
    Scene scene(c_Top, false);
    scene.view->fadein(true);
    scene.view->setActive(false);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.view->height(), 99);
}

void TestFadeView::showingReportsTheGeometry()
{
    Scene scene(c_Top, false);
    scene.view->hide();
    scene.recorder.clear();
    scene.view->show();
    QCOMPARE(scene.recorder.names(), list("geometryChanged"));
    QCOMPARE(scene.lastGeometry(), scene.view->geometry());
}

ZELKOV_TEST_MAIN(TestFadeView)
#include "tst_fadeview.moc"
