// SPDX-License-Identifier: MIT
// Where a nine-part picture is cut and where the parts go.
#include "indicators/NinePartGrid.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

class TestNinePartGrid : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePartsOfASmallPicture()
    {
        const vx::NinePartGrid grid
            = vx::ninePartGrid(QRect(0, 0, 100, 100), QSize(10, 10), QMargins(2, 2, 2, 2));
        QCOMPARE(grid.count, 9);
        // Lines: source 0, 2, 7, 9, target 0, 2, 97, 99; both ends of a part are inside.
        QCOMPARE(grid.parts[0].target, QRect(0, 0, 3, 3));
        QCOMPARE(grid.parts[0].source, QRect(0, 0, 3, 3));
        QCOMPARE(grid.parts[1].target, QRect(2, 0, 96, 3));
        QCOMPARE(grid.parts[1].source, QRect(2, 0, 6, 3));
        QCOMPARE(grid.parts[4].target, QRect(2, 2, 96, 96));
        QCOMPARE(grid.parts[4].source, QRect(2, 2, 6, 6));
        QCOMPARE(grid.parts[8].target, QRect(97, 97, 3, 3));
        QCOMPARE(grid.parts[8].source, QRect(7, 7, 3, 3));
        for (int i = 0; i < 9; ++i) {
            QCOMPARE(grid.parts[static_cast<std::size_t>(i)].centre, i == 4);
        }
    }

    void theGridStandsInsideItsRectangle()
    {
        const vx::NinePartGrid grid
            = vx::ninePartGrid(QRect(30, 40, 50, 60), QSize(10, 10), QMargins(1, 2, 3, 4));
        QCOMPARE(grid.parts[0].target, QRect(QPoint(30, 40), QPoint(31, 42)));
        QCOMPARE(grid.parts[8].target, QRect(QPoint(76, 95), QPoint(79, 99)));
        QCOMPARE(grid.parts[8].source, QRect(QPoint(6, 5), QPoint(9, 9)));
    }

    void aGrowingBorderTakesWholeSteps_data()
    {
        QTest::addColumn<int>("width");
        QTest::addColumn<int>("left");
        QTest::addColumn<int>("right");
        // Picture 10 wide, margins 2 and 2: extent 9; k = (width - 1 - 9) / 4 + 1.
        QTest::newRow("same size") << 10 << 2 << 2;
        QTest::newRow("no whole step more") << 13 << 2 << 5;
        QTest::newRow("one step more") << 14 << 4 << 4;
        QTest::newRow("many") << 100 << 46 << 48;
        QTest::newRow("smaller: division towards 0") << 8 << 2 << 0;
    }
    void aGrowingBorderTakesWholeSteps()
    {
        QFETCH(int, width);
        QFETCH(int, left);
        QFETCH(int, right);
        const vx::NinePartGrid grid = vx::ninePartGridWithGrowingBorder(
            QRect(0, 0, width, width), QSize(10, 10), QMargins(2, 2, 2, 2));
        QVERIFY(grid.count > 0);
        const vx::NinePart& first = grid.parts[0];
        const vx::NinePart& last = grid.parts[static_cast<std::size_t>(grid.count - 1)];
        QCOMPARE(first.target.right(), left);
        QCOMPARE(first.target.bottom(), left);
        QCOMPARE(last.target.left(), width - 1 - right);
        QCOMPARE(last.target.right(), width - 1);
    }

    void aGrowingBorderLeavesTheCentreAtItsSize()
    {
        QRandomGenerator random(7);
        for (int i = 0; i < 2000; ++i) {
            const QMargins margins(random.bounded(1, 6), random.bounded(1, 6), random.bounded(1, 6), random.bounded(1, 6));
            const QSize picture(20 + random.bounded(20), 20 + random.bounded(20));
            const QRect target(random.bounded(50), random.bounded(50), 60 + random.bounded(300), 60 + random.bounded(300));
            const vx::NinePartGrid grid = vx::ninePartGridWithGrowingBorder(target, picture, margins);
            QCOMPARE(grid.count, 9);
            QCOMPARE(grid.parts[4].target.size(), grid.parts[4].source.size());
            QCOMPARE((grid.parts[0].target.width() - 1) % margins.left(), 0);
        }
    }

    void marginsOfNothingDoNotDivide()
    {
        const vx::NinePartGrid grid
            = vx::ninePartGridWithGrowingBorder(QRect(0, 0, 50, 50), QSize(10, 10), QMargins(0, 0, 0, 0));
        QVERIFY(grid.count > 0);
    }

    void partsWithoutRoomAreLeftOut()
    {
        // Margins meet beyond the middle: the middle column and row have no width.
        const vx::NinePartGrid grid = vx::ninePartGrid(QRect(0, 0, 6, 6), QSize(20, 20), QMargins(4, 4, 4, 4));
        QCOMPARE(grid.count, 4);
        QVERIFY(vx::ninePartGrid(QRect(0, 0, 50, 50), QSize(), QMargins(2, 2, 2, 2)).count == 0);
    }
};

ZELKOV_TEST_MAIN(TestNinePartGrid)
#include "tst_ninepartgrid.moc"
