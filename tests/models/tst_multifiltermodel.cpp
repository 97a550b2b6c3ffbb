// SPDX-License-Identifier: MIT
// Required and search filters, alone and together, on standing and changing sources.
#include <memory>

#include <QtCore/QItemSelectionModel>
#include <QtGui/QStandardItemModel>
#include <QtTest/QAbstractItemModelTester>
#include <QtTest/QtTest>

#include "models/MultiFilterModel.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

namespace
{
class Proxy : public vx::MultiFilterModel
{
public:
    using MultiFilterModel::acceptRow;
    using MultiFilterModel::MultiFilterModel;
};

/// Counts the cells that are read.
class Counting : public QStandardItemModel
{
public:
    using QStandardItemModel::QStandardItemModel;

    QVariant data(const QModelIndex& index, int role) const override
    {
        reads << (index.isValid() ? index.column() : -1);
        return QStandardItemModel::data(index, role);
    }

    mutable QVector<int> reads;
};

void addDevice(QStandardItemModel& model, const QString& name, const QString& place, const QString& state)
{
    model.appendRow({new QStandardItem(name), new QStandardItem(place), new QStandardItem(state)});
}

/// Name, place, state.
void fill(QStandardItemModel& model)
{
    addDevice(model, QStringLiteral("gate"), QStringLiteral("north"), QStringLiteral("online"));
    addDevice(model, QStringLiteral("old gate"), QStringLiteral("north"), QStringLiteral("offline"));
    addDevice(model, QStringLiteral("yard"), QStringLiteral("by the gate"), QStringLiteral("online"));
    addDevice(model, QStringLiteral("roof"), QStringLiteral("south"), QStringLiteral("online"));
    addDevice(model, QStringLiteral("Gate"), QStringLiteral("South"), QStringLiteral("broken"));
}

QStringList names(const QAbstractItemModel& model)
{
    QStringList result;
    for (int row = 0; row < model.rowCount(); ++row) {
        result << model.index(row, 0).data().toString();
    }
    return result;
}

QRegExp word(const char* text, Qt::CaseSensitivity sensitivity = Qt::CaseSensitive)
{
    return QRegExp(QString::fromLatin1(text), sensitivity, QRegExp::RegExp);
}

QStringList list(const char* commaSeparated)
{
    return QString::fromLatin1(commaSeparated).split(QLatin1Char(','));
}

const char* const c_all = "gate,old gate,yard,roof,Gate";
}

class TestMultiFilterModel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void withoutFiltersEveryRowPasses();
    void requiredFilterMatchesTheWholeField();
    void searchFilterFindsTheSameWordAnywhere();
    void excludeTurnsARequiredFilter();
    void requiredFiltersAllHold();
    void repeatedRequiredFilterStaysSingle();
    void requiredAndExcludedTogetherRejectEveryRow();
    void aFilterThatDiffersInCaseOrSyntaxOrColumnIsAnother();
    void searchFindsInAnyColumnOfItsList();
    void searchFiltersAllHold();
    void searchWithoutColumnsRejectsAll();
    void emptyPatternsAddNothingButFilterAgain();
    void searchFiltersMayBeDoubled();
    void clearSearchFiltersKeepsRequiredOnes();
    void removeFiltersDropsBoth();
    void caseSensitivityIsThePatterns();
    void wildcardsAndExpressionsWork();
    void theCaretStandsForTheStartOfTheText();
    void columnsOutsideReadAsEmptyText();
    void filterRoleAppliesToBothSets();
    void theFilterOfTheBaseClassIsNotConsulted();
    void sortingIsThatOfTheBaseClass();
    void requiredFiltersAreTestedFirstAndFailuresEndTheTest();
    void subclassesTestRowsAgainstTheirOwnSets();
    void ownSetsGiveTheResultsOfTheModel();
    void acceptRowWithoutASourceReadsEmptyText();
    void setSearchFiltersReplacesThemAtOnce();
    void rowsModeKeepsTheSelection();
    void layoutModeGivesTheSameRowsAndKeepsTheSelection();
    void treesAreFilteredLevelByLevel();
    void passesTheModelTesterWhileFiltersChange_data();
    void passesTheModelTesterWhileFiltersChange();
    void passesTheModelTesterWhileTheSourceChanges_data();
    void passesTheModelTesterWhileTheSourceChanges();
    void filtersSurviveAChangeOfSource();

