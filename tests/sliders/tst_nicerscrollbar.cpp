// SPDX-License-Identifier: MIT
// The overlay bar: its place, what it copies and sends back, when it is shown and when it fades.
#include "ScrollScene.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QPointer>
#include <QtTest/QtTest>

Q_DECLARE_METATYPE(Qt::Orientation)
Q_DECLARE_METATYPE(Qt::ScrollBarPolicy)
Q_DECLARE_METATYPE(NicerScrollBar::EPositions)

namespace
{
const char c_VisibleVertical[] = "QScrollBar::handle:vertical { background: rgb(140,140,140,170); }";
const char c_VisibleHorizontal[] = "QScrollBar::handle:horizontal { background: rgb(140,140,140,170); }";
const char c_FadedVertical[] = "QScrollBar::handle:vertical { background: transparent; }";
const char c_FadedHorizontal[] = "QScrollBar::handle:horizontal { background: transparent; }";

void orientations()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::newRow("horizontal") << Qt::Horizontal;
    QTest::newRow("vertical") << Qt::Vertical;
}
}

class TestNicerScrollBar : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNumbersOfThePositionsStand();
    void theStyleNamesStand();
    void aBarTakesOverTheAreasOwn_data() { orientations(); }
    void aBarTakesOverTheAreasOwn();
    void theBarLiesWhereItsPositionSays_data();
    void theBarLiesWhereItsPositionSays();
    void resizingTheAreaKeepsTheBarOnItsEdge_data() { theBarLiesWhereItsPositionSays_data(); }
    void resizingTheAreaKeepsTheBarOnItsEdge();
    void theParentsEventsAreNotEaten();
    void aBarOnAnotherParentFollowsTheSizeOfTheArea();

    void aBarOverAFilledAreaStartsWithItsRangeAndValue();
    void theValueOfTheRealBarComesOneTurnLater();
    void theRangeAndThePageStepOfTheRealBarComeOneTurnLater();
    void aValueSetOnThisBarIsNotHandedOn();
    void whileHeldTheBarHandsItsValuesOnOneTurnLater();
    void whileHeldTheBarIgnoresTheRealOne();
    void theTwoBarsDoNotEcho();
    void aRangeIsTakenOverEvenWhileHeld();

    void theBarIsShownByItsPolicy_data();
    void theBarIsShownByItsPolicy();
    void aChangeOfTheRangeShowsAndHides();

    void theTimerIsASingleShotOfOneAndAHalfSeconds();
    void theBarFadesNotBeforeItsDelay();
    void aFadedBarIsATransparentHandle_data() { orientations(); }
    void aFadedBarIsATransparentHandle();
    void noSheetIsSetBeforeTheFirstFade();
    void activityShowsAFadedBarAgain_data();
    void activityShowsAFadedBarAgain();
    void activityStartsTheDelayAnew();
    void aHeldBarIsNotShownByTheRealOne();
    void withoutFadingTheBarStaysVisible();
    void switchingFadingOffLeavesAFadedBarFaded();
    void switchingFadingOffStartsTheTimer();
    void switchingFadingOnShowsAndStartsTheDelay();
    void showingRaisesTheBar();
    void fadedPixelsShowTheContent();

    void aPlainBarShadowsNothing();
    void aBarWithoutAreaOrParentDoesNothing();
    void hidingDuringADragEndsTheDrag();
    void theAreaMayGetAnotherBar();
    void theBarMayOutliveItsArea();
    void theBarMayBeDeletedByItsOwnSignals_data();
    void theBarMayBeDeletedByItsOwnSignals();
};

void TestNicerScrollBar::theNumbersOfThePositionsStand()
{
    QCOMPARE(static_cast<int>(NicerScrollBar::epAutomatic), 1);
    QCOMPARE(static_cast<int>(NicerScrollBar::epBottom), 2);
    QCOMPARE(static_cast<int>(NicerScrollBar::epTop), 3);
    QCOMPARE(static_cast<int>(NicerScrollBar::epRight), 4);
    QCOMPARE(static_cast<int>(NicerScrollBar::epLeft), 5);
}

