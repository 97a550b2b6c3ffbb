// SPDX-License-Identifier: MIT
// What a spinner costs beside a widget that draws a ready pixmap: tick, update, repaint. Both go through the same
// steps in turns, and the figure that counts is their ratio. A spinner that strokes its mark in each paint event
// is there for comparison.
#include "indicators/BadgeWidget.h"

#include <benchmark/benchmark.h>

#include <QtCore/QTimer>
#include <QtCore/QTimerEvent>
#include <QtCore/QVector>
#include <QtGui/QConicalGradient>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <memory>
#include <vector>

namespace
{
constexpr int Extent = 32;
constexpr int FrameCount = 12;
constexpr int WallColumns = 8;
constexpr int HourInMilliseconds = 3600000;

// The floor: twelve ready pixmaps, shared by all, and nothing else.
class ReadyPixmaps : public QWidget
{
public:
    explicit ReadyPixmaps(QWidget* parent)
        : QWidget(parent)
        , m_frames(frames())
        , m_timer(this)
    {
        connect(&m_timer, &QTimer::timeout, this, [this] {
            m_index = (m_index + 1) % FrameCount;
            update();
        });
    }

private:
    static QVector<QPixmap> frames()
    {
        static QVector<QPixmap>& shared = *new QVector<QPixmap>; // outlives the application, never destroyed
        for (int i = shared.size(); i < FrameCount; ++i) {
            shared << vx::BadgeDrawer::renderBusyBadgePixmap(
                vx::BadgeDrawer::ebbtSpokes, -480 * i, -4320, Qt::white, QColor(192, 192, 192))
                          .scaled(Extent, Extent, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        }
        return shared;
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.drawPixmap(QPoint(0, 0), m_frames.at(m_index));
    }

private:
    QVector<QPixmap> m_frames;
    int m_index = 0;
    QTimer m_timer;
};

// The plain way: strokes in every paint event.
class StrokedSpinner : public QWidget
{
public:
    explicit StrokedSpinner(QWidget* parent)
        : QWidget(parent)
        , m_timer(this)
    {
        connect(&m_timer, &QTimer::timeout, this, [this] {
            m_angle -= 30;
            update();
        });
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.setRenderHint(QPainter::Antialiasing);
        const QPointF center(width() / 2.0, height() / 2.0);
        QConicalGradient gradient(center, m_angle);
        gradient.setColorAt(0.0, Qt::white);
        gradient.setColorAt(1.0, QColor(192, 192, 192));
        painter.setPen(QPen(QBrush(gradient), 0.12 * width(), Qt::SolidLine, Qt::RoundCap));
        for (int i = 0; i < FrameCount; ++i) {
            const double angle = i * 3.14159265358979 / 6;
            const QPointF ray(std::cos(angle), std::sin(angle));
            painter.drawLine(center + ray * (0.44 * width()), center + ray * (0.29 * width()));
        }
    }

private:
    int m_angle = 0;
    QTimer m_timer;
};

class Spinner : public vx::BadgeWidget
{
public:
    explicit Spinner(QWidget* parent)
        : BadgeWidget(parent)
    {
        setBadgeSize(QSize(Extent, Extent));
        setBadgeBusy(true);
    }
};

// Of this thread, in seconds: what other programs take does not count.
double processorTime()
{
    timespec time;
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return double(time.tv_sec) + double(time.tv_nsec) * 1e-9;
}

class PaintCounter : public QObject
{
public:
    bool eventFilter(QObject*, QEvent* event) override
    {
        count += event->type() == QEvent::Paint ? 1 : 0;
        return false;
    }
    int count = 0;
};

// A shown window full of animated widgets whose clock is in our hands.
template <class Widget> class Wall
{
public:
    explicit Wall(int count)
    {
        const int columns = std::min(count, WallColumns);
        m_window.resize(columns * Extent, (count + columns - 1) / columns * Extent);
        for (int i = 0; i < count; ++i) {
            auto* widget = new Widget(&m_window);
            widget->setGeometry(i % columns * Extent, i / columns * Extent, Extent, Extent);
            m_widgets.push_back(widget);
        }
        m_window.show();
        QCoreApplication::processEvents();
        for (Widget* widget : m_widgets) {
            auto* timer = widget->template findChild<QTimer*>();
            timer->start(HourInMilliseconds);
            m_timers.push_back(timer);
        }
        PaintCounter counter;
        for (Widget* widget : m_widgets) {
            widget->installEventFilter(&counter);
        }
        for (int i = 0; i < 2 * FrameCount; ++i) {
            step();
        }
        if (counter.count != 2 * FrameCount * count) {
            std::fprintf(stderr, "%d paint events instead of %d\n", counter.count, 2 * FrameCount * count);
            std::exit(1);
        }
        for (Widget* widget : m_widgets) {
            widget->removeEventFilter(&counter);
        }
    }

    // One tick of every widget, and the repaint that follows.
    void step()
    {
        for (QTimer* timer : m_timers) {
            QTimerEvent event(timer->timerId());
            QCoreApplication::sendEvent(timer, &event);
        }
        QCoreApplication::sendPostedEvents();
    }

    // Processor seconds for a batch of steps.
    double batch(int steps)
    {
        const double start = processorTime();
        for (int i = 0; i < steps; ++i) {
            step();
        }
        return processorTime() - start;
    }

private:
    QWidget m_window;
    std::vector<Widget*> m_widgets;
    std::vector<QTimer*> m_timers;
};

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + std::ptrdiff_t(values.size() / 2), values.end());
    return values[values.size() / 2];
}

