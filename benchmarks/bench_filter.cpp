// SPDX-License-Identifier: MIT
// What filtering costs, beside a plain QSortFilterProxyModel with one QRegExp and beside bare loops over the same
// strings. "--million" measures a list of 1,000,000 rows once, with the memory it takes.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstring>
#include <memory>

#include <QtCore/QAbstractTableModel>
#include <QtCore/QElapsedTimer>
#include <QtCore/QFile>
#include <QtCore/QSortFilterProxyModel>
#include <QtCore/QStringMatcher>
#include <QtWidgets/QApplication>

#include "models/MultiFilterModel.h"

namespace
{
constexpr int c_rows = 100000;
constexpr int c_columns = 4;

/// Name, place, address, state of made-up devices.
class Devices : public QAbstractTableModel
{
public:
    explicit Devices(int rows)
        : m_rows(rows)
    {
        static const char* const places[] = {"north gate", "car park", "loading ramp", "stairs", "lobby", "roof"};
        static const char* const states[] = {"online", "online", "online", "offline"};
        m_texts.reserve(rows * c_columns);
        uint random = 1;
        for (int row = 0; row < rows; ++row) {
            random = random * 1664525u + 1013904223u;
            m_texts << QStringLiteral("Camera %1").arg(row)
                    << QStringLiteral("Building %1, %2").arg(row % 97).arg(QLatin1String(places[(random >> 16) % 6]))
                    << QStringLiteral("10.%1.%2.%3").arg(row / 65536).arg(row / 256 % 256).arg(row % 256)
                    << QString::fromLatin1(states[(random >> 24) % 4]);
        }
    }

    int rowCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : m_rows; }
    int columnCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : c_columns; }
    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == Qt::DisplayRole && index.isValid()
            ? QVariant(m_texts.at(index.row() * c_columns + index.column()))
            : QVariant();
    }
    QString text(int row, int column) const { return m_texts.at(row * c_columns + column); }

private:
    int m_rows;
    QVector<QString> m_texts;
};

Devices& devices()
{
    static Devices model(c_rows);
    return model;
}

/// Tests rows without building a mapping, which costs every proxy the same.
class OpenProxy : public vx::MultiFilterModel
{
public:
    using MultiFilterModel::filterAcceptsRow;
    using MultiFilterModel::MultiFilterModel;
};

class OpenPlainProxy : public QSortFilterProxyModel
{
public:
    using QSortFilterProxyModel::filterAcceptsRow;
};

template <class Proxy>
void testAllRows(benchmark::State& state, const Proxy& proxy)
{
    for (auto _ : state) {
        int hits = 0;
        for (int row = 0; row < c_rows; ++row) {
            hits += proxy.filterAcceptsRow(row, QModelIndex()) ? 1 : 0;
        }
        benchmark::DoNotOptimize(hits);
        state.counters["rows"] = hits;
    }
    state.SetItemsProcessed(state.iterations() * c_rows);
}

QRegExp literal()
{
    return QRegExp(QStringLiteral("gate"), Qt::CaseInsensitive, QRegExp::FixedString);
}

// --- Rows only: the tests themselves ---------------------------------------------------------------------------

void rowsPlainAllColumns(benchmark::State& state)
{
    OpenPlainProxy proxy;
    proxy.setSourceModel(&devices());
    proxy.setFilterKeyColumn(-1);
    proxy.setFilterRegExp(literal());
    testAllRows(state, proxy);
}
BENCHMARK(rowsPlainAllColumns)->Unit(benchmark::kMillisecond);

void rowsPlainOneColumn(benchmark::State& state)
{
    OpenPlainProxy proxy;
    proxy.setSourceModel(&devices());
    proxy.setFilterKeyColumn(1);
    proxy.setFilterRegExp(literal());
    testAllRows(state, proxy);
}
BENCHMARK(rowsPlainOneColumn)->Unit(benchmark::kMillisecond);

void rowsSearchTwoColumns(benchmark::State& state)
{
    OpenProxy proxy(nullptr);
    proxy.setSourceModel(&devices());
    proxy.addSearchFilter({0, 1}, literal());
    testAllRows(state, proxy);
}
BENCHMARK(rowsSearchTwoColumns)->Unit(benchmark::kMillisecond);

void rowsSearchTwoColumnsExpression(benchmark::State& state)
{
    OpenProxy proxy(nullptr);
    proxy.setSourceModel(&devices());
    proxy.addSearchFilter({0, 1}, QRegExp(QStringLiteral("g.te"), Qt::CaseInsensitive));
    testAllRows(state, proxy);
}
BENCHMARK(rowsSearchTwoColumnsExpression)->Unit(benchmark::kMillisecond);

void rowsBareMatcherTwoColumns(benchmark::State& state)
{
    const QStringMatcher matcher(QStringLiteral("gate"), Qt::CaseInsensitive);
    const Devices& source = devices();
    for (auto _ : state) {
        int hits = 0;
        for (int row = 0; row < c_rows; ++row) {
            const bool hit
                = matcher.indexIn(source.data(source.index(row, 0), Qt::DisplayRole).toString()) >= 0
                || matcher.indexIn(source.data(source.index(row, 1), Qt::DisplayRole).toString()) >= 0;
            hits += hit ? 1 : 0;
        }
        benchmark::DoNotOptimize(hits);
    }
}
BENCHMARK(rowsBareMatcherTwoColumns)->Unit(benchmark::kMillisecond);

