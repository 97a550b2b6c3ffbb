// SPDX-License-Identifier: MIT
// The pictures of pills and busy marks: each pixel of the canvas against the distance from what is drawn.
#include "indicators/BadgeDrawer.h"
#include "indicators/BadgeGeometry.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QtMath>
#include <QtGui/QFontMetrics>
#include <QtGui/QImage>
#include <QtTest/QtTest>

#include <cmath>
#include <functional>

using vx::BadgeDrawer;
namespace geometry = vx::BadgeGeometry;

namespace
{
const QColor White(255, 255, 255);
const QColor Black(0, 0, 0);
const QColor Red(246, 67, 70, 220);

QImage argb(const QPixmap& pixmap)
{
    return pixmap.toImage().convertToFormat(QImage::Format_ARGB32);
}

double distanceToSegment(const QPointF& p, const QPointF& a, const QPointF& b)
{
    const QPointF ab = b - a;
    const double square = QPointF::dotProduct(ab, ab);
    const double t = square == 0.0 ? 0.0 : qBound(0.0, QPointF::dotProduct(p - a, ab) / square, 1.0);
    const QPointF d = p - (a + t * ab);
    return std::hypot(d.x(), d.y());
}

double distanceToLine(const QPointF& p, const QLineF& line)
{
    return distanceToSegment(p, line.p1(), line.p2());
}

// From the middle line of a pill: all points closer than half its height belong to it.
double distanceToSpine(const QPointF& p, const QRectF& pill)
{
    const double radius = pill.height() / 2;
    return distanceToSegment(
        p, QPointF(pill.left() + radius, pill.center().y()), QPointF(pill.right() - radius, pill.center().y()));
}

// Compares coverage: inside by more than a pixel and a half is filled, outside by as much is untouched.
// signedDistance is negative inside. Returns a report of the first wrong pixel, or nothing.
QString wrongPixel(const QImage& image, const std::function<double(const QPointF&)>& signedDistance,
    const std::function<bool(QRgb)>& filled, const std::function<bool(QRgb)>& untouched)
{
    int inside = 0;
    int outside = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const double distance = signedDistance(QPointF(x + 0.5, y + 0.5));
            const QRgb pixel = image.pixel(x, y);
            if (distance < -1.5 && ++inside && !filled(pixel)) {
                return QStringLiteral("(%1, %2) should be filled, is #%3").arg(x).arg(y).arg(pixel, 8, 16);
            }
            if (distance > 1.5 && ++outside && !untouched(pixel)) {
                return QStringLiteral("(%1, %2) should be untouched, is #%3").arg(x).arg(y).arg(pixel, 8, 16);
            }
        }
    }
    return inside > 50 && outside > 50 ? QString() : QStringLiteral("nothing to compare");
}

bool isOpaque(QRgb pixel)
{
    return qAlpha(pixel) == 255;
}

bool isTransparent(QRgb pixel)
{
    return qAlpha(pixel) == 0;
}

bool isWhite(QRgb pixel)
{
    return qRed(pixel) > 250 && qGreen(pixel) > 250 && qBlue(pixel) > 250 && qAlpha(pixel) > 250;
}

bool isRed(QRgb pixel)
{
    return qAbs(qRed(pixel) - 246) < 4 && qAbs(qGreen(pixel) - 67) < 4 && qAbs(qBlue(pixel) - 70) < 4
        && qAlpha(pixel) == 220;
}

bool isSmooth(const QImage& image)
{
    int halfCovered = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const int alpha = qAlpha(image.pixel(x, y));
            halfCovered += alpha > 20 && alpha < 200 ? 1 : 0;
        }
    }
    return halfCovered > 40;
}

QImage mark(BadgeDrawer::EBusyBadgeType type, int startAngle = 1440, const QColor& color1 = White,
    const QColor& color2 = Black, int span = -4320)
{
    return argb(BadgeDrawer::renderBusyBadgePixmap(type, startAngle, span, color1, color2));
}

QImage pill(const QString& text, bool stroke, bool crossed)
{
    return argb(BadgeDrawer::renderBadgePixmapFromText(text, stroke, crossed, White, Red));
}

// Direction from the gradients' centre in degrees, counter-clockwise from three o'clock.
double direction(const QPointF& p, const QPointF& center)
{
    return qRadiansToDegrees(std::atan2(center.y() - p.y(), p.x() - center.x()));
}

