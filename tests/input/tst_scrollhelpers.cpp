// SPDX-License-Identifier: MIT
// The scroll helpers of vx::MouseAdapter: which bar, which way, how far and how fast.
#include "input/MouseAdapter.h"

#include <memory>

#include <QtCore/QPropertyAnimation>
#include <QtTest/QtTest>
#include <QtWidgets/QAbstractScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QSlider>

#include "InputTools.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::MouseAdapter;

namespace
{
class Area : public QAbstractScrollArea
{
public:
    Area()
    {
        horizontalScrollBar()->setRange(0, 100);
        verticalScrollBar()->setRange(0, 100);
        horizontalScrollBar()->setValue(50);
        verticalScrollBar()->setValue(50);
    }
    QPoint values() const { return {horizontalScrollBar()->value(), verticalScrollBar()->value()}; }
};

QPropertyAnimation* asProperty(QAbstractAnimation* animation)
{
    return qobject_cast<QPropertyAnimation*>(animation);
}
}

class TestScrollHelpers : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void scrollMovesTheContentByTheOffset()
    {
        Area area;
        MouseAdapter adapter(&area, false);
        adapter.scroll(&area, QPoint(10, -20));
        QCOMPARE(area.values(), QPoint(40, 70));
        adapter.scroll(&area, QPoint(-1000, 1000));
        QCOMPARE(area.values(), QPoint(100, 0));
        adapter.scroll(&area, QPoint(std::numeric_limits<int>::min(), std::numeric_limits<int>::max()));
        QCOMPARE(area.values(), QPoint(100, 0));
    }

    void aPageIsAnimatedForOneSecond_data()
    {
        QTest::addColumn<int>("delta");
        QTest::addColumn<int>("end");
        QTest::newRow("forward") << 30 << 80;
        QTest::newRow("backward") << -30 << 20;
        QTest::newRow("beyond the end") << 70 << 100;
        QTest::newRow("beyond the start") << -70 << 0;
        QTest::newRow("nowhere") << 0 << 50;
        QTest::newRow("extreme") << std::numeric_limits<int>::max() << 100;
    }
    void aPageIsAnimatedForOneSecond()
    {
        QFETCH(int, delta);
        QSlider slider;
        slider.setRange(0, 100);
        slider.setValue(50);
        QPointer<QPropertyAnimation> animation(asProperty(MouseAdapter::scrollAnimated(&slider, delta, false)));
        QVERIFY(animation);
        QCOMPARE(animation->targetObject(), static_cast<QObject*>(&slider));
        QCOMPARE(animation->propertyName(), QByteArray("value"));
        QCOMPARE(animation->parent(), static_cast<QObject*>(nullptr));
        QCOMPARE(animation->startValue().toInt(), 50);
        QTEST(animation->endValue().toInt(), "end");
        QCOMPARE(animation->duration(), 1000);
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::OutExpo);
        QCOMPARE(animation->state(), QAbstractAnimation::Running);
        animation->setCurrentTime(1000);
        QTEST(slider.value(), "end");
        QTRY_VERIFY(animation.isNull());
    }

    void continuousScrollingKeepsItsSpeedToTheEnd_data()
    {
        QTest::addColumn<int>("delta");
        QTest::addColumn<int>("end");
        QTest::addColumn<int>("duration");
        QTest::newRow("forward") << 10 << 100 << 5000;
        QTest::newRow("backward") << -10 << 0 << 5000;
        QTest::newRow("not a divisor") << 7 << 100 << 7142;
        QTest::newRow("cut at the end") << 500 << 100 << 1000;
    }
    void continuousScrollingKeepsItsSpeedToTheEnd()
    {
        QFETCH(int, delta);
        QSlider slider;
        slider.setRange(0, 100);
        slider.setValue(50);
        QPointer<QPropertyAnimation> animation(asProperty(MouseAdapter::scrollAnimated(&slider, delta, true)));
        QVERIFY(animation);
        QTEST(animation->endValue().toInt(), "end");
        QTEST(animation->duration(), "duration");
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::Linear);
        animation->stop();
        QTRY_VERIFY(animation.isNull());
    }

    void continuousScrollingWithoutASpeedEndsAtOnce_data()
    {
        QTest::addColumn<int>("value");
        QTest::addColumn<int>("delta");
        QTest::newRow("no delta") << 50 << 0;
        QTest::newRow("at the end") << 100 << 10;
        QTest::newRow("at the start") << 0 << -10;
    }
    void continuousScrollingWithoutASpeedEndsAtOnce()
    {
        QFETCH(int, value);
        QFETCH(int, delta);
        QSlider slider;
        slider.setRange(0, 100);
        slider.setValue(value);
        QPointer<QAbstractAnimation> animation(MouseAdapter::scrollAnimated(&slider, delta, true));
        QVERIFY(animation);
        QCOMPARE(animation->state(), QAbstractAnimation::Stopped);
        QCOMPARE(slider.value(), value);
        QTRY_VERIFY(animation.isNull());
    }

    void extremeRangesAreCutNotOverflown()
    {
        QSlider slider;
        slider.setRange(std::numeric_limits<int>::min(), std::numeric_limits<int>::max());
        slider.setValue(std::numeric_limits<int>::min());
        QPointer<QAbstractAnimation> animation(MouseAdapter::scrollAnimated(&slider, 1, true));
        QCOMPARE(animation->duration(), std::numeric_limits<int>::max());
        animation->stop();
        QTRY_VERIFY(animation.isNull());
    }

    void theContentFollowsTheFinger_data()
    {
        QTest::addColumn<int>("direction");
        QTest::addColumn<QPoint>("end");
        QTest::newRow("left") << int(vx::dLeft) << QPoint(80, 50);
        QTest::newRow("right") << int(vx::dRight) << QPoint(20, 50);
        QTest::newRow("up") << int(vx::dUp) << QPoint(50, 57);
        QTest::newRow("down") << int(vx::dDown) << QPoint(50, 43);
        QTest::newRow("any is right") << int(vx::dAny) << QPoint(20, 50);
        QTest::newRow("left and down") << int(vx::dLeft | vx::dDown) << QPoint(20, 50);
    }
    void theContentFollowsTheFinger()
    {
        QFETCH(int, direction);
        Area area;
        MouseAdapter adapter(&area, false);
        adapter.scrollPage(&area, vx::Direction(direction), QSize(30, 7));
        QCOMPARE(area.values(), QPoint(50, 50));
        QFETCH(QPoint, end);
        QTRY_COMPARE(area.values(), end);
    }

    void continuousScrollingRunsUntilItIsStopped()
    {
        Area area;
        Area stopped;
        MouseAdapter adapter(&area, false);
        MouseAdapter other(&stopped, false);
        adapter.scrollContinous(&area, vx::dLeft, QSize(50, 1));
        other.scrollContinous(&stopped, vx::dDown, QSize(1, 50));
        QTRY_VERIFY(stopped.values().y() < 50);
        other.stopAnimation();
        other.stopAnimation();
        const QPoint halted = stopped.values();
        // The end of the one is the proof that the other one had the time.
        QTRY_COMPARE(area.values(), QPoint(100, 50));
        QCOMPARE(stopped.values(), halted);
    }

    void everyHelperStopsTheOneThatRuns()
    {
        Area area;
        Area clock;
        MouseAdapter adapter(&area, false);
        MouseAdapter timer(&clock, false);
        adapter.scrollContinous(&area, vx::dLeft, QSize(50, 50));
        adapter.scrollContinous(&area, vx::dUp, QSize(50, 50));
        adapter.scroll(&area, QPoint(5, 5));
        QCOMPARE(area.values(), QPoint(45, 45));
        timer.scrollContinous(&clock, vx::dLeft, QSize(50, 50));
        QTRY_VERIFY(clock.values().x() > 60);
        QCOMPARE(area.values(), QPoint(45, 45));
        timer.stopAnimation();
    }

    void nothingToScrollIsSilent()
    {
        QWidget widget;
        MouseAdapter adapter(&widget, false);
        QCOMPARE(MouseAdapter::scrollAnimated(nullptr, 5, true), static_cast<QAbstractAnimation*>(nullptr));
        adapter.scroll(nullptr, QPoint(1, 1));
        adapter.scrollPage(nullptr, vx::dLeft, QSize(5, 5));
        adapter.scrollContinous(nullptr, vx::dLeft, QSize(5, 5));
        adapter.stopAnimation();
    }

    void theAreaMayDieWhileItScrolls()
    {
        QWidget widget;
        MouseAdapter adapter(&widget, false);
        auto area = std::make_unique<Area>();
        adapter.scrollContinous(area.get(), vx::dLeft, QSize(50, 50));
        area.reset();
        adapter.stopAnimation();
        area = std::make_unique<Area>();
        QObject::connect(area->horizontalScrollBar(), &QScrollBar::valueChanged, &widget, [&] { area.reset(); });
        adapter.scroll(area.get(), QPoint(10, 10));
        QVERIFY(!area);
    }
};

ZELKOV_TEST_MAIN(TestScrollHelpers)
#include "tst_scrollhelpers.moc"
