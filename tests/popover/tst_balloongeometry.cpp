// SPDX-License-Identifier: MIT
// Tables and random cases for the way of a balloon from its target to its frame.
#include "popover/BalloonGeometry.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <limits>

using namespace vx::PopoverWidget::BalloonGeometry;

Q_DECLARE_METATYPE(QMargins)

namespace
{
constexpr quint32 c_Seed = 20260103;

// What positionIn() needs of a widget.
struct PlainNode
{
    const PlainNode* up = nullptr;
    QPoint at;

    QPoint pos() const { return at; }
    const PlainNode* parentWidget() const { return up; }
};

}

class TestBalloonGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theSideWithMoreRoomWins_data();
    void theSideWithMoreRoomWins();
    void theOffsetOfTheTargetIsMeasuredTwice();
    void theMeasuredRectangleIsMovedByItsCentre();
    void theAnchorIsInTheMiddleOfTheEdge_data();
    void theAnchorIsInTheMiddleOfTheEdge();
    void aNodeIsPlacedThroughTheNearestCommonAncestor();
    void nodesOfRandomTreesAreWhereTheirSumsAre();
    void contentKeepsItsLimits_data();
    void contentKeepsItsLimits();
    void theSizeHoldsContentMarginsAndStrips_data();
    void theSizeHoldsContentMarginsAndStrips();
    void configuredSidesReplaceThoseOfTheContent_data();
    void configuredSidesReplaceThoseOfTheContent();
    void limitsAreTheParentWithinItsBorders();
    void theFrameLiesBesideTheAnchorWithinTheLimits_data();
    void theFrameLiesBesideTheAnchorWithinTheLimits();
    void framesStayInsideTheLimits();
    void aFrameThatFitsKeepsItsSizeAndTouchesItsAnchor();
    void theBodyIsWhatTheArrowLeaves_data();
    void theBodyIsWhatTheArrowLeaves();
    void contentsMarginsKeepTheContentInTheBody_data();
    void contentsMarginsKeepTheContentInTheBody();
    void theArrowIsDrawnOutsideTheBodyOnly_data();
    void theArrowIsDrawnOutsideTheBodyOnly();
    void noArrowIsDrawnForAnAnchorInTheBody();
    void extremeNumbersHold();
};

void TestBalloonGeometry::theSideWithMoreRoomWins_data()
{
    QTest::addColumn<QRect>("target");
    QTest::addColumn<int>("allowed");
    QTest::addColumn<int>("side");

    // In a parent of 400 x 300: a target from 100 to 199 down has 100 above and below.
    const QRect middle(150, 100, 100, 100);
    QTest::newRow("tie, all") << middle << 15 << 1;
    QTest::newRow("tie, vertical") << middle << 3 << 1;
    QTest::newRow("tie, horizontal") << middle << 12 << 8;
    QTest::newRow("one pixel more above, all") << middle.translated(0, 1) << 15 << 2;
    QTest::newRow("one pixel more below, all") << middle.translated(0, -1) << 15 << 1;
    QTest::newRow("one pixel more on the right") << middle.translated(-1, 0) << 12 << 4;
    QTest::newRow("one pixel more on the left") << middle.translated(1, 0) << 12 << 8;
    QTest::newRow("the vertical pair wins") << QRect(0, 100, 10, 100) << 15 << 1;
    QTest::newRow("the vertical pair wins with one more") << QRect(0, 101, 10, 100) << 11 << 2;
    QTest::newRow("the horizontal pair if the vertical one is not whole, left") << QRect(0, 0, 9, 9) << 13 << 4;
    QTest::newRow("the same on the right") << QRect(390, 0, 9, 9) << 14 << 8;
    QTest::newRow("top alone, without room") << QRect(0, 290, 10, 10) << 1 << 1;
    QTest::newRow("bottom alone, without room") << QRect(0, 0, 10, 10) << 2 << 2;
    QTest::newRow("left alone") << QRect(390, 0, 10, 10) << 4 << 4;
    QTest::newRow("right alone") << QRect(0, 0, 10, 10) << 8 << 8;
    QTest::newRow("bottom before left") << QRect(0, 0, 10, 10) << 6 << 2;
    QTest::newRow("bottom before right") << QRect(0, 0, 10, 10) << 10 << 2;
    QTest::newRow("top before left") << QRect(0, 290, 10, 10) << 5 << 1;
    QTest::newRow("top before right") << QRect(0, 290, 10, 10) << 9 << 1;
    QTest::newRow("none") << middle << 0 << 0;
    QTest::newRow("no known bit") << middle << 16 << 15;
    QTest::newRow("no known bit beside one") << middle << 20 << 4;
    QTest::newRow("above the parent") << QRect(0, -50, 10, 10) << 15 << 1;
    QTest::newRow("below the parent") << QRect(0, 500, 10, 10) << 15 << 2;
}

