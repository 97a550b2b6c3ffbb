// SPDX-License-Identifier: MIT
// Tables and random cases for the law of fine scrubbing and the way from the pointer to a value.
#include "sliders/NubsieDrag.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <limits>

using namespace vx::NubsieDrag;

class TestNubsieDrag : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePlaceUnderThePointer_data();
    void thePlaceUnderThePointer();
    void theReachIsTheFartherSideOfTheWindow();
    void aDateHandleGoesOnePixelASecondAtLeast();
    void theSpeedFallsWithTheDistance_data();
    void theSpeedFallsWithTheDistance();
    void aSlowHandleFollowsWithinItsLag_data();
    void aSlowHandleFollowsWithinItsLag();
    void theLagIsNeverExceeded();
    void displayIsMappedToValue_data();
    void displayIsMappedToValue();
    void theMappingHasNoJumpsAndNeverFalls();
    void travelIsTwelveTenthsOfAHandleForAStep_data();
    void travelIsTwelveTenthsOfAHandleForAStep();
    void stepsFollowTheTravel_data();
    void stepsFollowTheTravel();
    void velocityIsPositiveTowardTheLowEnd();
};

void TestNubsieDrag::thePlaceUnderThePointer_data()
{
    QTest::addColumn<double>("along");
    QTest::addColumn<double>("length");
    QTest::addColumn<double>("expected");

    QTest::newRow("start") << 10.0 << 220.0 << 0.0;
    QTest::newRow("middle") << 110.0 << 220.0 << 0.5;
    QTest::newRow("end") << 210.0 << 220.0 << 1.0;
    QTest::newRow("before") << -10.0 << 220.0 << -0.1;
    QTest::newRow("past") << 230.0 << 220.0 << 1.1;
    QTest::newRow("no room, on the centre") << 10.0 << 20.0 << 0.4;
    QTest::newRow("no room, before") << 9.0 << 20.0 << 0.0;
    QTest::newRow("no room, past") << 11.0 << 20.0 << 1.0;
    QTest::newRow("less than no room") << 15.0 << 10.0 << -0.5;
}

void TestNubsieDrag::thePlaceUnderThePointer()
{
    QFETCH(double, along);
    QFETCH(double, length);
    QTEST(placeUnder(along, length, 20, 0.4), "expected");
}

void TestNubsieDrag::theReachIsTheFartherSideOfTheWindow()
{
    QCOMPARE(reach(300, 700), 400.0);
    QCOMPARE(reach(500, 700), 500.0);
    QCOMPARE(reach(0, 0), 0.0);
}

void TestNubsieDrag::aDateHandleGoesOnePixelASecondAtLeast()
{
    QVERIFY(qAbs(dateSpeed(1000, 86400) - 0.01156) < 1e-5);
    QCOMPARE(dateSpeed(1000, 0), 10.0);
    QCOMPARE(dateSpeed(1000, -99), 1000.0);
    // Ends before starts.
    QCOMPARE(dateSpeed(1000, -100), s_MinimumSpeed);
    QCOMPARE(dateSpeed(1000, -86400), s_MinimumSpeed);
}

void TestNubsieDrag::theSpeedFallsWithTheDistance_data()
{
    QTest::addColumn<double>("side");
    QTest::addColumn<double>("reach");
    QTest::addColumn<double>("minimum");
    QTest::addColumn<double>("expected");

    QTest::newRow("on the line") << 0.0 << 400.0 << 0.05 << 1.0;
    QTest::newRow("24 off") << 24.0 << 400.0 << 0.05 << 1.0;
    QTest::newRow("almost 25 off") << 24.99 << 400.0 << 0.05 << 1.0;
    QTest::newRow("25 off") << 25.0 << 400.0 << 0.05 << 0.940625;
    QTest::newRow("25 off on the other side") << -25.0 << 400.0 << 0.05 << 0.940625;
    QTest::newRow("halfway") << 200.0 << 400.0 << 0.05 << 0.525;
    QTest::newRow("at the reach") << 400.0 << 400.0 << 0.05 << 0.05;
    QTest::newRow("beyond") << -4000.0 << 400.0 << 0.05 << 0.05;
    QTest::newRow("a date") << 400.0 << 400.0 << 0.0115 << 0.0115;
    QTest::newRow("a few seconds only: never faster than the pointer") << 100.0 << 400.0 << 5.0 << 1.0;
    QTest::newRow("no reach") << 25.0 << 0.0 << 0.05 << 0.05;
}

