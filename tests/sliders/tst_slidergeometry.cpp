// SPDX-License-Identifier: MIT
// Tables and random cases for the value of a jump and the place of the overlay bar.
#include "sliders/SliderGeometry.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <limits>

using vx::SliderGeometry::jumpValue;
using vx::SliderGeometry::overlayBarRect;

Q_DECLARE_METATYPE(Qt::Orientation)

class TestSliderGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aPressLeadsToTheValueUnderIt_data();
    void aPressLeadsToTheValueUnderIt();
    void theWholeRangeOfIntHolds();
    void aJumpStaysInTheRangeAndNeverFallsAsThePressMovesUp();
    void aBarLiesOnItsEdge_data();
    void aBarLiesOnItsEdge();
};

void TestSliderGeometry::aPressLeadsToTheValueUnderIt_data()
{
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<bool>("inverted");
    QTest::addColumn<int>("pressed");
    QTest::addColumn<int>("length");
    QTest::addColumn<int>("handle");
    QTest::addColumn<int>("expected");

    // A handle of 9 takes 5 at each end: 100 pixels of 110 are left for 100 values.
    QTest::newRow("low end") << 0 << 100 << false << 0 << 110 << 9 << 0;
    QTest::newRow("half a handle") << 0 << 100 << false << 5 << 110 << 9 << 0;
    QTest::newRow("one further") << 0 << 100 << false << 6 << 110 << 9 << 1;
    QTest::newRow("middle") << 0 << 100 << false << 55 << 110 << 9 << 50;
    QTest::newRow("last but one") << 0 << 100 << false << 104 << 110 << 9 << 99;
    QTest::newRow("half a handle from the end") << 0 << 100 << false << 105 << 110 << 9 << 100;
    QTest::newRow("high end") << 0 << 100 << false << 110 << 110 << 9 << 100;
    QTest::newRow("before the slider") << 0 << 100 << false << -40 << 110 << 9 << 0;
    QTest::newRow("past the slider") << 0 << 100 << false << 400 << 110 << 9 << 100;
    // An even handle takes half a pixel more at each end than its half.
    QTest::newRow("even handle, start") << 0 << 99 << false << 5 << 110 << 10 << 0;
    QTest::newRow("even handle, next") << 0 << 99 << false << 6 << 110 << 10 << 0;
    QTest::newRow("even handle, second") << 0 << 99 << false << 7 << 110 << 10 << 1;
    QTest::newRow("fractions are cut off") << 0 << 10 << false << 14 << 110 << 9 << 0;
    QTest::newRow("a whole one is not") << 0 << 10 << false << 15 << 110 << 9 << 1;
    QTest::newRow("negative range is cut off toward its minimum") << -10 << 0 << false << 14 << 110 << 9 << -10;
    QTest::newRow("offset range") << 10 << 110 << false << 55 << 110 << 9 << 60;
    QTest::newRow("inverted from 0") << 0 << 100 << true << 35 << 110 << 9 << 70;
    QTest::newRow("inverted from 10 is off by 10") << 10 << 110 << true << 35 << 110 << 9 << 70;
    QTest::newRow("inverted from 10, low end") << 10 << 110 << true << 0 << 110 << 9 << 100;
    QTest::newRow("inverted from 10, high end") << 10 << 110 << true << 110 << 110 << 9 << 0;
    QTest::newRow("inverted from -20, low end") << -20 << 20 << true << 0 << 110 << 9 << 40;
    QTest::newRow("no room to move") << 3 << 100 << false << 5 << 10 << 9 << 3;
    QTest::newRow("handle longer than the slider") << 3 << 100 << false << 8 << 4 << 9 << 3;
    QTest::newRow("one value") << 7 << 7 << false << 60 << 110 << 9 << 7;
}

void TestSliderGeometry::aPressLeadsToTheValueUnderIt()
{
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QFETCH(bool, inverted);
    QFETCH(int, pressed);
    QFETCH(int, length);
    QFETCH(int, handle);
    QTEST(jumpValue(minimum, maximum, inverted, pressed, length, handle), "expected");
}

void TestSliderGeometry::theWholeRangeOfIntHolds()
{
    const int lowest = std::numeric_limits<int>::min();
    const int highest = std::numeric_limits<int>::max();
    QCOMPARE(jumpValue(lowest, highest, false, 0, 110, 9), lowest);
    QCOMPARE(jumpValue(lowest, highest, false, 110, 110, 9), highest);
    QCOMPARE(jumpValue(lowest, highest, true, 0, 110, 9), highest);
    QCOMPARE(jumpValue(lowest, highest, true, 110, 110, 9), 0);
}

void TestSliderGeometry::aJumpStaysInTheRangeAndNeverFallsAsThePressMovesUp()
{
    const quint32 seed = 20240611;
    QRandomGenerator random(seed);
    for (int round = 0; round < 2000; ++round) {
        const int minimum = random.bounded(-1000000, 1000000);
        const int maximum = minimum + random.bounded(2000000);
        const int length = random.bounded(1, 3000);
        const int handle = random.bounded(0, 60);
        int previous = minimum;
        for (int pressed = -10; pressed < length + 10; pressed += 1 + length / 50) {
            const int value = jumpValue(minimum, maximum, false, pressed, length, handle);
            QVERIFY2(value >= previous && value <= maximum, qPrintable(QString::number(round)));
            QCOMPARE(jumpValue(minimum, maximum, true, pressed, length, handle), maximum - value);
            previous = value;
        }
        QCOMPARE(jumpValue(minimum, maximum, false, -10, length, handle), minimum);
        if (length > handle + 1) {
            QCOMPARE(jumpValue(minimum, maximum, false, length + 10, length, handle), maximum);
        }
    }
}

void TestSliderGeometry::aBarLiesOnItsEdge_data()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<bool>("leading");
    QTest::addColumn<QRect>("expected");
    QTest::newRow("top") << Qt::Horizontal << true << QRect(0, 0, 300, 15);
    QTest::newRow("bottom") << Qt::Horizontal << false << QRect(0, 185, 300, 15);
    QTest::newRow("left") << Qt::Vertical << true << QRect(0, 0, 15, 200);
    QTest::newRow("right") << Qt::Vertical << false << QRect(285, 0, 15, 200);
}

void TestSliderGeometry::aBarLiesOnItsEdge()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(bool, leading);
    QTEST(overlayBarRect(orientation, leading, QSize(300, 200), 15), "expected");
}

ZELKOV_TEST_MAIN(TestSliderGeometry)
#include "tst_slidergeometry.moc"
