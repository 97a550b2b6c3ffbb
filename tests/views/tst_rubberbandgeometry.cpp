// SPDX-License-Identifier: MIT
// Grips, cursors and drags as plain functions.
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/RubberBandGeometry.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

#include <climits>

namespace geometry = vx::RubberBandGeometry;

namespace
{
constexpr double c_Ignore = vx::CoordinateSystem::IGNORE_ASPECT_RATIO;
constexpr double c_Calc = vx::CoordinateSystem::CALC_ASPECT_RATIO;

/// Writes down what it is asked for; one unit is one pixel.
class LoggingSystem : public vx::CoordinateSystem
{
public:
    QRect mapToScreen(const QRectF& rect) const override
    {
        log << QStringLiteral("map");
        return rect.toRect();
    }
    void setLeft(QRectF& rect, int x) const override
    {
        log << QStringLiteral("left %1").arg(x);
        rect.setLeft(x);
    }
    void setTop(QRectF& rect, int y) const override
    {
        log << QStringLiteral("top %1").arg(y);
        rect.setTop(y);
    }
    void setRight(QRectF& rect, int x) const override
    {
        log << QStringLiteral("right %1").arg(x);
        rect.setRight(x + 1);
    }
    void setBottom(QRectF& rect, int y) const override
    {
        log << QStringLiteral("bottom %1").arg(y);
        rect.setBottom(y + 1);
    }
    void move(QRectF& rect, const QPoint& offset, Qt::Alignment alignment) const override
    {
        log << QStringLiteral("move %1 %2 %3").arg(offset.x()).arg(offset.y()).arg(int(alignment));
        rect.translate(offset);
    }
    void adjustToAspectRatio(QRectF&, double ratio, Qt::Alignment alignment, const QRectF& original) const override
    {
        log << QStringLiteral("adjust %1 %2 %3").arg(ratio).arg(int(alignment)).arg(original.width());
    }

    mutable QStringList log;
};
}

class TestRubberBandGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void growingMovesEverySide();
    void growingKeepsExtremesInReach();
    void gripsReachTheMarginToBothSides_data();
    void gripsReachTheMarginToBothSides();
    void theModesSayWhatCanBeGripped_data();
    void theModesSayWhatCanBeGripped();
    void leftAndTopWinOnANarrowRectangle();
    void aGripIsWhatItsBandsAddUpTo();
    void aPolygonIsGrippedAsAWhole_data();
    void aPolygonIsGrippedAsAWhole();
    void everyGripHasItsCursor_data();
    void everyGripHasItsCursor();
    void aDragAsksTheSystemForItsSides_data();
    void aDragAsksTheSystemForItsSides();
    void aDragPastTheOppositeEdgeFlips_data();
    void aDragPastTheOppositeEdgeFlips();
    void aRandomDragEndsNormalisedAndWhereThePointerIs();
    void proportionsStayInARandomDrag();
};

void TestRubberBandGeometry::growingMovesEverySide()
{
    QCOMPARE(geometry::grown(QRect(10, 20, 30, 40), 4), QRect(6, 16, 38, 48));
    QCOMPARE(geometry::grown(QRect(6, 16, 38, 48), -4), QRect(10, 20, 30, 40));
    QCOMPARE(geometry::grown(QRect(), 4), QRect(-4, -4, 8, 8));
}

void TestRubberBandGeometry::growingKeepsExtremesInReach()
{
    const QRect grown = geometry::grown(QRect(QPoint(INT_MIN, INT_MIN), QPoint(INT_MAX, INT_MAX)), 4);
    QVERIFY(grown.isValid());
    QVERIFY(grown.width() > 1000000);
}

void TestRubberBandGeometry::gripsReachTheMarginToBothSides_data()
{
    QTest::addColumn<QPoint>("point");
    QTest::addColumn<int>("grip");
    // The rectangle is (100, 200) to (299, 349), the margin 5.
    const QVector<QPair<int, int>> columns
        = {{94, 0}, {95, 1}, {100, 1}, {105, 1}, {106, 2}, {293, 2}, {294, 4}, {299, 4}, {304, 4}, {305, 0}};
    const QVector<QPair<int, int>> rows = {{194, 0}, {195, 16}, {200, 16}, {205, 16}, {206, 32}, {343, 32},
        {344, 64}, {349, 64}, {354, 64}, {355, 0}};
    for (const auto& x : columns) {
        for (const auto& y : rows) {
            int grip = 0;
            if (x.second != 0 && y.second != 0) {
                grip = (x.second == 2 ? 0 : x.second) + (y.second == 32 ? 0 : y.second);
                grip = grip == 0 ? 34 : grip;
            }
            QTest::addRow("%d,%d", x.first, y.first) << QPoint(x.first, y.first) << grip;
        }
    }
}

