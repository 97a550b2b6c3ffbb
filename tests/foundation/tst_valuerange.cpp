// SPDX-License-Identifier: MIT
// The order of value ranges, and the walk of maps keyed by them.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/ValueRange.h"

#include <QtCore/QMap>
#include <QtTest/QtTest>

#include <limits>
#include <type_traits>

using vx::ValueRange;

class TestValueRange : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theConstructorsGiveTheirIntervals()
    {
        QCOMPARE(ValueRange().first, 0);
        QCOMPARE(ValueRange().second, 0);
        QCOMPARE(ValueRange(7).first, 7);
        QCOMPARE(ValueRange(7).second, 7);
        QCOMPARE(ValueRange(5, -3).first, 5);
        QCOMPARE(ValueRange(5, -3).second, -3);
        const ValueRange fromInt = 4;
        QVERIFY(fromInt == ValueRange(4, 4));
        static_assert(std::is_copy_assignable<ValueRange>::value, "");
    }

    void theOrderIsByFirstThenSecond_data()
    {
        QTest::addColumn<int>("a1");
        QTest::addColumn<int>("a2");
        QTest::addColumn<int>("b1");
        QTest::addColumn<int>("b2");
        QTest::addColumn<int>("order");
        QTest::newRow("equal") << 1 << 2 << 1 << 2 << 0;
        QTest::newRow("first decides") << 1 << 9 << 2 << 3 << -1;
        QTest::newRow("first decides against second") << 2 << 3 << 1 << 9 << 1;
        QTest::newRow("second decides") << 1 << 2 << 1 << 3 << -1;
        QTest::newRow("turned round") << 5 << 1 << 5 << 2 << -1;
        QTest::newRow("extremes") << std::numeric_limits<int>::min() << 0 << std::numeric_limits<int>::max() << 0 << -1;
    }
    void theOrderIsByFirstThenSecond()
    {
        QFETCH(int, a1);
        QFETCH(int, a2);
        QFETCH(int, b1);
        QFETCH(int, b2);
        QFETCH(int, order);
        const ValueRange a(a1, a2);
        const ValueRange b(b1, b2);
        QCOMPARE(a < b, order < 0);
        QCOMPARE(b < a, order > 0);
        QCOMPARE(a == b, order == 0);
        QCOMPARE(a != b, order != 0);
    }

    void bothEndsBelongToTheRange()
    {
        const ValueRange range(2, 5);
        QVERIFY(!range.contains(1));
        QVERIFY(range.contains(2));
        QVERIFY(range.contains(5));
        QVERIFY(!range.contains(6));
        QVERIFY(!ValueRange(5, 2).contains(3));
    }

    void aMapFindsTheExactKeyOnly()
    {
        QMap<ValueRange, int> map;
        map.insert(ValueRange(0, 10), 1);
        map.insert(5, 2);
        QVERIFY(map.contains(5));
        QVERIFY(!map.contains(6));
        QCOMPARE(map.value(ValueRange(0, 10)), 1);
        QCOMPARE(map.firstKey().second, 10);
    }
};

ZELKOV_TEST_MAIN(TestValueRange)
#include "tst_valuerange.moc"