void TestBalloonGeometry::theSideWithMoreRoomWins()
{
    QFETCH(QRect, target);
    QFETCH(int, allowed);
    QTEST(preferredSide(QRect(0, 0, 400, 300), target, QPointF(0, 0), allowed), "side");
}

void TestBalloonGeometry::theOffsetOfTheTargetIsMeasuredTwice()
{
    // At 60 of 300 there is more room below, but 60 counts twice.
    QCOMPARE(preferredSide(QRect(0, 0, 400, 300), QRect(0, 60, 100, 100), QPointF(0, 0), 3), 1);
    QCOMPARE(preferredSide(QRect(0, 0, 400, 300), QRect(0, 60, 100, 100), QPointF(0, 60), 3), 2);
    // A rounded offset: 100 above and below is a tie, 101 and 99 is not.
    QCOMPARE(preferredSide(QRect(0, 0, 400, 300), QRect(0, 60, 100, 100), QPointF(0, 40.49), 3), 1);
    QCOMPARE(preferredSide(QRect(0, 0, 400, 300), QRect(0, 60, 100, 100), QPointF(0, 40.5), 3), 2);
}

void TestBalloonGeometry::theMeasuredRectangleIsMovedByItsCentre()
{
    QRandomGenerator random(c_Seed);
    for (int i = 0; i < 20000; ++i) {
        const auto number = [&random](int from, int to) { return random.bounded(from, to); };
        const QRect parent(number(-50, 50), number(-50, 50), number(1, 500), number(1, 500));
        const QRect target(number(-300, 300), number(-300, 300), number(0, 200), number(0, 200));
        const QPoint position(number(-300, 300), number(-300, 300));
        QRect moved = target;
        moved.moveCenter(target.center() + position);
        const int above = moved.top() - parent.top();
        const int below = parent.bottom() - moved.bottom();
        const int right = parent.right() - moved.right();
        const int left = moved.left() - parent.left();
        QCOMPARE(preferredSide(parent, target, position, 15), above > below ? 2 : 1);
        QCOMPARE(preferredSide(parent, target, position, 12), right > left ? 4 : 8);
    }
}

void TestBalloonGeometry::theAnchorIsInTheMiddleOfTheEdge_data()
{
    QTest::addColumn<QRect>("target");
    QTest::addColumn<QPointF>("relative");
    QTest::addColumn<int>("side");
    QTest::addColumn<QPointF>("anchor");

    // At (1000, 2000). Of 41 x 21 the last pixel is (40, 20), the middle one (20, 10); of 40 x 20 it is (19, 9).
    const QRect odd(7, 8, 41, 21);
    const QRect even(7, 8, 40, 20);
    const QPointF none(0, 0);
    QTest::newRow("top") << odd << none << 1 << QPointF(1020, 2020);
    QTest::newRow("bottom") << odd << none << 2 << QPointF(1020, 2000);
    QTest::newRow("left") << odd << none << 4 << QPointF(1040, 2010);
    QTest::newRow("right") << odd << none << 8 << QPointF(1000, 2010);
    QTest::newRow("even, top") << even << none << 1 << QPointF(1019, 2019);
    QTest::newRow("even, bottom") << even << none << 2 << QPointF(1019, 2000);
    QTest::newRow("even, left") << even << none << 4 << QPointF(1039, 2009);
    QTest::newRow("even, right") << even << none << 8 << QPointF(1000, 2009);
    QTest::newRow("no side") << odd << none << 0 << QPointF(1000, 2000);
    QTest::newRow("any side") << odd << QPointF(5, 5) << 15 << QPointF(1000, 2000);
    QTest::newRow("(-1, 0) is no point") << odd << QPointF(-1, 0) << 1 << QPointF(1020, 2020);
    QTest::newRow("(10, 0) is x alone") << odd << QPointF(10, 0) << 1 << QPointF(1010, 2020);
    QTest::newRow("(0, 10) is y alone") << odd << QPointF(0, 10) << 1 << QPointF(1020, 2010);
    QTest::newRow("both") << odd << QPointF(3.5, 4.25) << 8 << QPointF(1003.5, 2004.25);
    QTest::newRow("beyond the target") << odd << QPointF(100, 200) << 4 << QPointF(1100, 2200);
    QTest::newRow("just above 0") << odd << QPointF(0.25, -3) << 2 << QPointF(1000.25, 2000);
    QTest::newRow("one pixel") << QRect(0, 0, 1, 1) << none << 1 << QPointF(1000, 2000);
    QTest::newRow("empty target") << QRect(0, 0, 0, 10) << QPointF(5, 5) << 1 << QPointF(1000, 2000);
    QTest::newRow("invalid target") << QRect() << QPointF(5, 5) << 1 << QPointF(1000, 2000);
}

