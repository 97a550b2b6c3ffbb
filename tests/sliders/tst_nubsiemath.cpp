// SPDX-License-Identifier: MIT
// The arithmetic of a slider's handle.
#include "sliders/NubsieMath.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <climits>
#include <limits>

namespace Math = vx::NubsieMath;

class TestNubsieMath : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFirstRangeInKeyOrderThatHoldsTheValueIsTheOne();
    void aValueIsPlacedOnTheScale_data();
    void aValueIsPlacedOnTheScale();
    void aPlaceGivesTheNearestValue_data();
    void aPlaceGivesTheNearestValue();
    void everyValueComesBackFromItsPlace();
    void turningRoundMirrorsTheRange_data();
    void turningRoundMirrorsTheRange();
    void steppingUpGoesAroundAtZero_data();
    void steppingUpGoesAroundAtZero();
    void steppingDownGoesAroundAtTheMaximum_data();
    void steppingDownGoesAroundAtTheMaximum();
    void datesAreCutOffToValues_data();
    void datesAreCutOffToValues();
    void placesAreDates_data();
    void placesAreDates();
    void aWidgetIsCentredOnePixelToTheLowerRight_data();
    void aWidgetIsCentredOnePixelToTheLowerRight();
    void anIconStandsInTheMiddleButNeverOutside_data();
    void anIconStandsInTheMiddleButNeverOutside();
    void picturesKeepTheirProportions_data();
    void picturesKeepTheirProportions();
    void onlyAWidePictureOnASquareHandleNeedsAPill_data();
    void onlyAWidePictureOnASquareHandleNeedsAPill();
    void onlyASquarePictureOnAnotherHandleNeedsASquare_data();
    void onlyASquarePictureOnAnotherHandleNeedsASquare();
    void wideningCutsOffAndKeepsTheHeight();
};

void TestNubsieMath::theFirstRangeInKeyOrderThatHoldsTheValueIsTheOne()
{
    const QMap<vx::ValueRange, int> map {{{5, 9}, 1}, {{3, 20}, 2}, {{9, 7}, 3}, {{30}, 4}};
    QCOMPARE(*Math::entryFor(map, 5), 2);
    QCOMPARE(*Math::entryFor(map, 3), 2);
    QCOMPARE(*Math::entryFor(map, 20), 2);
    QCOMPARE(*Math::entryFor(map, 30), 4);
    QVERIFY(Math::entryFor(map, 2) == nullptr);
    QVERIFY(Math::entryFor(map, 21) == nullptr);
    QVERIFY(Math::entryFor(QMap<vx::ValueRange, int>(), 0) == nullptr);
}

void TestNubsieMath::aValueIsPlacedOnTheScale_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<double>("place");
    QTest::newRow("low end") << 0 << 0 << 100 << 0.0;
    QTest::newRow("high end") << 100 << 0 << 100 << 1.0;
    QTest::newRow("quarter") << 25 << 0 << 100 << 0.25;
    QTest::newRow("below") << -7 << 0 << 100 << 0.0;
    QTest::newRow("above") << 101 << 0 << 100 << 1.0;
    QTest::newRow("negative range") << -15 << -20 << -10 << 0.5;
    QTest::newRow("one value") << 0 << 0 << 0 << 1.0;
    QTest::newRow("one value, another asked") << -5 << 3 << 3 << 1.0;
    QTest::newRow("all integers, low") << INT_MIN << INT_MIN << INT_MAX << 0.0;
    QTest::newRow("all integers, high") << INT_MAX << INT_MIN << INT_MAX << 1.0;
    QTest::newRow("crossed ends") << 5 << 10 << 0 << 0.0;
}

void TestNubsieMath::aValueIsPlacedOnTheScale()
{
    QFETCH(int, value);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(Math::normalized(value, minimum, maximum), "place");
}

void TestNubsieMath::aPlaceGivesTheNearestValue_data()
{
    QTest::addColumn<double>("place");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("value");
    QTest::newRow("low end") << 0.0 << 0 << 100 << 0;
    QTest::newRow("high end") << 1.0 << 0 << 100 << 100;
    QTest::newRow("half goes up") << 0.125 << 0 << 4 << 1;
    QTest::newRow("under a half") << 0.1249 << 0 << 4 << 0;
    QTest::newRow("half below zero goes up") << 0.125 << -4 << 0 << -3;
    QTest::newRow("under a half below zero") << 0.1249 << -4 << 0 << -4;
    QTest::newRow("below the scale") << -0.3 << 5 << 10 << 5;
    QTest::newRow("above the scale") << 1.3 << 5 << 10 << 10;
    QTest::newRow("one value") << 1.0 << 7 << 7 << 7;
    QTest::newRow("far above all integers") << 2147483648.0 << INT_MIN << INT_MAX << INT_MAX;
    QTest::newRow("infinite") << std::numeric_limits<double>::infinity() << 0 << 10 << 10;
    QTest::newRow("infinite below") << -std::numeric_limits<double>::infinity() << 0 << 10 << 0;
    QTest::newRow("no number") << std::numeric_limits<double>::quiet_NaN() << 0 << 10 << 0;
    QTest::newRow("crossed ends") << 0.5 << 10 << 0 << 10;
    QTest::newRow("highest integer") << 1.0 << INT_MIN << INT_MAX << INT_MAX;
    QTest::newRow("lowest integer") << 0.0 << INT_MIN << INT_MAX << INT_MIN;
}

