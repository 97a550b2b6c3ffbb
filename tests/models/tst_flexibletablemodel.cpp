// SPDX-License-Identifier: MIT
// The shape of the wrapped table, its odd dimension, and the model under Qt's own tester.
#include <random>

#include <QtTest/QAbstractItemModelTester>
#include <QtTest/QtTest>

#include "models/FlexibleTableModel.h"
#include "models/TableShape.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

using Position = std::pair<int, int>;
Q_DECLARE_METATYPE(Position)

namespace
{
class Letters : public vx::FlexibleTableModel
{
public:
    using FlexibleTableModel::columnCount;
    using FlexibleTableModel::dimension;
    using FlexibleTableModel::FlexibleTableModel;
    using FlexibleTableModel::rowCount;

    int cellCount(const QModelIndex& parent) const override
    {
        parentWasValid = parentWasValid || parent.isValid();
        return cells.size();
    }

    QVariant cellData(int cell, int role) const override
    {
        asked << cell;
        return role == Qt::DisplayRole && cell < cells.size() ? QVariant(cells.at(cell)) : QVariant();
    }

    void setCount(int count)
    {
        beginResetModel();
        cells.clear();
        for (int i = 0; i < count; ++i) {
            cells << QString::number(i);
        }
        endResetModel();
    }

    QStringList cells;
    mutable QVector<int> asked;
    mutable bool parentWasValid = false;
};

/// Cells stand in every second row.
class Spread : public Letters
{
public:
    std::pair<int, int> modelIndexPair(int cell) const override { return std::make_pair(cell * 2, 0); }
};
}

class TestFlexibleTableModel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void startsAsOneRow();
    void shapeOfTheTable_data();
    void shapeOfTheTable();
    void everyCellIsFoundAgain();
    void horizontalForcesDimensionOne();
    void dimensionIsAtLeastOne_data();
    void dimensionIsAtLeastOne();
    void changeOfLayoutResetsOnce();
    void repeatedLayoutDoesNotReset();
    void theLastRowIsShort();
    void oddDimension_data();
    void oddDimension();
    void sizesOfAGivenCount_data();
    void sizesOfAGivenCount();
    void rowsOfAGivenCountFollowAnOverriddenPosition();
    void anInvalidIndexIsNoCellAndIsNotAsked();
    void cellsOutsideHaveNoIndex();
    void childrenDoNotExist();
    void dataComesByTheFlatIndex();
    void overriddenCellIndexDecidesWhatIsShown();
    void passesTheModelTester_data();
    void passesTheModelTester();
    void passesTheModelTesterWhileChanging();
    void insertedRowsAndColumnsPassTheModelTester();
};

void TestFlexibleTableModel::startsAsOneRow()
{
    Letters model;
    QCOMPARE(model.orientation(), Qt::Horizontal);
    model.setCount(4);
    QCOMPARE(model.rowCount(QModelIndex()), 1);
    QCOMPARE(model.columnCount(QModelIndex()), 4);
}

void TestFlexibleTableModel::shapeOfTheTable_data()
{
    QTest::addColumn<int>("orientation");
    QTest::addColumn<int>("dimension");
    QTest::addColumn<int>("cells");
    QTest::addColumn<int>("rows");
    QTest::addColumn<int>("columns");

    const int horizontal = Qt::Horizontal;
    const int vertical = Qt::Vertical;
    QTest::newRow("horizontal 0") << horizontal << 1 << 0 << 1 << 0;
    QTest::newRow("horizontal 1") << horizontal << 1 << 1 << 1 << 1;
    QTest::newRow("horizontal 7") << horizontal << 1 << 7 << 1 << 7;
    QTest::newRow("horizontal, 5 asked for") << horizontal << 5 << 7 << 1 << 7;
    QTest::newRow("vertical 0") << vertical << 3 << 0 << 0 << 3;
    QTest::newRow("vertical 1") << vertical << 3 << 1 << 1 << 3;
    QTest::newRow("vertical 2") << vertical << 3 << 2 << 1 << 3;
    QTest::newRow("vertical 3, exact") << vertical << 3 << 3 << 1 << 3;
    QTest::newRow("vertical 4") << vertical << 3 << 4 << 2 << 3;
    QTest::newRow("vertical 6, exact") << vertical << 3 << 6 << 2 << 3;
    QTest::newRow("vertical 7, uneven") << vertical << 3 << 7 << 3 << 3;
    QTest::newRow("vertical, one column") << vertical << 1 << 7 << 7 << 1;
    QTest::newRow("vertical, wider than full") << vertical << 10 << 7 << 1 << 10;
}

