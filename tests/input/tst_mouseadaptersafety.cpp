// SPDX-License-Identifier: MIT
// vx::MouseAdapter among slots that delete it, event loops inside slots, bad input, and random events.
#include "input/MouseAdapter.h"

#include <memory>

#include <QtCore/QEventLoop>
#include <QtCore/QMap>
#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include "InputTools.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

using namespace inputtest;

namespace
{
const QPoint at(300, 300);
constexpr ulong t0 = 10000;

class Killer : public QObject
{
    Q_OBJECT
public:
    QPointer<QObject> victim;
    int calls = 0;

public Q_SLOTS:
    void kill()
    {
        ++calls;
        delete victim.data();
    }
};

/// Makes every signal fire while the widget lives.
void useEverything(const QPointer<QWidget>& widget, const QPointer<OpenAdapter>& adapter)
{
    const auto feed = [&](auto event) {
        if (widget) {
            QCoreApplication::sendEvent(widget, &event);
        }
    };
    const auto call = [&](void (OpenAdapter::*slot)()) {
        if (adapter) {
            (adapter->*slot)();
        }
    };
    if (adapter) {
        adapter->setDoubleClickInterval(60000);
        adapter->setLongClickInterval(60000);
        adapter->setAutoClickInterval(60000);
    }
    feed(enter(at));
    feed(move(at, t0, Qt::NoButton));
    feed(QEvent(QEvent::Leave));
    // Click, double click.
    feed(press(at, t0));
    feed(release(at, t0 + 10));
    call(&OpenAdapter::onDoubleClickTimeout);
    feed(press(at, t0));
    feed(release(at, t0 + 10));
    feed(release(at, t0 + 20));
    // Long press, long click.
    feed(press(at, t0));
    call(&OpenAdapter::onLongClickTimeout);
    feed(release(at, t0 + 60000));
    call(&OpenAdapter::onLongClickTimeout);
    call(&OpenAdapter::onAutoClickTimeout);
    // Swipe, pan.
    for (const ulong after : {100UL, 5000UL}) {
        feed(press(at, t0));
        feed(move(at + QPoint(50, 0), t0 + 20));
        feed(release(at + QPoint(50, 0), t0 + after));
    }
}
}