void TestNubsieDrag::theSpeedFallsWithTheDistance()
{
    QFETCH(double, side);
    QFETCH(double, reach);
    QFETCH(double, minimum);
    QTEST(speed(side, 25, reach, minimum), "expected");
}

void TestNubsieDrag::aSlowHandleFollowsWithinItsLag_data()
{
    QTest::addColumn<double>("speed");
    QTest::addColumn<double>("step");
    QTest::addColumn<double>("display");
    QTest::addColumn<double>("target");
    QTest::addColumn<double>("expected");

    QTest::newRow("half speed") << 0.5 << 0.1 << 0.4 << 0.5 << 0.45;
    QTest::newRow("half speed, back") << 0.5 << -0.1 << 0.4 << 0.3 << 0.35;
    QTest::newRow("full speed is right under the pointer") << 1.0 << 0.7 << 0.4 << 0.45 << 0.45;
    QTest::newRow("too far above") << 0.9 << 0.0 << 0.5 << 0.3 << 0.4;
    QTest::newRow("too far below") << 0.9 << 0.0 << 0.5 << 0.7 << 0.6;
    QTest::newRow("just as far as it may be") << 0.75 << 0.0 << 0.5 << 0.25 << 0.5;
}

void TestNubsieDrag::aSlowHandleFollowsWithinItsLag()
{
    QFETCH(double, speed);
    QFETCH(double, step);
    QFETCH(double, display);
    QFETCH(double, target);
    QTEST(laggedTarget(speed, step, display, target), "expected");
}

void TestNubsieDrag::theLagIsNeverExceeded()
{
    QRandomGenerator random(7);
    for (int i = 0; i < 20000; ++i) {
        const double share = random.generateDouble();
        const double target = random.generateDouble() * 1.4 - 0.2;
        const double step = random.generateDouble() - 0.5;
        const double display = random.generateDouble();
        const double place = laggedTarget(share, step, display, target);
        QVERIFY2(qAbs(place - target) < 1.0 - share + 1e-9, qPrintable(QString::number(i)));
    }
}

void TestNubsieDrag::displayIsMappedToValue_data()
{
    QTest::addColumn<double>("target");
    QTest::addColumn<bool>("anchored");
    QTest::addColumn<double>("display");
    QTest::addColumn<double>("value");
    QTest::addColumn<bool>("stillAnchored");

    // Pressed where it is drawn at 0.4 and truly at 0.5.
    QTest::newRow("at the start") << 0.4 << true << 0.4 << 0.5 << true;
    QTest::newRow("halfway to the top") << 0.7 << true << 0.7 << 0.75 << true;
    QTest::newRow("halfway to the bottom") << 0.2 << true << 0.2 << 0.25 << true;
    QTest::newRow("the top") << 1.0 << true << 1.0 << 1.0 << false;
    QTest::newRow("past the top") << 1.7 << true << 1.0 << 1.0 << false;
    QTest::newRow("the bottom") << 0.0 << true << 0.0 << 0.0 << false;
    QTest::newRow("past the bottom") << -0.3 << true << 0.0 << 0.0 << false;
    QTest::newRow("after an end it is one to one") << 0.4 << false << 0.4 << 0.4 << false;
}

void TestNubsieDrag::displayIsMappedToValue()
{
    QFETCH(double, target);
    QFETCH(bool, anchored);
    const Mapped result = mapped(target, {0.4, 0.5, anchored});
    QTEST(result.display, "display");
    QTEST(result.value, "value");
    QTEST(result.mapped, "stillAnchored");
}