void TestFlexibleTableModel::shapeOfTheTable()
{
    QFETCH(int, orientation);
    QFETCH(int, dimension);
    QFETCH(int, cells);
    QFETCH(int, rows);
    QFETCH(int, columns);

    const vx::TableShape shape = vx::TableShape::of(Qt::Orientation(orientation), dimension);
    QCOMPARE(shape.rows(cells), rows);
    QCOMPARE(shape.columns(cells), columns);

    Letters model;
    model.setCount(cells);
    model.setOrientation(Qt::Orientation(orientation), dimension);
    QCOMPARE(int(model.orientation()), orientation);
    QCOMPARE(model.rowCount(QModelIndex()), rows);
    QCOMPARE(model.columnCount(QModelIndex()), columns);
}

void TestFlexibleTableModel::everyCellIsFoundAgain()
{
    const uint seed = 7;
    std::mt19937 random(seed);
    for (int round = 0; round < 2000; ++round) {
        const auto shape = vx::TableShape::of(random() % 2 == 0 ? Qt::Horizontal : Qt::Vertical, int(random() % 12));
        const int count = int(random() % 100) + 1;
        const int cell = int(random() % uint(count));
        const Position position = shape.position(cell);
        const QByteArray where = QByteArray::number(round) + " of seed " + QByteArray::number(seed);
        QVERIFY2(shape.cell(position) == cell, where);
        QVERIFY2(position.first >= 0 && position.first < shape.rows(count), where);
        QVERIFY2(position.second >= 0 && position.second < shape.columns(count), where);
        QVERIFY2(shape.rows(count) * shape.columns(count) - count < shape.columns(count), where);
    }
}

void TestFlexibleTableModel::horizontalForcesDimensionOne()
{
    Letters model;
    model.setCount(7);
    QVERIFY(!model.setOrientation(Qt::Horizontal, 5)); // one row it was before
    QCOMPARE(model.columnCount(QModelIndex()), 7);
    QVERIFY(model.setOrientation(Qt::Vertical, 3));
    QVERIFY(model.setOrientation(Qt::Horizontal, 3));
    QCOMPARE(model.rowCount(QModelIndex()), 1);
    QCOMPARE(model.columnCount(QModelIndex()), 7);
}

void TestFlexibleTableModel::dimensionIsAtLeastOne_data()
{
    QTest::addColumn<int>("dimension");
    QTest::newRow("0") << 0;
    QTest::newRow("-1") << -1;
    QTest::newRow("least") << std::numeric_limits<int>::min();
}

void TestFlexibleTableModel::dimensionIsAtLeastOne()
{
    QFETCH(int, dimension);
    Letters model;
    model.setCount(4);
    QVERIFY(model.setOrientation(Qt::Vertical, dimension));
    QCOMPARE(model.columnCount(QModelIndex()), 1);
    QCOMPARE(model.rowCount(QModelIndex()), 4);
    QVERIFY(!model.setOrientation(Qt::Vertical, 1));
}

void TestFlexibleTableModel::changeOfLayoutResetsOnce()
{
    Letters model;
    model.setCount(7);
    QSignalSpy about(&model, &QAbstractItemModel::modelAboutToBeReset);
    QSignalSpy done(&model, &QAbstractItemModel::modelReset);
    int columnsBefore = 0;
    connect(&model, &QAbstractItemModel::modelAboutToBeReset, &model,
        [&] { columnsBefore = model.columnCount(QModelIndex()); });
    QVERIFY(model.setOrientation(Qt::Vertical, 3));
    QCOMPARE(about.count(), 1);
    QCOMPARE(done.count(), 1);
    QCOMPARE(columnsBefore, 7);
    QVERIFY(model.setOrientation(Qt::Vertical, 4));
    QCOMPARE(done.count(), 2);
}

void TestFlexibleTableModel::repeatedLayoutDoesNotReset()
{
    Letters model;
    model.setCount(7);
    model.setOrientation(Qt::Vertical, 3);
    QSignalSpy done(&model, &QAbstractItemModel::modelReset);
    QVERIFY(!model.setOrientation(Qt::Vertical, 3));
    QCOMPARE(done.count(), 0);
}

