// SPDX-License-Identifier: MIT
// vx::MouseAdapter: which signals come, in which order, and what must not come.
#include "input/MouseAdapter.h"

#include <memory>

#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include "InputTools.h"
#include "Pointer.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

using namespace inputtest;
using zelkovtest::SignalRecorder;

namespace
{
const QPoint at(300, 300);
constexpr ulong t0 = 10000;
constexpr int shortTime = 20; // ms, for intervals that shall run out
constexpr int longTime = 60000;

QPoint by(int dx, int dy = 0)
{
    return at + QPoint(dx, dy);
}

QStringList list(const char* names)
{
    return QString::fromLatin1(names).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

/// A widget with an adapter and a record of all its signals; hover signals off unless wanted.
struct Stage
{
    explicit Stage(bool hover = false)
        : widget(new QWidget)
        , adapter(new OpenAdapter(widget.get(), true))
        , recorder(adapter)
    {
        adapter->setMouseTracking(hover);
        adapter->setDoubleClickInterval(longTime);
        adapter->setLongClickInterval(2 * longTime);
    }
    void press(const QPoint& p, ulong ms) { send(widget.get(), inputtest::press(p, ms)); }
    void doublePress(const QPoint& p, ulong ms) { send(widget.get(), inputtest::doublePress(p, ms)); }
    void release(const QPoint& p, ulong ms) { send(widget.get(), inputtest::release(p, ms)); }
    void move(const QPoint& p, ulong ms) { send(widget.get(), inputtest::move(p, ms)); }
    void enter()
    {
        QEnterEvent event = inputtest::enter(at);
        QCoreApplication::sendEvent(widget.get(), &event);
    }
    void plain(QEvent::Type type)
    {
        QEvent event(type);
        QCoreApplication::sendEvent(widget.get(), &event);
    }
    bool waitFor(const char* signal)
    {
        return QTest::qWaitFor([&] { return recorder.count(QLatin1String(signal)) > 0; });
    }
    vx::MouseGesture::Ptr gesture(int entry) const
    {
        return recorder.entries().at(entry).arguments.at(0).value<vx::MouseGesture::Ptr>();
    }

    std::unique_ptr<QWidget> widget;
    OpenAdapter* adapter;
    SignalRecorder recorder;
};

class Receiver : public QObject
{
    Q_OBJECT
public:
    QList<vx::MouseEvent> events;
    QList<vx::MouseGesture::Ptr> gestures;

public Q_SLOTS:
    void takeEvent(vx::MouseEvent event) { events << event; }
    void takeGesture(vx::MouseGesture::Ptr gesture) { gestures << gesture; }
};
}

class TestMouseAdapter : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    // Stays first: nothing may have registered the types before.
    void queuedConnectionsCarryEventAndGesture()
    {
        QWidget widget;
        auto* adapter = new OpenAdapter(&widget, false);
        Receiver receiver;
        QVERIFY(QObject::connect(adapter, SIGNAL(moved(vx::MouseEvent)), &receiver,
            SLOT(takeEvent(vx::MouseEvent)), Qt::QueuedConnection));
        QVERIFY(QObject::connect(adapter, SIGNAL(pressed(vx::MouseGesture::Ptr)), &receiver,
            SLOT(takeGesture(vx::MouseGesture::Ptr)), Qt::QueuedConnection));
        send(&widget, move(by(3), t0));
        send(&widget, press(at, t0 + 1));
        delete adapter;
        QVERIFY(receiver.events.isEmpty());
        // The values belong to the calls, not to the adapter.
        QCoreApplication::processEvents();
        QCOMPARE(receiver.events.size(), 1);
        QCOMPARE(receiver.events.first().globalPos(), by(3));
        QCOMPARE(receiver.events.first().timeMillis(), qint64(t0));
        QCOMPARE(receiver.gestures.size(), 1);
        QCOMPARE(receiver.gestures.first()->pressed(1).globalPos(), at);
        QVERIFY(QMetaType::type("vx::MouseEvent") != QMetaType::UnknownType);
        QVERIFY(QMetaType::type("vx::MouseGesture::Ptr") != QMetaType::UnknownType);
    }