void TestNicerScrollBar::theStyleNamesStand()
{
    QCOMPARE(NicerScrollBar::s_HorizontalNicerScrollBar, QStringLiteral("HorizontalNicerScrollBar"));
    QCOMPARE(NicerScrollBar::s_VerticalNicerScrollBar, QStringLiteral("VerticalNicerScrollBar"));
    QCOMPARE(
        NicerScrollBar::s_HorizontalNicerScrollBarInvisible, QStringLiteral("HorizontalNicerScrollBarInvisible"));
    QCOMPARE(NicerScrollBar::s_VerticalNicerScrollBarInvisible, QStringLiteral("VerticalNicerScrollBarInvisible"));
}

void TestNicerScrollBar::aBarTakesOverTheAreasOwn()
{
    QFETCH(Qt::Orientation, orientation);
    const bool horizontal = orientation == Qt::Horizontal;
    const ScrollScene scene(orientation);
    QCOMPARE(scene.bar->orientation(), orientation);
    QCOMPARE(scene.bar->objectName(),
        horizontal ? QStringLiteral("HorizontalNicerScrollBar") : QStringLiteral("VerticalNicerScrollBar"));
    QCOMPARE(scene.area.horizontalScrollBarPolicy(), horizontal ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded);
    QCOMPARE(scene.area.verticalScrollBarPolicy(), horizontal ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOff);
    QVERIFY(!scene.real->isVisible());
    QVERIFY(scene.bar->isVisible());
    QCOMPARE(scene.bar->parentWidget(), &scene.area);
    QCOMPARE(scene.bar->contextMenuPolicy(), Qt::NoContextMenu);
    QCOMPARE(scene.bar->palette().color(QPalette::Light), QColor(0, 0, 0, 0));
    QVERIFY(scene.bar->hasMouseTracking());
}

void TestNicerScrollBar::theBarLiesWhereItsPositionSays_data()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<NicerScrollBar::EPositions>("position");
    QTest::addColumn<QString>("edge");
    const auto row
        = [](const char* name, Qt::Orientation orientation, NicerScrollBar::EPositions position,
              const char* edge) { QTest::newRow(name) << orientation << position << QString::fromLatin1(edge); };
    row("horizontal automatic", Qt::Horizontal, NicerScrollBar::epAutomatic, "bottom");
    row("horizontal bottom", Qt::Horizontal, NicerScrollBar::epBottom, "bottom");
    row("horizontal top", Qt::Horizontal, NicerScrollBar::epTop, "top");
    row("horizontal right", Qt::Horizontal, NicerScrollBar::epRight, "bottom");
    row("horizontal left", Qt::Horizontal, NicerScrollBar::epLeft, "bottom");
    row("vertical automatic", Qt::Vertical, NicerScrollBar::epAutomatic, "right");
    row("vertical bottom", Qt::Vertical, NicerScrollBar::epBottom, "right");
    row("vertical top", Qt::Vertical, NicerScrollBar::epTop, "right");
    row("vertical right", Qt::Vertical, NicerScrollBar::epRight, "right");
    row("vertical left", Qt::Vertical, NicerScrollBar::epLeft, "left");
}

static QRect edgeRect(const QString& edge, int width, int height)
{
    if (edge == QLatin1String("top")) {
        return {0, 0, width, 15};
    }
    if (edge == QLatin1String("bottom")) {
        return {0, height - 15, width, 15};
    }
    return edge == QLatin1String("left") ? QRect(0, 0, 15, height) : QRect(width - 15, 0, 15, height);
}

void TestNicerScrollBar::theBarLiesWhereItsPositionSays()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(NicerScrollBar::EPositions, position);
    QFETCH(QString, edge);
    const ScrollScene scene(orientation, position);
    QCOMPARE(scene.bar->geometry(), edgeRect(edge, 300, 200));
}