// The grey that a conical gradient from white to black has at a point.
int expectedGrey(const QPointF& p, double gradientAngle)
{
    double turned = std::fmod(direction(p, QPointF(49, 49)) - gradientAngle, 360.0);
    turned += turned < 0.0 ? 360.0 : 0.0;
    return qRound(255.0 * (1.0 - turned / 360.0));
}

bool seamIsNear(const QPointF& p, double gradientAngle)
{
    const int grey = expectedGrey(p, gradientAngle);
    return grey < 8 || grey > 247;
}

QRect boundsOf(const QImage& image, const std::function<bool(QRgb)>& matches)
{
    QRect bounds;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (matches(image.pixel(x, y))) {
                bounds |= QRect(x, y, 1, 1);
            }
        }
    }
    return bounds;
}
}

class TestBadgePictures : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void arcCoversThreeQuartersFromTheStartAngle_data();
    void arcCoversThreeQuartersFromTheStartAngle();
    void arcHasTheFirstColourOnly();
    void ringCoversTheWholeCircle();
    void dotsCoverEightDiscs();
    void spokesCoverTwelveStrokes();
    void gradientTurnsBehindTheMark_data();
    void gradientTurnsBehindTheMark();
    void geometryStaysWhileTheGradientTurns_data();
    void geometryStaysWhileTheGradientTurns();
    void gradientTurnsClockwise();
    void unknownTypeStaysTransparent_data();
    void unknownTypeStaysTransparent();
    void edgesAreSmooth_data();
    void edgesAreSmooth();
    void emptyTextGivesAPlainDisc();
    void outlineWithoutTextUsesTheWholeCanvas();
    void crossWithoutTextUsesTheWholeCanvas();
    void crossMovesInWithTheOutline();
    void pillFollowsTheMeasuredText_data();
    void pillFollowsTheMeasuredText();
    void textFitsItsRoomAndIsCentred_data();
    void textFitsItsRoomAndIsCentred();
    void pillCarriesOutlineCrossAndTextTogether();
    void veryLongTextIsStillAPill();
    void whitespaceIsATextOfItsOwn();
    void transparentColoursKeepThePixmap();
};

void TestBadgePictures::arcCoversThreeQuartersFromTheStartAngle_data()
{
    QTest::addColumn<int>("startAngle");
    QTest::addColumn<int>("span");
    QTest::newRow("first frame") << 1440 << -4320;
    QTest::newRow("second frame") << 960 << -4320;
    QTest::newRow("zero") << 0 << -4320;
    QTest::newRow("negative") << -5280 << -4320;
    QTest::newRow("counter-clockwise quarter") << 0 << 1440;
}

void TestBadgePictures::arcCoversThreeQuartersFromTheStartAngle()
{
    QFETCH(int, startAngle);
    QFETCH(int, span);
    const double start = startAngle / 16.0;
    const double sweep = span / 16.0;
    const auto onCircle = [](double degrees) {
        return QPointF(
            50 + 43 * std::cos(qDegreesToRadians(degrees)), 50 - 43 * std::sin(qDegreesToRadians(degrees)));
    };
    const auto distance = [&](const QPointF& p) {
        double along = std::fmod(direction(p, QPointF(50, 50)) - start, 360.0) * (sweep < 0 ? -1 : 1);
        along += along < 0.0 ? 360.0 : 0.0;
        const QPointF d = p - QPointF(50, 50);
        const double toCircle = qAbs(std::hypot(d.x(), d.y()) - 43.0);
        const double toEnds = qMin(distanceToSegment(p, onCircle(start), onCircle(start)),
            distanceToSegment(p, onCircle(start + sweep), onCircle(start + sweep)));
        return (along <= qAbs(sweep) ? toCircle : toEnds) - 7.5;
    };
    const QImage image = mark(BadgeDrawer::ebbtArc, startAngle, White, Black, span);
    QCOMPARE(wrongPixel(image, distance, isOpaque, isTransparent), QString());
}

void TestBadgePictures::arcHasTheFirstColourOnly()
{
    const QColor orange(255, 128, 0);
    const QImage image = mark(BadgeDrawer::ebbtArc, 1440, orange, Black);
    QCOMPARE(image.pixelColor(93, 50), orange);
    QCOMPARE(image.pixelColor(50, 93), orange);
    QCOMPARE(image, mark(BadgeDrawer::ebbtArc, 1440, orange, White));
}

void TestBadgePictures::ringCoversTheWholeCircle()
{
    const auto distance = [](const QPointF& p) {
        const QPointF d = p - QPointF(50, 50);
        return qAbs(std::hypot(d.x(), d.y()) - 43.0) - 7.5;
    };
    QCOMPARE(wrongPixel(mark(BadgeDrawer::ebbtRing), distance, isOpaque, isTransparent), QString());
}

