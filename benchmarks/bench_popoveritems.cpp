// SPDX-License-Identifier: MIT
// What it costs to find a row by its id among 1000, beside a bare loop over an array of ids and beside
// QObject::findChild by name, which is what one would use without ids.
#include "popover/Container.h"
#include "popover/Item.h"

#include <benchmark/benchmark.h>

#include <QtWidgets/QApplication>

#include <algorithm>
#include <vector>

namespace
{
namespace pw = vx::PopoverWidget;
constexpr int Rows = 1000;

class Row : public pw::Item
{
public:
    explicit Row(int id)
        : Item(nullptr, pw::eifText, id, QStringLiteral("row%1").arg(id), QStringLiteral("Camera %1").arg(id),
            QString())
    {
    }
};

/// 1000 rows, a tenth of them in each of a header, a footer and a nested container.
class Content
{
public:
    Content()
    {
        for (pw::Container* part : {m_header, m_footer, m_nested}) {
            for (int i = 0; i < Rows / 10; ++i) {
                m_ids.push_back(0);
                part->addItem(new Row(int(m_ids.size())));
            }
        }
        m_box.addHeader(m_header);
        m_box.addFooter(m_footer);
        m_box.addContainer(m_nested);
        while (m_ids.size() < std::size_t(Rows)) {
            m_ids.push_back(0);
            m_box.addItem(new Row(int(m_ids.size())));
        }
        const QList<int> ids = m_box.getItemIDs();
        std::copy(ids.begin(), ids.end(), m_ids.begin());
    }

    pw::Container& box() { return m_box; }
    const std::vector<int>& ids() const { return m_ids; }

private:
    static pw::Container* create() { return new pw::Container(nullptr, QString(), Qt::Vertical, Qt::AlignTop); }

    pw::Container* m_header = create();
    pw::Container* m_footer = create();
    pw::Container* m_nested = create();
    pw::Container m_box {nullptr, QString(), Qt::Vertical, Qt::AlignTop};
    std::vector<int> m_ids; // in the order of the walk
};

Content& content()
{
    static Content instance;
    return instance;
}

// Arg: the place of the row in the walk.
void getItem(benchmark::State& state)
{
    const int id = content().ids().at(std::size_t(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(content().box().getItem(id));
    }
}

void getItems(benchmark::State& state)
{
    for (auto _ : state) {
        benchmark::DoNotOptimize(content().box().getItems(content().ids().back()));
    }
}

void floorOfAnArray(benchmark::State& state)
{
    const std::vector<int>& ids = content().ids();
    const int id = ids.at(std::size_t(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(std::find(ids.begin(), ids.end(), id));
    }
}

void findChild(benchmark::State& state)
{
    const QString name = QStringLiteral("row%1").arg(content().ids().at(std::size_t(state.range(0))));
    for (auto _ : state) {
        benchmark::DoNotOptimize(content().box().findChild<pw::Item*>(name));
    }
}

void build(benchmark::State& state)
{
    for (auto _ : state) {
        pw::Container box(nullptr, QString(), Qt::Vertical, Qt::AlignTop);
        for (int i = 0; i < Rows; ++i) {
            box.addItem(new Row(i));
        }
        state.PauseTiming();
        box.clear();
        state.ResumeTiming();
    }
}

BENCHMARK(getItem)->Arg(0)->Arg(500)->Arg(999);
BENCHMARK(getItems);
BENCHMARK(floorOfAnArray)->Arg(0)->Arg(500)->Arg(999);
BENCHMARK(findChild)->Arg(500);
BENCHMARK(build)->Unit(benchmark::kMillisecond);
}

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
