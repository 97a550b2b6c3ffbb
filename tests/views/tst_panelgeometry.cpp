// SPDX-License-Identifier: MIT
// Where panels stand and what they snap to, as plain functions.
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/PanelGeometry.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>
#include <QtWidgets/QWidget>

#include <climits>

namespace geometry = vx::PanelGeometry;

class TestPanelGeometry : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void rectanglesStandAtTheirEdge_data();
    void rectanglesStandAtTheirEdge();
    void aStillStripForgetsTheNeighbourOnTop();
    void theNeighbourCountsWhereItIsInTheWay();
    void extremesBecomeSizesThatWidgetsCanHave();
    void sixteenIsOpenAndFifteenIsNot();
    void rowsStackUpWithBothBars();
    void aRequestSnapsAtTwoThirds_data();
    void aRequestSnapsAtTwoThirds();
    void aReleaseSnapsAtSixtySixHundredths_data();
    void aReleaseSnapsAtSixtySixHundredths();
    void theTwoFactorsDifferInBetween();
    void snappingIsMonotonic();
};

void TestPanelGeometry::rectanglesStandAtTheirEdge_data()
{
    QTest::addColumn<int>("edge");
    QTest::addColumn<int>("neighbour");
    QTest::addColumn<int>("offset");
    QTest::addColumn<int>("height");
    QTest::addColumn<QRect>("rect");
    QTest::addColumn<QRect>("full");
    // The parent is 400 by 300.
    QTest::newRow("top") << 0 << 0 << 0 << 99 << QRect(0, 0, 400, 99) << QRect(0, 0, 400, 300);
    QTest::newRow("top, lowered") << 0 << 0 << 20 << 99 << QRect(0, 20, 400, 99) << QRect(0, 20, 400, 300);
    QTest::newRow("top, below another") << 0 << 40 << 20 << 99 << QRect(0, 60, 400, 99) << QRect(0, 20, 400, 300);
    QTest::newRow("bottom") << 1 << 0 << 0 << 99 << QRect(0, 201, 400, 99) << QRect();
    QTest::newRow("bottom, above another") << 1 << 40 << 0 << 99 << QRect(0, 161, 400, 99) << QRect();
    QTest::newRow("the bottom knows no offset") << 1 << 0 << 20 << 99 << QRect(0, 201, 400, 99) << QRect();
    QTest::newRow("bottom, taller than the parent") << 1 << 0 << 0 << 350 << QRect(0, -50, 400, 350) << QRect();
    QTest::newRow("no edge") << 2 << 40 << 20 << 99 << QRect() << QRect();
}

void TestPanelGeometry::rectanglesStandAtTheirEdge()
{
    QFETCH(int, edge);
    QFETCH(int, neighbour);
    QFETCH(int, offset);
    QFETCH(int, height);
    const geometry::Surroundings surroundings {edge, 400, 300, neighbour, offset};
    QTEST(geometry::panelRect(surroundings, height), "rect");
    QTEST(geometry::fullRect(surroundings, 300), "full");
}

void TestPanelGeometry::aStillStripForgetsTheNeighbourOnTop()
{
    QCOMPARE(geometry::stillStripRect({0, 400, 300, 40, 20}), QRect(0, 20, 400, 15));
    QCOMPARE(geometry::stillStripRect({1, 400, 300, 40, 20}), QRect(0, 245, 400, 15));
    QCOMPARE(geometry::stillStripRect({7, 400, 300, 40, 20}), QRect());
}

void TestPanelGeometry::theNeighbourCountsWhereItIsInTheWay()
{
    QCOMPARE(geometry::neighbourOffset(0, true, 40), 40);
    QCOMPARE(geometry::neighbourOffset(0, false, 40), 0);
    QCOMPARE(geometry::neighbourOffset(1, true, 40), 0);
    QCOMPARE(geometry::neighbourOffset(1, false, 40), 40);
}