private:
    std::unique_ptr<QStandardItemModel> m_source;
    std::unique_ptr<Proxy> m_proxy;
};

void TestMultiFilterModel::init()
{
    TestCase::init();
    m_source = std::make_unique<QStandardItemModel>();
    fill(*m_source);
    m_proxy = std::make_unique<Proxy>(nullptr);
    m_proxy->setSourceModel(m_source.get());
}

void TestMultiFilterModel::cleanup()
{
    m_proxy.reset();
    m_source.reset();
    TestCase::cleanup();
}

void TestMultiFilterModel::withoutFiltersEveryRowPasses()
{
    QCOMPARE(names(*m_proxy), list(c_all));
}

void TestMultiFilterModel::requiredFilterMatchesTheWholeField()
{
    m_proxy->setRequiredFilter(0, word("gate"), false);
    QCOMPARE(names(*m_proxy), list("gate"));
}

void TestMultiFilterModel::searchFilterFindsTheSameWordAnywhere()
{
    m_proxy->addSearchFilter({0}, word("gate"));
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
}

void TestMultiFilterModel::excludeTurnsARequiredFilter()
{
    m_proxy->setRequiredFilter(0, word("gate"), true);
    QCOMPARE(names(*m_proxy), list("old gate,yard,roof,Gate"));
}

void TestMultiFilterModel::requiredFiltersAllHold()
{
    m_proxy->setRequiredFilter(2, word("online"), false);
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));
    m_proxy->setRequiredFilter(1, word("north"), true);
    QCOMPARE(names(*m_proxy), list("yard,roof"));
    m_proxy->setRequiredFilter(2, word("offline"), false); // the same column again: a further condition
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::repeatedRequiredFilterStaysSingle()
{
    Counting source;
    addDevice(source, QStringLiteral("gate"), QString(), QString());
    m_proxy->setSourceModel(&source);
    m_proxy->setRequiredFilter(0, word("gate"), false);
    m_proxy->setRequiredFilter(0, word("gate"), false);
    source.reads.clear();
    m_proxy->invalidate();
    QCOMPARE(m_proxy->rowCount(), 1);
    QCOMPARE(source.reads.count(0), 1);
    m_proxy->setSourceModel(m_source.get());
}

void TestMultiFilterModel::requiredAndExcludedTogetherRejectEveryRow()
{
    m_proxy->setRequiredFilter(0, word("gate"), false);
    m_proxy->setRequiredFilter(0, word("gate"), true);
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::aFilterThatDiffersInCaseOrSyntaxOrColumnIsAnother()
{
    m_proxy->setRequiredFilter(0, word("gate", Qt::CaseInsensitive), false);
    QCOMPARE(names(*m_proxy), list("gate,Gate"));
    m_proxy->setRequiredFilter(0, word("gate", Qt::CaseSensitive), false);
    QCOMPARE(names(*m_proxy), list("gate"));
    m_proxy->removeFilters();
    m_proxy->setRequiredFilter(0, QRegExp(QStringLiteral("g*"), Qt::CaseSensitive, QRegExp::Wildcard), false);
    QCOMPARE(names(*m_proxy), list("gate"));
    m_proxy->setRequiredFilter(0, QRegExp(QStringLiteral("g*"), Qt::CaseSensitive, QRegExp::RegExp), false);
    QCOMPARE(names(*m_proxy), QStringList());
    m_proxy->removeFilters();
    m_proxy->setRequiredFilter(0, word("roof"), false);
    m_proxy->setRequiredFilter(1, word("roof"), false);
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::searchFindsInAnyColumnOfItsList()
{
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    QCOMPARE(names(*m_proxy), list("gate,old gate,yard"));
}

void TestMultiFilterModel::searchFiltersAllHold()
{
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    m_proxy->addSearchFilter({1, 2}, word("north"));
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
    m_proxy->addSearchFilter({2}, word("off"));
    QCOMPARE(names(*m_proxy), list("old gate"));
}

void TestMultiFilterModel::searchWithoutColumnsRejectsAll()
{
    m_proxy->addSearchFilter({}, word("gate"));
    QCOMPARE(names(*m_proxy), QStringList());
    m_proxy->clearSearchFilters();
    QCOMPARE(names(*m_proxy), list(c_all));
}

void TestMultiFilterModel::emptyPatternsAddNothingButFilterAgain()
{
    Counting source;
    fill(source);
    m_proxy->setSourceModel(&source);
    m_proxy->setRequiredFilter(2, word("online"), false);
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));

    source.reads.clear();
    m_proxy->addSearchFilter({0}, QRegExp());
    QVERIFY(source.reads.count(2) >= 5);
    source.reads.clear();
    m_proxy->setRequiredFilter(0, QRegExp(QString()), true);
    QVERIFY(source.reads.count(2) >= 5);
    QVERIFY(!source.reads.contains(0));
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));
    m_proxy->setSourceModel(m_source.get());
}

