// SPDX-License-Identifier: MIT
// What a frame of a pulse costs once its tints are in the cache, beside a widget that does nothing but draw a ready
// image of the same size. Both repaint in turns, and the figure that counts is their ratio.
#include "foundation/FadingWidget.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtGui/QPainter>
#include <QtWidgets/QAbstractButton>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <vector>

namespace
{
constexpr int LevelCount = 9;
constexpr int CycleLength = 16;
constexpr int HourInMilliseconds = 3600000;
const QColor Tint(191, 191, 191);

QImage shape(int extent)
{
    QImage image(extent, extent, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(Qt::black);
    painter.drawEllipse(image.rect());
    return image;
}

class Pulse : public QAbstractButton, public vx::FadingWidget
{
public:
    Pulse(QWidget* parent, int extent)
        : QAbstractButton(parent)
        , vx::FadingWidget(this, HourInMilliseconds, 16, Tint, 0, 128)
    {
        setIconSize(QSize(extent, extent));
        setIcon(QIcon(QPixmap::fromImage(shape(extent))));
        startFading();
    }
    int levels() const { return m_tinted.size(); }
    bool pulses() const { return m_timer.isActive() && !m_image.isNull(); }
    void forgetTints()
    {
        m_tinted.clear();
        m_color.setAlpha(0);
    }

protected:
    void paintEvent(QPaintEvent* event) override { vx::FadingWidget::paintEvent(event); }
};

// The floor: ready images and one drawImage().
class ReadyImages : public QAbstractButton
{
public:
    ReadyImages(QWidget* parent, int extent)
        : QAbstractButton(parent)
    {
        const QImage icon = shape(extent);
        for (int i = 0; i < LevelCount; ++i) {
            QImage image(icon.size(), icon.format());
            for (int y = 0; y < extent; ++y) {
                for (int x = 0; x < extent; ++x) {
                    image.setPixelColor(
                        x, y, QColor(191, 191, 191, std::min(16 * i, icon.pixelColor(x, y).alpha())));
                }
            }
            m_images.push_back(image);
        }
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        const QImage& image = m_images[m_frame < LevelCount ? m_frame : CycleLength - m_frame];
        painter.drawImage(QPoint((width() - image.width()) / 2, (height() - image.height()) / 2), image);
        m_frame = (m_frame + 1) % CycleLength;
    }

private:
    std::vector<QImage> m_images;
    std::size_t m_frame = 0;
};

// All stand in one window and are ready before it is shown: of two windows, or of two widgets that come one after
// the other, one would be repainted more slowly than the other whatever it draws.
void show(QWidget& window, const std::vector<QWidget*>& widgets, int extent)
{
    const int edge = extent + 16;
    window.resize(int(widgets.size()) * edge, edge);
    for (std::size_t i = 0; i < widgets.size(); ++i) {
        widgets[i]->setAttribute(Qt::WA_OpaquePaintEvent);
        widgets[i]->setGeometry(int(i) * edge, 0, edge, edge);
    }
    window.show();
    QCoreApplication::processEvents();
    for (int i = 0; i < 2 * CycleLength; ++i) {
        for (QWidget* widget : widgets) {
            widget->repaint();
        }
    }
}

double batch(QWidget& widget, int frames)
{
    QElapsedTimer elapsed;
    elapsed.start();
    for (int i = 0; i < frames; ++i) {
        widget.repaint();
    }
    return double(elapsed.nsecsElapsed()) * 1e-9 / frames;
}

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + std::ptrdiff_t(values.size() / 2), values.end());
    return values[values.size() / 2];
}

void besideReadyImages(benchmark::State& state)
{
    const int extent = int(state.range(0));
    QWidget window;
    Pulse pulse(&window, extent);
    ReadyImages floor(&window, extent);
    show(window, {&pulse, &floor}, extent);
    if (!pulse.pulses() || pulse.levels() != LevelCount) {
        std::fprintf(stderr, "the pulse has %d levels\n", pulse.levels());
        std::exit(1);
    }
    std::vector<double> pulseTimes;
    std::vector<double> floorTimes;
    for (auto _ : state) {
        floorTimes.push_back(batch(floor, 4 * CycleLength));
        pulseTimes.push_back(batch(pulse, 4 * CycleLength));
        state.SetIterationTime(pulseTimes.back());
    }
    const double pulseTime = median(pulseTimes);
    const double floorTime = median(floorTimes);
    state.counters["subject_us"] = pulseTime * 1e6;
    state.counters["floor_us"] = floorTime * 1e6;
    state.counters["ratio"] = pulseTime / floorTime;
}

// One whole cycle with an empty cache: what the first pulse of a button pays.
void firstCycle(benchmark::State& state)
{
    const int extent = int(state.range(0));
    QWidget window;
    Pulse pulse(&window, extent);
    show(window, {&pulse}, extent);
    for (auto _ : state) {
        pulse.forgetTints();
        batch(pulse, CycleLength);
    }
}
}

BENCHMARK(besideReadyImages)
    ->Name("pulse_frame_beside_ready_image")
    ->Arg(32)
    ->Arg(64)
    ->UseManualTime()
    ->Iterations(300)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(firstCycle)->Name("first_cycle")->Arg(32)->Arg(64)->Unit(benchmark::kMicrosecond);

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