void TestPanelGeometry::extremesBecomeSizesThatWidgetsCanHave()
{
    const QVector<int> extremes = {INT_MIN, INT_MIN + 1, -1, 0, 1, INT_MAX - 1, INT_MAX};
    for (const int edge : {0, 1}) {
        for (const int parent : extremes) {
            for (const int offset : extremes) {
                for (const int height : extremes) {
                    const QRect rect = geometry::panelRect({edge, parent, parent, offset, offset}, height);
                    QVERIFY(rect.height() >= 0 && rect.height() <= QWIDGETSIZE_MAX);
                    QVERIFY(rect.width() >= 0 && rect.width() <= QWIDGETSIZE_MAX);
                    QVERIFY(qAbs(rect.y()) <= QWIDGETSIZE_MAX);
                }
            }
        }
    }
    QCOMPARE(geometry::widgetHeight(-1), 0);
    QCOMPARE(geometry::widgetHeight(QWIDGETSIZE_MAX), QWIDGETSIZE_MAX);
    QCOMPARE(geometry::widgetHeight(qint64(QWIDGETSIZE_MAX) + 1), QWIDGETSIZE_MAX);
}

void TestPanelGeometry::sixteenIsOpenAndFifteenIsNot()
{
    QVERIFY(!geometry::isOpen(15));
    QVERIFY(geometry::isOpen(16));
    QVERIFY(!geometry::isOpen(0));
}

void TestPanelGeometry::rowsStackUpWithBothBars()
{
    QCOMPARE(geometry::rowHeights(100, 2), (QVector<int> {15, 130, 230}));
    QCOMPARE(geometry::rowHeights(100, 0), QVector<int> {15});
    QCOMPARE(geometry::rowHeights(0, 3), (QVector<int> {15, 30, 30, 30}));
    QVERIFY(geometry::rowHeights(INT_MAX, 2).last() > 0);
}

void TestPanelGeometry::aRequestSnapsAtTwoThirds_data()
{
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("contents");
    QTest::addColumn<int>("row");
    QTest::newRow("nothing") << 0 << 100 << 0;
    QTest::newRow("just below two thirds") << 66 << 100 << 0;
    QTest::newRow("just above") << 67 << 100 << 1;
    QTest::newRow("two thirds on the dot") << 200 << 300 << 1;
    QTest::newRow("one less") << 199 << 300 << 0;
    QTest::newRow("a pixel short of a row") << 129 << 100 << 1;
    QTest::newRow("a row") << 130 << 100 << -1;
    QTest::newRow("more") << 500 << 100 << -1;
}

void TestPanelGeometry::aRequestSnapsAtTwoThirds()
{
    QFETCH(int, height);
    QFETCH(int, contents);
    QTEST(geometry::snapOfRequest(height, contents), "row");
}

void TestPanelGeometry::aReleaseSnapsAtSixtySixHundredths_data()
{
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("contents");
    QTest::addColumn<int>("row");
    QTest::newRow("below") << 65 << 100 << 0;
    QTest::newRow("exactly") << 66 << 100 << 1;
    QTest::newRow("a pixel short of a row") << 129 << 100 << 1;
    QTest::newRow("a row") << 130 << 100 << -1;
}

void TestPanelGeometry::aReleaseSnapsAtSixtySixHundredths()
{
    QFETCH(int, height);
    QFETCH(int, contents);
    QTEST(geometry::snapOfRelease(height, contents), "row");
}

void TestPanelGeometry::theTwoFactorsDifferInBetween()
{
    QCOMPARE(geometry::snapOfRequest(199, 300), 0);
    QCOMPARE(geometry::snapOfRelease(199, 300), 1);
    QCOMPARE(geometry::snapOfRelease(198, 300), 1);
    QCOMPARE(geometry::snapOfRelease(197, 300), 0);
}

void TestPanelGeometry::snappingIsMonotonic()
{
    QRandomGenerator random(51);
    const auto rank = [](int row) { return row == -1 ? 2 : row; };
    for (int i = 0; i < 20000; ++i) {
        const int contents = random.bounded(0, 2000);
        const int a = random.bounded(0, 3000);
        const int b = random.bounded(0, 3000);
        QVERIFY(a > b || rank(geometry::snapOfRequest(a, contents)) <= rank(geometry::snapOfRequest(b, contents)));
        QVERIFY(a > b || rank(geometry::snapOfRelease(a, contents)) <= rank(geometry::snapOfRelease(b, contents)));
        // Nothing closes on a release that a request would leave open.
        QVERIFY(rank(geometry::snapOfRelease(a, contents)) >= rank(geometry::snapOfRequest(a, contents)));
    }
}

ZELKOV_TEST_MAIN(TestPanelGeometry)
#include "tst_panelgeometry.moc"