void TestMultiFilterModel::searchFiltersMayBeDoubled()
{
    Counting source;
    addDevice(source, QStringLiteral("gate"), QString(), QString());
    m_proxy->setSourceModel(&source);
    m_proxy->addSearchFilter({0}, word("gate"));
    m_proxy->addSearchFilter({0}, word("gate"));
    source.reads.clear();
    m_proxy->invalidate();
    QCOMPARE(m_proxy->rowCount(), 1);
    QCOMPARE(source.reads.count(0), 2);
    m_proxy->setSourceModel(m_source.get());
}

void TestMultiFilterModel::clearSearchFiltersKeepsRequiredOnes()
{
    m_proxy->setRequiredFilter(2, word("online"), false);
    m_proxy->addSearchFilter({0}, word("roof"));
    QCOMPARE(names(*m_proxy), list("roof"));
    m_proxy->clearSearchFilters();
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));
}

void TestMultiFilterModel::removeFiltersDropsBoth()
{
    m_proxy->setRequiredFilter(2, word("online"), false);
    m_proxy->addSearchFilter({0}, word("roof"));
    m_proxy->removeFilters();
    QCOMPARE(names(*m_proxy), list(c_all));
    m_proxy->setRequiredFilter(2, word("broken"), false);
    QCOMPARE(names(*m_proxy), list("Gate"));
}

void TestMultiFilterModel::caseSensitivityIsThePatterns()
{
    m_proxy->addSearchFilter({0}, word("GATE", Qt::CaseSensitive));
    QCOMPARE(names(*m_proxy), QStringList());
    m_proxy->clearSearchFilters();
    m_proxy->addSearchFilter({0}, word("GATE", Qt::CaseInsensitive));
    QCOMPARE(names(*m_proxy), list("gate,old gate,Gate"));
    m_proxy->removeFilters();
    m_proxy->setRequiredFilter(0, word("GATE", Qt::CaseInsensitive), false);
    QCOMPARE(names(*m_proxy), list("gate,Gate"));
}