void TestBalloonGeometry::theAnchorIsInTheMiddleOfTheEdge()
{
    QFETCH(QRect, target);
    QFETCH(QPointF, relative);
    QFETCH(int, side);
    QTEST(anchorPoint(target, relative, side, QPointF(1000, 2000)), "anchor");
}

void TestBalloonGeometry::aNodeIsPlacedThroughTheNearestCommonAncestor()
{
    const PlainNode window {nullptr, {500, 600}};
    const PlainNode overlay {&window, {10, 20}};
    const PlainNode button {&window, {100, 50}};
    const PlainNode panel {&window, {30, 40}};
    const PlainNode nested {&panel, {5, 6}};
    const PlainNode inOverlay {&overlay, {7, 8}};
    const PlainNode elsewhere {nullptr, {900, 900}};
    const PlainNode stranger {&elsewhere, {1, 2}};

    QCOMPARE(positionIn(&button, &overlay), QPoint(90, 30));
    QCOMPARE(positionIn(&nested, &overlay), QPoint(25, 26));
    QCOMPARE(positionIn(&inOverlay, &overlay), QPoint(7, 8));
    QCOMPARE(positionIn(&nested, &window), QPoint(35, 46));
    QCOMPARE(positionIn(&stranger, &overlay), QPoint(391, 282));
    // The ancestors of the parent alone: the window itself is not among the target's parents.
    QCOMPARE(positionIn(&window, &overlay), QPoint(500, 600));
    QCOMPARE(positionIn(&nested, static_cast<const PlainNode*>(nullptr)), QPoint(535, 646));
}

void TestBalloonGeometry::nodesOfRandomTreesAreWhereTheirSumsAre()
{
    QRandomGenerator random(c_Seed);
    for (int i = 0; i < 2000; ++i) {
        QVector<PlainNode> nodes(12);
        for (int n = 0; n < nodes.size(); ++n) {
            nodes[n].at = QPoint(random.bounded(-100, 100), random.bounded(-100, 100));
            nodes[n].up = n == 0 ? nullptr : &nodes[random.bounded(n)];
        }
        const auto absolute = [](const PlainNode* node) {
            QPoint sum;
            for (; node != nullptr; node = node->up) {
                sum += node->at;
            }
            return sum;
        };
        const PlainNode* const target = &nodes[1 + random.bounded(11)];
        const PlainNode* const parent = &nodes[random.bounded(12)];
        QCOMPARE(positionIn(target, parent), absolute(target) - absolute(parent));
    }
}

void TestBalloonGeometry::contentKeepsItsLimits_data()
{
    QTest::addColumn<QSize>("hint");
    QTest::addColumn<QSize>("minimum");
    QTest::addColumn<QSize>("maximum");
    QTest::addColumn<QSize>("size");

    QTest::newRow("within") << QSize(50, 60) << QSize(10, 10) << QSize(90, 90) << QSize(50, 60);
    QTest::newRow("too narrow") << QSize(5, 60) << QSize(10, 10) << QSize(90, 90) << QSize(10, 60);
    QTest::newRow("too high") << QSize(50, 95) << QSize(10, 10) << QSize(90, 90) << QSize(50, 90);
    QTest::newRow("the lower limit wins") << QSize(50, 60) << QSize(80, 85) << QSize(70, 75) << QSize(80, 85);
}