void TestBadgePictures::dotsCoverEightDiscs()
{
    const auto distance = [](const QPointF& p) {
        double nearest = 1000.0;
        for (const QRect& dot : geometry::dotRects()) {
            const QPointF center = QRectF(dot).center();
            nearest = qMin(nearest, distanceToSegment(p, center, center) - 10.0);
        }
        return nearest;
    };
    QCOMPARE(wrongPixel(mark(BadgeDrawer::ebbtDots), distance, isOpaque, isTransparent), QString());
}

void TestBadgePictures::spokesCoverTwelveStrokes()
{
    const auto distance = [](const QPointF& p) {
        double nearest = 1000.0;
        for (const QLine& spoke : geometry::spokeLines()) {
            nearest = qMin(nearest, distanceToLine(p, QLineF(spoke)) - 6.0);
        }
        return nearest;
    };
    QCOMPARE(wrongPixel(mark(BadgeDrawer::ebbtSpokes), distance, isOpaque, isTransparent), QString());
}

void TestBadgePictures::gradientTurnsBehindTheMark_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<int>("startAngle");
    for (const int angle : {1440, 960, 0, -480, -5280}) {
        QTest::addRow("ring at %d", angle) << int(BadgeDrawer::ebbtRing) << angle;
        QTest::addRow("dots at %d", angle) << int(BadgeDrawer::ebbtDots) << angle;
        QTest::addRow("spokes at %d", angle) << int(BadgeDrawer::ebbtSpokes) << angle;
    }
}

void TestBadgePictures::gradientTurnsBehindTheMark()
{
    QFETCH(int, type);
    QFETCH(int, startAngle);
    const double angle = startAngle / 16 - (type == BadgeDrawer::ebbtSpokes ? 15 : 0);
    const QImage image = mark(BadgeDrawer::EBusyBadgeType(type), startAngle);
    int compared = 0;
    for (int y = 0; y < 100; ++y) {
        for (int x = 0; x < 100; ++x) {
            const QPointF p(x + 0.5, y + 0.5);
            if (qAlpha(image.pixel(x, y)) != 255 || seamIsNear(p, angle)) {
                continue;
            }
            ++compared;
            const int grey = qRed(image.pixel(x, y));
            QVERIFY2(qAbs(grey - expectedGrey(p, angle)) <= 3,
                qPrintable(
                    QStringLiteral("(%1, %2) is %3, not %4").arg(x).arg(y).arg(grey).arg(expectedGrey(p, angle))));
        }
    }
    QVERIFY(compared > 1000);
}

void TestBadgePictures::geometryStaysWhileTheGradientTurns_data()
{
    QTest::addColumn<int>("type");
    QTest::newRow("ring") << int(BadgeDrawer::ebbtRing);
    QTest::newRow("dots") << int(BadgeDrawer::ebbtDots);
    QTest::newRow("spokes") << int(BadgeDrawer::ebbtSpokes);
}

void TestBadgePictures::geometryStaysWhileTheGradientTurns()
{
    QFETCH(int, type);
    const auto first = mark(BadgeDrawer::EBusyBadgeType(type), 1440);
    const auto second = mark(BadgeDrawer::EBusyBadgeType(type), -480);
    QVERIFY(first != second);
    QCOMPARE(first.convertToFormat(QImage::Format_Alpha8), second.convertToFormat(QImage::Format_Alpha8));
}

void TestBadgePictures::gradientTurnsClockwise()
{
    // The bright spoke stands at twelve o'clock first and at one o'clock a tick later.
    const QImage first = mark(BadgeDrawer::ebbtSpokes, 1440);
    const QImage second = mark(BadgeDrawer::ebbtSpokes, geometry::nextAngle(1440));
    QVERIFY(qRed(first.pixel(48, 10)) > 235);
    QVERIFY(qRed(first.pixel(66, 16)) < 20);
    QVERIFY(qRed(second.pixel(66, 16)) > 235);
    QVERIFY(qRed(second.pixel(48, 10)) < 235);
}

void TestBadgePictures::unknownTypeStaysTransparent_data()
{
    QTest::addColumn<int>("type");
    QTest::newRow("minus one") << -1;
    QTest::newRow("four") << 4;
    QTest::newRow("large") << 0x7fffffff;
}