void TestMultiFilterModel::wildcardsAndExpressionsWork()
{
    m_proxy->addSearchFilter({0}, QRegExp(QStringLiteral("o?d"), Qt::CaseSensitive, QRegExp::Wildcard));
    QCOMPARE(names(*m_proxy), list("old gate"));
    m_proxy->clearSearchFilters();
    m_proxy->addSearchFilter({0}, QRegExp(QStringLiteral("o?d"), Qt::CaseSensitive, QRegExp::FixedString));
    QCOMPARE(names(*m_proxy), QStringList());
    m_proxy->removeFilters();
    m_proxy->setRequiredFilter(0, word(".*gate"), false);
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
    m_proxy->setRequiredFilter(2, word("on|off"), true);
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
    m_proxy->setRequiredFilter(2, word("(on|off)line"), true);
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::theCaretStandsForTheStartOfTheText()
{
    m_proxy->addSearchFilter({0}, word("^gate"));
    QCOMPARE(names(*m_proxy), list("gate"));
}

void TestMultiFilterModel::columnsOutsideReadAsEmptyText()
{
    m_proxy->setRequiredFilter(7, word("x*"), false);
    QCOMPARE(names(*m_proxy), list(c_all));
    m_proxy->setRequiredFilter(-1, word("x"), false);
    QCOMPARE(names(*m_proxy), QStringList());
    m_proxy->removeFilters();
    m_proxy->addSearchFilter({7}, word("x*"));
    QCOMPARE(names(*m_proxy), list(c_all));
    m_proxy->addSearchFilter({7}, word("x"));
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::filterRoleAppliesToBothSets()
{
    m_source->item(3, 0)->setData(QStringLiteral("hidden gate"), Qt::UserRole);
    m_proxy->setFilterRole(Qt::UserRole);
    m_proxy->addSearchFilter({0}, word("gate"));
    QCOMPARE(names(*m_proxy), list("roof"));
    m_proxy->removeFilters();
    m_proxy->setRequiredFilter(0, word("hidden gate"), false);
    QCOMPARE(names(*m_proxy), list("roof"));
    m_proxy->setFilterRole(Qt::DisplayRole);
    QCOMPARE(names(*m_proxy), QStringList());
}

void TestMultiFilterModel::theFilterOfTheBaseClassIsNotConsulted()
{
    m_proxy->setFilterKeyColumn(0);
    m_proxy->setFilterFixedString(QStringLiteral("roof"));
    QCOMPARE(names(*m_proxy), list(c_all));
}

void TestMultiFilterModel::sortingIsThatOfTheBaseClass()
{
    m_proxy->setSortCaseSensitivity(Qt::CaseInsensitive);
    m_proxy->addSearchFilter({2}, word("line"));
    m_proxy->sort(0);
    QCOMPARE(names(*m_proxy), list("gate,old gate,roof,yard"));
    m_proxy->sort(0, Qt::DescendingOrder);
    QCOMPARE(names(*m_proxy), list("yard,roof,old gate,gate"));
    addDevice(*m_source, QStringLiteral("pole"), QString(), QStringLiteral("online"));
    QCOMPARE(names(*m_proxy), list("yard,roof,pole,old gate,gate"));
    m_proxy->clearSearchFilters();
    QCOMPARE(names(*m_proxy).size(), 6);
    QCOMPARE(names(*m_proxy).first(), QStringLiteral("yard"));
}

void TestMultiFilterModel::requiredFiltersAreTestedFirstAndFailuresEndTheTest()
{
    Counting source;
    addDevice(source, QStringLiteral("gate"), QStringLiteral("north"), QStringLiteral("online"));
    m_proxy->setSourceModel(&source);
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    m_proxy->setRequiredFilter(2, word("online"), false);
    source.reads.clear();
    m_proxy->invalidate();
    m_proxy->rowCount();
    QCOMPARE(source.reads, QVector<int>({2, 0})); // the hit in column 0 ends the search

    m_proxy->setRequiredFilter(1, word("south"), false);
    m_proxy->setRequiredFilter(0, word("gate"), false);
    source.reads.clear();
    m_proxy->invalidate();
    m_proxy->rowCount();
    QCOMPARE(source.reads, QVector<int>({2, 1})); // the failure in column 1 ends the test
    m_proxy->setSourceModel(m_source.get());
}

void TestMultiFilterModel::subclassesTestRowsAgainstTheirOwnSets()
{
    /// Shows devices that pass, and those that are broken.
    class AlsoBroken : public vx::MultiFilterModel
    {
    public:
        AlsoBroken()
            : MultiFilterModel(nullptr)
        {
            m_broken << Filter {2, word("broken"), false};
        }

    protected:
        bool filterAcceptsRow(int row, const QModelIndex& parent) const override
        {
            return MultiFilterModel::filterAcceptsRow(row, parent) || acceptRow(m_broken, row, parent);
        }

    private:
        QList<Filter> m_broken;
    };
    AlsoBroken proxy;
    proxy.setSourceModel(m_source.get());
    proxy.addSearchFilter({0}, word("roof"));
    QCOMPARE(names(proxy), list("roof,Gate"));
}

void TestMultiFilterModel::ownSetsGiveTheResultsOfTheModel()
{
    using Filter = vx::MultiFilterModel::Filter;
    using Searches = QVector<QPair<QVector<int>, QRegExp>>;
    const QModelIndex top;
    QVERIFY(m_proxy->acceptRow(QList<Filter>(), 0, top));
    QVERIFY(m_proxy->acceptRow(Searches(), 0, top));
    QVERIFY(m_proxy->acceptRow(QList<Filter>(), Searches(), 0, top));

    const QList<Filter> online {{2, word("online"), false}};
    const QList<Filter> notNorth {{2, word("online"), false}, {1, word("north"), true}};
    const Searches gate {{{0, 1}, word("gate")}};
    const Searches none {{{}, word("gate")}};
    QVERIFY(m_proxy->acceptRow(online, 0, top));
    QVERIFY(!m_proxy->acceptRow(online, 1, top));
    QVERIFY(!m_proxy->acceptRow(notNorth, 0, top));
    QVERIFY(m_proxy->acceptRow(notNorth, 2, top));
    QVERIFY(m_proxy->acceptRow(gate, 2, top));
    QVERIFY(!m_proxy->acceptRow(gate, 3, top));
    QVERIFY(!m_proxy->acceptRow(none, 0, top));
    QVERIFY(m_proxy->acceptRow(online, gate, 0, top));
    QVERIFY(!m_proxy->acceptRow(online, gate, 1, top));
    QVERIFY(!m_proxy->acceptRow(online, gate, 3, top));
    QCOMPARE(names(*m_proxy), list(c_all)); // the model's own sets are another matter
}

void TestMultiFilterModel::acceptRowWithoutASourceReadsEmptyText()
{
    Proxy proxy(nullptr);
    proxy.setRequiredFilter(0, word("x"), false);
    QVERIFY(!proxy.acceptRow(QList<vx::MultiFilterModel::Filter> {{0, word("x"), false}}, 0, QModelIndex()));
    QCOMPARE(proxy.rowCount(), 0);
}

void TestMultiFilterModel::setSearchFiltersReplacesThemAtOnce()
{
    m_proxy->setRequiredFilter(2, word("online"), false);
    m_proxy->addSearchFilter({0}, word("roof"));
    QCOMPARE(names(*m_proxy), list("roof"));
    QSignalSpy inserted(m_proxy.get(), &QAbstractItemModel::rowsInserted);
    m_proxy->setSearchFilters({{{0, 1}, word("gate")}, {{0}, QRegExp()}});
    QCOMPARE(names(*m_proxy), list("gate,yard"));
    QVERIFY(inserted.count() > 0);
    // Only what the new filters show came in; clearing first would have shown the roof again.
    int rows = 0;
    for (const QList<QVariant>& arguments : inserted) {
        rows += arguments.at(2).toInt() - arguments.at(1).toInt() + 1;
    }
    QCOMPARE(rows, 2);
    m_proxy->setSearchFilters({});
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));
}