void TestBalloonGeometry::contentKeepsItsLimits()
{
    QFETCH(QSize, hint);
    QFETCH(QSize, minimum);
    QFETCH(QSize, maximum);
    QTEST(contentSize(hint, minimum, maximum), "size");
}

void TestBalloonGeometry::theSizeHoldsContentMarginsAndStrips_data()
{
    QTest::addColumn<int>("side");
    QTest::addColumn<int>("spacing");
    QTest::addColumn<QSize>("title");
    QTest::addColumn<QSize>("header");
    QTest::addColumn<QSize>("footer");
    QTest::addColumn<QSize>("size");

    // Content 100 x 200, inner margin 4, arrow 15. An invalid strip is hidden.
    const QSize none;
    QTest::newRow("top") << 1 << 3 << none << none << none << QSize(108, 223);
    QTest::newRow("bottom") << 2 << 3 << none << none << none << QSize(108, 223);
    QTest::newRow("left") << 4 << 3 << none << none << none << QSize(123, 208);
    QTest::newRow("right") << 8 << 3 << none << none << none << QSize(123, 208);
    QTest::newRow("no side: not even a margin") << 0 << 3 << none << none << none << QSize(100, 200);
    QTest::newRow("any side: not even a margin") << 15 << 3 << none << none << none << QSize(100, 200);
    QTest::newRow("title") << 1 << 3 << QSize(100, 24) << none << none << QSize(108, 250);
    QTest::newRow("title without spacing") << 1 << 0 << QSize(99, 24) << none << none << QSize(108, 247);
    QTest::newRow("one pixel wider") << 1 << 3 << QSize(101, 24) << none << none << QSize(109, 250);
    QTest::newRow("header") << 4 << 3 << none << QSize(120, 10) << none << QSize(143, 221);
    QTest::newRow("each adds its own excess")
        << 0 << 1 << QSize(110, 10) << QSize(120, 10) << QSize(130, 10) << QSize(160, 233);
}

void TestBalloonGeometry::theSizeHoldsContentMarginsAndStrips()
{
    QFETCH(int, side);
    QFETCH(int, spacing);
    QFETCH(QSize, title);
    QFETCH(QSize, header);
    QFETCH(QSize, footer);
    const auto strip = [](const QSize& hint) {
        return Strip {hint.isValid(), hint.isValid() ? hint : QSize(999, 999)};
    };
    QTEST(sizeFromContent(QSize(100, 200), side, 4, 15, spacing, {strip(title), strip(header), strip(footer)}),
        "size");
}

void TestBalloonGeometry::configuredSidesReplaceThoseOfTheContent_data()
{
    QTest::addColumn<QSizeF>("fixed");
    QTest::addColumn<int>("constraints");
    QTest::addColumn<QSizeF>("size");

    const QSizeF content(100, 200);
    QTest::newRow("none") << QSizeF(10, 20) << 0 << content;
    QTest::newRow("width") << QSizeF(10, 20) << 1 << QSizeF(10, 200);
    QTest::newRow("height") << QSizeF(10, 20) << 2 << QSizeF(100, 20);
    QTest::newRow("both") << QSizeF(10, 20) << 3 << QSizeF(10, 20);
    QTest::newRow("invalid") << QSizeF() << 3 << content;
    QTest::newRow("half invalid") << QSizeF(-1, 20) << 2 << content;
    QTest::newRow("null") << QSizeF(0, 0) << 3 << content;
    QTest::newRow("no width but a height") << QSizeF(0, 20) << 3 << QSizeF(0, 20);
}

void TestBalloonGeometry::configuredSidesReplaceThoseOfTheContent()
{
    QFETCH(QSizeF, fixed);
    QFETCH(int, constraints);
    QTEST(constrainedSize(QSizeF(100, 200), fixed, constraints), "size");
}

