// SPDX-License-Identifier: MIT
// What a repaint of a label or an eliding button costs when nothing has changed, beside a widget that draws the
// ready text or picture. Both repaint in turns, and the figure that counts is their ratio.
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "indicators/Label.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtGui/QPainter>
#include <QtWidgets/QApplication>
#include <QtWidgets/QPushButton>

#include <algorithm>
#include <vector>

namespace
{
constexpr int c_Batch = 64;
const char c_Text[] = "The camera in the main entrance does not answer any more";

class ReadyText : public QWidget
{
public:
    ReadyText(QWidget* parent, const QString& text)
        : QWidget(parent)
        , m_text(text)
    {
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.drawText(rect(), Qt::AlignLeft | Qt::AlignVCenter, m_text);
    }

private:
    QString m_text;
};

class ReadyPicture : public QWidget
{
public:
    ReadyPicture(QWidget* parent, const QPixmap& picture)
        : QWidget(parent)
        , m_picture(picture)
    {
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.drawPixmap(0, 0, m_picture);
    }

private:
    QPixmap m_picture;
};

double batch(QWidget& widget)
{
    QElapsedTimer elapsed;
    elapsed.start();
    for (int i = 0; i < c_Batch; ++i) {
        widget.repaint();
    }
    return double(elapsed.nsecsElapsed()) * 1e-9 / c_Batch;
}

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + std::ptrdiff_t(values.size() / 2), values.end());
    return values[values.size() / 2];
}

// Both stand in one window and are ready before it is shown.
void compare(benchmark::State& state, QWidget& window, QWidget& subject, QWidget& floor, const QSize& size)
{
    window.resize(2 * size.width(), size.height());
    int x = 0;
    for (QWidget* widget : {&subject, &floor}) {
        widget->setAttribute(Qt::WA_OpaquePaintEvent);
        widget->setGeometry(QRect(QPoint(x, 0), size));
        x += size.width();
    }
    window.show();
    QCoreApplication::processEvents();
    batch(subject);
    batch(floor);
    std::vector<double> subjectTimes;
    std::vector<double> floorTimes;
    for (auto _ : state) {
        floorTimes.push_back(batch(floor));
        subjectTimes.push_back(batch(subject));
        state.SetIterationTime(subjectTimes.back());
    }
    const double subjectTime = median(subjectTimes);
    const double floorTime = median(floorTimes);
    state.counters["subject_us"] = subjectTime * 1e6;
    state.counters["floor_us"] = floorTime * 1e6;
    state.counters["ratio"] = subjectTime / floorTime;
}

void elidedLabel(benchmark::State& state)
{
    const QSize size(160, 24);
    const QString text = QString::fromLatin1(c_Text);
    QWidget window;
    vx::ElidedLabel label(text, &window);
    ReadyText floor(&window, label.fontMetrics().elidedText(text, Qt::ElideRight, size.width()));
    compare(state, window, label, floor, size);
}

void elidedButton(benchmark::State& state)
{
    const QString text = QString::fromLatin1(c_Text);
    QWidget window;
    ElidedButton button(text, &window);
    button.setElideMode(Qt::ElideRight);
    QPushButton floor(QStringLiteral("The camera in\u2026"), &window);
    compare(state, window, button, floor, QSize(140, 30));
}

void scaledPicture(benchmark::State& state)
{
    const int extent = int(state.range(0));
    QImage image(640, 360, QImage::Format_RGB32);
    image.fill(Qt::darkCyan);
    QWidget window;
    vx::Label label(&window);
    label.setScaledContents(true);
    label.setPixmap(QPixmap::fromImage(image));
    const QSize size(extent * 16, extent * 9);
    ReadyPicture floor(
        &window, QPixmap::fromImage(image).scaled(size, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation));
    compare(state, window, label, floor, size);
}
}

BENCHMARK(elidedLabel)
    ->Name("elided_label_beside_ready_text")
    ->UseManualTime()
    ->Iterations(300)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(elidedButton)
    ->Name("elided_button_beside_push_button")
    ->UseManualTime()
    ->Iterations(300)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(scaledPicture)
    ->Name("scaled_picture_beside_draw_pixmap")
    ->ArgName("sixteenth")
    ->Arg(5)
    ->Arg(20)
    ->UseManualTime()
    ->Iterations(300)
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