void TestBadgePictures::unknownTypeStaysTransparent()
{
    QFETCH(int, type);
    const QImage image = mark(BadgeDrawer::EBusyBadgeType(type));
    QCOMPARE(image.size(), QSize(100, 100));
    QVERIFY(boundsOf(image, [](QRgb pixel) { return !isTransparent(pixel); }).isNull());
}

void TestBadgePictures::edgesAreSmooth_data()
{
    QTest::addColumn<QImage>("image");
    QTest::newRow("arc") << mark(BadgeDrawer::ebbtArc);
    QTest::newRow("ring") << mark(BadgeDrawer::ebbtRing);
    QTest::newRow("dots") << mark(BadgeDrawer::ebbtDots);
    QTest::newRow("spokes") << mark(BadgeDrawer::ebbtSpokes);
    QTest::newRow("disc") << pill(QString(), false, false);
    QTest::newRow("pill") << pill(QStringLiteral("wide text"), false, false);
}

void TestBadgePictures::edgesAreSmooth()
{
    QFETCH(QImage, image);
    QVERIFY(isSmooth(image));
}

void TestBadgePictures::emptyTextGivesAPlainDisc()
{
    const QImage image = pill(QString(), false, false);
    QCOMPARE(image.size(), QSize(100, 100));
    const auto distance = [](const QPointF& p) { return distanceToSpine(p, QRectF(0, 0, 100, 100)) - 50.0; };
    QCOMPARE(wrongPixel(image, distance, isRed, isTransparent), QString());
}

void TestBadgePictures::outlineWithoutTextUsesTheWholeCanvas()
{
    const QImage image = pill(QString(), true, false);
    QCOMPARE(image.size(), QSize(100, 100));
    const auto distance
        = [](const QPointF& p) { return qAbs(distanceToSpine(p, QRectF(2, 2, 96, 96)) - 48.0) - 2.5; };
    const auto notWhite = [](QRgb pixel) { return isRed(pixel) || qAlpha(pixel) < 60; };
    QCOMPARE(wrongPixel(image, distance, isWhite, notWhite), QString());
    QVERIFY(isRed(image.pixel(50, 50)));
    QVERIFY(isTransparent(image.pixel(0, 0)));
}

void TestBadgePictures::crossWithoutTextUsesTheWholeCanvas()
{
    const QImage image = pill(QString(), false, true);
    // The square caps reach half the pen's width beyond the ends.
    QLineF line = geometry::crossLine(QRect(0, 0, 100, 100));
    QCOMPARE(line.angle(), 45.0);
    for (int y = 0; y < 100; ++y) {
        for (int x = 0; x < 100; ++x) {
            const QPointF p(x + 0.5, y + 0.5);
            const QPointF d = p - QPointF(50, 50);
            const double along = qAbs(d.x() - d.y()) / M_SQRT2;
            const double across = qAbs(d.x() + d.y()) / M_SQRT2;
            const QRgb pixel = image.pixel(x, y);
            if (across < 3.5 && along < 40 + 3.5) {
                QVERIFY2(isWhite(pixel), qPrintable(QStringLiteral("(%1, %2)").arg(x).arg(y)));
            } else if ((across > 6.5 || along > 40 + 6.5) && std::hypot(d.x(), d.y()) < 48.5) {
                QVERIFY2(isRed(pixel), qPrintable(QStringLiteral("(%1, %2)").arg(x).arg(y)));
            }
        }
    }
}

void TestBadgePictures::crossMovesInWithTheOutline()
{
    // Along the diagonal: the slash ends at 40 + 5 without an outline and at 38 + 5 with one.
    const auto reach = [](const QImage& image) {
        int steps = 0;
        while (isWhite(image.pixel(50 + steps, 49 - steps))) {
            ++steps;
        }
        return steps;
    };
    const int plain = reach(pill(QString(), false, true));
    const int outlined = reach(pill(QString(), true, true));
    QVERIFY2(plain >= 30 && plain <= 32, qPrintable(QString::number(plain)));
    QVERIFY2(outlined == plain - 1 || outlined == plain - 2, qPrintable(QString::number(outlined)));
}

void TestBadgePictures::pillFollowsTheMeasuredText_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("digit") << QStringLiteral("3");
    QTest::newRow("two digits") << QStringLiteral("10");
    QTest::newRow("three digits") << QStringLiteral("999");
    QTest::newRow("word") << QStringLiteral("recording");
    QTest::newRow("tall letters") << QString::fromUtf8("\xc3\x85g\xc3\x84j");
    QTest::newRow("dot") << QStringLiteral(".");
}

