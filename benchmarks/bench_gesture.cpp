// SPDX-License-Identifier: MIT
// What a mouse adapter costs: a recorded move through its event filter beside a filter that does nothing, and all
// verdicts on a gesture of 64 events with a count of the allocations.
//
// Instructions instead of time, where the processor's counters are out of reach:
//   valgrind --tool=callgrind --toggle-collect=deliverToFloor   bench_gesture
//   --benchmark_filter=recordedMove/still valgrind --tool=callgrind --toggle-collect=deliverToAdapter
//   bench_gesture --benchmark_filter=recordedMove/still
// Both deliver the same number of moves, so the totals that valgrind prints compare directly.
#include "input/MouseAdapter.h"
#include "input/MouseGesture.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <cstdlib>
#include <vector>

namespace
{
constexpr int MovesPerGesture = 62; // with press and release 64 events
constexpr int Rounds = 200;
const QPoint Start(300, 300);

long allocations = 0;

class NothingFilter : public QObject
{
public:
    using QObject::QObject;
    bool eventFilter(QObject*, QEvent*) override { return false; }
};

class OpenGesture : public vx::MouseGesture
{
public:
    OpenGesture()
        : vx::MouseGesture(400, 1000, 1000, 8, 8)
    {
    }
    using vx::MouseGesture::add;
};

QMouseEvent mouse(QEvent::Type type, const QPoint& position, ulong ms)
{
    const bool held = type != QEvent::MouseButtonRelease;
    QMouseEvent event(type, position, position, position,
        type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton, held ? Qt::LeftButton : Qt::NoButton,
        Qt::NoModifier);
    event.setTimestamp(ms);
    return event;
}

void send(QWidget* widget, QEvent::Type type, const QPoint& position, ulong ms)
{
    QMouseEvent event = mouse(type, position, ms);
    QCoreApplication::sendEvent(widget, &event);
}

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + long(values.size() / 2), values.end());
    return values[values.size() / 2];
}
}

#if defined(__GLIBC__) && !defined(__SANITIZE_ADDRESS__)
#define ZELKOV_COUNTS_ALLOCATIONS 1
// Stands before the one of the C library, so that operator new and Qt's containers are counted, too.
extern "C" void* __libc_malloc(size_t size);
extern "C" void* malloc(size_t size)
{
    ++allocations;
    return __libc_malloc(size);
}
#endif

// Two functions with names of their own, for callgrind.
extern "C" __attribute__((noinline)) void deliverToFloor(QWidget* widget, QEvent* event)
{
    QCoreApplication::sendEvent(widget, event);
    benchmark::ClobberMemory();
}

extern "C" __attribute__((noinline)) void deliverToAdapter(QWidget* widget, QEvent* event)
{
    benchmark::ClobberMemory();
    QCoreApplication::sendEvent(widget, event);
}

namespace
{
// `step`: pixels a move goes on. 0 stays inside the click radius, 10 leaves it at once and is reported as panning.
void recordedMove(benchmark::State& state, int step, bool hover)
{
    QWidget floor;
    QWidget subject;
    floor.setObjectName(QStringLiteral("floor"));
    subject.setObjectName(QStringLiteral("subject"));
    NothingFilter nothing;
    floor.installEventFilter(&nothing);
    vx::MouseAdapter adapter(&subject, false);
    adapter.setMouseTracking(hover);
    floor.setMouseTracking(true);

    std::vector<double> floorTimes;
    std::vector<double> subjectTimes;
    QElapsedTimer clock;
    ulong now = 1000;
    for (auto _ : state) {
        send(&subject, QEvent::MouseButtonPress, Start, ++now);
        for (const bool first : {true, false}) {
            clock.start();
            for (int i = 1; i <= MovesPerGesture; ++i) {
                QMouseEvent event = mouse(QEvent::MouseMove, Start + QPoint(i * step, 0), now + ulong(i));
                if (first) {
                    deliverToFloor(&floor, &event);
                } else {
                    deliverToAdapter(&subject, &event);
                }
            }
            (first ? floorTimes : subjectTimes).push_back(double(clock.nsecsElapsed()) / MovesPerGesture);
        }
        state.SetIterationTime(subjectTimes.back() * 1e-9);
        now += 100;
        send(&subject, QEvent::MouseButtonRelease, Start, ++now);
        send(&subject, QEvent::MouseButtonRelease, Start, ++now);
        now += 10000;
    }
    const double floorTime = median(floorTimes);
    const double subjectTime = median(subjectTimes);
    state.counters["floor_ns"] = floorTime;
    state.counters["subject_ns"] = subjectTime;
    state.counters["ratio"] = subjectTime / floorTime;
}

void allVerdicts(benchmark::State& state)
{
    OpenGesture gesture;
    QMouseEvent down = mouse(QEvent::MouseButtonPress, Start, 1000);
    gesture.add(&down, nullptr);
    const long before = allocations;
    for (int i = 1; i <= MovesPerGesture; ++i) {
        QMouseEvent move = mouse(QEvent::MouseMove, Start + QPoint(i, 0), 1000 + ulong(i));
        gesture.add(&move, nullptr);
    }
#ifdef ZELKOV_COUNTS_ALLOCATIONS
    if (allocations - before < MovesPerGesture) {
        state.SkipWithError("the allocation counter does not count");
        return;
    }
#else
    Q_UNUSED(before)
#endif
    QMouseEvent up = mouse(QEvent::MouseButtonRelease, Start + QPoint(70, 0), 1100);
    gesture.add(&up, nullptr);
    gesture.finish();

    long allocated = 0;
    for (auto _ : state) {
        const long start = allocations;
        bool any = gesture.isPan(vx::dAny);
        any |= gesture.isLongPress(Qt::MouseButtonMask);
        any |= gesture.wasSwipe(vx::dAny);
        any |= gesture.wasPan(vx::dAny);
        any |= gesture.wasDoubleClick(Qt::MouseButtonMask);
        any |= gesture.wasLongClick(Qt::MouseButtonMask);
        any |= gesture.wasSingleClick(Qt::MouseButtonMask);
        any |= gesture.insideClickRadius(1);
        benchmark::DoNotOptimize(any);
        allocated += allocations - start;
    }
    state.counters["allocations"] = benchmark::Counter(double(allocated), benchmark::Counter::kAvgIterations);
    if (allocated != 0) {
        state.SkipWithError("verdicts must not allocate");
    }
}

// An event that the filter has no interest in, beside the filter that does nothing.
void otherEvent(benchmark::State& state)
{
    QWidget widget;
    NothingFilter nothing;
    vx::MouseAdapter adapter(nullptr, false);
    const bool watched = state.range(0) != 0;
    widget.installEventFilter(watched ? static_cast<QObject*>(&adapter) : &nothing);
    QEvent event(QEvent::User);
    for (auto _ : state) {
        QCoreApplication::sendEvent(&widget, &event);
    }
}
}

BENCHMARK_CAPTURE(recordedMove, still, 0, true)->UseManualTime()->Iterations(Rounds);
BENCHMARK_CAPTURE(recordedMove, panning, 10, true)->UseManualTime()->Iterations(Rounds);
BENCHMARK_CAPTURE(recordedMove, noHover, 0, false)->UseManualTime()->Iterations(Rounds);
BENCHMARK(allVerdicts);
BENCHMARK(otherEvent)->ArgName("adapter")->Arg(0)->Arg(1);

int main(int argc, char* argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 1;
    }
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
