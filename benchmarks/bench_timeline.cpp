// SPDX-License-Identifier: MIT
// What the time line costs: the rule by which handles share a scale, laying out a thousand of them, one step of a
// drag. Each beside its floor, measured in turns; the figure that counts is the ratio.
#include "sliders/MultiNubsieSlider.h"
#include "sliders/NubsieLayout.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtCore/QRandomGenerator>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QSlider>

#include <algorithm>
#include <cmath>
#include <ctime>
#include <vector>

namespace
{
double median(std::vector<double> values)
{
    std::nth_element(values.begin(), values.begin() + static_cast<long>(values.size() / 2), values.end());
    return values.at(values.size() / 2);
}

double cpuSeconds()
{
    timespec now {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

// Of this process, so that a busy machine does not count.
template <typename Work> double seconds(const Work& work)
{
    const double start = cpuSeconds();
    work();
    return cpuSeconds() - start;
}

void report(
    benchmark::State& state, const std::vector<double>& ours, const std::vector<double>& floor, double scale = 1.0)
{
    state.counters["ours_us"] = median(ours) * scale * 1e6;
    state.counters["floor_us"] = median(floor) * scale * 1e6;
    state.counters["ratio"] = median(ours) / median(floor);
}

// The rule ---------------------------------------------------------------------------------------------------

std::vector<vx::NubsieLayout::Place> randomPlaces(std::size_t count)
{
    QRandomGenerator random(1);
    std::vector<vx::NubsieLayout::Place> places(count);
    for (auto& place : places) {
        place.value = random.generateDouble();
        place.display = place.value;
    }
    return places;
}

// Share of the scale that all handles together want, in percent.
void theRule(benchmark::State& state)
{
    constexpr int rounds = 100;
    const std::size_t count = static_cast<std::size_t>(state.range(0));
    const double length = static_cast<double>(state.range(1)) / 100.0 / static_cast<double>(count);
    const bool atRest = state.range(2) != 0;
    const std::vector<double> lengths(count, length);
    std::vector<vx::NubsieLayout::Place> start = randomPlaces(count);
    if (atRest) {
        vx::NubsieLayout::enqueueAll(start, lengths);
    }
    std::vector<double> numbers(count);
    QRandomGenerator random(2);
    for (double& number : numbers) {
        number = random.generateDouble();
    }
    std::vector<double> ours;
    std::vector<double> floor;
    for (auto _ : state) {
        floor.push_back(seconds([&] {
            for (int i = 0; i < rounds; ++i) {
                std::vector<double> copy = numbers;
                std::sort(copy.begin(), copy.end());
                benchmark::DoNotOptimize(copy.data());
            }
        }));
        ours.push_back(seconds([&] {
            for (int i = 0; i < rounds; ++i) {
                std::vector<vx::NubsieLayout::Place> copy = start;
                vx::NubsieLayout::enqueueAll(copy, lengths);
                benchmark::DoNotOptimize(copy.data());
            }
        }));
        state.SetIterationTime(ours.back());
    }
    report(state, ours, floor, 1.0 / rounds);
    const double n = static_cast<double>(count);
    state.counters["ns_per_NlogN"] = median(ours) / rounds * 1e9 / (n * std::log2(n));
}

// A thousand handles -----------------------------------------------------------------------------------------

class Thousand
{
public:
    explicit Thousand(int handleWidth)
    {
        m_host.resize(5100, 120);
        m_slider = new vx::MultiNubsieSlider(&m_host, &m_host);
        m_slider->setGeometry(20, 20, 5050, 40);
        QRandomGenerator random(3);
        for (int i = 0; i < 1000; ++i) {
            m_slider->addNubsie(QStringLiteral("handle"), random.bounded(0, 1000000), 0, 1000000, i);
            vx::Nubsie* const nubsie = m_slider->nubsie(i);
            nubsie->setSize(QSize(handleWidth, 20));
            nubsie->setDraggedSize(QSize(handleWidth + 4, 24));
            m_handles.push_back(nubsie);
            auto* const plain = new QWidget(&m_host);
            plain->setGeometry(random.bounded(0, 5000), 80, handleWidth, 20);
            m_plain.push_back(plain);
        }
        m_host.show();
        QCoreApplication::processEvents();
        m_slider->updateNubsiePositions(false);
        QCoreApplication::processEvents();
    }

    double layout(bool moving)
    {
        if (moving) {
            // A few pixels to and fro, as if the client had set new values.
            m_shift = -m_shift;
            for (vx::Nubsie* nubsie : m_handles) {
                nubsie->setNormalizedValue(nubsie->normalizedValue() + m_shift);
                nubsie->setDisplayValue(nubsie->getDisplayValue() + m_shift);
            }
        }
        const double result = seconds([&] { m_slider->updateNubsiePositions(false); });
        QCoreApplication::processEvents();
        return result;
    }

    double moves()
    {
        m_way = -m_way;
        const double result = seconds([&] {
            for (QWidget* widget : m_plain) {
                widget->move(widget->x() + m_way, widget->y());
            }
        });
        QCoreApplication::processEvents();
        return result;
    }

private:
    QWidget m_host;
    vx::MultiNubsieSlider* m_slider;
    std::vector<vx::Nubsie*> m_handles;
    std::vector<QWidget*> m_plain;
    double m_shift = 0.0006;
    int m_way = 3;
};

void aThousandHandles(benchmark::State& state)
{
    Thousand scene(static_cast<int>(state.range(0)));
    const bool moving = state.range(1) != 0;
    std::vector<double> ours;
    std::vector<double> floor;
    for (auto _ : state) {
        floor.push_back(scene.moves());
        ours.push_back(scene.layout(moving));
        state.SetIterationTime(ours.back());
    }
    report(state, ours, floor);
}

// A step of a drag -------------------------------------------------------------------------------------------

constexpr int Steps = 100;

void sendMouse(QWidget* widget, QEvent::Type type, const QPoint& position)
{
    const QPoint inWindow = widget->mapTo(widget->window(), position);
    QMouseEvent event(type, position, inWindow, widget->mapToGlobal(position),
        type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton,
        type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
}

// From the event to the end of the repaint.
double drag(QWidget* widget, const QPoint& from)
{
    return seconds([&] {
        for (int i = 0; i < Steps; ++i) {
            const int way = i < Steps / 2 ? i : Steps - i;
            sendMouse(widget, QEvent::MouseMove, from + QPoint(4 * way, 0));
            QCoreApplication::processEvents();
        }
    });
}

QPixmap knob()
{
    QPixmap result(40, 40);
    result.fill(Qt::red);
    return result;
}

void aDragStep(benchmark::State& state)
{
    QWidget host;
    host.resize(640, 200);
    auto* const plain = new QSlider(Qt::Horizontal, &host);
    plain->setGeometry(20, 20, 600, 40);
    plain->setRange(0, 600);
    auto* const slider = new vx::MultiNubsieSlider(&host, &host);
    slider->setGeometry(20, 100, 600, 40);
    slider->setDrawTrack(true);
    for (int i = 0; i < state.range(0); ++i) {
        slider->addNubsie(QStringLiteral("handle"), i * 60, 0, 600, i);
        slider->setStandardSize(i, QSize(20, 20));
        slider->setDraggedSize(i, QSize(30, 30));
        slider->setIcon(i, knob());
    }
    host.show();
    QCoreApplication::processEvents();
    slider->updateNubsiePositions(false);

    const QPoint onPlain(5, 20);
    sendMouse(plain, QEvent::MouseButtonPress, onPlain);
    const QPoint onHandle(9, 17);
    sendMouse(slider, QEvent::MouseButtonPress, onHandle);
    // Grown, with its picture scaled.
    QElapsedTimer growing;
    growing.start();
    while (growing.elapsed() < 300) {
        QCoreApplication::processEvents();
    }

    std::vector<double> ours;
    std::vector<double> floor;
    for (auto _ : state) {
        floor.push_back(drag(plain, onPlain));
        ours.push_back(drag(slider, onHandle));
        state.SetIterationTime(ours.back() / Steps);
    }
    report(state, ours, floor, 1.0 / Steps);
    sendMouse(plain, QEvent::MouseButtonRelease, onPlain);
    sendMouse(slider, QEvent::MouseButtonRelease, onHandle);
    if (plain->value() == 0 || slider->value(0) == 0) {
        state.SkipWithError("nothing was dragged");
    }
}
}

BENCHMARK(theRule)
    ->Name("rule_for_all_handles_beside_a_sort")
    ->ArgNames({"handles", "percent", "at_rest"})
    ->Args({128, 50, 0})
    ->Args({128, 50, 1})
    ->Args({128, 95, 0})
    ->Args({128, 250, 0})
    ->Args({128, 250, 1})
    ->Args({512, 50, 1})
    ->Args({2048, 50, 1})
    ->Args({8192, 50, 1})
    ->Args({512, 95, 1})
    ->Args({2048, 95, 1})
    ->Args({8192, 95, 1})
    ->UseManualTime()
    ->Iterations(30)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(aThousandHandles)
    ->Name("thousand_handles_beside_as_many_moves")
    ->ArgNames({"handle_width", "moving"})
    ->Args({3, 1})
    ->Args({3, 0})
    ->Args({20, 1})
    ->Args({20, 0})
    ->UseManualTime()
    ->Iterations(30)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(aDragStep)
    ->Name("drag_step_beside_plain_slider")
    ->ArgName("handles")
    ->Arg(2)
    ->Arg(10)
    ->UseManualTime()
    ->Iterations(40)
    ->Unit(benchmark::kMicrosecond);

int main(int argc, char* argv[])
{
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
