// SPDX-License-Identifier: MIT
// Tables and random cases for the outline of a balloon and its colours.
#include "popover/BalloonGeometry.h"
#include "popover/BalloonLook.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtGui/QPalette>
#include <QtTest/QtTest>

#include <cmath>

using namespace vx::PopoverWidget::BalloonGeometry;
using vx::PopoverWidget::BalloonLook;

namespace
{
constexpr quint32 c_Seed = 20260103;
constexpr int c_Shade = 80; // sixteenths of a square pixel, all corners together

// Four times as large, so that pieces of curves do not matter.
QImage filled(const QPainterPath& path, const QSize& size)
{
    QImage image(size * 4, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.scale(4, 4);
    painter.fillPath(path, Qt::black);
    return image;
}

// In sixteenths of a square pixel.
int areaOfDifference(const QPainterPath& a, const QPainterPath& b, const QSize& size)
{
    const QImage first = filled(a, size);
    const QImage second = filled(b, size);
    int area = 0;
    for (int y = 0; y < first.height(); ++y) {
        const QRgb* const p = reinterpret_cast<const QRgb*>(first.constScanLine(y));
        const QRgb* const q = reinterpret_cast<const QRgb*>(second.constScanLine(y));
        for (int x = 0; x < first.width(); ++x) {
            area += p[x] != q[x] ? 1 : 0;
        }
    }
    return area;
}

// Body and arrow put together by Qt, the slow way.
QPainterPath unionOutline(const QRectF& inner, int radius, const QPolygonF& arrow)
{
    QPainterPath path;
    if (radius == 0) {
        path.addRect(inner);
    } else {
        path.addRoundedRect(inner, radius, radius, Qt::AbsoluteSize);
    }
    path.addPolygon(arrow);
    // The union has its curves in straight pieces, small ones if all is large.
    constexpr qreal scale = 64;
    return QTransform::fromScale(1 / scale, 1 / scale)
        .map(QTransform::fromScale(scale, scale).map(path).simplified());
}

qreal contrast(const QColor& a, const QColor& b)
{
    const auto luminance = [](const QColor& color) {
        const auto linear = [](qreal c) { return c <= 0.03928 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4); };
        return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
    };
    const qreal first = luminance(a);
    const qreal second = luminance(b);
    return (qMax(first, second) + 0.05) / (qMin(first, second) + 0.05);
}
}

class TestBalloonOutline : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theArrowStandsOnItsEdge_data();
    void theArrowStandsOnItsEdge();
    void outlinesAreTheUnionOfBodyAndArrow();
    void oddOutlinesAreUnionsToo_data();
    void oddOutlinesAreUnionsToo();
    void theLookReadsWellOnEveryPalette_data();
    void theLookReadsWellOnEveryPalette();
    void givenColoursAreKept();
};

void TestBalloonOutline::theArrowStandsOnItsEdge_data()
{
    QTest::addColumn<int>("side");
    QTest::addColumn<QPointF>("anchor");
    QTest::addColumn<QPolygonF>("arrow");

    // The body is (100, 100) to (300, 250), the arrow's half width 15.
    const auto arrow = [](const QPointF& tip, const QPointF& from, const QPointF& to) {
        return QPolygonF({tip, from, to, tip});
    };
    const auto top = [&arrow](qreal x, qreal from, qreal to) {
        return arrow(QPointF(x, 85), QPointF(from, 100), QPointF(to, 100));
    };
    QTest::newRow("top") << 1 << QPointF(200, 85) << top(200, 185, 215);
    QTest::newRow("top, last with two slopes on the left") << 1 << QPointF(131, 85) << top(131, 116, 146);
    QTest::newRow("top, near the left corner") << 1 << QPointF(130, 85) << top(130, 130, 145);
    QTest::newRow("top, nearer") << 1 << QPointF(110, 85) << top(110, 110, 125);
    QTest::newRow("top, last with two slopes on the right") << 1 << QPointF(269, 85) << top(269, 254, 284);
    QTest::newRow("top, near the right corner") << 1 << QPointF(270, 85) << top(270, 255, 270);
    QTest::newRow("top, nearer on the right") << 1 << QPointF(290, 85) << top(290, 275, 290);
    QTest::newRow("bottom") << 2 << QPointF(200, 265)
                            << arrow(QPointF(200, 265), QPointF(185, 250), QPointF(215, 250));
    QTest::newRow("bottom, near the left corner")
        << 2 << QPointF(120, 265) << arrow(QPointF(120, 265), QPointF(120, 250), QPointF(135, 250));
    QTest::newRow("bottom, near the right corner")
        << 2 << QPointF(280, 265) << arrow(QPointF(280, 265), QPointF(265, 250), QPointF(280, 250));
    QTest::newRow("left") << 4 << QPointF(85, 170)
                          << arrow(QPointF(85, 170), QPointF(100, 155), QPointF(100, 185));
    QTest::newRow("left, no care for the corner")
        << 4 << QPointF(85, 118) << arrow(QPointF(85, 118), QPointF(100, 103), QPointF(100, 133));
    QTest::newRow("right") << 8 << QPointF(315, 170)
                           << arrow(QPointF(315, 170), QPointF(300, 155), QPointF(300, 185));
    QTest::newRow("right, no care for the corner")
        << 8 << QPointF(315, 240) << arrow(QPointF(315, 240), QPointF(300, 225), QPointF(300, 255));
}

