// SPDX-License-Identifier: MIT
// What frames, time labels, the dial and list rows cost. Where there is a floor or a baseline both run in turns, and
// the figure that counts is their ratio.
#include "controls/DialButton.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetItem.h"
#include "indicators/BorderIcon.h"
#include "indicators/TimeLabel.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtGui/QPainter>
#include <QtWidgets/QApplication>
#include <QtWidgets/QDial>
#include <QtWidgets/QLabel>

#include <algorithm>
#include <functional>
#include <vector>

namespace
{
constexpr int c_Batch = 32;
constexpr int c_Rows = 64;

double batch(const std::function<void()>& work)
{
    QElapsedTimer elapsed;
    elapsed.start();
    for (int i = 0; i < c_Batch; ++i) {
        work();
    }
    return double(elapsed.nsecsElapsed()) * 1e-9 / c_Batch;
}

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + std::ptrdiff_t(values.size() / 2), values.end());
    return values[values.size() / 2];
}

void compare(benchmark::State& state, const std::function<void()>& subject, const std::function<void()>& floor)
{
    batch(subject);
    batch(floor);
    std::vector<double> subjectTimes;
    std::vector<double> floorTimes;
    std::vector<double> ratios;
    for (auto _ : state) {
        floorTimes.push_back(batch(floor));
        subjectTimes.push_back(batch(subject));
        ratios.push_back(subjectTimes.back() / floorTimes.back());
        state.SetIterationTime(subjectTimes.back());
    }
    state.counters["subject_us"] = median(subjectTimes) * 1e6;
    state.counters["floor_us"] = median(floorTimes) * 1e6;
    // Of neighbours in time, which a busy machine slows down alike.
    state.counters["ratio"] = median(ratios);
}

// The floor draws a ready picture of the whole frame.
void ninePartPaint(benchmark::State& state)
{
    const QRect target(0, 0, 400, 300);
    QPixmap picture(48, 48);
    picture.fill(QColor(30, 100, 210, 128));
    BorderIcon icon(picture, QMargins(16, 16, 16, 16), static_cast<BorderIcon::Stretch>(state.range(0)));
    QPixmap ready(target.size());
    ready.fill(Qt::transparent);
    {
        QPainter painter(&ready);
        icon.paint(&painter, target);
    }
    QImage canvas(target.size(), QImage::Format_ARGB32_Premultiplied);
    canvas.fill(Qt::white);
    QPainter painter(&canvas);
    compare(state, [&] { icon.paint(&painter, target); }, [&] { painter.drawPixmap(0, 0, ready); });
}

// One frame for each of 64 pictures, as 25 times a second; the figure is that of one update.
void frameTimes(benchmark::State& state)
{
    QWidget wall;
    wall.resize(1600, 900);
    std::vector<vx::TimeLabel*> labels;
    quint64 time = 1775031300000000;
    for (int i = 0; i < 64; ++i) {
        auto* const picture = new QWidget(&wall);
        picture->setGeometry(i % 8 * 200, i / 8 * 112, 198, 110);
        auto* const label = new vx::TimeLabel(true, picture);
        labels.push_back(label);
    }
    wall.show();
    for (vx::TimeLabel* label : labels) {
        label->showFrametime(true, time, 18, 4, true, Qt::AlignHCenter | Qt::AlignBottom, false);
        label->setAnchortime(time);
    }
    QCoreApplication::processEvents();
    for (auto _ : state) {
        time += 40000;
        QElapsedTimer elapsed;
        elapsed.start();
        for (vx::TimeLabel* label : labels) {
            label->setFrametime(time);
        }
        state.SetIterationTime(double(elapsed.nsecsElapsed()) * 1e-9 / double(labels.size()));
        QCoreApplication::processEvents();
    }
    if (labels.front()->height() < 12) {
        state.SkipWithError("the labels are not shown");
    }
}

// A step of the value with its repaint, beside a QDial of the same size.
void dialStep(benchmark::State& state)
{
    QWidget window;
    window.resize(300, 150);
    QPixmap picture(120, 120);
    picture.fill(Qt::transparent);
    {
        QPainter painter(&picture);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setBrush(Qt::gray);
        painter.drawEllipse(4, 4, 112, 112);
    }
    vx::DialButton dial(&window);
    dial.setGeometry(0, 0, 120, 120);
    dial.setImage(picture);
    dial.setButton(picture);
    QDial plain(&window);
    plain.setGeometry(150, 0, 120, 120);
    for (QDial* each : {static_cast<QDial*>(&dial), &plain}) {
        each->setRange(0, 1000);
    }
    window.show();
    QCoreApplication::processEvents();
    const auto step = [](QDial& each) {
        each.setValue(each.value() == each.maximum() ? 0 : each.value() + 1);
        each.repaint();
    };
    compare(state, [&] { step(dial); }, [&] { step(plain); });
}

// Rows with a label each.
void listRow(benchmark::State& state)
{
    for (auto _ : state) {
        state.PauseTiming();
        auto* const list = new vx::iOSListWidget;
        state.ResumeTiming();
        for (int i = 0; i < c_Rows; ++i) {
            new vx::iOSListWidgetItem(list, new QLabel(QStringLiteral("Gate west")), QStringLiteral("row"));
        }
        state.PauseTiming();
        if (list->count() != c_Rows) {
            state.SkipWithError("rows are missing");
        }
        delete list;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        state.ResumeTiming();
    }
    state.SetItemsProcessed(int64_t(state.iterations()) * c_Rows);
}
}

BENCHMARK(ninePartPaint)
    ->Name("nine_part_beside_draw_pixmap")
    ->ArgName("mode")
    ->DenseRange(0, 3)
    ->UseManualTime()
    ->Iterations(200)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(frameTimes)->Name("frame_time_of_one_label")->UseManualTime()->Iterations(200)->Unit(benchmark::kMicrosecond);
BENCHMARK(dialStep)
    ->Name("dial_step_beside_dial")
    ->UseManualTime()
    ->Iterations(200)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(listRow)->Name("list_of_64_rows")->Iterations(30)->Unit(benchmark::kMillisecond);

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