void TestRubberBandGeometry::gripsReachTheMarginToBothSides()
{
    QFETCH(QPoint, point);
    QFETCH(int, grip);
    QCOMPARE(geometry::gripAt(QRect(100, 200, 200, 150), point, 5, 3), grip);
}

void TestRubberBandGeometry::theModesSayWhatCanBeGripped_data()
{
    QTest::addColumn<QPoint>("point");
    QTest::addColumn<int>("modes");
    QTest::addColumn<int>("grip");
    const QPoint edge(0, 50);
    const QPoint inside(50, 50);
    const QPoint outside(-10, 50);
    QTest::newRow("edge, none") << edge << 0 << 0;
    QTest::newRow("edge, edges") << edge << 1 << 1;
    QTest::newRow("edge, inside") << edge << 2 << 34;
    QTest::newRow("edge, both") << edge << 3 << 1;
    QTest::newRow("inside, none") << inside << 0 << 0;
    QTest::newRow("inside, edges") << inside << 1 << 0;
    QTest::newRow("inside, inside") << inside << 2 << 34;
    QTest::newRow("inside, both") << inside << 3 << 34;
    QTest::newRow("outside, both") << outside << 3 << 0;
    QTest::newRow("in the margin, inside") << QPoint(-4, 50) << 2 << 34;
    QTest::newRow("other bits") << inside << 4 << 0;
}

void TestRubberBandGeometry::theModesSayWhatCanBeGripped()
{
    QFETCH(QPoint, point);
    QFETCH(int, modes);
    QFETCH(int, grip);
    QCOMPARE(geometry::gripAt(QRect(0, 0, 100, 100), point, 4, modes), grip);
}

void TestRubberBandGeometry::leftAndTopWinOnANarrowRectangle()
{
    // 3 by 3 pixels: every point is in the bands of all four edges.
    QCOMPARE(geometry::gripAt(QRect(10, 10, 3, 3), QPoint(12, 12), 4, 3), 17);
    // Only the right and bottom bands reach this far.
    QCOMPARE(geometry::gripAt(QRect(10, 10, 3, 3), QPoint(15, 15), 4, 3), 68);
}

void TestRubberBandGeometry::aGripIsWhatItsBandsAddUpTo()
{
    QRandomGenerator random(56);
    const QVector<int> all = {0, 1, 4, 16, 17, 20, 34, 64, 65, 68};
    for (int i = 0; i < 20000; ++i) {
        const QRect rect(
            random.bounded(-50, 50), random.bounded(-50, 50), random.bounded(0, 60), random.bounded(0, 60));
        const QPoint point(random.bounded(-80, 130), random.bounded(-80, 130));
        const int margin = random.bounded(0, 12);
        const int grip = geometry::gripAt(rect, point, margin, 3);
        QVERIFY2(all.contains(grip), qPrintable(QString::number(grip)));
        const bool near = point.x() >= rect.left() - margin && point.x() <= rect.right() + margin
            && point.y() >= rect.top() - margin && point.y() <= rect.bottom() + margin;
        QCOMPARE(grip != 0, near);
        if ((grip & 1) != 0) {
            QVERIFY(qAbs(point.x() - rect.left()) <= margin);
        }
        if ((grip & 64) != 0) {
            QVERIFY(qAbs(point.y() - rect.bottom()) <= margin && qAbs(point.y() - rect.top()) > margin);
        }
    }
    // Nothing overflows at the ends of the range: left and top are one pixel out of reach.
    const QRect everything(QPoint(INT_MIN, INT_MIN), QPoint(INT_MAX, INT_MAX));
    QCOMPARE(geometry::gripAt(everything, QPoint(), INT_MAX, 3), 68);
    QCOMPARE(geometry::gripAt(everything, QPoint(-1, -1), INT_MAX, 3), 17);
}