void TestNubsieMath::aPlaceGivesTheNearestValue()
{
    QFETCH(double, place);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(Math::denormalized(place, minimum, maximum), "value");
}

void TestNubsieMath::everyValueComesBackFromItsPlace()
{
    const quint32 seed = QRandomGenerator::global()->generate();
    qInfo("seed %u", seed);
    QRandomGenerator random(seed);
    for (int i = 0; i < 20000; ++i) {
        const int a = static_cast<int>(random.generate());
        const int b = static_cast<int>(random.generate());
        const int minimum = qMin(a, b);
        const int maximum = qMax(a, b);
        const auto span = static_cast<qint64>(maximum) - minimum;
        const int value
            = static_cast<int>(minimum + static_cast<qint64>(random.generateDouble() * static_cast<double>(span)));
        const double place = Math::normalized(value, minimum, maximum);
        QVERIFY(place >= 0.0 && place <= 1.0);
        QCOMPARE(Math::denormalized(place, minimum, maximum), value);
        const int turned = Math::turnedRound(value, minimum, maximum);
        QVERIFY(turned >= minimum && turned <= maximum);
        QCOMPARE(Math::turnedRound(turned, minimum, maximum), value);
    }
}

void TestNubsieMath::turningRoundMirrorsTheRange_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("turned");
    QTest::newRow("inside") << 3 << 0 << 10 << 7;
    QTest::newRow("offset") << 6 << 5 << 10 << 9;
    QTest::newRow("outside") << 12 << 0 << 10 << -2;
    QTest::newRow("too large") << -10 << 0 << INT_MAX << INT_MAX;
    QTest::newRow("too small") << 10 << INT_MIN << 0 << INT_MIN;
}

void TestNubsieMath::turningRoundMirrorsTheRange()
{
    QFETCH(int, value);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(Math::turnedRound(value, minimum, maximum), "turned");
}

void TestNubsieMath::steppingUpGoesAroundAtZero_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("next");
    QTest::newRow("inside") << 4 << 10 << 5;
    QTest::newRow("to the end") << 9 << 10 << 10;
    QTest::newRow("around") << 10 << 10 << 0;
    QTest::newRow("only zero") << 0 << 0 << 0;
    QTest::newRow("maximum -1") << -5 << -1 << 0;
    QTest::newRow("below zero") << -4 << 10 << -3;
    QTest::newRow("highest integer") << INT_MAX << INT_MAX << 0;
}

void TestNubsieMath::steppingUpGoesAroundAtZero()
{
    QFETCH(int, value);
    QFETCH(int, maximum);
    QTEST(Math::steppedUp(value, maximum), "next");
}

void TestNubsieMath::steppingDownGoesAroundAtTheMaximum_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("next");
    QTest::newRow("inside") << 6 << 5 << 10 << 5;
    QTest::newRow("around") << 5 << 5 << 10 << 10;
    QTest::newRow("one value") << 3 << 3 << 3 << 3;
    QTest::newRow("lowest integer") << INT_MIN << INT_MIN << 4 << 4;
}

void TestNubsieMath::steppingDownGoesAroundAtTheMaximum()
{
    QFETCH(int, value);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(Math::steppedDown(value, minimum, maximum), "next");
}