void TestFlexibleTableModel::theLastRowIsShort()
{
    Letters model;
    model.setCount(7);
    model.setOrientation(Qt::Vertical, 3);
    QCOMPARE(model.modelIndexPair(6), Position(2, 0));
    QCOMPARE(model.modelIndex(6), model.index(2, 0, QModelIndex()));
    QCOMPARE(model.cellIndex(Position(2, 2)), 8);
    QCOMPARE(model.cellIndex(model.index(2, 2, QModelIndex())), 8);
    model.asked.clear();
    QCOMPARE(model.data(model.index(2, 2, QModelIndex()), Qt::DisplayRole), QVariant());
    QCOMPARE(model.asked, QVector<int>({8}));
}

void TestFlexibleTableModel::oddDimension_data()
{
    QTest::addColumn<int>("orientation");
    QTest::addColumn<int>("cells");
    QTest::addColumn<Position>("expected");

    const int horizontal = Qt::Horizontal;
    const int vertical = Qt::Vertical;
    QTest::newRow("vertical 0") << vertical << 0 << Position(0, 0);
    QTest::newRow("vertical 1") << vertical << 1 << Position(1, 1);
    QTest::newRow("vertical 2") << vertical << 2 << Position(1, 3);
    QTest::newRow("vertical 3, a row too many") << vertical << 3 << Position(2, 1);
    QTest::newRow("vertical 4") << vertical << 4 << Position(2, 2);
    QTest::newRow("vertical 6, a row too many") << vertical << 6 << Position(3, 1);
    QTest::newRow("vertical 7") << vertical << 7 << Position(3, 2);
    QTest::newRow("horizontal 0") << horizontal << 0 << Position(0, 0);
    QTest::newRow("horizontal 1") << horizontal << 1 << Position(1, 1);
    QTest::newRow("horizontal 5") << horizontal << 5 << Position(1, 6);
}

void TestFlexibleTableModel::oddDimension()
{
    QFETCH(int, orientation);
    QFETCH(int, cells);
    QFETCH(Position, expected);
    Letters model;
    model.setOrientation(Qt::Orientation(orientation), 3);
    QCOMPARE(model.dimension(cells), expected);
}

void TestFlexibleTableModel::sizesOfAGivenCount_data()
{
    QTest::addColumn<int>("orientation");
    QTest::addColumn<int>("cells");
    QTest::addColumn<int>("rows");
    QTest::addColumn<int>("columns");

    const int horizontal = Qt::Horizontal;
    const int vertical = Qt::Vertical;
    QTest::newRow("horizontal -1") << horizontal << -1 << 1 << 0;
    QTest::newRow("horizontal 0") << horizontal << 0 << 1 << 0;
    QTest::newRow("horizontal 5") << horizontal << 5 << 1 << 5;
    QTest::newRow("vertical -1") << vertical << -1 << 0 << 3;
    QTest::newRow("vertical 0") << vertical << 0 << 0 << 3;
    QTest::newRow("vertical 1") << vertical << 1 << 1 << 3;
    QTest::newRow("vertical 2") << vertical << 2 << 1 << 3;
    QTest::newRow("vertical 3") << vertical << 3 << 1 << 3;
    QTest::newRow("vertical 4") << vertical << 4 << 2 << 3;
    QTest::newRow("vertical 7") << vertical << 7 << 3 << 3;
}

void TestFlexibleTableModel::sizesOfAGivenCount()
{
    QFETCH(int, orientation);
    QFETCH(int, cells);
    QFETCH(int, rows);
    QFETCH(int, columns);
    Letters model; // without cells of its own: the count is the given one
    model.setOrientation(Qt::Orientation(orientation), 3);
    QCOMPARE(model.rowCount(cells), rows);
    QCOMPARE(model.columnCount(cells), columns);
}

void TestFlexibleTableModel::rowsOfAGivenCountFollowAnOverriddenPosition()
{
    Spread model;
    model.setOrientation(Qt::Vertical, 2);
    QCOMPARE(model.rowCount(5), 9);
    QCOMPARE(model.rowCount(1), 1);
}

