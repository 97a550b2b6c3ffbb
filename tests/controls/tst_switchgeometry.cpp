// SPDX-License-Identifier: MIT
// Places and times of a sliding switch, as numbers.
#include "TestCase.h"
#include "TestMain.h"
#include "controls/SwitchGeometry.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <cmath>
#include <limits>

namespace geometry = vx::SwitchGeometry;

class TestSwitchGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theDefaultSizeHasItsPlaces()
    {
        const QRect control(0, 0, 72, 18);
        QCOMPARE(geometry::iconOffset(control), 24);
        QCOMPARE(geometry::onPosition(control), QPoint(9, 0));
        QCOMPARE(geometry::stripSize(control), QSize(96, 18));
    }

    void divisionsTruncate()
    {
        QCOMPARE(geometry::iconOffset(QRect(0, 0, 74, 18)), 24);
        QCOMPARE(geometry::iconOffset(QRect(0, 0, 75, 18)), 25);
        QCOMPARE(geometry::stripSize(QRect(0, 0, 73, 5)), QSize(97, 5));
        QCOMPARE(geometry::stripSize(QRect(0, 0, 74, 5)), QSize(98, 5));
        QCOMPARE(geometry::onPosition(QRect(3, 4, 74, 5)), QPoint(12, 4));
    }

    void aStripExactlyInTheMiddleIsOff_data()
    {
        QTest::addColumn<double>("x");
        QTest::addColumn<int>("offset");
        QTest::addColumn<bool>("on");
        QTest::newRow("middle") << -12.0 << 24 << false;
        QTest::newRow("just right") << -11.999 << 24 << true;
        QTest::newRow("just left") << -12.001 << 24 << false;
        QTest::newRow("half of an odd offset is truncated") << -12.0 << 25 << false;
        QTest::newRow("right of the truncated half") << -11.9 << 25 << true;
        QTest::newRow("no offset") << 0.0 << 1 << false;
    }
    void aStripExactlyInTheMiddleIsOff()
    {
        QFETCH(double, x);
        QFETCH(int, offset);
        QTEST(geometry::snapsToOn(x, offset), "on");
    }

    void theTimeGoesWithTheWay_data()
    {
        QTest::addColumn<double>("from");
        QTest::addColumn<double>("to");
        QTest::addColumn<bool>("right");
        QTest::addColumn<int>("milliseconds");
        QTest::newRow("full to the right") << -24.0 << 9.0 << true << 275;
        QTest::newRow("full to the left") << 9.0 << -24.0 << false << 275;
        QTest::newRow("a third") << -2.0 << 9.0 << true << 91;
        QTest::newRow("there already") << 9.0 << 9.0 << true << 0;
        QTest::newRow("beyond") << 10.0 << 9.0 << true << 0;
        QTest::newRow("the other way") << -24.0 << 9.0 << false << 0;
        QTest::newRow("nowhere") << std::nan("") << 9.0 << true << 0;
        QTest::newRow("from far away") << -1e300 << 9.0 << true << std::numeric_limits<int>::max();
    }
    void theTimeGoesWithTheWay()
    {
        QFETCH(double, from);
        QFETCH(double, to);
        QFETCH(bool, right);
        QTEST(geometry::duration(from, to, right, 300, 72), "milliseconds");
        QCOMPARE(geometry::duration(from, to, right, 300, 0), 0);
    }

    void theLeftEndWins()
    {
        QCOMPARE(geometry::limited(50, -24, 9), 9.0);
        QCOMPARE(geometry::limited(-50, -24, 9), -24.0);
        QCOMPARE(geometry::limited(1.5, -24, 9), 1.5);
        QCOMPARE(geometry::limited(1.5, 9, -24), 9.0);
    }

    void everyPlaceIsWithinTheEndsAndNoTimeIsNegative()
    {
        QRandomGenerator random(20260701);
        for (int i = 0; i < 5000; ++i) {
            const QRect control(0, 0, random.bounded(1, 2000), 18);
            const double left = -geometry::iconOffset(control);
            const double right = geometry::onPosition(control).x();
            const double x = random.bounded(8000.0) - 4000.0;
            const double limited = geometry::limited(x, left, right);
            QVERIFY(limited >= left && limited <= right);
            const int there = geometry::duration(x, right, true, 300, control.width());
            QVERIFY(there >= 0);
            QCOMPARE(there == 0, int(600.0 * (right - x) / control.width()) <= 0);
        }
    }
};

ZELKOV_TEST_MAIN(TestSwitchGeometry)
#include "tst_switchgeometry.moc"