void TestBalloonGeometry::limitsAreTheParentWithinItsBorders()
{
    QCOMPARE(limits(QRectF(0, 0, 400, 300), QMargins(1, 2, 3, 4)), QRectF(1, 2, 396, 294));
    QCOMPARE(limits(QRectF(0, 0, 400, 300), QMargins(-10, 0, 0, 0)), QRectF(-10, 0, 410, 300));
}

void TestBalloonGeometry::theFrameLiesBesideTheAnchorWithinTheLimits_data()
{
    QTest::addColumn<QSizeF>("size");
    QTest::addColumn<QPointF>("anchor");
    QTest::addColumn<int>("side");
    QTest::addColumn<QRectF>("frame");

    // Limits are 4 to 396 and 4 to 296, the inner margin is 6.
    const QSizeF size(100, 80);
    const QPointF middle(200, 150);
    QTest::newRow("top") << size << middle << 1 << QRectF(150, 150, 100, 80);
    QTest::newRow("bottom") << size << middle << 2 << QRectF(150, 70, 100, 80);
    QTest::newRow("left") << size << middle << 4 << QRectF(200, 110, 100, 80);
    QTest::newRow("right") << size << middle << 8 << QRectF(100, 110, 100, 80);
    QTest::newRow("no side grows by the margin") << size << middle << 0 << QRectF(144, 104, 112, 92);
    QTest::newRow("any side is centred") << size << middle << 15 << QRectF(150, 110, 100, 80);
    QTest::newRow("halves are kept") << QSizeF(101, 81) << QPointF(200.25, 150.5) << 1
                                     << QRectF(149.75, 150.5, 101, 81);

    QTest::newRow("at the left limit") << size << QPointF(54, 150) << 1 << QRectF(4, 150, 100, 80);
    QTest::newRow("past the left limit") << size << QPointF(53, 150) << 1 << QRectF(4, 150, 100, 80);
    QTest::newRow("far past it") << size << QPointF(-500, 150) << 1 << QRectF(4, 150, 100, 80);
    QTest::newRow("at the right limit") << size << QPointF(346, 150) << 1 << QRectF(296, 150, 100, 80);
    QTest::newRow("past the right limit") << size << QPointF(347, 150) << 1 << QRectF(296, 150, 100, 80);
    QTest::newRow("past the upper limit") << size << QPointF(200, 83) << 2 << QRectF(150, 4, 100, 80);
    QTest::newRow("at the lower limit") << size << QPointF(200, 216) << 1 << QRectF(150, 216, 100, 80);
    QTest::newRow("past the lower limit") << size << QPointF(200, 217) << 1 << QRectF(150, 216, 100, 80);
    QTest::newRow("past two") << size << QPointF(390, 290) << 4 << QRectF(296, 216, 100, 80);

    // Too large: right and bottom edges are put on the limits last, and what stands out is cut.
    QTest::newRow("too wide") << QSizeF(500, 80) << middle << 1 << QRectF(4, 150, 392, 80);
    QTest::newRow("too high") << QSizeF(100, 400) << middle << 1 << QRectF(150, 4, 100, 292);
    QTest::newRow("too large") << QSizeF(900, 900) << middle << 8 << QRectF(4, 4, 392, 292);
    QTest::newRow("as large as the limits") << QSizeF(392, 292) << middle << 15 << QRectF(4, 4, 392, 292);
}

void TestBalloonGeometry::theFrameLiesBesideTheAnchorWithinTheLimits()
{
    QFETCH(QSizeF, size);
    QFETCH(QPointF, anchor);
    QFETCH(int, side);
    QTEST(frame(QRectF(4, 4, 392, 292), size, anchor, side, 6), "frame");
}

void TestBalloonGeometry::framesStayInsideTheLimits()
{
    QRandomGenerator random(c_Seed);
    for (int i = 0; i < 50000; ++i) {
        const QRectF area = limits(QRectF(0, 0, 20 + random.bounded(800), 20 + random.bounded(800)),
            QMargins(random.bounded(10), random.bounded(10), random.bounded(10), random.bounded(10)));
        const QSizeF size(1 + random.bounded(1000), 1 + random.bounded(1000));
        const QPointF anchor(random.bounded(3000) - 1000, random.bounded(3000) - 1000);
        const int side = QVector<int> {0, 1, 2, 4, 8, 15}.at(random.bounded(6));
        const QRectF rect = frame(area, size, anchor, side, random.bounded(8));
        if (!area.contains(rect)) {
            qInfo() << "seed" << c_Seed << "case" << i << area << size << anchor << side << rect;
        }
        QVERIFY(area.contains(rect));
    }
}