void TestFlexibleTableModel::anInvalidIndexIsNoCellAndIsNotAsked()
{
    Letters model;
    model.setCount(3);
    QCOMPARE(model.cellIndex(QModelIndex()), -1);
    QVERIFY(!model.data(QModelIndex(), Qt::DisplayRole).isValid());
    QVERIFY(model.asked.isEmpty());
}

void TestFlexibleTableModel::cellsOutsideHaveNoIndex()
{
    Letters model;
    model.setCount(4);
    model.setOrientation(Qt::Vertical, 3);
    QVERIFY(!model.modelIndex(-1).isValid());
    QVERIFY(!model.modelIndex(-4).isValid());
    QVERIFY(model.modelIndex(5).isValid()); // the short row's empty place
    QVERIFY(!model.modelIndex(6).isValid());
    QVERIFY(!model.index(0, 3, QModelIndex()).isValid());
}

void TestFlexibleTableModel::childrenDoNotExist()
{
    Letters model;
    model.setCount(4);
    const QModelIndex first = model.modelIndex(0);
    QCOMPARE(model.rowCount(first), 0);
    QCOMPARE(model.columnCount(first), 0);
    QVERIFY(!model.index(0, 0, first).isValid());
    QVERIFY(!model.parentWasValid);
}

void TestFlexibleTableModel::dataComesByTheFlatIndex()
{
    Letters model;
    model.setCount(7);
    for (const int columns : {1, 2, 3, 7, 10}) {
        model.setOrientation(Qt::Vertical, columns);
        for (int cell = 0; cell < 7; ++cell) {
            QCOMPARE(model.modelIndex(cell).data().toString(), QString::number(cell));
        }
    }
    model.setOrientation(Qt::Horizontal, 1);
    for (int cell = 0; cell < 7; ++cell) {
        QCOMPARE(model.modelIndex(cell), model.index(0, cell, QModelIndex()));
        QCOMPARE(model.modelIndex(cell).data().toString(), QString::number(cell));
    }
}

void TestFlexibleTableModel::overriddenCellIndexDecidesWhatIsShown()
{
    class Reversed : public Letters
    {
    public:
        using Letters::cellIndex;
        int cellIndex(const std::pair<int, int>& position) const override
        {
            return cells.size() - 1 - Letters::cellIndex(position);
        }
    };
    Reversed model;
    model.setCount(4);
    QCOMPARE(model.index(0, 0, QModelIndex()).data().toString(), QStringLiteral("3"));
}

void TestFlexibleTableModel::passesTheModelTester_data()
{
    QTest::addColumn<int>("orientation");
    QTest::addColumn<int>("cells");
    for (const int cells : {0, 1, 2, 3, 6, 7}) {
        QTest::addRow("horizontal %d", cells) << int(Qt::Horizontal) << cells;
        QTest::addRow("vertical %d", cells) << int(Qt::Vertical) << cells;
    }
}

void TestFlexibleTableModel::passesTheModelTester()
{
    QFETCH(int, orientation);
    QFETCH(int, cells);
    Letters model;
    model.setCount(cells);
    model.setOrientation(Qt::Orientation(orientation), 3);
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
}

void TestFlexibleTableModel::passesTheModelTesterWhileChanging()
{
    Letters model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    for (int round = 0; round < 40; ++round) {
        model.setCount((round * 7) % 11);
        model.setOrientation(round % 3 == 0 ? Qt::Horizontal : Qt::Vertical, round % 5);
    }
}

void TestFlexibleTableModel::insertedRowsAndColumnsPassTheModelTester()
{
    class Growing : public Letters
    {
    public:
        void grow()
        {
            const int count = cells.size();
            if (orientation() == Qt::Horizontal) {
                beginInsertColumns(QModelIndex(), count, count);
                cells << QString::number(count);
                endInsertColumns();
            } else {
                beginInsertRows(QModelIndex(), count, count);
                cells << QString::number(count);
                endInsertRows();
            }
        }
    };
    Growing model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    for (int i = 0; i < 4; ++i) {
        model.grow();
    }
    QCOMPARE(model.columnCount(QModelIndex()), 4);
    model.setOrientation(Qt::Vertical, 1);
    for (int i = 0; i < 4; ++i) {
        model.grow();
    }
    QCOMPARE(model.rowCount(QModelIndex()), 8);
}

ZELKOV_TEST_MAIN(TestFlexibleTableModel)
#include "tst_flexibletablemodel.moc"