void TestRubberBandGeometry::aPolygonIsGrippedAsAWhole_data()
{
    QTest::addColumn<QPolygon>("polygon");
    QTest::addColumn<QPoint>("point");
    QTest::addColumn<int>("grip");
    const QPolygon triangle({QPoint(0, 0), QPoint(100, 0), QPoint(0, 100)});
    QTest::newRow("inside") << triangle << QPoint(20, 20) << 34;
    QTest::newRow("on the slanted side") << triangle << QPoint(50, 50) << 34;
    QTest::newRow("beyond it") << triangle << QPoint(51, 50) << 0;
    QTest::newRow("on a corner") << triangle << QPoint(100, 0) << 34;
    QTest::newRow("beyond a corner") << triangle << QPoint(101, 0) << 0;
    QTest::newRow("on the closing side") << triangle << QPoint(0, 40) << 34;
    QTest::newRow("beside it") << triangle << QPoint(-1, 40) << 0;
    const QPolygon closed({QPoint(0, 0), QPoint(100, 0), QPoint(0, 100), QPoint(0, 0)});
    QTest::newRow("closed by hand") << closed << QPoint(0, 40) << 34;
    const QPolygon bow({QPoint(0, 0), QPoint(100, 100), QPoint(100, 0), QPoint(0, 100)});
    QTest::newRow("in a wing of a bow") << bow << QPoint(90, 50) << 34;
    QTest::newRow("between the wings") << bow << QPoint(50, 80) << 0;
    QTest::newRow("no point") << QPolygon() << QPoint() << 0;
    QTest::newRow("one point") << QPolygon(QVector<QPoint> {QPoint(5, 5)}) << QPoint(5, 5) << 0;
    QTest::newRow("two points") << QPolygon(QVector<QPoint> {QPoint(0, 0), QPoint(10, 0)}) << QPoint(5, 0) << 0;
}

void TestRubberBandGeometry::aPolygonIsGrippedAsAWhole()
{
    QFETCH(QPolygon, polygon);
    QFETCH(QPoint, point);
    QFETCH(int, grip);
    QCOMPARE(geometry::gripAt(polygon, point), grip);
}

void TestRubberBandGeometry::everyGripHasItsCursor_data()
{
    QTest::addColumn<int>("grip");
    QTest::addColumn<int>("still");
    QTest::addColumn<int>("dragging");
    for (int grip = -2; grip <= 130; ++grip) {
        int still = Qt::ArrowCursor;
        switch (grip) {
        case 0:
        case 34:
            still = Qt::OpenHandCursor;
            break;
        case 1:
        case 4:
            still = Qt::SizeHorCursor;
            break;
        case 16:
        case 64:
            still = Qt::SizeVerCursor;
            break;
        case 17:
        case 68:
            still = Qt::SizeFDiagCursor;
            break;
        case 20:
        case 65:
            still = Qt::SizeBDiagCursor;
            break;
        default:
            break;
        }
        QTest::addRow("%d", grip) << grip << still << (grip == 34 ? int(Qt::ClosedHandCursor) : still);
    }
}

void TestRubberBandGeometry::everyGripHasItsCursor()
{
    QFETCH(int, grip);
    QTEST(int(geometry::cursorFor(grip, false)), "still");
    QTEST(int(geometry::cursorFor(grip, true)), "dragging");
}

void TestRubberBandGeometry::aDragAsksTheSystemForItsSides_data()
{
    QTest::addColumn<int>("grip");
    QTest::addColumn<QStringList>("asked");
    QTest::addColumn<QRect>("result");
    // From (10, 20) with 100 by 50 pixels, by (3, 7).
    const QString adjust = QStringLiteral("adjust 1.5 33 100");
    const QString map = QStringLiteral("map");
    QTest::newRow("none") << 0 << QStringList() << QRect(10, 20, 100, 50);
    QTest::newRow("left") << 1 << QStringList {QStringLiteral("left 13"), adjust, map} << QRect(13, 20, 97, 50);
    QTest::newRow("right") << 4 << QStringList {QStringLiteral("right 112"), adjust, map}
                           << QRect(10, 20, 103, 50);
    QTest::newRow("top") << 16 << QStringList {QStringLiteral("top 27"), adjust, map} << QRect(10, 27, 100, 43);
    QTest::newRow("bottom") << 64 << QStringList {QStringLiteral("bottom 76"), adjust, map}
                            << QRect(10, 20, 100, 57);
    QTest::newRow("top left") << 17
                              << QStringList {QStringLiteral("left 13"), QStringLiteral("top 27"), adjust, map}
                              << QRect(13, 27, 97, 43);
    QTest::newRow("top right") << 20
                               << QStringList {QStringLiteral("right 112"), QStringLiteral("top 27"), adjust, map}
                               << QRect(10, 27, 103, 43);
    QTest::newRow("bottom left") << 65
                                 << QStringList {QStringLiteral("left 13"), QStringLiteral("bottom 76"), adjust,
                                        map}
                                 << QRect(13, 20, 97, 57);
    QTest::newRow("bottom right") << 68
                                  << QStringList {QStringLiteral("right 112"), QStringLiteral("bottom 76"), adjust,
                                         map}
                                  << QRect(10, 20, 103, 57);
    QTest::newRow("inside") << 34 << QStringList {QStringLiteral("move 3 7 33"), map} << QRect(13, 27, 100, 50);
    QTest::newRow("no grip") << 85 << QStringList {map} << QRect(10, 20, 100, 50);
}

