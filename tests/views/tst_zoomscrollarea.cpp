// SPDX-License-Identifier: MIT
// The area whose wheel zooms: the law of its steps, its ticks and timers, touch and the overlay bars.
#include "sliders/NicerScrollBar.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/ZoomLaw.h"
#include "views/ZoomScrollArea.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QPointer>
#include <QtCore/QTimeLine>
#include <QtCore/QTimer>
#include <QtGui/QTouchEvent>
#include <QtGui/QWheelEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include <climits>
#include <memory>

using zelkovtest::SignalRecorder;
namespace law = vx::ZoomLaw;

namespace
{
class OpenArea : public ZoomScrollArea
{
public:
    using ZoomScrollArea::isTouchActive;
    using ZoomScrollArea::viewportEvent;
};

struct Scene
{
    Scene()
    {
        area.setFrameShape(QFrame::NoFrame);
        area.resize(300, 200);
        auto* const content = new QWidget;
        content->resize(1000, 800);
        area.setWidget(content);
        area.show();
        if (!QTest::qWaitForWindowExposed(&area)) {
            qFatal("no window");
        }
        QCoreApplication::processEvents();
        recorder.add(&area);
    }

    /// True if the event was left for others.
    bool wheel(int angle)
    {
        QWidget* const viewport = area.viewport();
        const QPoint centre = viewport->rect().center();
        QWheelEvent event(centre, viewport->mapToGlobal(centre), QPoint(), QPoint(0, angle), Qt::NoButton,
            Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(viewport, &event);
        return !event.isAccepted();
    }

    QVector<double> factors() const
    {
        QVector<double> result;
        for (const auto& entry : recorder.entries()) {
            if (entry.name == QLatin1String("updateZoomFactor")) {
                result << entry.arguments.first().toDouble();
            }
        }
        return result;
    }

    int timeLines() const { return area.findChildren<QTimeLine*>().size(); }

    QTimer* timer(int interval) const
    {
        const auto timers = area.findChildren<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
        for (QTimer* const timer : timers) {
            if (timer->interval() == interval) {
                return timer;
            }
        }
        return nullptr;
    }

    /// Lets the stop wait: on a busy machine a time line may end after it.
    void holdStop() { timer(825)->start(60000); }
    void stop() { QMetaObject::invokeMethod(&area, "stopAllZooming", Qt::DirectConnection); }

    bool touch(QEvent::Type type)
    {
        QTouchEvent event(type);
        return area.viewportEvent(&event);
    }

    OpenArea area;
    SignalRecorder recorder;
};

bool isAll(const QVector<double>& values, double wanted)
{
    return std::all_of(values.begin(), values.end(), [wanted](double value) { return value == wanted; });
}
}

class TestZoomScrollArea : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void anAngleIsCutToWholeNotches_data();
    void anAngleIsCutToWholeNotches();
    void stepsAddUpUntilTheDirectionTurns_data();
    void stepsAddUpUntilTheDirectionTurns();
    void oneStepIsTakenTowardsNoughtButNoughtBecomesOne_data();
    void oneStepIsTakenTowardsNoughtButNoughtBecomesOne();
    void anyStepGivesTheFullFactor();

    void theAreaIsSetUpAsTold();
    void theBarsLieAtTheTopAndTheRight();
    void theBarsCanBeSwitchedOff();
    void aNotchGivesTicksAndAStop();
    void theWheelDoesNotScrollAndIsLeftForOthers();
    void aWheelOverAnOverlayBarZooms();
    void lessThanANotchStillTicks();
    void zoomingOutGivesMinusOne();
    void everyEventHasATimeLineOfItsOwn();
    void theEndedTimeLineIsDestroyedAtOnce();
    void theStopComesInTimeEvenWhileTimeLinesRun();
    void aTurnOfTheDirectionCountsAtOnce();
    void severalNotchesAreTakenOneByOne();
    void scrollingIsReported();

    void touchesAreNotedAndGoNoFurther();
    void theEndOfATouchOnlyStartsTheTime();
    void touchIsForgottenWhenTheTimeIsOver();
    void falseClearsNothingAtOnce();