void TestNicerScrollBar::resizingTheAreaKeepsTheBarOnItsEdge()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(NicerScrollBar::EPositions, position);
    QFETCH(QString, edge);
    ScrollScene scene(orientation, position);
    scene.area.resize(417, 333);
    QCOMPARE(scene.bar->geometry(), edgeRect(edge, 417, 333));
    scene.area.resize(90, 61);
    QCOMPARE(scene.bar->geometry(), edgeRect(edge, 90, 61));
    scene.bar->setGeometry(1, 2, 3, 4);
    scene.bar->resizeBar();
    QCOMPARE(scene.bar->geometry(), edgeRect(edge, 90, 61));
}

void TestNicerScrollBar::theParentsEventsAreNotEaten()
{
    ScrollScene scene(Qt::Vertical, NicerScrollBar::epAutomatic, QSize(100, 3000));
    QCOMPARE(scene.real->maximum(), 3000 - 200);
    scene.area.resize(300, 500);
    QCOMPARE(scene.area.viewport()->height(), 500);
    QCOMPARE(scene.real->maximum(), 3000 - 500);
    QResizeEvent resize(QSize(300, 500), QSize(300, 200));
    QVERIFY(!scene.bar->eventFilter(&scene.area, &resize));
    QEvent other(QEvent::LayoutRequest);
    QVERIFY(!scene.bar->eventFilter(&scene.area, &other));
}

void TestNicerScrollBar::aBarOnAnotherParentFollowsTheSizeOfTheArea()
{
    QWidget window;
    window.resize(400, 400);
    QScrollArea area(&window);
    area.resize(300, 200);
    const NicerScrollBar bar(&area, Qt::Vertical, NicerScrollBar::epRight, &window);
    window.show();
    QCOMPARE(bar.geometry(), QRect(285, 0, 15, 200));
    area.resize(200, 100);
    window.resize(500, 500);
    QCOMPARE(bar.geometry(), QRect(185, 0, 15, 100));
}

void TestNicerScrollBar::aBarOverAFilledAreaStartsWithItsRangeAndValue()
{
    QAbstractScrollArea* const area = new QScrollArea;
    area->verticalScrollBar()->setRange(3, 500);
    area->verticalScrollBar()->setPageStep(77);
    area->verticalScrollBar()->setValue(123);
    const NicerScrollBar* bar = new NicerScrollBar(area, Qt::Vertical, NicerScrollBar::epAutomatic, area);
    QCOMPARE(bar->minimum(), 3);
    QCOMPARE(bar->maximum(), 500);
    QCOMPARE(bar->pageStep(), 77);
    QCOMPARE(bar->value(), 123);
    delete area;
}

void TestNicerScrollBar::theValueOfTheRealBarComesOneTurnLater()
{
    const ScrollScene scene;
    scene.real->setValue(1234);
    QCOMPARE(scene.bar->value(), 0);
    QTRY_COMPARE(scene.bar->value(), 1234);
}

void TestNicerScrollBar::theRangeAndThePageStepOfTheRealBarComeOneTurnLater()
{
    const ScrollScene scene;
    QCOMPARE(scene.bar->maximum(), scene.real->maximum());
    QCOMPARE(scene.bar->pageStep(), scene.real->pageStep());
    scene.bar->setGeometry(1, 2, 3, 4);
    scene.real->setPageStep(31);
    scene.real->setRange(-5, 900);
    QVERIFY(scene.bar->maximum() != 900);
    QTRY_COMPARE(scene.bar->maximum(), 900);
    QCOMPARE(scene.bar->minimum(), -5);
    QCOMPARE(scene.bar->pageStep(), 31);
    QCOMPARE(scene.bar->geometry(), QRect(285, 0, 15, 200));
}

void TestNicerScrollBar::aValueSetOnThisBarIsNotHandedOn()
{
    const ScrollScene scene;
    zelkovtest::SignalRecorder recorder(scene.bar);
    scene.bar->setValue(500);
    ScrollScene::settle();
    QCOMPARE(recorder.names(), QStringList());
    QCOMPARE(scene.real->value(), 0);
}

