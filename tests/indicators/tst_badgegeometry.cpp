// SPDX-License-Identifier: MIT
// The numbers of badges, checked against tables.
#include "indicators/BadgeGeometry.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtGui/QColor>
#include <QtTest/QtTest>

#include <limits>
#include <random>

namespace geometry = vx::BadgeGeometry;

class TestBadgeGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void anglesFollowTheTruncatingRemainder();
    void aTurnHasTwelveFrames();
    void everyAngleHasAnIndexOfItsOwn();
    void gradientAnglesTruncateTowardZero_data();
    void gradientAnglesTruncateTowardZero();
    void rectanglesShareTheIntegerCentre();
    void dotsStandOnTheirCircle_data();
    void dotsStandOnTheirCircle();
    void spokesRunFromOutsideIn_data();
    void spokesRunFromOutsideIn();
    void cacheKeySpellsAllNumbers_data();
    void cacheKeySpellsAllNumbers();
    void cacheKeyEqualsTheFormattedText();
    void cacheKeyKnowsOnlyTheBrightnessOfColours();
    void textRoomIsSmallerWithinAnOutline();
    void pillIsADiscUntilTheTextIsWider_data();
    void pillIsADiscUntilTheTextIsWider();
    void outlineStandsTwoPixelsInside();
    void crossRunsUpwardToTheRight_data();
    void crossRunsUpwardToTheRight();
    void textStandsTenPixelsInside();
    void coveringSizeKeepsTheProportions_data();
    void coveringSizeKeepsTheProportions();
};

void TestBadgeGeometry::anglesFollowTheTruncatingRemainder()
{
    QVector<int> angles;
    int angle = geometry::FirstAngle;
    for (int i = 0; i < 18; ++i) {
        angle = geometry::nextAngle(angle);
        angles << angle;
    }
    const QVector<int> expected {960, 480, 0, -480, -960, -1440, -1920, -2400, -2880, -3360, -3840, -4320, -4800,
        -5280, 0, -480, -960, -1440};
    QCOMPARE(angles, expected);
}

void TestBadgeGeometry::aTurnHasTwelveFrames()
{
    int angle = 0;
    for (int i = 1; i <= 12; ++i) {
        angle = geometry::nextAngle(angle);
        QCOMPARE(angle == 0, i == 12);
    }
}

void TestBadgeGeometry::everyAngleHasAnIndexOfItsOwn()
{
    QCOMPARE(geometry::AngleCount, 15);
    int angle = geometry::FirstAngle;
    for (int expected : {14, 13, 12, 11, 10, 9, 8, 7, 6, 5, 4, 3, 2, 1, 0, 11, 10}) {
        QCOMPARE(geometry::angleIndex(angle), expected);
        angle = geometry::nextAngle(angle);
    }
}

void TestBadgeGeometry::gradientAnglesTruncateTowardZero_data()
{
    QTest::addColumn<int>("startAngle");
    QTest::addColumn<int>("plain");
    QTest::addColumn<int>("spokes");
    QTest::newRow("first") << 1440 << 90 << 75;
    QTest::newRow("zero") << 0 << 0 << -15;
    QTest::newRow("below one") << 15 << 0 << -15;
    QTest::newRow("one") << 16 << 1 << -14;
    QTest::newRow("above minus one") << -15 << 0 << -15;
    QTest::newRow("minus one") << -16 << -1 << -16;
    QTest::newRow("above minus two") << -31 << -1 << -16;
    QTest::newRow("last") << -5280 << -330 << -345;
}

void TestBadgeGeometry::gradientAnglesTruncateTowardZero()
{
    QFETCH(int, startAngle);
    QTEST(geometry::gradientAngle(startAngle), "plain");
    QTEST(geometry::spokesGradientAngle(startAngle), "spokes");
}

void TestBadgeGeometry::rectanglesShareTheIntegerCentre()
{
    QCOMPARE(geometry::ringRect(), QRect(7, 7, 86, 86));
    QCOMPARE(geometry::dotsRect(), QRect(10, 10, 80, 80));
    QCOMPARE(geometry::spokesRect(), QRect(6, 6, 88, 88));
    QCOMPARE(geometry::ringRect().center(), QPoint(49, 49));
    QCOMPARE(geometry::dotsRect().center(), QPoint(49, 49));
    QCOMPARE(geometry::spokesRect().center(), QPoint(49, 49));
}