class TestMouseAdapterSafety : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aSlotMayDelete_data()
    {
        QTest::addColumn<QByteArray>("signal");
        QTest::addColumn<int>("victim");
        const QMetaObject& meta = vx::MouseAdapter::staticMetaObject;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
            if (meta.method(i).methodType() != QMetaMethod::Signal) {
                continue;
            }
            const QByteArray signature = meta.method(i).methodSignature();
            QTest::newRow(("adapter in " + signature).constData()) << signature << 0;
            QTest::newRow(("widget in " + signature).constData()) << signature << 1;
            QTest::newRow(("window in " + signature).constData()) << signature << 2;
        }
    }
    void aSlotMayDelete()
    {
        QFETCH(QByteArray, signal);
        QFETCH(int, victim);
        for (const bool filter : {true, false}) {
            const QPointer<QWidget> window(new QWidget);
            const QPointer<QWidget> widget(new QWidget(window));
            const QPointer<OpenAdapter> adapter(new OpenAdapter(widget, filter));
            Killer killer;
            killer.victim = victim == 0 ? static_cast<QObject*>(adapter) : victim == 1 ? widget : window;
            QVERIFY(QObject::connect(adapter, ("2" + signal).constData(), &killer, SLOT(kill())));
            useEverything(widget, adapter);
            QCOMPARE(killer.calls, 1);
            QVERIFY(killer.victim.isNull());
            QVERIFY(adapter.isNull());
            delete window.data();
        }
    }

    void aDeletedWidgetGetsNoEventAfterTheFilter()
    {
        QWidget* widget = new QWidget;
        auto* adapter = new OpenAdapter(widget, false);
        QObject::connect(adapter, &vx::MouseAdapter::pressed, widget, [widget] { delete widget; });
        QMouseEvent event = press(at, t0);
        QVERIFY(adapter->eventFilter(widget, &event));
    }

    void anEventLoopInsideASlotReportsNothingTwice()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, true);
        adapter.setMouseTracking(false);
        adapter.setDoubleClickInterval(0);
        zelkovtest::SignalRecorder recorder(&adapter);
        bool nested = false;
        QObject::connect(&adapter, &vx::MouseAdapter::pressed, &adapter, [&] {
            if (!nested) {
                nested = true;
                send(&widget, release(at, t0 + 10));
            }
        });
        send(&widget, press(at, t0));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')), QStringLiteral("pressed released clicked finished"));
    }

    void aGestureThatBeginsInAVerdictSurvivesTheEndOfTheOldOne()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, true);
        adapter.setMouseTracking(false);
        adapter.setDoubleClickInterval(0);
        zelkovtest::SignalRecorder recorder(&adapter);
        QObject::connect(
            &adapter, &vx::MouseAdapter::swiped, &adapter, [&] { send(&widget, press(at, t0 + 500)); });
        send(&widget, press(at, t0));
        send(&widget, release(at + QPoint(50, 0), t0 + 100));
        send(&widget, release(at, t0 + 510));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')),
            QStringLiteral("pressed released swiped pressed finished released clicked finished"));
    }

    void aSlotMayFinishOrCancelTheGesture()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, true);
        zelkovtest::SignalRecorder recorder(&adapter);
        auto finish = QObject::connect(&adapter, &vx::MouseAdapter::pressed, &adapter,
            [](const vx::MouseGesture::Ptr& gesture) { gesture->finish(); });
        send(&widget, press(at, t0));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')), QStringLiteral("pressed finished"));
        QObject::disconnect(finish);
        recorder.clear();
        QObject::connect(&adapter, &vx::MouseAdapter::pressed, &adapter,
            [](const vx::MouseGesture::Ptr& gesture) { gesture->cancel(); });
        send(&widget, press(at, t0));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')), QStringLiteral("pressed"));
    }

    void nullWidgetsAreSilent()
    {
        OpenAdapter adapter(nullptr, true);
        adapter.setMouseTracking(false);
        adapter.setMouseTracking(true);
        adapter.attachTo(nullptr);
        adapter.detachFrom(nullptr);
        adapter.startNewGesture();
        adapter.finishGesture();
        QWidget widget;
        adapter.attachTo(&widget);
        zelkovtest::SignalRecorder recorder(&adapter);
        adapter.setDoubleClickInterval(0);
        send(&widget, press(at, t0));
        send(&widget, release(at, t0 + 10));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')), QStringLiteral("pressed released clicked finished"));
    }

    void objectsThatAreNoWidgetsHaveNoSource()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, true);
        zelkovtest::SignalRecorder recorder(&adapter);
        QObject object;
        QMouseEvent down = press(at, t0);
        QEvent hide(QEvent::Hide);
        QVERIFY(adapter.eventFilter(&object, &down));
        const auto gesture = recorder.entries().at(0).arguments.at(0).value<vx::MouseGesture::Ptr>();
        QCOMPARE(gesture->clickedWidget(), static_cast<QWidget*>(nullptr));
        QVERIFY(!adapter.eventFilter(&object, &hide));
        QVERIFY(gesture->isStarted());
    }

    void theSourceMayDieDuringTheGesture()
    {
        QWidget widget;
        OpenAdapter adapter(&widget, true);
        adapter.setDoubleClickInterval(0);
        zelkovtest::SignalRecorder recorder(&adapter);
        auto other = std::make_unique<QWidget>();
        adapter.attachTo(other.get());
        send(other.get(), press(at, t0));
        other.reset();
        QEvent hide(QEvent::Hide);
        QCoreApplication::sendEvent(&widget, &hide);
        send(&widget, release(at, t0 + 10));
        QCOMPARE(recorder.names().join(QLatin1Char(' ')), QStringLiteral("pressed released clicked finished"));
    }

    void theFilterGoesWithTheAdapter()
    {
        QWidget widget;
        auto adapter = std::make_unique<OpenAdapter>(&widget, true);
        QVERIFY(send(&widget, press(at, t0)));
        QPointer<OpenAdapter> watched(adapter.get());
        adapter.reset();
        QVERIFY(watched.isNull());
        QMouseEvent event = press(at, t0);
        event.ignore();
        QCoreApplication::sendEvent(&widget, &event);
        auto* parent = new QWidget;
        new OpenAdapter(parent, true);
        send(parent, press(at, t0));
        delete parent;
    }

    void randomEventsKeepTheLaws()
    {
        const QStringList verdicts {QStringLiteral("swiped"), QStringLiteral("panned"),
            QStringLiteral("doubleClicked"), QStringLiteral("longClicked"), QStringLiteral("clicked")};
        for (quint32 seed = 1; seed <= 60; ++seed) {
            QRandomGenerator random(seed);
            QWidget widget;
            QWidget other;
            OpenAdapter adapter(&widget, true);
            adapter.attachTo(&other);
            adapter.setDoubleClickInterval(random.bounded(3) * 30000);
            adapter.setLongClickInterval(random.bounded(3) * 30000);
            adapter.setSwipeInterval(random.bounded(2000));
            adapter.setAutoClickInterval(0);
            zelkovtest::SignalRecorder recorder(&adapter);
            ulong now = t0;
            for (int step = 0; step < 300; ++step) {
                now += random.bounded(random.bounded(4) == 0 ? 70000U : 300U);
                QWidget* target = random.bounded(5) == 0 ? &other : &widget;
                const QPoint p = at + QPoint(random.bounded(24), random.bounded(24));
                switch (random.bounded(12)) {
                case 0:
                case 1:
                    send(target, press(p, now, random.bounded(2) ? Qt::LeftButton : Qt::RightButton));
                    break;
                case 2:
                case 3:
                    send(target, release(p, now));
                    break;
                case 4:
                    send(target, doublePress(p, now));
                    break;
                case 5:
                    send(target, move(p, now, Qt::NoButton));
                    break;
                case 6:
                    send(target, enter(p));
                    break;
                case 7: {
                    QEvent event(random.bounded(2) ? QEvent::Leave : QEvent::Hide);
                    QCoreApplication::sendEvent(target, &event);
                    break;
                }
                case 8:
                    adapter.onDoubleClickTimeout();
                    break;
                case 9:
                    adapter.onLongClickTimeout();
                    break;
                default:
                    send(target, move(p, now));
                    break;
                }
            }
            const QByteArray where = "seed " + QByteArray::number(seed);
            QMap<const vx::MouseGesture*, QString> over;
            QMap<const vx::MouseGesture*, int> ends;
            for (int i = 0; i < recorder.entries().size(); ++i) {
                const auto& entry = recorder.entries().at(i);
                const auto gesture = entry.arguments.at(0).value<vx::MouseGesture::Ptr>();
                if (!gesture) {
                    continue;
                }
                QVERIFY2(
                    !over.contains(gesture.data()) || entry.name == QLatin1String("finished"), where.constData());
                if (verdicts.contains(entry.name)) {
                    over.insert(gesture.data(), entry.name);
                    QVERIFY2(gesture->isFinished(), where.constData());
                    QVERIFY2(i + 1 < recorder.entries().size(), where.constData());
                    QCOMPARE(recorder.entries().at(i + 1).name, QStringLiteral("finished"));
                    QCOMPARE(recorder.entries().at(i + 1).arguments.at(0).value<vx::MouseGesture::Ptr>(), gesture);
                }
                if (entry.name == QLatin1String("finished")) {
                    QVERIFY2(++ends[gesture.data()] == 1, where.constData());
                    over.insert(gesture.data(), entry.name);
                    QVERIFY2(!gesture->isCanceled(), where.constData());
                }
                QVERIFY2(!(gesture->wasSwipe(vx::dAny) && gesture->wasPan(vx::dAny)), where.constData());
            }
            QVERIFY2(!ends.isEmpty(), where.constData());
        }
    }
};

ZELKOV_TEST_MAIN(TestMouseAdapterSafety)
#include "tst_mouseadaptersafety.moc"