void TestMultiFilterModel::rowsModeKeepsTheSelection()
{
    QCOMPARE(int(m_proxy->refreshMode()), int(vx::MultiFilterModel::RefreshMode::Rows));
    QItemSelectionModel selection(m_proxy.get());
    selection.select(m_proxy->index(3, 0), QItemSelectionModel::Select); // the roof
    int layouts = 0;
    connect(m_proxy.get(), &QAbstractItemModel::layoutChanged, m_proxy.get(), [&layouts] { ++layouts; });
    QSignalSpy removed(m_proxy.get(), &QAbstractItemModel::rowsRemoved);
    m_proxy->setRequiredFilter(2, word("online"), false);
    QCOMPARE(layouts, 0);
    QCOMPARE(removed.count(), 2);
    QCOMPARE(selection.selectedIndexes(), QModelIndexList({m_proxy->index(2, 0)}));
}

void TestMultiFilterModel::layoutModeGivesTheSameRowsAndKeepsTheSelection()
{
    m_proxy->setRefreshMode(vx::MultiFilterModel::RefreshMode::Layout);
    QCOMPARE(int(m_proxy->refreshMode()), int(vx::MultiFilterModel::RefreshMode::Layout));
    QAbstractItemModelTester tester(m_proxy.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
    QItemSelectionModel selection(m_proxy.get());
    selection.select(m_proxy->index(3, 0), QItemSelectionModel::Select); // the roof
    int layouts = 0;
    connect(m_proxy.get(), &QAbstractItemModel::layoutChanged, m_proxy.get(), [&layouts] { ++layouts; });
    QSignalSpy removed(m_proxy.get(), &QAbstractItemModel::rowsRemoved);
    m_proxy->setRequiredFilter(2, word("online"), false);
    QCOMPARE(layouts, 1);
    QCOMPARE(removed.count(), 0);
    QCOMPARE(names(*m_proxy), list("gate,yard,roof"));
    QCOMPARE(selection.selectedIndexes(), QModelIndexList({m_proxy->index(2, 0)}));
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    QCOMPARE(names(*m_proxy), list("gate,yard"));
    m_proxy->removeFilters();
    QCOMPARE(names(*m_proxy), list(c_all));
}

void TestMultiFilterModel::treesAreFilteredLevelByLevel()
{
    m_source->item(0, 0)->appendRow(new QStandardItem(QStringLiteral("gate lamp")));
    m_source->item(0, 0)->appendRow(new QStandardItem(QStringLiteral("bell")));
    m_proxy->addSearchFilter({0}, word("gate"));
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
    const QModelIndex gate = m_proxy->index(0, 0);
    QCOMPARE(m_proxy->rowCount(gate), 1);
    QCOMPARE(m_proxy->index(0, 0, gate).data().toString(), QStringLiteral("gate lamp"));
}

void TestMultiFilterModel::passesTheModelTesterWhileFiltersChange_data()
{
    QTest::addColumn<bool>("sorted");
    QTest::newRow("in the order of the source") << false;
    QTest::newRow("sorted") << true;
}

void TestMultiFilterModel::passesTheModelTesterWhileFiltersChange()
{
    QFETCH(bool, sorted);
    if (sorted) {
        m_proxy->sort(0);
    }
    QAbstractItemModelTester tester(m_proxy.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
    m_proxy->setRequiredFilter(2, word("online"), false);
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    m_proxy->addSearchFilter({}, word("gate"));
    QCOMPARE(m_proxy->rowCount(), 0);
    m_proxy->clearSearchFilters();
    m_proxy->addSearchFilter({0}, word("o"));
    m_proxy->removeFilters();
    QCOMPARE(m_proxy->rowCount(), 5);
}

void TestMultiFilterModel::passesTheModelTesterWhileTheSourceChanges_data()
{
    QTest::addColumn<bool>("sorted");
    QTest::newRow("in the order of the source") << false;
    QTest::newRow("sorted") << true;
}

void TestMultiFilterModel::passesTheModelTesterWhileTheSourceChanges()
{
    QFETCH(bool, sorted);
    if (sorted) {
        m_proxy->sort(0);
    }
    m_proxy->setRequiredFilter(2, word("online"), false);
    m_proxy->addSearchFilter({0, 1}, word("gate"));
    QAbstractItemModelTester tester(m_proxy.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
    addDevice(*m_source, QStringLiteral("gate 2"), QString(), QStringLiteral("online"));
    addDevice(*m_source, QStringLiteral("gate 3"), QString(), QStringLiteral("offline"));
    QCOMPARE(names(*m_proxy), list(sorted ? "gate,gate 2,yard" : "gate,yard,gate 2"));
    m_source->item(6, 2)->setText(QStringLiteral("online")); // comes in by a change of data
    QCOMPARE(m_proxy->rowCount(), 4);
    m_source->item(0, 2)->setText(QStringLiteral("offline")); // and one goes
    QCOMPARE(m_proxy->rowCount(), 3);
    m_source->insertRow(0, {new QStandardItem(QStringLiteral("first gate")), new QStandardItem,
                               new QStandardItem(QStringLiteral("online"))});
    QCOMPARE(m_proxy->rowCount(), 4);
    m_source->removeRows(1, 3);
    QCOMPARE(m_proxy->rowCount(), 3);
    m_source->clear();
    QCOMPARE(m_proxy->rowCount(), 0);
    fill(*m_source);
    QCOMPARE(m_proxy->rowCount(), 2);
}

void TestMultiFilterModel::filtersSurviveAChangeOfSource()
{
    m_proxy->addSearchFilter({0}, word("gate"));
    QStandardItemModel other;
    addDevice(other, QStringLiteral("side gate"), QString(), QString());
    addDevice(other, QStringLiteral("door"), QString(), QString());
    m_proxy->setSourceModel(&other);
    QCOMPARE(names(*m_proxy), list("side gate"));
    m_proxy->setSourceModel(m_source.get());
    QCOMPARE(names(*m_proxy), list("gate,old gate"));
}

ZELKOV_TEST_MAIN(TestMultiFilterModel)
#include "tst_multifiltermodel.moc"