void TestRubberBandGeometry::aDragAsksTheSystemForItsSides()
{
    QFETCH(int, grip);
    const LoggingSystem system;
    QRect screen(10, 20, 100, 50);
    QRectF units(screen);
    const QRectF original = units;
    geometry::drag(system, grip, screen, units, 1.5, QPoint(3, 7), original);
    QTEST(system.log, "asked");
    QTEST(screen, "result");
    QCOMPARE(units, QRectF(screen));
}

void TestRubberBandGeometry::aDragPastTheOppositeEdgeFlips_data()
{
    QTest::addColumn<int>("grip");
    QTest::addColumn<QPoint>("offset");
    QTest::addColumn<QRect>("result");
    QTest::newRow("left") << 1 << QPoint(130, 0) << QRect(110, 20, 30, 50);
    QTest::newRow("right") << 4 << QPoint(-130, 0) << QRect(-20, 20, 30, 50);
    QTest::newRow("top") << 16 << QPoint(0, 60) << QRect(10, 70, 100, 10);
    QTest::newRow("bottom") << 64 << QPoint(0, -60) << QRect(10, 10, 100, 10);
    QTest::newRow("bottom right") << 68 << QPoint(-130, -60) << QRect(-20, 10, 30, 10);
}

void TestRubberBandGeometry::aDragPastTheOppositeEdgeFlips()
{
    QFETCH(int, grip);
    QFETCH(QPoint, offset);
    const LoggingSystem system;
    QRect screen(10, 20, 100, 50);
    QRectF units(screen);
    geometry::drag(system, grip, screen, units, c_Ignore, offset, units);
    QTEST(units.toRect(), "result");
    QVERIFY(units.width() >= 0 && units.height() >= 0);
}

void TestRubberBandGeometry::aRandomDragEndsNormalisedAndWhereThePointerIs()
{
    QWidget view;
    view.resize(640, 400);
    const vx::LinearCoordinateSystem system(QRectF(-1, -1, 2, 2), &view);
    QRandomGenerator random(57);
    const QVector<int> grips = {1, 4, 16, 17, 20, 34, 64, 65, 68};
    for (int i = 0; i < 5000; ++i) {
        const int grip = grips.at(random.bounded(grips.size()));
        QRectF units;
        system.setLeft(units, random.bounded(0, 600));
        system.setTop(units, random.bounded(0, 350));
        system.setRight(units, random.bounded(0, 639));
        system.setBottom(units, random.bounded(0, 399));
        units = units.normalized();
        const QRect before = system.mapToScreen(units);
        const QPoint offset(random.bounded(-300, 300), random.bounded(-200, 200));
        QRect screen = before;
        const QRectF original = units;
        geometry::drag(system, grip, screen, units, c_Ignore, offset, original);
        QVERIFY(units.width() >= 0 && units.height() >= 0);
        QVERIFY(screen.width() >= 0 && screen.height() >= 0);
        if (grip == 34) {
            QCOMPARE(screen.topLeft(), before.topLeft() + offset);
            QVERIFY(qFuzzyCompare(1 + units.width(), 1 + original.width()));
        } else if ((grip & 1) != 0) {
            const int x = before.left() + offset.x();
            QVERIFY2(screen.left() == x || screen.right() + 1 == x, qPrintable(QString::number(i)));
        } else if ((grip & 64) != 0) {
            const int y = before.bottom() + offset.y();
            QVERIFY2(screen.bottom() == y || screen.top() == y + 1, qPrintable(QString::number(i)));
        }
    }
}

void TestRubberBandGeometry::proportionsStayInARandomDrag()
{
    QWidget view;
    view.resize(500, 250);
    const vx::LinearCoordinateSystem system(QRectF(0, 0, 1000, 500), &view);
    QRandomGenerator random(58);
    const QVector<int> grips = {1, 4, 16, 17, 20, 64, 65, 68};
    for (int i = 0; i < 5000; ++i) {
        const QRectF original(
            random.bounded(500), random.bounded(200), random.bounded(20, 300), random.bounded(20, 200));
        QRect screen = system.mapToScreen(original);
        QRectF units = original;
        const QPoint offset(random.bounded(-40, 40), random.bounded(-40, 40));
        geometry::drag(system, grips.at(random.bounded(grips.size())), screen, units, c_Calc, offset, original);
        if (units.height() > 1e-6) {
            const double before = original.width() / original.height();
            QVERIFY2(
                qAbs(units.width() / units.height() - before) < 1e-6 * before, qPrintable(QString::number(i)));
        }
    }
}

ZELKOV_TEST_MAIN(TestRubberBandGeometry)
#include "tst_rubberbandgeometry.moc"