    void slotsMayDeleteTheArea_data();
    void slotsMayDeleteTheArea();
    void theAreaMayDieWhileTimeLinesRun();
    void aNestedLoopInASlotIsFine();
};

void TestZoomScrollArea::anAngleIsCutToWholeNotches_data()
{
    QTest::addColumn<int>("angle");
    QTest::addColumn<int>("steps");
    QTest::newRow("nothing") << 0 << 0;
    QTest::newRow("less than a notch") << 119 << 0;
    QTest::newRow("a notch") << 120 << 1;
    QTest::newRow("nearly two") << 239 << 1;
    QTest::newRow("two") << 240 << 2;
    QTest::newRow("less than one back") << -119 << 0;
    QTest::newRow("one back") << -120 << -1;
    QTest::newRow("a fine wheel") << 15 << 0;
}

void TestZoomScrollArea::anAngleIsCutToWholeNotches()
{
    QFETCH(int, angle);
    QTEST(law::stepsOf(angle), "steps");
}

void TestZoomScrollArea::stepsAddUpUntilTheDirectionTurns_data()
{
    QTest::addColumn<int>("owed");
    QTest::addColumn<int>("steps");
    QTest::addColumn<int>("result");
    QTest::newRow("first") << 0 << 1 << 1;
    QTest::newRow("more") << 1 << 2 << 3;
    QTest::newRow("more out") << -1 << -2 << -3;
    QTest::newRow("turned") << 3 << -1 << -1;
    QTest::newRow("turned back") << -3 << 2 << 2;
    QTest::newRow("turned, as many") << 2 << -2 << 0;
    QTest::newRow("turned, more") << 2 << -3 << -1;
    QTest::newRow("none") << 2 << 0 << 2;
    QTest::newRow("the end of the range") << INT_MAX << 1 << INT_MAX;
}

void TestZoomScrollArea::stepsAddUpUntilTheDirectionTurns()
{
    QFETCH(int, owed);
    QFETCH(int, steps);
    QTEST(law::scheduled(owed, steps), "result");
}

void TestZoomScrollArea::oneStepIsTakenTowardsNoughtButNoughtBecomesOne_data()
{
    QTest::addColumn<int>("owed");
    QTest::addColumn<int>("result");
    QTest::newRow("3") << 3 << 2;
    QTest::newRow("2") << 2 << 1;
    QTest::newRow("1") << 1 << 0;
    QTest::newRow("0") << 0 << 1;
    QTest::newRow("-1") << -1 << 0;
    QTest::newRow("-2") << -2 << -1;
}

void TestZoomScrollArea::oneStepIsTakenTowardsNoughtButNoughtBecomesOne()
{
    QFETCH(int, owed);
    QTEST(law::afterOne(owed), "result");
}

void TestZoomScrollArea::anyStepGivesTheFullFactor()
{
    QCOMPARE(law::factor(1), 1.0);
    QCOMPARE(law::factor(7), 1.0);
    QCOMPARE(law::factor(0), 0.0);
    QCOMPARE(law::factor(-1), -1.0);
    QCOMPARE(law::factor(INT_MIN), -1.0);
}