void TestBadgeGeometry::dotsStandOnTheirCircle_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QPoint>("center");
    // 48 instead of 49 is the truncation of 48.99...: the cosine of a right angle is not exactly zero.
    QTest::newRow("north") << 0 << QPoint(49, 9);
    QTest::newRow("north west") << 1 << QPoint(20, 20);
    QTest::newRow("west") << 2 << QPoint(9, 48);
    QTest::newRow("south west") << 3 << QPoint(20, 77);
    QTest::newRow("south") << 4 << QPoint(48, 89);
    QTest::newRow("south east") << 5 << QPoint(77, 77);
    QTest::newRow("east") << 6 << QPoint(89, 49);
    QTest::newRow("north east") << 7 << QPoint(77, 20);
}

void TestBadgeGeometry::dotsStandOnTheirCircle()
{
    QFETCH(int, index);
    const QRect dot = geometry::dotRects().at(size_t(index));
    QTEST(dot.center(), "center");
    QCOMPARE(dot.size(), QSize(20, 20));
}

void TestBadgeGeometry::spokesRunFromOutsideIn_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QLine>("line");
    QTest::newRow("6 o'clock") << 0 << QLine(49, 93, 49, 78);
    QTest::newRow("7 o'clock") << 1 << QLine(27, 87, 34, 74);
    QTest::newRow("8 o'clock") << 2 << QLine(10, 71, 23, 63);
    QTest::newRow("9 o'clock") << 3 << QLine(5, 49, 20, 49);
    QTest::newRow("10 o'clock") << 4 << QLine(10, 27, 23, 34);
    QTest::newRow("11 o'clock") << 5 << QLine(27, 10, 34, 23);
    QTest::newRow("12 o'clock") << 6 << QLine(48, 5, 48, 20);
    QTest::newRow("1 o'clock") << 7 << QLine(70, 10, 63, 23);
    QTest::newRow("2 o'clock") << 8 << QLine(87, 26, 74, 34);
    QTest::newRow("3 o'clock") << 9 << QLine(93, 48, 78, 48);
    QTest::newRow("4 o'clock") << 10 << QLine(87, 71, 74, 63);
    QTest::newRow("5 o'clock") << 11 << QLine(71, 87, 63, 74);
}

void TestBadgeGeometry::spokesRunFromOutsideIn()
{
    QFETCH(int, index);
    QTEST(geometry::spokeLines().at(size_t(index)), "line");
}

void TestBadgeGeometry::cacheKeySpellsAllNumbers_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("start");
    QTest::addColumn<int>("span");
    QTest::addColumn<QColor>("color1");
    QTest::addColumn<QColor>("color2");
    QTest::addColumn<QString>("key");
    QTest::newRow("defaults") << 3 << QSize(20, 20) << 1440 << -4320 << QColor(255, 255, 255)
                              << QColor(192, 192, 192) << QStringLiteral("3_20x20_1440_-4320_255_192");
    QTest::newRow("red and blue") << 0 << QSize(32, 48) << 0 << -4320 << QColor(200, 10, 10) << QColor(0, 0, 7)
                                  << QStringLiteral("0_32x48_0_-4320_200_7");
    QTest::newRow("alpha does not count") << 1 << QSize(1, 2) << -5280 << 16 << QColor(9, 8, 7, 6)
                                          << QColor(0, 0, 0, 0) << QStringLiteral("1_1x2_-5280_16_9_0");
    QTest::newRow("invalid") << -1 << QSize() << 0 << 0 << QColor() << QColor()
                             << QStringLiteral("-1_-1x-1_0_0_0_0");
    const int least = std::numeric_limits<int>::min();
    const int most = std::numeric_limits<int>::max();
    QTest::newRow("longest") << least << QSize(least, least) << least << least << QColor(Qt::white)
                             << QColor(Qt::white)
                             << QStringLiteral(
                                    "-2147483648_-2147483648x-2147483648_-2147483648_-2147483648_255_255");
    QTest::newRow("greatest") << most << QSize(most, 10) << most << 100 << QColor(Qt::white) << QColor(Qt::black)
                              << QStringLiteral("2147483647_2147483647x10_2147483647_100_255_0");
}