void TestNubsieMath::datesAreCutOffToValues_data()
{
    QTest::addColumn<qint64>("date");
    QTest::addColumn<qint64>("start");
    QTest::addColumn<qint64>("end");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("value");
    QTest::newRow("start") << 1000ll << 1000ll << 2000ll << 0 << 100 << 0;
    QTest::newRow("end") << 2000ll << 1000ll << 2000ll << 0 << 100 << 100;
    QTest::newRow("exactly a value") << 1250ll << 1000ll << 2000ll << 0 << 4 << 1;
    QTest::newRow("just under it") << 1249ll << 1000ll << 2000ll << 0 << 4 << 0;
    QTest::newRow("offset range") << 1500ll << 1000ll << 2000ll << 10 << 20 << 15;
    QTest::newRow("before: cut off toward the minimum") << 900ll << 1000ll << 2000ll << 0 << 15 << -1;
    QTest::newRow("no span, earlier") << 999ll << 1000ll << 1000ll << 3 << 8 << INT_MIN;
    QTest::newRow("no span, later") << 1001ll << 1000ll << 1000ll << 3 << 8 << INT_MAX;
    QTest::newRow("no span, the same") << 1000ll << 1000ll << 1000ll << 3 << 8 << 3;
    QTest::newRow("backward") << 1500ll << 2000ll << 1000ll << 0 << 10 << 5;
    QTest::newRow("far out") << LLONG_MAX << 0ll << 1ll << 0 << 100 << INT_MAX;
}

void TestNubsieMath::datesAreCutOffToValues()
{
    QFETCH(qint64, date);
    QFETCH(qint64, start);
    QFETCH(qint64, end);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(Math::valueOfDate(date, start, end, minimum, maximum), "value");
}

void TestNubsieMath::placesAreDates_data()
{
    QTest::addColumn<qint64>("start");
    QTest::addColumn<qint64>("end");
    QTest::addColumn<double>("place");
    QTest::addColumn<qint64>("date");
    QTest::newRow("start") << 1000ll << 2000ll << 0.0 << 1000ll;
    QTest::newRow("end") << 1000ll << 2000ll << 1.0 << 2000ll;
    QTest::newRow("cut off") << 1000ll << 2000ll << 0.4999 << 1499ll;
    QTest::newRow("backward, cut off toward the start") << 2000ll << 1000ll << 0.4999 << 1501ll;
    QTest::newRow("too late for a number") << LLONG_MAX - 5 << 0ll << -1.0 << LLONG_MAX;
    QTest::newRow("too early for a number") << LLONG_MIN + 5 << 0ll << -1.0 << LLONG_MIN;
    QTest::newRow("no number") << 0ll << 10ll << std::numeric_limits<double>::quiet_NaN() << LLONG_MIN;
}

void TestNubsieMath::placesAreDates()
{
    QFETCH(qint64, start);
    QFETCH(qint64, end);
    QFETCH(double, place);
    QTEST(Math::dateOfPlace(start, end, place), "date");
}

void TestNubsieMath::aWidgetIsCentredOnePixelToTheLowerRight_data()
{
    QTest::addColumn<QPointF>("middle");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QPoint>("topLeft");
    QTest::newRow("even") << QPointF(50, 40) << QSize(20, 10) << QPoint(41, 36);
    QTest::newRow("odd: halves go up") << QPointF(50, 40) << QSize(21, 11) << QPoint(41, 36);
    QTest::newRow("fraction") << QPointF(50.4, 40.6) << QSize(20, 10) << QPoint(41, 37);
    QTest::newRow("negative half goes up") << QPointF(-10, -10) << QSize(1, 1) << QPoint(-9, -9);
    QTest::newRow("no size") << QPointF(0, 0) << QSize(0, 0) << QPoint(1, 1);
    QTest::newRow("far out") << QPointF(1e300, -1e300) << QSize(20, 20) << QPoint(16777215, -16777215);
    QTest::newRow("no number") << QPointF(std::numeric_limits<double>::quiet_NaN(), 0) << QSize(20, 20)
                               << QPoint(0, -9);
}

void TestNubsieMath::aWidgetIsCentredOnePixelToTheLowerRight()
{
    QFETCH(QPointF, middle);
    QFETCH(QSize, size);
    QTEST(Math::topLeft(middle, size), "topLeft");
}

void TestNubsieMath::anIconStandsInTheMiddleButNeverOutside_data()
{
    QTest::addColumn<QSize>("area");
    QTest::addColumn<QSize>("icon");
    QTest::addColumn<QPoint>("point");
    QTest::newRow("as large") << QSize(20, 20) << QSize(20, 20) << QPoint(0, 0);
    QTest::newRow("smaller") << QSize(20, 20) << QSize(10, 6) << QPoint(5, 7);
    QTest::newRow("odd") << QSize(21, 20) << QSize(20, 17) << QPoint(0, 1);
    QTest::newRow("wider") << QSize(20, 20) << QSize(30, 10) << QPoint(0, 5);
    QTest::newRow("higher") << QSize(20, 20) << QSize(10, 21) << QPoint(5, 0);
    QTest::newRow("none") << QSize(20, 20) << QSize(0, 0) << QPoint(10, 10);
}

void TestNubsieMath::anIconStandsInTheMiddleButNeverOutside()
{
    QFETCH(QSize, area);
    QFETCH(QSize, icon);
    QTEST(Math::iconPoint(area, icon), "point");
}