void TestBalloonOutline::theArrowStandsOnItsEdge()
{
    QFETCH(int, side);
    QFETCH(QPointF, anchor);
    QFETCH(QPolygonF, arrow);
    const QRectF inner(100, 100, 200, 150);
    for (const int radius : {0, 6, 20}) {
        const QPainterPath path = outline(inner, radius, true, 15, side, anchor);
        const QPainterPath expected = unionOutline(inner, radius, arrow);
        const int difference = areaOfDifference(path, expected, QSize(400, 350));
        QVERIFY2(difference <= c_Shade, qPrintable(QStringLiteral("radius %1: %2").arg(radius).arg(difference)));
    }
    // Without an arrow it is the body alone.
    QPainterPath body;
    body.addRoundedRect(inner, 6, 6, Qt::AbsoluteSize);
    QCOMPARE(outline(inner, 6, false, 15, side, anchor), body);
}

void TestBalloonOutline::outlinesAreTheUnionOfBodyAndArrow()
{
    QRandomGenerator random(c_Seed);
    for (int i = 0; i < 200; ++i) {
        const QRectF inner(40, 40, 20 + random.bounded(120), 20 + random.bounded(120));
        const int side = 1 << random.bounded(4);
        const int radius = random.bounded(25);
        const int width = 1 + random.bounded(20);
        const qreal along = random.bounded(1000) / 1000.0;
        const qreal away = 5 + random.bounded(20);
        QPointF tip(inner.left() + along * inner.width(), inner.top() + along * inner.height());
        QPointF from;
        QPointF to;
        if (side == sTop || side == sBottom) {
            const qreal y = side == sTop ? inner.top() : inner.bottom();
            tip.setY(side == sTop ? y - away : y + away);
            const bool inMiddle = tip.x() > inner.left() + 2 * width && tip.x() < inner.right() - 2 * width;
            const bool leftHalf = tip.x() < inner.center().x();
            from = QPointF(!inMiddle && leftHalf ? tip.x() : tip.x() - width, y);
            to = QPointF(!inMiddle && !leftHalf ? tip.x() : tip.x() + width, y);
        } else {
            const qreal x = side == sLeft ? inner.left() : inner.right();
            tip.setX(side == sLeft ? x - away : x + away);
            from = QPointF(x, tip.y() - width);
            to = QPointF(x, tip.y() + width);
        }
        const QPainterPath path = outline(inner, radius, true, width, side, tip);
        const QPainterPath expected = unionOutline(inner, radius, QPolygonF({tip, from, to, tip}));
        const int difference = areaOfDifference(path, expected, QSize(220, 220));
        if (difference > c_Shade) {
            qInfo() << "seed" << c_Seed << "case" << i << inner << side << radius << width << tip << difference;
        }
        QVERIFY(difference <= c_Shade);
    }
}

void TestBalloonOutline::oddOutlinesAreUnionsToo_data()
{
    QTest::addColumn<QRectF>("inner");
    QTest::addColumn<int>("radius");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("side");
    QTest::addColumn<QPointF>("anchor");
    QTest::addColumn<QRectF>("bounds");

    const QRectF inner(50, 50, 100, 60);
    QTest::newRow("anchor beyond the corner")
        << inner << 6 << 10 << 1 << QPointF(40, 35) << QRectF(40, 35, 110, 75);
    QTest::newRow("base across the corner")
        << inner << 20 << 10 << 4 << QPointF(35, 52) << QRectF(35, 42, 115, 68);
    QTest::newRow("negative width") << inner << 6 << -10 << 1 << QPointF(100, 35) << QRectF(50, 35, 100, 75);
    QTest::newRow("no width") << inner << 6 << 0 << 1 << QPointF(100, 35) << inner;
    QTest::newRow("anchor on the other side")
        << inner << 6 << 10 << 1 << QPointF(100, 130) << QRectF(50, 50, 100, 80);
    QTest::newRow("negative radius") << inner << -6 << 10 << 2 << QPointF(100, 125) << QRectF(50, 50, 100, 75);
    QTest::newRow("radius beyond the body")
        << inner << 500 << 4 << 2 << QPointF(100, 125) << QRectF(50, 50, 100, 75);
    QTest::newRow("any side has no base") << inner << 6 << 10 << 15 << QPointF(100, 35) << inner;
}