void TestNicerScrollBar::whileHeldTheBarHandsItsValuesOnOneTurnLater()
{
    const ScrollScene scene;
    zelkovtest::SignalRecorder recorder(scene.bar);
    scene.bar->setSliderDown(true);
    scene.bar->setValue(500);
    QCOMPARE(recorder.names(), QStringList());
    ScrollScene::settle();
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("nicerValueChanged")});
    QCOMPARE(recorder.entries().at(0).arguments, QVariantList {500});
    QCOMPARE(scene.real->value(), 500);
    scene.bar->setSliderDown(false);
    scene.bar->setValue(600);
    ScrollScene::settle();
    QCOMPARE(recorder.names().size(), 1);
    QCOMPARE(scene.real->value(), 500);
}

void TestNicerScrollBar::whileHeldTheBarIgnoresTheRealOne()
{
    const ScrollScene scene;
    scene.bar->setSliderDown(true);
    scene.real->setValue(700);
    ScrollScene::settle();
    QCOMPARE(scene.bar->value(), 0);
    scene.bar->setSliderDown(false);
    scene.real->setValue(701);
    QTRY_COMPARE(scene.bar->value(), 701);
}

void TestNicerScrollBar::theTwoBarsDoNotEcho()
{
    const ScrollScene scene;
    QSignalSpy own(scene.bar, &QScrollBar::valueChanged);
    QSignalSpy real(scene.real, &QScrollBar::valueChanged);
    scene.real->setValue(10);
    ScrollScene::settle();
    QCOMPARE(own.count(), 1);
    QCOMPARE(real.count(), 1);
    scene.bar->setSliderDown(true);
    scene.bar->setValue(20);
    ScrollScene::settle();
    QCOMPARE(own.count(), 2);
    QCOMPARE(real.count(), 2);
    scene.bar->setSliderDown(false);
}

void TestNicerScrollBar::aRangeIsTakenOverEvenWhileHeld()
{
    const ScrollScene scene;
    scene.bar->setSliderDown(true);
    scene.real->setRange(0, 321);
    QTRY_COMPARE(scene.bar->maximum(), 321);
    scene.bar->setSliderDown(false);
}

void TestNicerScrollBar::theBarIsShownByItsPolicy_data()
{
    QTest::addColumn<Qt::ScrollBarPolicy>("policy");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<bool>("shown");
    QTest::newRow("as needed, 0") << Qt::ScrollBarAsNeeded << 0 << false;
    QTest::newRow("as needed, 1") << Qt::ScrollBarAsNeeded << 1 << false;
    QTest::newRow("as needed, 2") << Qt::ScrollBarAsNeeded << 2 << true;
    QTest::newRow("always on, 0") << Qt::ScrollBarAlwaysOn << 0 << true;
    QTest::newRow("always off, 1000") << Qt::ScrollBarAlwaysOff << 1000 << false;
}

void TestNicerScrollBar::theBarIsShownByItsPolicy()
{
    QFETCH(Qt::ScrollBarPolicy, policy);
    QFETCH(int, maximum);
    QFETCH(bool, shown);
    const BareScene scene;
    scene.real->setRange(0, 0);
    ScrollScene::settle();
    QVERIFY(!scene.bar->isVisible());
    scene.real->setRange(0, maximum);
    ScrollScene::settle();
    QCOMPARE(scene.bar->isVisible(), maximum > 1);
    scene.bar->setScrollBarPolicy(policy);
    QCOMPARE(scene.bar->isVisible(), shown);
    // A change of the range keeps to the policy.
    scene.real->setRange(-1, maximum);
    ScrollScene::settle();
    QCOMPARE(scene.bar->isVisible(), shown);
    // Nobody else shows a bar that is off.
    scene.bar->showBar();
    QCOMPARE(scene.bar->isVisible(), shown);
}

void TestNicerScrollBar::aChangeOfTheRangeShowsAndHides()
{
    const BareScene scene(Qt::Horizontal);
    scene.real->setRange(0, 3);
    QTRY_VERIFY(scene.bar->isVisible());
    scene.real->setRange(-100, 1);
    QTRY_VERIFY(!scene.bar->isVisible());
    scene.real->setRange(0, 2);
    QTRY_VERIFY(scene.bar->isVisible());
}

