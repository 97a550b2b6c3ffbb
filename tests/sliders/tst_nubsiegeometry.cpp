// SPDX-License-Identifier: MIT
// Tables for the bar, the places of handles and the disc of a hit.
#include "sliders/NubsieGeometry.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>

using namespace vx::NubsieGeometry;

Q_DECLARE_METATYPE(Qt::Orientation)

class TestNubsieGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theBarLiesAQuarterOfItsExtentOffTheMiddle_data();
    void theBarLiesAQuarterOfItsExtentOffTheMiddle();
    void theExtentIsTheBarLessTheStandardSize();
    void aHandleAtRestStandsAtItsDisplayValue_data();
    void aHandleAtRestStandsAtItsDisplayValue();
    void aHandleInMotionStandsByItsDraggedSize_data();
    void aHandleInMotionStandsByItsDraggedSize();
    void pointsBecomeWholePixels();
    void theHitAreaIsTheDiscWithoutItsEdge_data();
    void theHitAreaIsTheDiscWithoutItsEdge();
};

void TestNubsieGeometry::theBarLiesAQuarterOfItsExtentOffTheMiddle_data()
{
    QTest::addColumn<QRect>("area");
    QTest::addColumn<double>("extent");
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<QRectF>("expected");

    QTest::newRow("horizontal") << QRect(0, 0, 220, 40) << 5.0 << Qt::Horizontal << QRectF(0, 17.5, 220, 2.5);
    QTest::newRow("vertical") << QRect(0, 0, 40, 220) << 5.0 << Qt::Vertical << QRectF(17.5, 0, 2.5, 220);
    QTest::newRow("odd height") << QRect(0, 0, 220, 41) << 4.0 << Qt::Horizontal << QRectF(0, 18.5, 220, 2);
    QTest::newRow("one pixel thick") << QRect(0, 0, 220, 40) << 2.0 << Qt::Horizontal << QRectF(0, 19, 220, 1);
    QTest::newRow("never thinner") << QRect(0, 0, 220, 40) << 1.0 << Qt::Horizontal << QRectF(0, 19.5, 220, 1);
    QTest::newRow("no extent") << QRect(0, 0, 40, 220) << 0.0 << Qt::Vertical << QRectF(20, 0, 1, 220);
    QTest::newRow("no width") << QRect(0, 0, 0, 40) << 5.0 << Qt::Horizontal << QRectF(0, 0, 0, 40);
    QTest::newRow("no height") << QRect(0, 0, 220, 0) << 5.0 << Qt::Vertical << QRectF(0, 0, 220, 0);
}

void TestNubsieGeometry::theBarLiesAQuarterOfItsExtentOffTheMiddle()
{
    QFETCH(QRect, area);
    QFETCH(double, extent);
    QFETCH(Qt::Orientation, orientation);
    QTEST(barRect(area, extent, orientation), "expected");
}

void TestNubsieGeometry::theExtentIsTheBarLessTheStandardSize()
{
    const QRectF bar(0, 17.5, 220, 30);
    QCOMPARE(extent(bar, QSize(20, 8), Qt::Horizontal), 200.0);
    QCOMPARE(extent(bar, QSize(20, 8), Qt::Vertical), 22.0);
    QCOMPARE(extent(bar, QSize(250, 8), Qt::Horizontal), -30.0);
}

void TestNubsieGeometry::aHandleAtRestStandsAtItsDisplayValue_data()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<double>("display");
    QTest::addColumn<QPointF>("expected");

    QTest::newRow("left end") << Qt::Horizontal << 0.0 << QPointF(109, 217.5);
    QTest::newRow("middle") << Qt::Horizontal << 0.5 << QPointF(209, 217.5);
    QTest::newRow("right end") << Qt::Horizontal << 1.0 << QPointF(309, 217.5);
    QTest::newRow("bottom") << Qt::Vertical << 0.0 << QPointF(117.5, 411);
    QTest::newRow("a quarter up") << Qt::Vertical << 0.25 << QPointF(117.5, 360);
    QTest::newRow("top") << Qt::Vertical << 1.0 << QPointF(117.5, 207);
}