void TestZoomScrollArea::theAreaIsSetUpAsTold()
{
    Scene scene;
    QVERIFY(scene.area.viewport()->testAttribute(Qt::WA_AcceptTouchEvents));
    QVERIFY(!scene.area.isTouchActive());
    for (const int interval : {2000, 825}) {
        const QTimer* const timer = scene.timer(interval);
        QVERIFY(timer);
        QVERIFY(timer->isSingleShot());
        QVERIFY(!timer->isActive());
    }
    QCOMPARE(scene.area.horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(scene.area.verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
}

void TestZoomScrollArea::theBarsLieAtTheTopAndTheRight()
{
    Scene scene;
    QScrollBar* const across = scene.area.horizontalNicerScrollBar();
    QScrollBar* const down = scene.area.verticalNicerScrollBar();
    QVERIFY(qobject_cast<NicerScrollBar*>(across));
    QVERIFY(qobject_cast<NicerScrollBar*>(down));
    QCOMPARE(across->parentWidget(), &scene.area);
    QVERIFY(across->isVisible());
    QVERIFY(down->isVisible());
    QCOMPARE(across->geometry().top(), 0);
    QVERIFY(down->geometry().right() >= 298);
}

void TestZoomScrollArea::theBarsCanBeSwitchedOff()
{
    Scene scene;
    scene.area.enableScrollbars(false);
    QVERIFY(scene.area.horizontalNicerScrollBar()->isHidden());
    QVERIFY(scene.area.verticalNicerScrollBar()->isHidden());
    scene.area.enableScrollbars(true);
    QVERIFY(scene.area.horizontalNicerScrollBar()->isVisible());
    QVERIFY(scene.area.verticalNicerScrollBar()->isVisible());
    scene.area.widget()->resize(100, 100);
    QCoreApplication::processEvents();
    QTRY_VERIFY(scene.area.horizontalNicerScrollBar()->isHidden());
}

void TestZoomScrollArea::aNotchGivesTicksAndAStop()
{
    Scene scene;
    QElapsedTimer clock;
    clock.start();
    scene.wheel(120);
    QVERIFY(scene.timer(825)->isActive());
    QTRY_VERIFY_WITH_TIMEOUT(!scene.timer(825)->isActive(), 5000);
    QVERIFY2(clock.elapsed() >= 800, qPrintable(QString::number(clock.elapsed())));
    const QVector<double> factors = scene.factors();
    QVERIFY2(factors.size() >= 4 && factors.size() <= 13, qPrintable(QString::number(factors.size())));
    // Full speed on each tick; the end of the time line takes the step, and then the stream stops.
    const int moving = factors.indexOf(0.0);
    QVERIFY(moving >= 3);
    QVERIFY(isAll(factors.mid(0, moving), 1.0));
    QVERIFY(isAll(factors.mid(moving), 0.0));
    QTRY_COMPARE(scene.timeLines(), 0);
    const int before = scene.factors().size();
    QTest::qWait(200);
    QCOMPARE(scene.factors().size(), before);
}

void TestZoomScrollArea::theWheelDoesNotScrollAndIsLeftForOthers()
{
    Scene scene;
    QVERIFY(scene.wheel(-120));
    QCOMPARE(scene.area.verticalScrollBar()->value(), 0);
    QCOMPARE(scene.recorder.count(QStringLiteral("scrollAreaChanged")), 0);
}

void TestZoomScrollArea::aWheelOverAnOverlayBarZooms()
{
    Scene scene;
    QScrollBar* const bar = scene.area.verticalNicerScrollBar();
    const QPoint centre = bar->rect().center();
    QWheelEvent event(centre, bar->mapToGlobal(centre), QPoint(), QPoint(0, 120), Qt::NoButton, Qt::NoModifier,
        Qt::NoScrollPhase, false);
    QApplication::sendEvent(bar, &event);
    QCOMPARE(scene.timeLines(), 1);
    QTRY_VERIFY(scene.factors().contains(1.0));
    QCOMPARE(scene.area.verticalScrollBar()->value(), 0);
}

void TestZoomScrollArea::lessThanANotchStillTicks()
{
    Scene scene;
    scene.wheel(119);
    QCOMPARE(scene.timeLines(), 1);
    QVERIFY(scene.timer(825)->isActive());
    scene.holdStop();
    QTRY_COMPARE_WITH_TIMEOUT(scene.timeLines(), 0, 5000);
    QVector<double> factors = scene.factors();
    // No step is owed, so the ticks say 0, but the end of the time line turns 0 into a step.
    QCOMPARE(factors.takeLast(), 1.0);
    QVERIFY(factors.size() >= 3);
    QVERIFY(isAll(factors, 0.0));
    scene.stop();
    QCOMPARE(scene.factors().last(), 0.0);
}

void TestZoomScrollArea::zoomingOutGivesMinusOne()
{
    Scene scene;
    scene.wheel(-120);
    QTRY_VERIFY(!scene.factors().isEmpty());
    QVERIFY(isAll(scene.factors(), -1.0));
}

void TestZoomScrollArea::everyEventHasATimeLineOfItsOwn()
{
    Scene scene;
    scene.wheel(120);
    scene.wheel(120);
    scene.wheel(120);
    const auto lines = scene.area.findChildren<QTimeLine*>();
    QCOMPARE(lines.size(), 3);
    for (const QTimeLine* const line : lines) {
        QCOMPARE(line->duration(), 750);
        QCOMPARE(line->updateInterval(), 75);
        QCOMPARE(line->state(), QTimeLine::Running);
        QCOMPARE(line->parent(), &scene.area);
    }
    QTRY_COMPARE_WITH_TIMEOUT(scene.timeLines(), 0, 5000);
}

void TestZoomScrollArea::theEndedTimeLineIsDestroyedAtOnce()
{
    Scene scene;
    scene.wheel(120);
    const QPointer<QTimeLine> line(scene.area.findChild<QTimeLine*>());
    bool told = false;
    bool dead = false;
    bool pending = true;
    connect(line, &QTimeLine::finished, &scene.area, [&] { told = true; });
    connect(line, &QObject::destroyed, this, [&] {
        dead = true;
        // In its own signal, so before the slots that were connected later.
        pending = told;
    });
    QTRY_VERIFY_WITH_TIMEOUT(dead, 5000);
    QVERIFY(!pending);
}

void TestZoomScrollArea::theStopComesInTimeEvenWhileTimeLinesRun()
{
    Scene scene;
    scene.wheel(120);
    QTRY_VERIFY(!scene.factors().isEmpty());
    // What the timer does, earlier.
    QVERIFY(QMetaObject::invokeMethod(&scene.area, "stopAllZooming", Qt::DirectConnection));
    QCOMPARE(scene.factors().last(), 0.0);
    QCOMPARE(scene.timeLines(), 1);
    const int before = scene.factors().size();
    QTRY_COMPARE_WITH_TIMEOUT(scene.timeLines(), 0, 5000);
    QVERIFY(scene.factors().size() > before);
    QVERIFY(isAll(scene.factors().mid(before), 0.0));
}

void TestZoomScrollArea::aTurnOfTheDirectionCountsAtOnce()
{
    Scene scene;
    scene.wheel(600);
    scene.wheel(-120);
    QTRY_VERIFY(!scene.factors().isEmpty());
    QVERIFY(isAll(scene.factors(), -1.0));
}

void TestZoomScrollArea::severalNotchesAreTakenOneByOne()
{
    Scene scene;
    scene.wheel(240);
    scene.holdStop();
    // The one time line takes one of two steps: the factor stays until the timer stops it.
    QTRY_COMPARE_WITH_TIMEOUT(scene.timeLines(), 0, 5000);
    QCOMPARE(scene.factors().last(), 1.0);
    scene.stop();
    QCOMPARE(scene.factors().last(), 0.0);
    QCOMPARE(scene.factors().count(0.0), 1);
}

void TestZoomScrollArea::scrollingIsReported()
{
    Scene scene;
    int seen = -1;
    connect(&scene.area, &ZoomScrollArea::scrollAreaChanged, this, [&] { seen = -scene.area.widget()->y(); });
    scene.area.verticalScrollBar()->setValue(40);
    // After the content has moved.
    QCOMPARE(seen, 40);
    QCOMPARE(scene.recorder.names(), QStringList {QStringLiteral("scrollAreaChanged")});
}

void TestZoomScrollArea::touchesAreNotedAndGoNoFurther()
{
    for (const auto type : {QEvent::TouchBegin, QEvent::TouchUpdate}) {
        Scene scene;
        QVERIFY(scene.touch(type));
        QVERIFY(scene.area.isTouchActive());
        QVERIFY(scene.timer(2000)->isActive());
        QCOMPARE(scene.recorder.names(), QStringList());
    }
    // The whole way.
    Scene scene;
    QTouchDevice* const device = QTest::createTouchDevice();
    QTest::touchEvent(scene.area.viewport(), device).press(0, QPoint(50, 50), scene.area.viewport());
    QVERIFY(scene.area.isTouchActive());
    QTest::touchEvent(scene.area.viewport(), device).move(0, QPoint(50, 10), scene.area.viewport());
    QTest::touchEvent(scene.area.viewport(), device).release(0, QPoint(50, 10), scene.area.viewport());
    QCOMPARE(scene.area.verticalScrollBar()->value(), 0);
}

void TestZoomScrollArea::theEndOfATouchOnlyStartsTheTime()
{
    for (const auto type : {QEvent::TouchEnd, QEvent::TouchCancel}) {
        Scene scene;
        QVERIFY(scene.touch(type));
        QVERIFY(!scene.area.isTouchActive());
        QVERIFY(scene.timer(2000)->isActive());
    }
}

void TestZoomScrollArea::touchIsForgottenWhenTheTimeIsOver()
{
    Scene scene;
    QElapsedTimer clock;
    clock.start();
    scene.touch(QEvent::TouchBegin);
    scene.touch(QEvent::TouchEnd);
    QVERIFY(scene.area.isTouchActive());
    QTRY_VERIFY_WITH_TIMEOUT(!scene.area.isTouchActive(), 8000);
    QVERIFY2(clock.elapsed() >= 1900, qPrintable(QString::number(clock.elapsed())));
}

void TestZoomScrollArea::falseClearsNothingAtOnce()
{
    Scene scene;
    scene.area.setTouchActive(true);
    QVERIFY(scene.area.isTouchActive());
    QTest::qWait(300);
    const int before = scene.timer(2000)->remainingTime();
    scene.area.setTouchActive(false);
    QVERIFY(scene.area.isTouchActive());
    // The time starts over.
    QVERIFY(scene.timer(2000)->remainingTime() > before);
    QVERIFY(QMetaObject::invokeMethod(&scene.area, "wheelTimeout", Qt::DirectConnection));
    QVERIFY(!scene.area.isTouchActive());
    scene.area.setTouchActive(false);
    QVERIFY(!scene.area.isTouchActive());
}

void TestZoomScrollArea::slotsMayDeleteTheArea_data()
{
    QTest::addColumn<double>("at");
    QTest::addColumn<int>("angle");
    QTest::newRow("on a tick") << 1.0 << 120;
    QTest::newRow("at the end of the time line") << 0.0 << 120;
    QTest::newRow("at the end, after less than a notch") << 1.0 << 60; // 0 becomes 1
    QTest::newRow("at the stop") << 0.0 << 240;
}

void TestZoomScrollArea::slotsMayDeleteTheArea()
{
    QFETCH(double, at);
    QFETCH(int, angle);
    auto* const area = new ZoomScrollArea;
    const QPointer<ZoomScrollArea> alive(area);
    area->resize(300, 200);
    area->show();
    connect(area, &ZoomScrollArea::updateZoomFactor, this, [&](double factor) {
        if (factor == at) {
            delete alive;
        }
    });
    QWheelEvent event(QPointF(10, 10), QPointF(10, 10), QPoint(), QPoint(0, angle), Qt::NoButton, Qt::NoModifier,
        Qt::NoScrollPhase, false);
    QApplication::sendEvent(area->viewport(), &event);
    if (angle == 60) {
        const auto timers = area->findChildren<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
        for (QTimer* const timer : timers) {
            if (timer->interval() == 825) {
                timer->start(60000);
            }
        }
    }
    QTRY_VERIFY_WITH_TIMEOUT(!alive, 5000);
}

void TestZoomScrollArea::theAreaMayDieWhileTimeLinesRun()
{
    auto scene = std::make_unique<Scene>();
    scene->wheel(120);
    scene->wheel(120);
    QTest::qWait(100);
    scene.reset();
    QTest::qWait(50);
}

void TestZoomScrollArea::aNestedLoopInASlotIsFine()
{
    Scene scene;
    int depth = 0;
    connect(&scene.area, &ZoomScrollArea::updateZoomFactor, this, [&] {
        if (depth < 3) {
            ++depth;
            QTest::qWait(100);
            --depth;
        }
    });
    scene.wheel(120);
    scene.wheel(120);
    QTRY_COMPARE_WITH_TIMEOUT(scene.timeLines(), 0, 8000);
    QTRY_VERIFY_WITH_TIMEOUT(depth == 0, 5000);
}

ZELKOV_TEST_MAIN(TestZoomScrollArea)
#include "tst_zoomscrollarea.moc"