void TestBadgeGeometry::cacheKeySpellsAllNumbers()
{
    QFETCH(int, type);
    QFETCH(QSize, size);
    QFETCH(int, start);
    QFETCH(int, span);
    QFETCH(QColor, color1);
    QFETCH(QColor, color2);
    QTEST(geometry::cacheKey(type, size, start, span, color1, color2), "key");
}

void TestBadgeGeometry::cacheKeyEqualsTheFormattedText()
{
    const quint32 seed = 20240611;
    std::mt19937 random(seed);
    const auto number = [&random] { return int(random()) >> (random() % 32); };
    for (int i = 0; i < 5000; ++i) {
        const int type = number();
        const QSize size(number(), number());
        const int start = number();
        const int span = number();
        const QColor color1 = QColor::fromRgb(QRgb(random()));
        const QColor color2 = QColor::fromRgb(QRgb(random()));
        const QString expected = QStringLiteral("%1_%2x%3_%4_%5_%6_%7")
                                     .arg(type)
                                     .arg(size.width())
                                     .arg(size.height())
                                     .arg(start)
                                     .arg(span)
                                     .arg(color1.value())
                                     .arg(color2.value());
        QVERIFY2(geometry::cacheKey(type, size, start, span, color1, color2) == expected,
            qPrintable(QStringLiteral("seed %1, round %2").arg(seed).arg(i)));
    }
}

void TestBadgeGeometry::cacheKeyKnowsOnlyTheBrightnessOfColours()
{
    const auto key = [](const QColor& color1, const QColor& color2) {
        return geometry::cacheKey(3, QSize(20, 20), 0, -4320, color1, color2);
    };
    QCOMPARE(key(QColor(255, 0, 0), QColor(10, 200, 10)), key(QColor(0, 255, 0), QColor(200, 200, 200)));
    QVERIFY(key(QColor(255, 0, 0), QColor(10, 200, 10)) != key(QColor(254, 0, 0), QColor(10, 200, 10)));
    QVERIFY(key(QColor(255, 0, 0), QColor(10, 200, 10)) != key(QColor(255, 0, 0), QColor(10, 199, 10)));
}

void TestBadgeGeometry::textRoomIsSmallerWithinAnOutline()
{
    QCOMPARE(geometry::textRoomHeight(false), 80);
    QCOMPARE(geometry::textRoomHeight(true), 70);
}

void TestBadgeGeometry::pillIsADiscUntilTheTextIsWider_data()
{
    QTest::addColumn<int>("textWidth");
    QTest::addColumn<QSize>("plain");
    QTest::addColumn<QSize>("stroked");
    QTest::newRow("nothing") << 0 << QSize(100, 100) << QSize(100, 100);
    QTest::newRow("narrow") << 30 << QSize(100, 100) << QSize(100, 100);
    QTest::newRow("just a stroked disc") << 70 << QSize(100, 100) << QSize(100, 100);
    QTest::newRow("stroked pill") << 71 << QSize(100, 100) << QSize(101, 100);
    QTest::newRow("just a disc") << 80 << QSize(100, 100) << QSize(110, 100);
    QTest::newRow("pill") << 81 << QSize(101, 100) << QSize(111, 100);
    QTest::newRow("long") << 400 << QSize(420, 100) << QSize(430, 100);
    QTest::newRow("widest") << 32747 << QSize(32767, 100) << QSize(32767, 100);
    QTest::newRow("wider than a painter draws") << 32748 << QSize(32767, 100) << QSize(32767, 100);
    QTest::newRow("absurd") << std::numeric_limits<int>::max() << QSize(32767, 100) << QSize(32767, 100);
    QTest::newRow("negative") << -5 << QSize(100, 100) << QSize(100, 100);
}