void TestBalloonOutline::oddOutlinesAreUnionsToo()
{
    QFETCH(QRectF, inner);
    QFETCH(int, radius);
    QFETCH(int, width);
    QFETCH(int, side);
    QFETCH(QPointF, anchor);
    QFETCH(QRectF, bounds);
    const QRectF actual = outline(inner, radius, true, width, side, anchor).boundingRect();
    QVERIFY2(qAbs(actual.left() - bounds.left()) < 0.1 && qAbs(actual.top() - bounds.top()) < 0.1
            && qAbs(actual.right() - bounds.right()) < 0.1 && qAbs(actual.bottom() - bounds.bottom()) < 0.1,
        qPrintable(QStringLiteral("%1 %2 %3 %4")
                       .arg(actual.left())
                       .arg(actual.top())
                       .arg(actual.right())
                       .arg(actual.bottom())));
}

void TestBalloonOutline::theLookReadsWellOnEveryPalette_data()
{
    QTest::addColumn<QColor>("window");
    QTest::addColumn<QColor>("button");
    QTest::addColumn<QColor>("text");
    QTest::addColumn<QColor>("body");

    const QColor grey(239, 239, 239);
    const QColor raised(35, 43, 55);
    QTest::newRow("light") << grey << grey << QColor(0, 0, 0) << grey;
    QTest::newRow("white") << QColor(255, 255, 255) << grey << QColor(30, 30, 30) << grey;
    QTest::newRow("dark") << QColor(18, 22, 29) << raised << QColor(231, 235, 242) << raised;
    QTest::newRow("black") << QColor(0, 0, 0) << raised << QColor(255, 255, 255) << raised;
    QTest::newRow("dark with light buttons")
        << QColor(18, 22, 29) << grey << QColor(231, 235, 242) << QColor(18, 22, 29);
    QTest::newRow("light with dark buttons") << grey << raised << QColor(0, 0, 0) << grey;
}

void TestBalloonOutline::theLookReadsWellOnEveryPalette()
{
    QFETCH(QColor, window);
    QFETCH(QColor, button);
    QFETCH(QColor, text);
    QFETCH(QColor, body);
    QPalette palette;
    palette.setColor(QPalette::Window, window);
    palette.setColor(QPalette::Button, button);
    palette.setColor(QPalette::WindowText, text);
    const BalloonLook look = BalloonLook::resolved(QColor(), QColor(), QColor(), palette);
    QCOMPARE(look.upper, body);
    QCOMPARE(look.lower, body);
    QVERIFY(contrast(body, text) >= 7);
    // The border is seen against the window around and against the body.
    QVERIFY(contrast(look.border, window) >= 1.5);
    QVERIFY(contrast(look.border, body) >= 1.5);
    QCOMPARE(look.border.alpha(), 255);
}

void TestBalloonOutline::givenColoursAreKept()
{
    const QPalette palette;
    BalloonLook look = BalloonLook::resolved(Qt::red, Qt::green, Qt::blue, palette);
    QCOMPARE(look.lower, QColor(Qt::red));
    QCOMPARE(look.upper, QColor(Qt::green));
    QCOMPARE(look.border, QColor(Qt::blue));

    look = BalloonLook::resolved(Qt::red, QColor(), QColor(), palette);
    QCOMPARE(look.lower, QColor(Qt::red));
    QCOMPARE(look.upper, QColor(Qt::red));
    QVERIFY(!look.border.isValid());

    look = BalloonLook::resolved(QColor(), Qt::green, QColor(), palette);
    QCOMPARE(look.lower, QColor(Qt::green));
    QCOMPARE(look.upper, QColor(Qt::green));

    look = BalloonLook::resolved(QColor(), QColor(), Qt::blue, palette);
    QVERIFY(look.upper.isValid() && look.lower.isValid());
    QCOMPARE(look.border, QColor(Qt::blue));
}

ZELKOV_TEST_MAIN(TestBalloonOutline)
#include "tst_balloonoutline.moc"