void TestBalloonGeometry::aFrameThatFitsKeepsItsSizeAndTouchesItsAnchor()
{
    QRandomGenerator random(c_Seed);
    const QRectF area(4, 4, 792, 592);
    for (int i = 0; i < 20000; ++i) {
        const QSizeF size(20 + random.bounded(200), 20 + random.bounded(200));
        const QPointF anchor(250 + random.bounded(300), 250 + random.bounded(100));
        const int side = 1 << random.bounded(4);
        const QRectF rect = frame(area, size, anchor, side, 4);
        QCOMPARE(rect.size(), size);
        switch (side) {
        case sTop:
            QCOMPARE(QPointF(rect.center().x(), rect.top()), anchor);
            break;
        case sBottom:
            QCOMPARE(QPointF(rect.center().x(), rect.bottom()), anchor);
            break;
        case sLeft:
            QCOMPARE(QPointF(rect.left(), rect.center().y()), anchor);
            break;
        default:
            QCOMPARE(QPointF(rect.right(), rect.center().y()), anchor);
            break;
        }
        // The tip then lies outside the body, on the strip of its side.
        const QRectF inner = innerRect(QRectF(QPointF(0, 0), rect.size()), side, 15);
        QVERIFY(arrowDrawn(side, inner, anchor - rect.topLeft()));
    }
}

void TestBalloonGeometry::theBodyIsWhatTheArrowLeaves_data()
{
    QTest::addColumn<int>("side");
    QTest::addColumn<QRectF>("inner");

    QTest::newRow("top") << 1 << QRectF(0, 15, 100, 65);
    QTest::newRow("bottom") << 2 << QRectF(0, 0, 100, 65);
    QTest::newRow("left") << 4 << QRectF(15, 0, 85, 80);
    QTest::newRow("right") << 8 << QRectF(0, 0, 85, 80);
    QTest::newRow("none") << 0 << QRectF(0, 0, 100, 80);
    QTest::newRow("any") << 15 << QRectF(0, 0, 100, 80);
}

void TestBalloonGeometry::theBodyIsWhatTheArrowLeaves()
{
    QFETCH(int, side);
    QTEST(innerRect(QRectF(0, 0, 100, 80), side, 15), "inner");
}

void TestBalloonGeometry::contentsMarginsKeepTheContentInTheBody_data()
{
    QTest::addColumn<int>("side");
    QTest::addColumn<QMargins>("margins");

    QTest::newRow("top") << 1 << QMargins(4, 19, 4, 4);
    QTest::newRow("bottom") << 2 << QMargins(4, 4, 4, 19);
    QTest::newRow("left") << 4 << QMargins(19, 4, 4, 4);
    QTest::newRow("right") << 8 << QMargins(4, 4, 19, 4);
    QTest::newRow("none") << 0 << QMargins(4, 4, 4, 4);
    QTest::newRow("any") << 15 << QMargins(4, 4, 4, 4);
}

void TestBalloonGeometry::contentsMarginsKeepTheContentInTheBody()
{
    QFETCH(int, side);
    const QRect rect(0, 0, 100, 80);
    QTEST(contentsMargins(innerRect(rect, side, 15), rect, 4), "margins");
    // They do not depend on the size, so it does not matter that they are set before it.
    const QRect small(0, 0, 3, 2);
    QTEST(contentsMargins(innerRect(small, side, 15), small, 4), "margins");
}