void TestNubsieGeometry::aHandleAtRestStandsAtItsDisplayValue()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(double, display);
    const QRectF bar = orientation == Qt::Horizontal ? QRectF(0, 17.5, 220, 2.5) : QRectF(17.5, 0, 2.5, 220);
    QTEST(position(bar, QPointF(100, 200), QSize(20, 16), display, orientation), "expected");
}

void TestNubsieGeometry::aHandleInMotionStandsByItsDraggedSize_data()
{
    QTest::addColumn<Qt::Orientation>("orientation");
    QTest::addColumn<bool>("current");
    QTest::addColumn<double>("display");
    QTest::addColumn<QPointF>("expected");

    QTest::newRow("held, left end") << Qt::Horizontal << true << 0.0 << QPointF(115, 217.5);
    QTest::newRow("held, middle") << Qt::Horizontal << true << 0.5 << QPointF(209.5, 217.5);
    QTest::newRow("held, right end") << Qt::Horizontal << true << 1.0 << QPointF(304, 217.5);
    QTest::newRow("another, left end") << Qt::Horizontal << false << 0.0 << QPointF(110, 217.5);
    QTest::newRow("another, right end") << Qt::Horizontal << false << 1.0 << QPointF(310, 217.5);
    // Upright it is the width of the dragged size that counts.
    QTest::newRow("held, bottom") << Qt::Vertical << true << 0.0 << QPointF(117.5, 404);
    QTest::newRow("held, top") << Qt::Vertical << true << 1.0 << QPointF(117.5, 215);
    QTest::newRow("another, bottom") << Qt::Vertical << false << 0.0 << QPointF(125, 412);
    QTest::newRow("another, top") << Qt::Vertical << false << 1.0 << QPointF(125, 208);
}

void TestNubsieGeometry::aHandleInMotionStandsByItsDraggedSize()
{
    QFETCH(Qt::Orientation, orientation);
    QFETCH(bool, current);
    QFETCH(double, display);
    const QRectF bar = orientation == Qt::Horizontal ? QRectF(0, 17.5, 220, 2.5) : QRectF(17.5, 0, 2.5, 220);
    QTEST(positionInMotion(bar, QPointF(100, 200), QSize(20, 16), QSize(31, 40), current, display, orientation),
        "expected");
}

void TestNubsieGeometry::pointsBecomeWholePixels()
{
    QCOMPARE(rounded(QPointF(10.5, -10.4)), QPoint(11, -10));
    QCOMPARE(truncated(QPointF(10.9, -10.9)), QPoint(10, -10));
    QCOMPARE(rounded(QPointF(1e300, -1e300)), QPoint(16777215, -16777215));
    QCOMPARE(truncated(QPointF(qInf(), qQNaN())), QPoint(16777215, 0));
}

void TestNubsieGeometry::theHitAreaIsTheDiscWithoutItsEdge_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<bool>("expected");

    // Of a rectangle 20 wide with its centre at (60, 40).
    QTest::newRow("centre") << QPointF(60, 40) << true;
    QTest::newRow("just inside") << QPointF(69, 40) << true;
    QTest::newRow("on the edge") << QPointF(70, 40) << false;
    QTest::newRow("on the edge above") << QPointF(60, 30) << false;
    QTest::newRow("on the edge aslant") << QPointF(66, 48) << false;
    QTest::newRow("inside aslant") << QPointF(66, 47) << true;
    QTest::newRow("corner of the rectangle") << QPointF(52, 34) << false;
}

void TestNubsieGeometry::theHitAreaIsTheDiscWithoutItsEdge()
{
    QFETCH(QPointF, point);
    // The width counts, not the height.
    QTEST(discContains(QRectF(50, 34, 20, 12), point), "expected");
}

ZELKOV_TEST_MAIN(TestNubsieGeometry)
#include "tst_nubsiegeometry.moc"