QRegExp requiredPattern(bool plain)
{
    return plain ? QRegExp(QStringLiteral("online"), Qt::CaseSensitive, QRegExp::FixedString)
                 : QRegExp(QStringLiteral("on(line|hold)"));
}

void rowsRequired(benchmark::State& state)
{
    OpenProxy proxy(nullptr);
    proxy.setSourceModel(&devices());
    proxy.setRequiredFilter(3, requiredPattern(state.range(0) != 0), false);
    testAllRows(state, proxy);
}
BENCHMARK(rowsRequired)->ArgName("literal")->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);

void rowsBareRegExpLoop(benchmark::State& state)
{
    const QRegExp regExp = requiredPattern(state.range(0) != 0);
    const Devices& source = devices();
    for (auto _ : state) {
        int hits = 0;
        for (int row = 0; row < c_rows; ++row) {
            hits += regExp.exactMatch(source.text(row, 3)) ? 1 : 0;
        }
        benchmark::DoNotOptimize(hits);
    }
}
BENCHMARK(rowsBareRegExpLoop)->ArgName("literal")->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);

// --- Whole models: with the mapping and the signals ------------------------------------------------------------

void modelPlainOneColumn(benchmark::State& state)
{
    for (auto _ : state) {
        QSortFilterProxyModel proxy;
        proxy.setFilterKeyColumn(1);
        proxy.setFilterRegExp(literal());
        proxy.setSourceModel(&devices());
        benchmark::DoNotOptimize(proxy.rowCount());
    }
}
BENCHMARK(modelPlainOneColumn)->Unit(benchmark::kMillisecond);

void modelRequiredAndSearch(benchmark::State& state)
{
    for (auto _ : state) {
        vx::MultiFilterModel proxy(nullptr);
        proxy.setRequiredFilter(3, requiredPattern(true), false);
        proxy.addSearchFilter({0, 1}, literal());
        proxy.setSourceModel(&devices());
        benchmark::DoNotOptimize(proxy.rowCount());
    }
}
BENCHMARK(modelRequiredAndSearch)->Unit(benchmark::kMillisecond);

enum Way : int { wClearAndAdd, wReplace, wLayout, wPlain };

/// Types "gate" letter by letter and clears the box again, on a mapping that is in use.
void typing(benchmark::State& state)
{
    const auto way = Way(state.range(0));
    Devices source(int(state.range(1)));
    vx::MultiFilterModel multi(nullptr);
    QSortFilterProxyModel plain;
    plain.setFilterKeyColumn(1);
    QAbstractItemModel& model = way == wPlain ? static_cast<QAbstractItemModel&>(plain) : multi;
    multi.setSourceModel(&source);
    plain.setSourceModel(&source);
    if (way == wLayout) {
        multi.setRefreshMode(vx::MultiFilterModel::RefreshMode::Layout);
    }
    model.rowCount();
    for (auto _ : state) {
        for (const char* text : {"g", "ga", "gat", "gate", ""}) {
            const QRegExp regExp(QString::fromLatin1(text), Qt::CaseInsensitive, QRegExp::FixedString);
            switch (way) {
            case wClearAndAdd:
                multi.clearSearchFilters();
                multi.addSearchFilter({0, 1}, regExp);
                break;
            case wReplace:
            case wLayout:
                multi.setSearchFilters({{{0, 1}, regExp}});
                break;
            case wPlain:
                plain.setFilterRegExp(regExp);
                break;
            }
            benchmark::DoNotOptimize(model.rowCount());
        }
    }
}
BENCHMARK(typing)
    ->ArgNames({"way", "rows"})
    ->ArgsProduct({{wClearAndAdd, wReplace, wLayout, wPlain}, {10000, 30000, 100000}})
    ->Unit(benchmark::kMillisecond);

// --- One million rows ------------------------------------------------------------------------------------------

double residentMegabytes()
{
    QFile file(QStringLiteral("/proc/self/statm"));
    return file.open(QIODevice::ReadOnly) ? file.readAll().split(' ').value(1).toDouble() * 4096 / 1e6 : 0;
}

void million()
{
    const double empty = residentMegabytes();
    Devices source(1000000);
    const double filled = residentMegabytes();
    vx::MultiFilterModel proxy(nullptr);
    proxy.setRefreshMode(vx::MultiFilterModel::RefreshMode::Layout);
    proxy.setSourceModel(&source);
    proxy.rowCount();
    const double mapped = residentMegabytes();
    std::printf("1,000,000 rows: source %.0f MB, proxy without filters %.0f MB\n", filled - empty, mapped - filled);
    proxy.setRequiredFilter(3, requiredPattern(true), false);
    for (const char* text : {"g", "ga", "gat", "gate", ""}) {
        QElapsedTimer timer;
        timer.start();
        proxy.setSearchFilters({{{0, 1}, QRegExp(QString::fromLatin1(text), Qt::CaseInsensitive)}});
        const int rows = proxy.rowCount();
        std::printf("  \"%s\": %lld ms, %d rows, %.0f MB more than the source\n", text,
            static_cast<long long>(timer.elapsed()), rows, residentMegabytes() - filled);
    }
}
}

int main(int argc, char* argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    if (argc > 1 && std::strcmp(argv[1], "--million") == 0) {
        million();
        return 0;
    }
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