void TestBalloonGeometry::theArrowIsDrawnOutsideTheBodyOnly_data()
{
    QTest::addColumn<int>("allowed");
    QTest::addColumn<QPointF>("anchor");
    QTest::addColumn<bool>("drawn");

    // The body is 0 to 100 and 15 to 80; its edges belong to it.
    QTest::newRow("on the strip") << 1 << QPointF(50, 0) << true;
    QTest::newRow("just above the body") << 1 << QPointF(50, 14) << true;
    QTest::newRow("on the edge") << 1 << QPointF(50, 15) << false;
    QTest::newRow("rounded onto the edge") << 1 << QPointF(50, 14.5) << false;
    QTest::newRow("rounded off the edge") << 1 << QPointF(50, 14.4) << true;
    QTest::newRow("inside") << 1 << QPointF(50, 40) << false;
    QTest::newRow("on the lower edge") << 1 << QPointF(50, 80) << false;
    QTest::newRow("below") << 1 << QPointF(50, 81) << true;
    QTest::newRow("on the right edge") << 1 << QPointF(100, 40) << false;
    QTest::newRow("right of it") << 1 << QPointF(101, 40) << true;
    QTest::newRow("no side allowed") << 0 << QPointF(50, 0) << false;
    QTest::newRow("an unknown side allowed") << 16 << QPointF(50, 0) << true;
}

void TestBalloonGeometry::theArrowIsDrawnOutsideTheBodyOnly()
{
    QFETCH(int, allowed);
    QFETCH(QPointF, anchor);
    QTEST(arrowDrawn(allowed, QRectF(0, 15, 100, 65), anchor), "drawn");
}

void TestBalloonGeometry::noArrowIsDrawnForAnAnchorInTheBody()
{
    // Random targets in random parents, from the side to the outline.
    QRandomGenerator random(c_Seed);
    int drawn = 0;
    for (int i = 0; i < 50000; ++i) {
        const QRect parent(0, 0, 60 + random.bounded(500), 60 + random.bounded(500));
        const QRect target(QPoint(random.bounded(parent.width()), random.bounded(parent.height())),
            QSize(1 + random.bounded(80), 1 + random.bounded(80)));
        const int allowed = random.bounded(16);
        const int side = preferredSide(parent, QRect(QPoint(0, 0), target.size()), target.topLeft(), allowed);
        const QPointF anchor = anchorPoint(target, QPointF(), side, target.topLeft());
        const QRect rect = toRect(frame(limits(parent, QMargins(4, 4, 4, 4)),
            QSizeF(40 + random.bounded(300), 40 + random.bounded(300)), anchor, side, 4));
        const QRectF inner = innerRect(QRectF(0, 0, rect.width(), rect.height()), side, 15);
        const QPointF tip = anchor - rect.topLeft();
        const bool arrow = arrowDrawn(allowed, inner, tip);
        QVERIFY(allowed != 0 || !arrow);
        QVERIFY(!(arrow && inner.contains(tip.toPoint())));
        drawn += arrow ? 1 : 0;
    }
    QVERIFY(drawn > 10000);
}

void TestBalloonGeometry::extremeNumbersHold()
{
    constexpr int low = std::numeric_limits<int>::min();
    constexpr int high = std::numeric_limits<int>::max();
    const QRect all(QPoint(low, low), QPoint(high, high));
    QCOMPARE(preferredSide(QRect(0, 0, 10, 10), all, QPointF(1e300, -1e300), 3), 1);
    QCOMPARE(preferredSide(QRect(0, 0, 10, 10), QRect(0, 0, 1, 1), QPointF(0, 1e300), 3), 2);
    anchorPoint(all, QPointF(), 1, QPointF());
    for (const int extreme : {low, -1, 0, high}) {
        for (const int side : {0, 1, 2, 4, 8, 15}) {
            const QSize size = sizeFromContent(
                QSize(high, high), side, extreme, extreme, extreme, {Strip {true, QSize(high, low)}});
            QVERIFY(size.width() < (1 << 24) && size.height() < (1 << 24));
            const QRectF inner = innerRect(QRectF(0, 0, 100, 100), side, extreme);
            contentsMargins(inner, QRect(0, 0, 100, 100), extreme);
            frame(limits(QRectF(0, 0, 100, 100), QMargins(extreme, extreme, extreme, extreme)), QSizeF(10, 10),
                QPointF(5, 5), side, extreme);
        }
    }
    QCOMPARE(toPoint(QPointF(std::numeric_limits<qreal>::quiet_NaN(), 2.5)).y(), 3);
}

ZELKOV_TEST_MAIN(TestBalloonGeometry)
#include "tst_balloongeometry.moc"