void TestBadgePictures::pillFollowsTheMeasuredText()
{
    QFETCH(QString, text);
    for (const bool stroke : {false, true}) {
        QFont font;
        int pixelSize = 100;
        font.setPixelSize(pixelSize);
        while (QFontMetrics(font).boundingRect(text).height() > (stroke ? 70 : 80)) {
            font.setPixelSize(--pixelSize);
        }
        const int width = QFontMetrics(font).boundingRect(text).width() + 20;
        const QSize expected(stroke ? qMax(90, width) + 10 : qMax(100, width), 100);
        const QImage image = pill(text, stroke, false);
        QCOMPARE(image.size(), expected);
        const auto distance = [&](const QPointF& p) { return distanceToSpine(p, QRectF(image.rect())) - 50.0; };
        QCOMPARE(wrongPixel(
                     image, distance, [](QRgb pixel) { return qAlpha(pixel) >= 220; },
                     [](QRgb pixel) { return qAlpha(pixel) < 60; }),
            QString());
    }
}

void TestBadgePictures::textFitsItsRoomAndIsCentred_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("digit") << QStringLiteral("8");
    QTest::newRow("digits") << QStringLiteral("808");
    QTest::newRow("word") << QStringLiteral("HIDE");
}

void TestBadgePictures::textFitsItsRoomAndIsCentred()
{
    QFETCH(QString, text);
    const QImage image = pill(text, false, false);
    const QRect ink = boundsOf(image, isWhite);
    QVERIFY(ink.height() > 40);
    QVERIFY(ink.height() <= 80);
    QVERIFY(qAbs((ink.left() + ink.right() + 1) / 2.0 - image.width() / 2.0) < 4.0);
    QVERIFY(qAbs((ink.top() + ink.bottom() + 1) / 2.0 - 50.0) < 12.0);
}

void TestBadgePictures::pillCarriesOutlineCrossAndTextTogether()
{
    const QImage image = pill(QStringLiteral("1234"), true, true);
    QVERIFY(image.width() > 150);
    const int middle = image.width() / 2;
    QVERIFY(isWhite(image.pixel(middle, 2))); // outline
    QVERIFY(isWhite(image.pixel(middle, 97)));
    QVERIFY(isWhite(image.pixel(2, 50)));
    const QLineF slash = geometry::crossLine(QRect(2, 2, image.width() - 4, 96));
    QVERIFY(slash.x1() < slash.x2() && slash.y1() > slash.y2());
    for (double t = 0.05; t < 1.0; t += 0.05) {
        QVERIFY(isWhite(image.pixel(slash.pointAt(t).toPoint())));
    }
    // Text: more white than without it.
    const auto whites = [](const QImage& picture) {
        int count = 0;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x) {
                count += isWhite(picture.pixel(x, y)) ? 1 : 0;
            }
        }
        return count;
    };
    const QImage blank = pill(QStringLiteral("    "), true, true);
    QVERIFY(whites(image) > whites(blank) + 1000);
}

void TestBadgePictures::veryLongTextIsStillAPill()
{
    const QImage image = pill(QString(2500, QLatin1Char('i')), false, false);
    QCOMPARE(image.size(), QSize(32767, 100));
    QVERIFY(isRed(image.pixel(16000, 3)));
    QVERIFY(isRed(image.pixel(32767 - 10, 50)) || isWhite(image.pixel(32767 - 10, 50)));
}

void TestBadgePictures::whitespaceIsATextOfItsOwn()
{
    const QImage image = pill(QStringLiteral(" "), true, false);
    QCOMPARE(image.size(), QSize(100, 100));
    QVERIFY(isRed(image.pixel(50, 50)));
}

void TestBadgePictures::transparentColoursKeepThePixmap()
{
    const QPixmap nothing = BadgeDrawer::renderBadgePixmapFromText(
        QStringLiteral("x"), true, true, Qt::transparent, Qt::transparent);
    QCOMPARE(nothing.size(), QSize(100, 100));
    QVERIFY(boundsOf(argb(nothing), [](QRgb pixel) { return !isTransparent(pixel); }).isNull());
    QVERIFY(!BadgeDrawer::renderBadgePixmapFromText(QString(), false, false, QColor(), QColor()).isNull());
    QVERIFY(!BadgeDrawer::renderBusyBadgePixmap(BadgeDrawer::ebbtRing, 0, 0, QColor(), QColor()).isNull());
}

ZELKOV_TEST_MAIN(TestBadgePictures)
#include "tst_badgepictures.moc"
