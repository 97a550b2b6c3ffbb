// SPDX-License-Identifier: MIT
// Where a slider with several handles paints its progress and its numbers, and how large its flags are.
#include "sliders/SliderDecoration.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>

#include <climits>
#include <limits>

namespace Decoration = vx::SliderDecoration;

class TestSliderDecoration : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void progressRunsAlongTheWidth_data();
    void progressRunsAlongTheWidth();
    void theNumberOfTheValueStandsClearOfTheHandle();
    void theNumbersOfTheRangeStandAtTheEndsOfTheBar();
    void aFlagIsHalfAsHighAsTheSlider_data();
    void aFlagIsHalfAsHighAsTheSlider();
    void aFlagWithoutAColourIsThreePixelsLarge_data();
    void aFlagWithoutAColourIsThreePixelsLarge();
};

void TestSliderDecoration::progressRunsAlongTheWidth_data()
{
    QTest::addColumn<QRectF>("bar");
    QTest::addColumn<double>("progress");
    QTest::addColumn<QRectF>("done");
    const QRectF bar(0, 7.5, 201, 2.5);
    QTest::newRow("none") << bar << 0.0 << QRectF(0, 7.5, 0, 2);
    QTest::newRow("half, cut off") << bar << 0.5 << QRectF(0, 7.5, 100, 2);
    QTest::newRow("all") << bar << 1.0 << QRectF(0, 7.5, 201, 2);
    QTest::newRow("vertical: not turned") << QRectF(7.5, 0, 2.5, 200) << 0.5 << QRectF(7.5, 0, 1, 200);
    QTest::newRow("empty bar") << QRectF(0, 0, 0, 0) << 1.0 << QRectF(0, 0, 0, 0);
    QTest::newRow("negative") << bar << -1.0 << QRectF(0, 7.5, 0, 2);
    QTest::newRow("no number") << bar << std::numeric_limits<double>::quiet_NaN() << QRectF(0, 7.5, 0, 2);
}

void TestSliderDecoration::progressRunsAlongTheWidth()
{
    QFETCH(QRectF, bar);
    QFETCH(double, progress);
    QTEST(Decoration::progressRect(bar, progress), "done");
}

void TestSliderDecoration::theNumberOfTheValueStandsClearOfTheHandle()
{
    const QPointF position(110, 20);
    const QSizeF handle(24, 30);
    const QSizeF text(17, 9);
    QCOMPARE(Decoration::valuePosition(Qt::Horizontal, position, handle, text, 4), QPointF(110, 20 + 9 + 30 + 14));
    QCOMPARE(Decoration::valuePosition(Qt::Vertical, position, handle, text, 4), QPointF(110 + 24 + 14, 20 + 9));
}

void TestSliderDecoration::theNumbersOfTheRangeStandAtTheEndsOfTheBar()
{
    const QRectF bar(3, 10, 200, 2.5);
    const QSizeF text(17, 9);
    QCOMPARE(Decoration::minimumPosition(Qt::Horizontal, bar, text, 4), QPointF(3, 12.5 + 9 + 4));
    QCOMPARE(Decoration::maximumPosition(Qt::Horizontal, bar, text, 4), QPointF(203 - 17 - 4, 12.5 + 9 + 4));
    const QRectF upright(10, 3, 2.5, 200);
    QCOMPARE(Decoration::minimumPosition(Qt::Vertical, upright, text, 4), QPointF(12.5 + 4, 203));
    QCOMPARE(Decoration::maximumPosition(Qt::Vertical, upright, text, 4), QPointF(12.5 + 4, 3 + 9));
}

void TestSliderDecoration::aFlagIsHalfAsHighAsTheSlider_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<int>("thickness");
    QTest::addColumn<QSize>("size");
    QTest::newRow("even") << QSize(64, 64) << 40 << QSize(20, 20);
    QTest::newRow("odd: cut off") << QSize(64, 64) << 41 << QSize(20, 20);
    QTest::newRow("proportions") << QSize(64, 32) << 40 << QSize(20, 10);
    QTest::newRow("larger") << QSize(3, 3) << 40 << QSize(20, 20);
    QTest::newRow("thin") << QSize(64, 64) << 1 << QSize(1, 1);
    QTest::newRow("no thickness") << QSize(64, 64) << 0 << QSize(1, 1);
    QTest::newRow("no picture") << QSize(0, 0) << 40 << QSize(0, 0);
    QTest::newRow("out of all bounds") << QSize(64, 64) << INT_MAX << QSize(64, 64);
}

void TestSliderDecoration::aFlagIsHalfAsHighAsTheSlider()
{
    QFETCH(QSize, picture);
    QFETCH(int, thickness);
    QTEST(Decoration::flagSize(picture, thickness), "size");
}

void TestSliderDecoration::aFlagWithoutAColourIsThreePixelsLarge_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("size");
    QTest::newRow("square") << QSize(64, 64) << QSize(3, 3);
    QTest::newRow("the shorter side counts") << QSize(64, 32) << QSize(6, 3);
    QTest::newRow("no picture") << QSize(0, 0) << QSize(0, 0);
}

void TestSliderDecoration::aFlagWithoutAColourIsThreePixelsLarge()
{
    QFETCH(QSize, picture);
    QTEST(Decoration::shrunkFlagSize(picture), "size");
}

ZELKOV_TEST_MAIN(TestSliderDecoration)
#include "tst_sliderdecoration.moc"
