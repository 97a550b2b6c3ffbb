// SPDX-License-Identifier: MIT
// Where a drop lands, as a plain function.
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/DropPosition.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>

class TestDropPosition : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFirstCentrePastThePointIsTaken_data();
    void theFirstCentrePastThePointIsTaken();
    void theOtherAxisDoesNotMatter();
    void theFirstInOrderGoesBeforeTheNearest();
    void randomRowsAgreeWithCounting();
};

void TestDropPosition::theFirstCentrePastThePointIsTaken_data()
{
    QTest::addColumn<int>("at");
    QTest::addColumn<int>("position");
    // Items of 20 pixels side by side: centres at 9, 29, 49.
    QTest::newRow("before all") << -5 << 0;
    QTest::newRow("just before the first centre") << 8 << 0;
    QTest::newRow("on the first centre") << 9 << 1;
    QTest::newRow("between") << 20 << 1;
    QTest::newRow("just before the last") << 48 << 2;
    QTest::newRow("on the last") << 49 << -1;
    QTest::newRow("past all") << 500 << -1;
}

void TestDropPosition::theFirstCentrePastThePointIsTaken()
{
    QFETCH(int, at);
    const QVector<QRect> across = {QRect(0, 0, 20, 30), QRect(20, 0, 20, 30), QRect(40, 0, 20, 30)};
    const QVector<QRect> down = {QRect(0, 0, 30, 20), QRect(0, 20, 30, 20), QRect(0, 40, 30, 20)};
    QTEST(vx::dropPosition(across, QPoint(at, 1000), Qt::Horizontal), "position");
    QTEST(vx::dropPosition(down, QPoint(1000, at), Qt::Vertical), "position");
    QCOMPARE(vx::dropPosition({}, QPoint(at, at), Qt::Horizontal), -1);
}

void TestDropPosition::theOtherAxisDoesNotMatter()
{
    const QVector<QRect> one = {QRect(0, 0, 20, 20)};
    for (const int other : {-1000, 0, 9, 1000}) {
        QCOMPARE(vx::dropPosition(one, QPoint(5, other), Qt::Horizontal), 0);
        QCOMPARE(vx::dropPosition(one, QPoint(other, 5), Qt::Vertical), 0);
        QCOMPARE(vx::dropPosition(one, QPoint(15, other), Qt::Horizontal), -1);
    }
}

void TestDropPosition::theFirstInOrderGoesBeforeTheNearest()
{
    // As in a bar that runs from right to left.
    const QVector<QRect> mirrored = {QRect(40, 0, 20, 20), QRect(20, 0, 20, 20), QRect(0, 0, 20, 20)};
    QCOMPARE(vx::dropPosition(mirrored, QPoint(5, 5), Qt::Horizontal), 0);
    QCOMPARE(vx::dropPosition(mirrored, QPoint(45, 5), Qt::Horizontal), 0);
    QCOMPARE(vx::dropPosition(mirrored, QPoint(55, 5), Qt::Horizontal), -1);
}

void TestDropPosition::randomRowsAgreeWithCounting()
{
    QRandomGenerator random(55);
    for (int i = 0; i < 5000; ++i) {
        QVector<QRect> items;
        int x = 0;
        for (int n = random.bounded(8); n > 0; --n) {
            const int width = random.bounded(1, 40);
            items << QRect(x, 0, width, 10);
            x += width;
        }
        const QPoint point(random.bounded(-20, x + 20), 3);
        int before = 0;
        for (const QRect& item : items) {
            before += item.center().x() <= point.x() ? 1 : 0;
        }
        QCOMPARE(vx::dropPosition(items, point, Qt::Horizontal), before == items.size() ? -1 : before);
    }
}

ZELKOV_TEST_MAIN(TestDropPosition)
#include "tst_dropposition.moc"