void TestNubsieMath::picturesKeepTheirProportions_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("target");
    QTest::addColumn<QSize>("scaled");
    QTest::newRow("square") << QSize(100, 100) << QSize(20, 20) << QSize(20, 20);
    QTest::newRow("wide") << QSize(100, 50) << QSize(20, 20) << QSize(20, 10);
    QTest::newRow("high") << QSize(50, 100) << QSize(20, 20) << QSize(10, 20);
    QTest::newRow("thin stays visible") << QSize(1000, 1) << QSize(20, 20) << QSize(20, 1);
    QTest::newRow("nothing to scale") << QSize(0, 0) << QSize(20, 20) << QSize();
    QTest::newRow("nowhere to go") << QSize(10, 10) << QSize(0, 20) << QSize();
    QTest::newRow("invalid target") << QSize(10, 10) << QSize() << QSize();
    QTest::newRow("too large") << QSize(10, 10) << QSize(16777215, 16777215) << QSize();
    QTest::newRow("too long a side") << QSize(10000, 1) << QSize(40000, 4) << QSize();
    QTest::newRow("large") << QSize(10, 10) << QSize(4000, 4000) << QSize(4000, 4000);
}

void TestNubsieMath::picturesKeepTheirProportions()
{
    QFETCH(QSize, picture);
    QFETCH(QSize, target);
    QTEST(Math::scaledSize(picture, target), "scaled");
}

void TestNubsieMath::onlyAWidePictureOnASquareHandleNeedsAPill_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QSize>("dragged");
    QTest::addColumn<bool>("needed");
    QTest::newRow("wide on square") << QSize(120, 100) << QSize(20, 20) << QSize(30, 40) << true;
    QTest::newRow("square on square") << QSize(100, 100) << QSize(20, 20) << QSize(30, 30) << false;
    QTest::newRow("high on square") << QSize(90, 100) << QSize(20, 20) << QSize(30, 30) << false;
    QTest::newRow("wide on wide") << QSize(120, 100) << QSize(24, 20) << QSize(30, 30) << false;
    QTest::newRow("no size") << QSize(120, 100) << QSize() << QSize(30, 30) << false;
    QTest::newRow("no dragged size") << QSize(120, 100) << QSize(20, 20) << QSize() << false;
}

void TestNubsieMath::onlyAWidePictureOnASquareHandleNeedsAPill()
{
    QFETCH(QSize, picture);
    QFETCH(QSize, size);
    QFETCH(QSize, dragged);
    QTEST(Math::needsPill(picture, size, dragged), "needed");
}

void TestNubsieMath::onlyASquarePictureOnAnotherHandleNeedsASquare_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QSize>("dragged");
    QTest::addColumn<bool>("needed");
    QTest::newRow("square on wide") << QSize(100, 100) << QSize(24, 20) << QSize(30, 30) << true;
    QTest::newRow("square on high") << QSize(100, 100) << QSize(20, 24) << QSize(30, 30) << true;
    QTest::newRow("square on square") << QSize(100, 100) << QSize(20, 20) << QSize(36, 30) << false;
    QTest::newRow("wide on wide") << QSize(120, 100) << QSize(24, 20) << QSize(30, 30) << false;
    QTest::newRow("no size") << QSize(100, 100) << QSize() << QSize(30, 30) << false;
    QTest::newRow("no dragged size") << QSize(100, 100) << QSize(24, 20) << QSize() << false;
}

void TestNubsieMath::onlyASquarePictureOnAnotherHandleNeedsASquare()
{
    QFETCH(QSize, picture);
    QFETCH(QSize, size);
    QFETCH(QSize, dragged);
    QTEST(Math::needsSquare(picture, size, dragged), "needed");
}

void TestNubsieMath::wideningCutsOffAndKeepsTheHeight()
{
    QCOMPARE(Math::widened(QSize(20, 20), QSize(133, 100)), QSize(26, 20));
    QCOMPARE(Math::widened(QSize(30, 31), QSize(200, 100)), QSize(60, 31));
    QCOMPARE(Math::widened(QSize(-1, -1), QSize(150, 100)), QSize(-1, -1));
    QCOMPARE(Math::widened(QSize(20, 20), QSize(0, 0)), QSize(20, 20));
    QCOMPARE(Math::widened(QSize(INT_MAX, 20), QSize(200, 100)), QSize(INT_MAX, 20));
    QCOMPARE(Math::squared(QSize(26, 20)), QSize(20, 20));
}

ZELKOV_TEST_MAIN(TestNubsieMath)
#include "tst_nubsiemath.moc"
