// SPDX-License-Identifier: MIT
// The verdicts as plain functions: both sides of every threshold, and laws that hold for any gesture.
#include "input/GestureVerdicts.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include "TestCase.h"
#include "TestMain.h"

using namespace vx;
namespace verdicts = vx::GestureVerdicts;

namespace
{
const GestureLimits limits {8, 12, 400, 1000, 700};
const GestureSample origin {QPoint(100, 100), 5000};

GestureSample sample(int dx, int dy, qint64 ms)
{
    return {origin.position + QPoint(dx, dy), origin.time + ms};
}
}

class TestGestureVerdicts : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theRadiusBelongsToTheClick()
    {
        QVERIFY(verdicts::wasSingleClick(true, origin, sample(5, 3, 10), 1, limits));
        QVERIFY(!verdicts::wasSingleClick(true, origin, sample(5, 4, 10), 1, limits));
        QVERIFY(!verdicts::wasSwipe(dAny, origin, sample(5, 3, 10), 1, limits));
        QVERIFY(verdicts::wasSwipe(dAny, origin, sample(5, 4, 10), 1, limits));
        QVERIFY(!verdicts::isPan(dAny, origin, sample(-8, 0, 10), 0, limits));
        QVERIFY(verdicts::isPan(dAny, origin, sample(-9, 0, 10), 0, limits));
        QVERIFY(!verdicts::wasPan(dAny, origin, sample(0, 8, 800), 1, limits));
        QVERIFY(verdicts::wasPan(dAny, origin, sample(0, 9, 800), 1, limits));
    }

    void theDoubleClickHasItsOwnRadius()
    {
        QVERIFY(verdicts::wasDoubleClick(true, origin, sample(12, 0, 300), 2, limits));
        QVERIFY(!verdicts::wasDoubleClick(true, origin, sample(13, 0, 300), 2, limits));
    }

    void theSwipeIntervalBelongsToTheSwipe()
    {
        QVERIFY(verdicts::wasSwipe(dAny, origin, sample(50, 0, 700), 1, limits));
        QVERIFY(!verdicts::wasPan(dAny, origin, sample(50, 0, 700), 1, limits));
        QVERIFY(!verdicts::wasSwipe(dAny, origin, sample(50, 0, 701), 1, limits));
        QVERIFY(verdicts::wasPan(dAny, origin, sample(50, 0, 701), 1, limits));
    }

    void theLongClickIntervalBelongsToTheLongClick()
    {
        QVERIFY(verdicts::wasSingleClick(true, origin, sample(0, 0, 999), 1, limits));
        QVERIFY(!verdicts::wasLongClick(true, origin, sample(0, 0, 999), 1, limits));
        QVERIFY(!verdicts::wasSingleClick(true, origin, sample(0, 0, 1000), 1, limits));
        QVERIFY(verdicts::wasLongClick(true, origin, sample(0, 0, 1000), 1, limits));
        QVERIFY(verdicts::wasLongClick(true, origin, sample(8, 0, 1000), 1, limits));
        QVERIFY(!verdicts::wasLongClick(true, origin, sample(9, 0, 1000), 1, limits));
    }

    void theDoubleClickIntervalBelongsToTheDoubleClick()
    {
        QVERIFY(verdicts::wasDoubleClick(true, origin, sample(0, 0, 400), 2, limits));
        QVERIFY(!verdicts::wasDoubleClick(true, origin, sample(0, 0, 401), 2, limits));
    }

    void anIntervalOfNullSwitchesTheFeatureOff()
    {
        GestureLimits off = limits;
        off.doubleClickInterval = 0;
        off.longClickInterval = 0;
        QVERIFY(!verdicts::wasDoubleClick(true, origin, origin, 2, off));
        QVERIFY(!verdicts::wasLongClick(true, origin, sample(0, 0, 5000), 1, off));
        QVERIFY(!verdicts::isLongPress(true, origin, sample(0, 0, 5000), 0, true, off));
        QVERIFY(verdicts::wasSingleClick(true, origin, sample(0, 0, 5000000), 1, off));
    }

    void theNumberOfReleasesDecides()
    {
        for (int releases = 0; releases < 4; ++releases) {
            QCOMPARE(verdicts::wasSwipe(dAny, origin, sample(50, 0, 10), releases, limits), releases == 1);
            QCOMPARE(verdicts::wasPan(dAny, origin, sample(50, 0, 900), releases, limits), releases == 1);
            QCOMPARE(verdicts::wasSingleClick(true, origin, sample(0, 0, 10), releases, limits), releases == 1);
            QCOMPARE(verdicts::wasLongClick(true, origin, sample(0, 0, 1010), releases, limits), releases == 1);
            QCOMPARE(verdicts::wasDoubleClick(true, origin, sample(0, 0, 10), releases, limits), releases == 2);
            QCOMPARE(verdicts::isPan(dAny, origin, sample(50, 0, 10), releases, limits), releases == 0);
            QCOMPARE(verdicts::isLongPress(true, origin, origin, releases, true, limits), releases == 0);
        }
    }

    void aLongPressNeedsItsTimeItsPlaceAndItsButton()
    {
        QVERIFY(verdicts::isLongPress(true, origin, sample(8, 0, 0), 0, true, limits));
        QVERIFY(!verdicts::isLongPress(true, origin, sample(9, 0, 0), 0, true, limits));
        QVERIFY(!verdicts::isLongPress(true, origin, origin, 0, false, limits));
        QVERIFY(!verdicts::isLongPress(false, origin, origin, 0, true, limits));
    }

    void clicksNeedTheirButton()
    {
        QVERIFY(!verdicts::wasSingleClick(false, origin, origin, 1, limits));
        QVERIFY(!verdicts::wasLongClick(false, origin, sample(0, 0, 1000), 1, limits));
        QVERIFY(!verdicts::wasDoubleClick(false, origin, origin, 2, limits));
    }

    void dragsNeedTheirDirection()
    {
        QVERIFY(verdicts::wasSwipe(dRight, origin, sample(50, 0, 10), 1, limits));
        QVERIFY(!verdicts::wasSwipe(dLeft | dUp | dDown, origin, sample(50, 0, 10), 1, limits));
        QVERIFY(verdicts::wasPan(dUp | dDown, origin, sample(0, -50, 900), 1, limits));
        QVERIFY(!verdicts::wasPan(dLeft | dRight, origin, sample(0, -50, 900), 1, limits));
        QVERIFY(verdicts::isPan(dLeft, origin, sample(-50, 0, 10), 0, limits));
        QVERIFY(!verdicts::isPan(dRight, origin, sample(-50, 0, 10), 0, limits));
    }

    void extremePointsAndTimesDoNotOverflow()
    {
        const int low = std::numeric_limits<int>::min();
        const int high = std::numeric_limits<int>::max();
        QCOMPARE(verdicts::distance(QPoint(low, low), QPoint(high, high)), 2 * ((qint64(1) << 32) - 1));
        QCOMPARE(verdicts::offset(QPoint(low, low), QPoint(high, high)), QPoint(high, high));
        QCOMPARE(verdicts::offset(QPoint(high, high), QPoint(low, low)), QPoint(low, low));
        QCOMPARE(verdicts::elapsed(5, 12), qint64(7));
        QCOMPARE(
            verdicts::elapsed(std::numeric_limits<qint64>::max(), std::numeric_limits<qint64>::min()), qint64(1));
    }

    void noGestureHasTwoVerdicts()
    {
        const quint32 seed = 20240917;
        QRandomGenerator random(seed);
        for (int round = 0; round < 20000; ++round) {
            const auto pick = [&random](int low, int high) { return random.bounded(low, high + 1); };
            const GestureLimits some {pick(0, 20), pick(0, 20), pick(0, 3) * 100, pick(0, 3) * 100, pick(0, 300)};
            const GestureSample end = sample(pick(-15, 15), pick(-15, 15), pick(0, 400));
            const int releases = pick(0, 3);
            const bool single = verdicts::wasSingleClick(true, origin, end, releases, some);
            const bool twice = verdicts::wasDoubleClick(true, origin, end, releases, some);
            const bool held = verdicts::wasLongClick(true, origin, end, releases, some);
            const bool swipe = verdicts::wasSwipe(dAny, origin, end, releases, some);
            const bool pan = verdicts::wasPan(dAny, origin, end, releases, some);
            const int sum = single + twice + held + swipe + pan;
            const QByteArray where = "seed " + QByteArray::number(seed) + ", round " + QByteArray::number(round);
            QVERIFY2(sum <= 1, where.constData());
            // One release is always something; two may be nothing.
            QVERIFY2(releases != 1 || sum == 1, where.constData());
            QVERIFY2(releases == 1 || releases == 2 || sum == 0, where.constData());
            // A direction and its complement share no drag.
            QVERIFY2(!(verdicts::wasSwipe(dLeft | dRight, origin, end, releases, some)
                         && verdicts::wasSwipe(dUp | dDown, origin, end, releases, some)),
                where.constData());
        }
    }
};

ZELKOV_TEST_MAIN(TestGestureVerdicts)
#include "tst_gestureverdicts.moc"