    void signalsAreDeclaredInTheirOrder()
    {
        const QMetaObject& meta = vx::MouseAdapter::staticMetaObject;
        QStringList names;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            if (meta.method(i).methodType() == QMetaMethod::Signal) {
                names << QString::fromLatin1(meta.method(i).methodSignature());
            }
        }
        const QString event = QStringLiteral("(vx::MouseEvent)");
        const QString gesture = QStringLiteral("(vx::MouseGesture::Ptr)");
        QStringList expected;
        for (const QString& name : list("entered left moved")) {
            expected << name + event;
        }
        for (const QString& name :
            list("pressed released clicked doubleClicked longClicked autoClicked longPressed "
                 "panning panned swiped finished")) {
            expected << name + gesture;
        }
        QCOMPARE(names, expected);
    }

    // The table of typical runs, row by row.

    void aQuickClickIsToldWhenTheDoubleClickTimeIsOver()
    {
        Stage stage;
        stage.adapter->setDoubleClickInterval(2 * shortTime);
        stage.press(at, t0);
        stage.release(at, t0 + 10);
        QCOMPARE(stage.recorder.names(), list("pressed released"));
        QVERIFY(stage.waitFor("finished"));
        QCOMPARE(stage.recorder.names(), list("pressed released clicked finished"));
        for (int i = 1; i < 4; ++i) {
            QCOMPARE(stage.gesture(i), stage.gesture(0));
        }
    }

    void aClickHeldPastTheDoubleClickTimeIsToldAtOnce()
    {
        TimerWatch watch;
        Stage stage;
        stage.adapter->setDoubleClickInterval(shortTime);
        stage.adapter->setLongClickInterval(1000);
        stage.press(at, t0);
        QVERIFY(QTest::qWaitFor([&] { return watch.fired(shortTime) == 1; }));
        QCOMPARE(stage.recorder.names(), list("pressed"));
        stage.release(at, t0 + 999);
        QCOMPARE(stage.recorder.names(), list("pressed released clicked finished"));
    }

    void aPressHeldInPlaceIsALongPressAndThenALongClick()
    {
        Stage stage;
        stage.adapter->setDoubleClickInterval(shortTime / 2);
        stage.adapter->setLongClickInterval(2 * shortTime);
        stage.press(at, t0);
        QVERIFY(stage.waitFor("longPressed"));
        QCOMPARE(stage.recorder.names(), list("pressed longPressed"));
        stage.release(at, t0 + 2 * shortTime);
        QCOMPARE(stage.recorder.names(), list("pressed longPressed released longClicked finished"));
    }

    void aDoubleClickIsToldAtTheSecondRelease()
    {
        Stage stage;
        stage.press(at, t0);
        stage.release(at, t0 + 50);
        stage.doublePress(at, t0 + 150);
        QCOMPARE(stage.recorder.names(), list("pressed released"));
        stage.release(at, t0 + 200);
        QCOMPARE(stage.recorder.names(), list("pressed released released doubleClicked finished"));
    }

    void aDragReleasedInTimeIsASwipeAndLaterAPan_data()
    {
        QTest::addColumn<int>("after");
        QTest::addColumn<QString>("verdict");
        QTest::newRow("1000 ms") << 1000 << "swiped";
        QTest::newRow("1001 ms") << 1001 << "panned";
    }
    void aDragReleasedInTimeIsASwipeAndLaterAPan()
    {
        QFETCH(int, after);
        QFETCH(QString, verdict);
        Stage stage;
        stage.press(at, t0);
        stage.move(by(8), t0 + 10);
        QCOMPARE(stage.recorder.names(), list("pressed"));
        stage.move(by(9), t0 + 20);
        stage.move(by(30), t0 + 30);
        QCOMPARE(stage.recorder.names(), list("pressed panning panning"));
        stage.release(by(30), t0 + ulong(after));
        QCOMPARE(stage.recorder.names(),
            list("pressed panning panning released") << verdict << QStringLiteral("finished"));
    }

    // What is odd and stays.

    void theLongClickTimeEndsAReleasedGestureWithASecondReleased_data()
    {
        QTest::addColumn<int>("held");
        QTest::addColumn<QString>("verdict");
        QTest::newRow("short") << shortTime - 1 << "clicked";
        QTest::newRow("long") << shortTime << "longClicked";
    }
    void theLongClickTimeEndsAReleasedGestureWithASecondReleased()
    {
        QFETCH(int, held);
        QFETCH(QString, verdict);
        Stage stage;
        stage.adapter->setLongClickInterval(shortTime);
        stage.adapter->setAutoClickInterval(shortTime);
        stage.press(at, t0);
        stage.release(at, t0 + ulong(held));
        QVERIFY(stage.waitFor("finished"));
        QCOMPARE(stage.recorder.names().mid(0, 5),
            list("pressed released released") << verdict << QStringLiteral("finished"));
        // It repeats, with no gesture, until the next one starts.
        QVERIFY(QTest::qWaitFor([&] { return stage.recorder.count(QStringLiteral("autoClicked")) >= 3; }));
        QVERIFY(stage.gesture(5).isNull());
        stage.recorder.clear();
        stage.adapter->setLongClickInterval(0);
        stage.adapter->setDoubleClickInterval(3 * shortTime);
        stage.press(at, t0 + 1000);
        stage.release(at, t0 + 1010);
        QVERIFY(stage.waitFor("finished"));
        QCOMPARE(stage.recorder.names(), list("pressed released clicked finished"));
    }

    void anAutoClickIntervalOfNullOrLessNeverStarts_data()
    {
        QTest::addColumn<int>("interval");
        QTest::newRow("0") << 0;
        QTest::newRow("-5") << -5;
    }
    void anAutoClickIntervalOfNullOrLessNeverStarts()
    {
        QFETCH(int, interval);
        TimerWatch watch;
        Stage stage;
        stage.adapter->setLongClickInterval(shortTime);
        stage.adapter->setAutoClickInterval(interval);
        stage.press(at, t0);
        stage.release(at, t0 + 10);
        QVERIFY(stage.waitFor("finished"));
        QCoreApplication::processEvents();
        QCoreApplication::processEvents();
        QCOMPARE(watch.fired(interval), 0);
        QCOMPARE(stage.recorder.count(QStringLiteral("autoClicked")), 0);
    }

    void aReleaseAloneStartsAGesture()
    {
        Stage far;
        far.release(at, t0);
        QCOMPARE(far.recorder.names(), list("released swiped finished"));

        // Near the null object the timers run on, and the end has no verdict.
        Stage near;
        near.adapter->setDoubleClickInterval(2 * shortTime);
        near.release(QPoint(4, 4), t0);
        QCOMPARE(near.recorder.names(), list("released"));
        QVERIFY(near.waitFor("finished"));
        QCOMPARE(near.recorder.names(), list("released finished"));

        Stage twice;
        twice.release(QPoint(4, 4), t0);
        twice.release(QPoint(4, 4), t0 + 5);
        QCOMPARE(twice.recorder.names(), list("released released finished"));
    }

    void leavingTheRadiusStopsTheTimersForGood()
    {
        Stage stage;
        stage.adapter->setLongClickInterval(1000);
        stage.press(at, t0);
        stage.move(by(9), t0 + 10);
        stage.move(at, t0 + 20);
        stage.recorder.clear();
        // The double click time has not run out, yet nothing waits for a second click.
        stage.release(at, t0 + 30);
        QCOMPARE(stage.recorder.names(), list("released clicked finished"));
    }

    void leavingTheRadiusPreventsTheLongPress()
    {
        TimerWatch watch;
        Stage stage;
        stage.adapter->setLongClickInterval(shortTime);
        stage.adapter->setAutoClickInterval(shortTime);
        stage.press(at, t0);
        stage.move(by(9), t0 + 10);
        stage.move(at, t0 + 20);
        QTimer later;
        later.setSingleShot(true);
        later.start(3 * shortTime);
        QVERIFY(QTest::qWaitFor([&] { return watch.fired(3 * shortTime) == 1; }));
        QCOMPARE(watch.fired(shortTime), 0);
        QCOMPARE(stage.recorder.count(QStringLiteral("longPressed")), 0);
    }

    void withoutADoubleClickIntervalEachReleaseFinishes_data()
    {
        QTest::addColumn<int>("interval");
        QTest::newRow("0") << 0;
        QTest::newRow("-1") << -1;
    }
    void withoutADoubleClickIntervalEachReleaseFinishes()
    {
        QFETCH(int, interval);
        Stage stage;
        stage.adapter->setDoubleClickInterval(interval);
        stage.press(at, t0);
        stage.release(at, t0 + 10);
        QCOMPARE(stage.recorder.names(), list("pressed released clicked finished"));
        stage.recorder.clear();
        stage.doublePress(at, t0 + 50);
        stage.release(at, t0 + 60);
        QCOMPARE(stage.recorder.count(QStringLiteral("doubleClicked")), 0);
    }

    void withoutALongClickIntervalNothingIsLong_data()
    {
        QTest::addColumn<int>("interval");
        QTest::newRow("0") << 0;
        QTest::newRow("-1") << -1;
    }
    void withoutALongClickIntervalNothingIsLong()
    {
        QFETCH(int, interval);
        TimerWatch watch;
        Stage stage;
        stage.adapter->setDoubleClickInterval(shortTime);
        stage.adapter->setLongClickInterval(interval);
        stage.press(at, t0);
        QVERIFY(QTest::qWaitFor([&] { return watch.fired(shortTime) == 1; }));
        QCOMPARE(watch.fired(interval), 0);
        stage.release(at, t0 + 3600000);
        QCOMPARE(stage.recorder.names(), list("pressed released clicked finished"));
    }

    void aSecondClickFarAwayHasNoVerdict()
    {
        Stage stage;
        stage.press(at, t0);
        stage.release(at, t0 + 50);
        stage.doublePress(by(9), t0 + 150);
        stage.release(by(9), t0 + 200);
        QCOMPARE(stage.recorder.names(), list("pressed released released finished"));
    }

    void threeQuickClicksAreADoubleClickAndANewGesture()
    {
        Stage stage;
        stage.press(at, t0);
        stage.release(at, t0 + 50);
        stage.doublePress(at, t0 + 100);
        stage.release(at, t0 + 150);
        stage.press(at, t0 + 200);
        QCOMPARE(stage.recorder.names(), list("pressed released released doubleClicked finished pressed"));
        QVERIFY(stage.gesture(5) != stage.gesture(0));
        QVERIFY(stage.gesture(5)->isStarted());
    }

    void movesAfterTheReleaseAreNotRecorded()
    {
        Stage stage;
        stage.press(at, t0);
        stage.release(at, t0 + 10);
        const vx::MouseGesture::Ptr gesture = stage.gesture(0);
        stage.doublePress(at, t0 + 20);
        stage.move(by(30), t0 + 30);
        QCOMPARE(gesture->last().type(), QEvent::MouseButtonRelease);
        QCOMPARE(stage.recorder.names(), list("pressed released"));
    }

    void hidingTheClickedWidgetCancels()
    {
        Stage stage;
        stage.widget->show();
        stage.press(at, t0);
        const vx::MouseGesture::Ptr gesture = stage.gesture(0);
        stage.widget->hide();
        QVERIFY(gesture->isCanceled());
        stage.move(by(50), t0 + 5);
        QCOMPARE(stage.recorder.names(), list("pressed"));
        stage.release(at, t0 + 10);
        QVERIFY(stage.gesture(1) != gesture);
        QCOMPARE(stage.recorder.names().at(1), QStringLiteral("released"));
        for (int i = 1; i < stage.recorder.entries().size(); ++i) {
            QVERIFY(stage.gesture(i) != gesture);
        }
    }

    void hidingAnotherWidgetDoesNotCancel()
    {
        Stage stage;
        QWidget other;
        stage.adapter->attachTo(&other);
        stage.press(at, t0);
        QEvent hide(QEvent::Hide);
        QCoreApplication::sendEvent(&other, &hide);
        QVERIFY(stage.gesture(0)->isStarted());
        stage.plain(QEvent::Hide);
        QVERIFY(stage.gesture(0)->isCanceled());
    }

    void enteringWithNoButtonDownCancels()
    {
        Stage stage;
        stage.press(at, t0);
        const vx::MouseGesture::Ptr gesture = stage.gesture(0);
        stage.plain(QEvent::Leave);
        QVERIFY(gesture->isStarted());
        stage.enter();
        QVERIFY(gesture->isCanceled());
        stage.press(at, t0 + 100);
        QCOMPARE(stage.recorder.names(), list("pressed pressed"));
        QVERIFY(stage.gesture(1) != gesture);
    }

    void enteringWithAButtonDownDoesNotCancel()
    {
        Stage stage;
        stage.widget->setGeometry(50, 50, 200, 200);
        stage.widget->show();
        QVERIFY(QTest::qWaitForWindowExposed(stage.widget.get()));
        QTest::mousePress(stage.widget->windowHandle(), Qt::LeftButton, Qt::NoModifier, QPoint(50, 50));
        QVERIFY(QGuiApplication::mouseButtons() != Qt::NoButton);
        QCOMPARE(stage.recorder.names(), list("pressed"));
        stage.enter();
        QVERIFY(stage.gesture(0)->isStarted());
        QTest::mouseRelease(stage.widget->windowHandle(), Qt::LeftButton, Qt::NoModifier, QPoint(50, 50));
    }

    void aCanceledGestureIsStillALongPress()
    {
        Stage stage;
        stage.adapter->setLongClickInterval(shortTime);
        stage.press(at, t0);
        stage.enter();
        QVERIFY(stage.gesture(0)->isCanceled());
        QVERIFY(stage.waitFor("longPressed"));
        QCOMPARE(stage.recorder.names(), list("pressed longPressed"));
    }

    // Hovering.

    void hoverSignalsAreSilentWithoutMouseTracking()
    {
        Stage stage(false);
        stage.widget->setMouseTracking(true);
        stage.enter();
        send(stage.widget.get(), inputtest::move(at, t0, Qt::NoButton));
        stage.plain(QEvent::Leave);
        QCOMPARE(stage.recorder.names(), QStringList());
    }

    void hoverSignalsCarryTheEvent()
    {
        Stage stage(true);
        stage.widget->setObjectName(QStringLiteral("camera"));
        QCursor::setPos(77, 88);
        stage.enter();
        send(stage.widget.get(), inputtest::move(by(3), t0, Qt::NoButton));
        stage.plain(QEvent::Leave);
        QCOMPARE(stage.recorder.names(), list("entered moved left"));
        const auto event
            = [&](int i) { return stage.recorder.entries().at(i).arguments.at(0).value<vx::MouseEvent>(); };
        QCOMPARE(event(0).type(), QEvent::Enter);
        QCOMPARE(event(0).globalPos(), at);
        QCOMPARE(event(1).type(), QEvent::MouseMove);
        QCOMPARE(event(1).globalPos(), by(3));
        QCOMPARE(event(1).timeMillis(), qint64(t0));
        QCOMPARE(event(2).type(), QEvent::Leave);
        QCOMPARE(event(2).globalPos(), QCursor::pos());
        for (int i = 0; i < 3; ++i) {
            QCOMPARE(event(i).sourceWidget().data(), stage.widget.get());
            QCOMPARE(event(i).sourceWidgetName(), QStringLiteral("camera"));
        }
    }

    void movedComesBeforePanning()
    {
        Stage stage(true);
        stage.press(at, t0);
        stage.move(by(20), t0 + 10);
        stage.release(by(20), t0 + 20);
        QCOMPARE(stage.recorder.names(), list("pressed moved panning released swiped finished"));
    }

    void aPlainEnterEventWillDo()
    {
        Stage stage(true);
        stage.plain(QEvent::Enter);
        QCOMPARE(stage.recorder.names(), list("entered"));
    }

    void theParentsTrackingIsOnDuringAGesture()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, false);
        QVERIFY(adapter.hasMouseTracking());
        QVERIFY(!widget.hasMouseTracking());
        adapter.setMouseTracking(true);
        QVERIFY(widget.hasMouseTracking());
        adapter.setMouseTracking(false);
        QVERIFY(!adapter.hasMouseTracking());
        QVERIFY(!widget.hasMouseTracking());
        adapter.setDoubleClickInterval(0);
        send(&widget, press(at, t0));
        QVERIFY(widget.hasMouseTracking());
        send(&widget, release(at, t0 + 10));
        QVERIFY(!widget.hasMouseTracking());
        adapter.setMouseTracking(true);
        send(&widget, press(at, t0 + 1000));
        send(&widget, release(at, t0 + 1010));
        QVERIFY(widget.hasMouseTracking());
    }

    // Configuration.

    void theAnswerOfTheFilterIsTheConstructorsArgument()
    {
        for (const bool filter : {true, false}) {
            QWidget widget;
            OpenAdapter adapter(&widget, filter);
            QMouseEvent down = press(at, t0);
            QMouseEvent twice = doublePress(at, t0);
            QMouseEvent held = move(at, t0);
            QMouseEvent up = release(at, t0);
            QEnterEvent in = enter(at);
            QEvent out(QEvent::Leave);
            QEvent hide(QEvent::Hide);
            QCOMPARE(adapter.eventFilter(&widget, &held), filter);
            QCOMPARE(adapter.eventFilter(&widget, &down), filter);
            QCOMPARE(adapter.eventFilter(&widget, &held), filter);
            QCOMPARE(adapter.eventFilter(&widget, &up), filter);
            for (QEvent* event : std::initializer_list<QEvent*> {&twice, &in, &out, &hide}) {
                QVERIFY(!adapter.eventFilter(&widget, event));
            }
        }
    }

    void thresholdsCountForLaterGestures()
    {
        Stage stage;
        stage.press(at, t0);
        stage.adapter->setClickRadius(50);
        stage.adapter->setDoubleClickRadius(50);
        stage.adapter->setSwipeInterval(5);
        stage.move(by(20), t0 + 10);
        stage.release(by(20), t0 + 20);
        QCOMPARE(stage.recorder.names(), list("pressed panning released swiped finished"));
        stage.recorder.clear();
        stage.adapter->setDoubleClickInterval(0);
        stage.press(at, t0 + 1000);
        stage.move(by(50), t0 + 1003);
        stage.release(by(50), t0 + 1010);
        stage.press(at, t0 + 2000);
        stage.release(by(51), t0 + 2006);
        QCOMPARE(
            stage.recorder.names(), list("pressed released clicked finished pressed released panned finished"));
    }

    void settingAnIntervalLeavesTheRunningTimerAlone()
    {
        Stage stage;
        stage.adapter->setLongClickInterval(shortTime);
        stage.press(at, t0);
        stage.adapter->setLongClickInterval(longTime);
        stage.adapter->setDoubleClickInterval(0);
        QVERIFY(!stage.adapter->canFinishGesture());
        QVERIFY(stage.waitFor("longPressed"));
        // The double click timer still runs, so the release waits for it.
        stage.release(at, t0 + 10);
        QCOMPARE(stage.recorder.names(), list("pressed longPressed released"));
        QVERIFY(!stage.adapter->canFinishGesture());
    }

    void twoAttachedWidgetsShareOneGesture()
    {
        Stage stage(true);
        auto other = std::make_unique<QWidget>();
        stage.adapter->attachTo(other.get());
        QVERIFY(other->hasMouseTracking());
        stage.press(at, t0);
        send(other.get(), inputtest::release(by(2), t0 + 10));
        QCOMPARE(stage.gesture(1), stage.gesture(0));
        QCOMPARE(stage.gesture(0)->clickedWidget(), other.get());
        QCOMPARE(stage.gesture(0)->pressed(1).sourceWidget().data(), stage.widget.get());
        stage.adapter->detachFrom(other.get());
        QVERIFY(!other->hasMouseTracking());
        stage.recorder.clear();
        send(other.get(), inputtest::press(at, t0 + 20));
        QCOMPARE(stage.recorder.names(), QStringList());
        other.reset();
    }

    void attachAndDetachFollowTheStoredTracking()
    {
        Stage stage(false);
        QWidget other;
        other.setMouseTracking(true);
        stage.adapter->attachTo(&other);
        QVERIFY(!other.hasMouseTracking());
        other.setMouseTracking(true);
        stage.adapter->detachFrom(&other);
        QVERIFY(other.hasMouseTracking());
    }

    void theGestureOutlivesTheAdapter()
    {
        vx::MouseGesture::Ptr kept;
        {
            Stage stage;
            stage.press(at, t0);
            kept = stage.gesture(0);
        }
        QCOMPARE(kept->pressed(1).globalPos(), at);
        QCOMPARE(kept->clickedWidget(), static_cast<QWidget*>(nullptr));
    }

    void subclassesCanDriveIt()
    {
        Stage stage;
        stage.adapter->notify(QEvent::MouseButtonPress);
        stage.adapter->finishGesture();
        stage.adapter->onDoubleClickTimeout();
        stage.adapter->onLongClickTimeout();
        QVERIFY(!stage.adapter->canFinishGesture());
        QCOMPARE(stage.recorder.names(), QStringList());
        stage.adapter->onAutoClickTimeout();
        QCOMPARE(stage.recorder.names(), list("autoClicked"));
        QVERIFY(stage.gesture(0).isNull());
        stage.recorder.clear();
        stage.adapter->startNewGesture();
        stage.adapter->notify(QEvent::None);
        QCOMPARE(stage.recorder.names(), QStringList());
        stage.press(at, t0);
        QVERIFY(!stage.adapter->canFinishGesture());
        stage.adapter->onDoubleClickTimeout();
        QCOMPARE(stage.recorder.names(), list("pressed"));
        stage.adapter->finishGesture();
        stage.adapter->notify(QEvent::None);
        QCOMPARE(stage.recorder.names(), list("pressed finished"));
    }

    void aRealDoubleClickArrivesThroughTheWindowSystem()
    {
        Stage stage;
        stage.widget->setGeometry(50, 50, 200, 200);
        stage.widget->show();
        QVERIFY(QTest::qWaitForWindowExposed(stage.widget.get()));
        zelkovtest::Pointer pointer(stage.widget.get());
        pointer.click(QPoint(60, 60));
        pointer.click(QPoint(60, 60));
        QCOMPARE(stage.recorder.names(), list("pressed released released doubleClicked finished"));
        pointer.click(QPoint(60, 60));
        QCOMPARE(stage.recorder.names().mid(5), list("pressed released"));
    }
};

ZELKOV_TEST_MAIN(TestMouseAdapter)
#include "tst_mouseadapter.moc"