void TestNubsieDrag::theMappingHasNoJumpsAndNeverFalls()
{
    QRandomGenerator random(99);
    for (int round = 0; round < 200; ++round) {
        // The ends of the scale too.
        const double display = round % 10 == 0 ? (round / 10) % 2 : random.generateDouble();
        const double value = round % 7 == 0 ? (round / 7) % 2 : random.generateDouble();
        double last = 0.0;
        for (int i = -10; i <= 2010; ++i) {
            const double target = i / 2000.0;
            const Mapped result = mapped(target, {display, value, true});
            QVERIFY(result.value >= 0.0 && result.value <= 1.0 + 1e-12);
            QVERIFY(result.value >= last - 1e-12);
            last = result.value;
        }
        if (display > 0.0 && display < 1.0) {
            QVERIFY(qAbs(mapped(display, {display, value, true}).value - value) < 1e-12);
        }
    }
}

void TestNubsieDrag::travelIsTwelveTenthsOfAHandleForAStep_data()
{
    QTest::addColumn<int>("slider");
    QTest::addColumn<int>("dragged");
    QTest::addColumn<int>("minimum");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<double>("expected");

    QTest::newRow("five values") << 600 << 30 << 0 << 4 << 180.0;
    QTest::newRow("offset range") << 600 << 30 << -2 << 2 << 180.0;
    QTest::newRow("longer than the slider") << 100 << 30 << 0 << 4 << 100.0;
    QTest::newRow("all integers") << 600 << 30 << std::numeric_limits<int>::min()
                                  << std::numeric_limits<int>::max() << 600.0;
    QTest::newRow("all integers, as large as it gets")
        << 600 << std::numeric_limits<int>::max() << std::numeric_limits<int>::min()
        << std::numeric_limits<int>::max() << 600.0;
    QTest::newRow("no size") << 600 << 0 << 0 << 4 << 0.0;
}

void TestNubsieDrag::travelIsTwelveTenthsOfAHandleForAStep()
{
    QFETCH(int, slider);
    QFETCH(int, dragged);
    QFETCH(int, minimum);
    QFETCH(int, maximum);
    QTEST(stepTravel(slider, dragged, minimum, maximum), "expected");
}

void TestNubsieDrag::stepsFollowTheTravel_data()
{
    QTest::addColumn<double>("way");
    QTest::addColumn<double>("travel");
    QTest::addColumn<double>("expected");

    QTest::newRow("not moved") << 0.0 << 180.0 << 0.25;
    QTest::newRow("up") << 45.0 << 180.0 << 0.5;
    QTest::newRow("down") << -18.0 << 180.0 << 0.15;
    QTest::newRow("past the top") << 400.0 << 180.0 << 1.0;
    QTest::newRow("past the bottom") << -400.0 << 180.0 << 0.0;
    QTest::newRow("no travel, not moved") << 0.0 << 0.0 << 0.25;
    QTest::newRow("no travel, up") << 1.0 << 0.0 << 1.0;
    QTest::newRow("no travel, down") << -1.0 << 0.0 << 0.0;
}

void TestNubsieDrag::stepsFollowTheTravel()
{
    QFETCH(double, way);
    QFETCH(double, travel);
    QTEST(steppedValue(way, travel, 0.25), "expected");
}

void TestNubsieDrag::velocityIsPositiveTowardTheLowEnd()
{
    QCOMPARE(velocity(0.5, 0.4, 100), 1.0);
    QCOMPARE(velocity(0.4, 0.5, 50), -2.0);
    QCOMPARE(velocity(0.5, 0.5, 50), 0.0);
    QCOMPARE(velocity(0.5, 0.4, 0), 100.0);
    QCOMPARE(velocity(0.5, 0.4, -30), 100.0);
}

ZELKOV_TEST_MAIN(TestNubsieDrag)
#include "tst_nubsiedrag.moc"