void TestNicerScrollBar::theTimerIsASingleShotOfOneAndAHalfSeconds()
{
    const ScrollScene scene;
    QVERIFY(scene.timer() != nullptr);
    QVERIFY(scene.timer()->isSingleShot());
    QCOMPARE(scene.timer()->interval(), 1500);
    QVERIFY(scene.timer()->isActive());
}

void TestNicerScrollBar::theBarFadesNotBeforeItsDelay()
{
    const ScrollScene scene;
    QElapsedTimer clock;
    clock.start();
    scene.bar->showBar();
    QTRY_VERIFY_WITH_TIMEOUT(scene.faded(), 20000);
    QVERIFY(clock.elapsed() >= 1400); // a coarse timer may be 5 % early
    QVERIFY(!scene.timer()->isActive());
}

void TestNicerScrollBar::aFadedBarIsATransparentHandle()
{
    QFETCH(Qt::Orientation, orientation);
    const bool horizontal = orientation == Qt::Horizontal;
    const ScrollScene scene(orientation);
    scene.fade();
    QCOMPARE(scene.bar->styleSheet(), QString::fromLatin1(horizontal ? c_FadedHorizontal : c_FadedVertical));
    QVERIFY(scene.bar->isVisible());
    QVERIFY(scene.bar->isEnabled());
    scene.bar->showBar();
    QCOMPARE(scene.bar->styleSheet(), QString::fromLatin1(horizontal ? c_VisibleHorizontal : c_VisibleVertical));
}

void TestNicerScrollBar::noSheetIsSetBeforeTheFirstFade()
{
    const ScrollScene scene;
    QCOMPARE(scene.bar->styleSheet(), QString());
    scene.bar->showBar();
    QCOMPARE(scene.bar->styleSheet(), QString());
}

void TestNicerScrollBar::activityShowsAFadedBarAgain_data()
{
    QTest::addColumn<int>("activity");
    QTest::newRow("value of the real bar") << 0;
    QTest::newRow("range of the real bar") << 1;
    QTest::newRow("move of the pointer") << 2;
    QTest::newRow("showBar") << 3;
    QTest::newRow("fading switched on") << 4;
}

