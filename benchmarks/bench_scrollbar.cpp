// SPDX-License-Identifier: MIT
// What one step of scrolling costs with the overlay bar, beside the same area with the plain bar and beside one with
// the least that an overlay can be. All go through the same steps in turns, and the figures that count are the ratios.
#include "sliders/NicerScrollBar.h"

#include <benchmark/benchmark.h>

#include <QtCore/QElapsedTimer>
#include <QtGui/QPainter>
#include <QtGui/QPaintEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QScrollArea>

#include <algorithm>
#include <vector>

namespace
{
constexpr int Steps = 50;
const char ApplicationSheet[] = "QScrollBar { background: transparent; border: none; width: 15px; }"
                                "QScrollBar::handle { background: rgb(120,120,120); }"
                                "QScrollBar::add-line, QScrollBar::sub-line { width: 0; height: 0; border: none; }"
                                "QScrollBar::add-page, QScrollBar::sub-page { background: transparent; }";

// Rows of text, as a list of devices has them.
class Content : public QWidget
{
public:
    Content() { resize(360, 20000); }

protected:
    void paintEvent(QPaintEvent* event) override
    {
        QPainter painter(this);
        const QRect dirty = event->rect();
        painter.fillRect(dirty, Qt::white);
        for (int row = dirty.top() / 24; row <= dirty.bottom() / 24; ++row) {
            painter.drawText(8, row * 24 + 17, QStringLiteral("Camera %1").arg(row));
        }
    }
};

// As little as an overlay can be: a strip of the same size that draws its handle. What lies under an overlay has to
// be repainted with it in every step, which a bar beside the content does not ask for.
class Strip : public QWidget
{
public:
    explicit Strip(QAbstractScrollArea* area)
        : QWidget(area)
        , m_bar(area->verticalScrollBar())
    {
        area->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        setGeometry(area->width() - 15, 0, 15, area->height());
        connect(m_bar, &QScrollBar::valueChanged, this, [this] { update(); });
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        const double all = m_bar->maximum() + m_bar->pageStep();
        painter.fillRect(QRectF(0, height() * m_bar->value() / all, width(), height() * m_bar->pageStep() / all),
            QColor(120, 120, 120));
    }

private:
    QScrollBar* m_bar;
};

enum class Bar
{
    Plain,
    Overlay,
    Strip
};

class Area
{
public:
    Area(Bar bar, bool styled)
    {
        if (styled) {
            m_area.setStyleSheet(QString::fromLatin1(ApplicationSheet));
        }
        m_area.setWidget(new Content);
        m_area.resize(400, 600);
        if (bar == Bar::Strip) {
            new Strip(&m_area);
        } else if (bar == Bar::Overlay) {
            new NicerScrollBar(&m_area, Qt::Vertical, NicerScrollBar::epAutomatic, &m_area);
        }
        m_area.show();
        QCoreApplication::processEvents();
    }

    double batch()
    {
        QElapsedTimer clock;
        clock.start();
        for (int i = 0; i < Steps; ++i) {
            m_value = (m_value + 7) % 15000;
            m_area.verticalScrollBar()->setValue(m_value);
            QCoreApplication::processEvents();
            QCoreApplication::processEvents();
        }
        return static_cast<double>(clock.nsecsElapsed()) * 1e-9 / Steps;
    }

private:
    QScrollArea m_area;
    int m_value = 0;
};

double median(std::vector<double> values)
{
    std::nth_element(values.begin(), values.begin() + static_cast<long>(values.size() / 2), values.end());
    return values.at(values.size() / 2);
}

void besideThePlainBar(benchmark::State& state)
{
    const bool styled = state.range(0) != 0;
    Area overlay(Bar::Overlay, styled);
    Area plain(Bar::Plain, styled);
    Area strip(Bar::Strip, styled);
    std::vector<double> overlayTimes;
    std::vector<double> plainTimes;
    std::vector<double> stripTimes;
    for (auto _ : state) {
        plainTimes.push_back(plain.batch());
        stripTimes.push_back(strip.batch());
        overlayTimes.push_back(overlay.batch());
        state.SetIterationTime(overlayTimes.back());
    }
    state.counters["overlay_us"] = median(overlayTimes) * 1e6;
    state.counters["plain_us"] = median(plainTimes) * 1e6;
    state.counters["strip_us"] = median(stripTimes) * 1e6;
    state.counters["ratio"] = median(overlayTimes) / median(plainTimes);
    state.counters["ratio_to_strip"] = median(overlayTimes) / median(stripTimes);
}
}

BENCHMARK(besideThePlainBar)
    ->Name("scroll_step_beside_plain_bar")
    ->ArgName("style_sheet")
    ->Arg(0)
    ->Arg(1)
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