void TestBadgeGeometry::pillIsADiscUntilTheTextIsWider()
{
    QFETCH(int, textWidth);
    QFETCH(QSize, plain);
    QFETCH(QSize, stroked);
    QCOMPARE(geometry::pillRect(textWidth, false), QRect(QPoint(0, 0), plain));
    QCOMPARE(geometry::pillRect(textWidth, true), QRect(QPoint(0, 0), stroked));
}

void TestBadgeGeometry::outlineStandsTwoPixelsInside()
{
    QCOMPARE(geometry::outlineRect(QRect(0, 0, 140, 100), true), QRect(2, 2, 136, 96));
    QCOMPARE(geometry::outlineRect(QRect(0, 0, 140, 100), false), QRect(0, 0, 140, 100));
}

void TestBadgeGeometry::crossRunsUpwardToTheRight_data()
{
    QTest::addColumn<QRect>("outline");
    QTest::addColumn<QLineF>("line");
    const double half = 0.7071067811865476 * 0.5;
    QTest::newRow("disc") << QRect(0, 0, 100, 100)
                          << QLineF(50 - 80 * half, 50 + 80 * half, 50 + 80 * half, 50 - 80 * half);
    QTest::newRow("outlined disc") << QRect(2, 2, 96, 96)
                                   << QLineF(50 - 76 * half, 50 + 76 * half, 50 + 76 * half, 50 - 76 * half);
    QTest::newRow("pill") << QRect(0, 0, 201, 100)
                          << QLineF(101 - 181 * half, 50 + 80 * half, 101 + 181 * half, 50 - 80 * half);
}

void TestBadgeGeometry::crossRunsUpwardToTheRight()
{
    QFETCH(QRect, outline);
    QTEST(geometry::crossLine(outline), "line");
}

void TestBadgeGeometry::textStandsTenPixelsInside()
{
    QCOMPARE(geometry::textRect(QRect(2, 2, 136, 96)), QRect(12, 12, 116, 76));
}

void TestBadgeGeometry::coveringSizeKeepsTheProportions_data()
{
    QTest::addColumn<QSize>("canvas");
    QTest::addColumn<QSize>("wanted");
    QTest::addColumn<QSize>("size");
    const QSize mark(100, 100);
    QTest::newRow("square") << mark << QSize(20, 20) << QSize(20, 20);
    QTest::newRow("wide wish") << mark << QSize(40, 20) << QSize(40, 40);
    QTest::newRow("tall wish") << mark << QSize(20, 40) << QSize(40, 40);
    QTest::newRow("pill") << QSize(300, 100) << QSize(20, 20) << QSize(60, 20);
    QTest::newRow("one pixel") << mark << QSize(1, 1) << QSize(1, 1);
    QTest::newRow("no width") << mark << QSize(0, 20) << QSize();
    QTest::newRow("no height") << mark << QSize(20, 0) << QSize();
    QTest::newRow("negative") << mark << QSize(-20, -20) << QSize();
    QTest::newRow("null canvas") << QSize(0, 0) << QSize(20, 20) << QSize();
    QTest::newRow("largest") << mark << QSize(4096, 4096) << QSize(4096, 4096);
    QTest::newRow("too many pixels") << mark << QSize(4097, 4096) << QSize();
    QTest::newRow("wide and low") << mark << QSize(30000, 1) << QSize();
    QTest::newRow("widest pill") << QSize(32767, 100) << QSize(32767, 1) << QSize(32767, 100);
    QTest::newRow("too wide a pill") << QSize(32767, 100) << QSize(20, 101) << QSize();
    const int most = std::numeric_limits<int>::max();
    QTest::newRow("absurd") << mark << QSize(most, most) << QSize();
}

void TestBadgeGeometry::coveringSizeKeepsTheProportions()
{
    QFETCH(QSize, canvas);
    QFETCH(QSize, wanted);
    QTEST(geometry::coveringSize(canvas, wanted), "size");
}

ZELKOV_TEST_MAIN(TestBadgeGeometry)
#include "tst_badgegeometry.moc"