void TestNicerScrollBar::activityShowsAFadedBarAgain()
{
    QFETCH(int, activity);
    const ScrollScene scene;
    scene.fade();
    scene.timer()->stop();
    QVERIFY(scene.faded());
    switch (activity) {
    case 0:
        scene.real->setValue(5);
        break;
    case 1:
        scene.real->setRange(0, 50);
        break;
    case 2: {
        QMouseEvent move(QEvent::MouseMove, QPoint(4, 4), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(scene.bar, &move);
        break;
    }
    case 3:
        scene.bar->showBar();
        break;
    default:
        scene.bar->setFadingEnabled(true);
        break;
    }
    QTRY_COMPARE(scene.bar->styleSheet(), QString::fromLatin1(c_VisibleVertical));
    QVERIFY(scene.timer()->isActive());
}

void TestNicerScrollBar::activityStartsTheDelayAnew()
{
    const ScrollScene scene;
    scene.timer()->start();
    QTRY_VERIFY(scene.timer()->remainingTime() < 1400);
    scene.real->setValue(5);
    ScrollScene::settle();
    QVERIFY(scene.timer()->remainingTime() > 1400);
    QTRY_VERIFY(scene.timer()->remainingTime() < 1400);
    scene.bar->setScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    QVERIFY(scene.timer()->remainingTime() > 1400);
}

void TestNicerScrollBar::aHeldBarIsNotShownByTheRealOne()
{
    const ScrollScene scene;
    scene.fade();
    scene.bar->setSliderDown(true);
    scene.real->setValue(5);
    ScrollScene::settle();
    QVERIFY(scene.faded());
    scene.bar->setSliderDown(false);
}

void TestNicerScrollBar::withoutFadingTheBarStaysVisible()
{
    const ScrollScene scene;
    scene.bar->setFadingEnabled(false);
    scene.fade();
    QVERIFY(!scene.faded());
    scene.timer()->stop();
    scene.bar->showBar();
    scene.bar->setScrollBarPolicy(Qt::ScrollBarAsNeeded);
    scene.real->setValue(9);
    ScrollScene::settle();
    QVERIFY(!scene.timer()->isActive());
}

void TestNicerScrollBar::switchingFadingOffLeavesAFadedBarFaded()
{
    const ScrollScene scene;
    scene.fade();
    scene.bar->setFadingEnabled(false);
    QVERIFY(scene.faded());
    scene.timer()->start(1);
    QTRY_VERIFY(!scene.timer()->isActive());
    ScrollScene::settle();
    QVERIFY(scene.faded());
    scene.bar->showBar();
    QVERIFY(!scene.faded());
}

void TestNicerScrollBar::switchingFadingOffStartsTheTimer()
{
    const ScrollScene scene;
    scene.timer()->stop();
    scene.bar->setFadingEnabled(false);
    QVERIFY(scene.timer()->isActive());
    scene.timer()->start(1);
    QTRY_VERIFY(!scene.timer()->isActive());
    ScrollScene::settle();
    QVERIFY(!scene.faded());
}

void TestNicerScrollBar::switchingFadingOnShowsAndStartsTheDelay()
{
    const ScrollScene scene;
    scene.bar->setFadingEnabled(false);
    scene.timer()->stop();
    scene.bar->hide();
    scene.bar->setFadingEnabled(true);
    QVERIFY(scene.bar->isVisible());
    QVERIFY(scene.timer()->isActive());
    QVERIFY(scene.timer()->remainingTime() > 1400);
}

void TestNicerScrollBar::showingRaisesTheBar()
{
    ScrollScene scene;
    auto* cover = new QWidget(&scene.area);
    cover->setGeometry(scene.area.rect());
    cover->show();
    QCOMPARE(scene.area.childAt(292, 50), cover);
    scene.bar->showBar();
    QCOMPARE(scene.area.childAt(292, 50), scene.bar);
    cover->raise();
    scene.bar->setScrollBarPolicy(Qt::ScrollBarAsNeeded);
    QCOMPARE(scene.area.childAt(292, 50), scene.bar);
}

void TestNicerScrollBar::fadedPixelsShowTheContent()
{
    ScrollScene scene;
    scene.area.setStyleSheet(
        QStringLiteral("QScrollBar:vertical { background: transparent; border: none; width: 15px; margin: 0px; }"
                       "QScrollBar::add-line, QScrollBar::sub-line { height: 0px; }"
                       "QScrollBar::add-page, QScrollBar::sub-page { background: transparent; }"));
    scene.area.widget()->setStyleSheet(QStringLiteral("background: rgb(200,0,0);"));
    scene.fade();
    const QPoint onHandle(292, 4);
    QCOMPARE(scene.area.grab().toImage().pixelColor(onHandle), QColor(200, 0, 0));
    // Qt reads the alpha of the handle's colour but says that it is not written rgba.
    expectWarning(QRegularExpression(QStringLiteral("Specified color without alpha value but alpha given")));
    scene.bar->showBar();
    const QColor seen = scene.area.grab().toImage().pixelColor(onHandle);
    // 170 of 255 parts of grey over the content.
    QVERIFY(qAbs(seen.red() - 160) <= 2);
    QVERIFY(qAbs(seen.green() - 93) <= 2);
}

void TestNicerScrollBar::aPlainBarShadowsNothing()
{
    QWidget parent;
    parent.resize(100, 100);
    auto* bar = new NicerScrollBar(&parent);
    parent.show();
    const QRect before = bar->geometry();
    QCOMPARE(bar->objectName(), QString());
    QCOMPARE(bar->orientation(), Qt::Vertical);
    QVERIFY(bar->findChild<QTimer*>() == nullptr);
    bar->resizeBar();
    parent.resize(200, 200);
    QCOMPARE(bar->geometry(), before);
    bar->setNicerRange(0, 50);
    bar->setNicerValue(30);
    QCOMPARE(bar->maximum(), 50);
    QCOMPARE(bar->value(), 30);
    bar->setFadingEnabled(false);
    bar->setFadingEnabled(true);
    bar->showBar();
    bar->setScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    QVERIFY(bar->isVisible());
    zelkovtest::SignalRecorder recorder(bar);
    bar->setSliderDown(true);
    bar->setValue(31);
    bar->setSliderDown(false);
    ScrollScene::settle();
    QCOMPARE(recorder.names(), QStringList());
}

void TestNicerScrollBar::aBarWithoutAreaOrParentDoesNothing()
{
    NicerScrollBar noArea(nullptr, Qt::Horizontal, NicerScrollBar::epAutomatic, nullptr);
    QCOMPARE(noArea.orientation(), Qt::Horizontal);
    noArea.resizeBar();
    noArea.showBar();
    noArea.setFadingEnabled(true);
    noArea.setNicerRange(0, 9);

    QScrollArea area;
    area.resize(300, 200);
    area.verticalScrollBar()->setRange(0, 1);
    NicerScrollBar noParent(&area, Qt::Vertical, NicerScrollBar::epAutomatic, nullptr);
    QCOMPARE(noParent.geometry().size(), QSize(15, 200));
    area.verticalScrollBar()->setValue(1);
    QTRY_COMPARE(noParent.value(), 1);
}

void TestNicerScrollBar::hidingDuringADragEndsTheDrag()
{
    const BareScene scene;
    scene.real->setRange(0, 100);
    QTRY_VERIFY(scene.bar->isVisible());
    QSignalSpy released(scene.bar, &QScrollBar::sliderReleased);
    scene.bar->setSliderDown(true);
    scene.real->setRange(0, 1);
    QTRY_VERIFY(!scene.bar->isVisible());
    QVERIFY(!scene.bar->isSliderDown());
    QCOMPARE(released.count(), 1);
    scene.real->setRange(0, 100);
    scene.real->setValue(60);
    QTRY_COMPARE(scene.bar->value(), 60);
}

void TestNicerScrollBar::theAreaMayGetAnotherBar()
{
    ScrollScene scene;
    scene.area.setVerticalScrollBar(new QScrollBar(Qt::Vertical));
    scene.bar->setNicerRange(0, 10);
    QVERIFY(!scene.bar->isVisible());
    scene.bar->setSliderDown(true);
    scene.bar->setValue(7);
    ScrollScene::settle();
    scene.bar->setSliderDown(false);
}

void TestNicerScrollBar::theBarMayOutliveItsArea()
{
    QWidget window;
    window.resize(300, 300);
    auto* area = new QScrollArea(&window);
    auto* bar = new NicerScrollBar(area, Qt::Vertical, NicerScrollBar::epAutomatic, &window);
    window.show();
    area->verticalScrollBar()->setRange(0, 100);
    delete area;
    ScrollScene::settle();
    bar->resizeBar();
    bar->showBar();
    bar->setNicerRange(0, 5);
    QVERIFY(!bar->isVisible());
    window.resize(400, 400);
    bar->setScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    QVERIFY(bar->isVisible());
}

void TestNicerScrollBar::theBarMayBeDeletedByItsOwnSignals_data()
{
    QTest::addColumn<int>("signal");
    QTest::newRow("valueChanged") << 0;
    QTest::newRow("nicerValueChanged") << 1;
}

void TestNicerScrollBar::theBarMayBeDeletedByItsOwnSignals()
{
    QFETCH(int, signal);
    const ScrollScene scene;
    const QPointer<NicerScrollBar> alive(scene.bar);
    const auto remove = [bar = scene.bar] { delete bar; };
    if (signal == 0) {
        connect(scene.bar, &QScrollBar::valueChanged, this, remove);
        scene.real->setValue(10);
    } else {
        connect(scene.bar, &NicerScrollBar::nicerValueChanged, this, remove);
        scene.bar->setSliderDown(true);
        scene.bar->setValue(10);
    }
    QTRY_VERIFY(alive.isNull());
}

ZELKOV_TEST_MAIN(TestNicerScrollBar)
#include "tst_nicerscrollbar.moc"