// Subject and floor take turns, so that a busy machine slows both down.
template <class Subject> void besideReadyPixmaps(benchmark::State& state)
{
    const int count = int(state.range(0));
    const int steps = std::max(2 * FrameCount, 240 / count);
    Wall<Subject> subject(count);
    Wall<ReadyPixmaps> floor(count);
    std::vector<double> subjectTimes;
    std::vector<double> floorTimes;
    for (auto _ : state) {
        floorTimes.push_back(floor.batch(steps) / steps);
        subjectTimes.push_back(subject.batch(steps) / steps);
        state.SetIterationTime(subjectTimes.back());
    }
    const double subjectTime = median(subjectTimes);
    const double floorTime = median(floorTimes);
    state.counters["subject_us"] = subjectTime * 1e6;
    state.counters["floor_us"] = floorTime * 1e6;
    state.counters["ratio"] = subjectTime / floorTime;
}

// Rendering and scaling one frame that is not in the cache.
void renderFrame(benchmark::State& state)
{
    const auto type = vx::BadgeDrawer::EBusyBadgeType(state.range(0));
    for (auto _ : state) {
        benchmark::DoNotOptimize(
            vx::BadgeDrawer::renderBusyBadgePixmap(type, 1440, -4320, Qt::white, Qt::gray)
                .scaled(Extent, Extent, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation));
    }
}

void setLabel(benchmark::State& state)
{
    vx::BadgeDrawer drawer(nullptr, nullptr);
    int number = 0;
    for (auto _ : state) {
        number = (number + 1) % 100;
        drawer.setBadgeLabel(QString::number(number), false);
    }
}
}

BENCHMARK_TEMPLATE(besideReadyPixmaps, Spinner)
    ->Name("spinner_beside_ready_pixmap")
    ->Arg(1)
    ->Arg(64)
    ->UseManualTime()
    ->Iterations(200)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_TEMPLATE(besideReadyPixmaps, StrokedSpinner)
    ->Name("stroked_spinner_beside_ready_pixmap")
    ->Arg(1)
    ->Arg(64)
    ->UseManualTime()
    ->Iterations(100)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(renderFrame)->DenseRange(0, 3)->Unit(benchmark::kMicrosecond);
BENCHMARK(setLabel)->Unit(benchmark::kMicrosecond);

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
