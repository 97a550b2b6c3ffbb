// SPDX-License-Identifier: MIT
// What the wall of 64 live views costs, at 1920 x 1080 and 25 frames a second: its pictures alone, and what each
// widget of the library adds. All are measured in turns over the frames of one second, with the CPU time of this
// process, so that a busy machine does not count. The figure that counts is the share: no widget may cost more than
// the picture.
#include "cameras/Scene.h"
#include "client/Fleet.h"
#include "client/LiveView.h"
#include "client/LiveWall.h"
#include "client/Reconnection.h"
#include "client/WallGeometry.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"
#include "theme/Theme.h"

#include <benchmark/benchmark.h>

#include <QtCore/QDateTime>
#include <QtCore/QElapsedTimer>
#include <QtCore/QEventLoop>
#include <QtCore/QTimer>
#include <QtGui/QPainter>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <ctime>
#include <memory>
#include <vector>

namespace
{
constexpr int c_Views = 64;
constexpr int c_Rate = 25;
const QSize c_Wall(1920, 1080);
constexpr quint64 c_Start = 1700000000000000;
constexpr quint64 c_Frame = 1000000 / c_Rate;

double cpuSeconds()
{
    timespec now {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

double median(std::vector<double> values)
{
    std::nth_element(values.begin(), values.begin() + static_cast<long>(values.size() / 2), values.end());
    return values.at(values.size() / 2);
}

QApplication& app()
{
    return *static_cast<QApplication*>(QCoreApplication::instance());
}

void paintNow()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::processEvents();
}

// The floor: the same picture, and nothing else.
class BarePicture : public QWidget
{
public:
    BarePicture(int seed, QWidget* parent)
        : QWidget(parent)
        , m_scene(seed)
    {
        setAttribute(Qt::WA_OpaquePaintEvent);
    }

    void showFrame(quint64 moment)
    {
        m_moment = moment;
        update();
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        if (m_ground.isNull()) {
            m_ground = m_scene.ground(size(), devicePixelRatioF());
        }
        painter.translate(-(m_ground.width() - width()) / 2, 0);
        painter.drawPixmap(0, 0, m_ground);
        painter.setRenderHint(QPainter::Antialiasing);
        m_scene.drawMovers(painter, m_ground.size(), qint64(m_moment / 1000));
    }

private:
    gallery::Scene m_scene;
    QPixmap m_ground;
    quint64 m_moment = 0;
};

struct BareWall
{
    BareWall()
    {
        window.resize(c_Wall);
        for (int i = 0; i < c_Views; ++i) {
            auto* const picture = new BarePicture(i, &window);
            picture->setGeometry(client::wallCell(window.rect(), 8, i, 2));
            pictures.push_back(picture);
        }
        window.show();
        paintNow();
    }

    void showFrame(quint64 moment)
    {
        for (BarePicture* const picture : pictures) {
            picture->showFrame(moment);
        }
        paintNow();
    }

    QWidget window;
    std::vector<BarePicture*> pictures;
};

struct ClientWall
{
    ClientWall(bool names, bool times, bool badges)
        : wall(fleet)
    {
        wall.setViewCount(c_Views);
        wall.setShowNames(names);
        wall.setShowTimes(times);
        wall.setShowBadges(badges);
        wall.resize(c_Wall);
        wall.showRecorded(c_Start); // frames come when the benchmark wants them
        wall.show();
        paintNow();
    }

    void showFrame(quint64 moment)
    {
        wall.showRecorded(moment);
        paintNow();
    }

    client::Fleet fleet;
    client::LiveWall wall;
};

// One second of a wall; microseconds of CPU a view and frame.
template <typename Wall> double second(Wall& wall, quint64 start)
{
    const double before = cpuSeconds();
    for (int frame = 0; frame < c_Rate; ++frame) {
        wall.showFrame(start + quint64(frame) * c_Frame);
    }
    return (cpuSeconds() - before) * 1e6 / (c_Views * c_Rate);
}

void wallOf64(benchmark::State& state)
{
    zelkov::theme::apply(app(), state.range(0) ? zelkov::theme::Name::Dark : zelkov::theme::Name::None);
    BareWall bare;
    ClientWall plain(false, false, false);
    ClientWall names(true, false, false);
    ClientWall times(false, true, false);
    ClientWall badges(false, false, true);
    ClientWall all(true, true, true);
    // The grounds of resized views are painted again after a moment.
    QElapsedTimer settling;
    settling.start();
    while (settling.elapsed() < 500) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents, 50);
    }
    std::vector<double> costs[6];
    quint64 moment = c_Start;
    for (auto _ : state) {
        moment += 1000000;
        costs[0].push_back(second(bare, moment));
        costs[1].push_back(second(plain, moment));
        costs[2].push_back(second(names, moment));
        costs[3].push_back(second(times, moment));
        costs[4].push_back(second(badges, moment));
        costs[5].push_back(second(all, moment));
        state.SetIterationTime(costs[5].back() * 1e-6 * c_Views * c_Rate);
    }
    const double picture = median(costs[0]);
    const double view = median(costs[1]);
    state.counters["1_picture_us"] = picture;
    state.counters["2_view_us"] = view;
    state.counters["3_name_us"] = median(costs[2]) - view;
    state.counters["4_time_us"] = median(costs[3]) - view;
    state.counters["5_badge_us"] = median(costs[4]) - view;
    state.counters["6_all_us"] = median(costs[5]);
    state.counters["7_time_share"] = (median(costs[3]) - view) / picture;
    state.counters["8_all_share"] = median(costs[5]) / picture;
    state.counters["9_core_percent"] = median(costs[5]) * c_Views * c_Rate / 1e4;
}

// The frame-time label by itself: 24 of 25 frames are of the same second. The paint that follows a new second counts.
void timeLabel(benchmark::State& state)
{
    zelkov::theme::apply(app(), zelkov::theme::Name::Dark);
    QWidget window;
    window.resize(240, 135);
    BarePicture picture(1, &window);
    picture.setGeometry(window.rect());
    vx::TimeLabel label(true, &window);
    window.show();
    label.showFrametime(true, c_Start, 15, 6, true, Qt::AlignHCenter | Qt::AlignBottom, false);
    label.resizeContent(true);
    paintNow();
    std::vector<double> same;
    std::vector<double> next;
    std::vector<double> floor;
    quint64 moment = c_Start;
    const int batch = 400;
    for (auto _ : state) {
        double start = cpuSeconds();
        for (int i = 0; i < batch; ++i) {
            label.setFrametime(moment + quint64(i) * 2000);
        }
        same.push_back((cpuSeconds() - start) / batch);
        start = cpuSeconds();
        for (int i = 0; i < batch; ++i) {
            moment += 1000000;
            label.setFrametime(moment);
            label.repaint();
        }
        next.push_back((cpuSeconds() - start) / batch);
        start = cpuSeconds();
        for (int i = 0; i < batch; ++i) {
            picture.showFrame(moment + quint64(i) * c_Frame);
            picture.repaint();
        }
        floor.push_back((cpuSeconds() - start) / batch);
        state.SetIterationTime(same.back());
    }
    state.counters["same_second_us"] = median(same) * 1e6;
    state.counters["next_second_us"] = median(next) * 1e6;
    state.counters["picture_us"] = median(floor) * 1e6; // with the label on it, which is not opaque here
    state.counters["share"]
        = (median(same) * (c_Rate - 1) + median(next)) / c_Rate / median(floor);
}

// A name label that is given date and time with each frame.
void nameTimeLabel(benchmark::State& state)
{
    zelkov::theme::apply(app(), zelkov::theme::Name::Dark);
    QWidget window;
    window.resize(240, 135);
    vx::NameTimeLabel label(&window);
    label.setFixedSize(230, 20);
    label.setDeviceName(QStringLiteral("Gate 1"));
    window.show();
    paintNow();
    std::vector<double> same;
    std::vector<double> next;
    QDateTime moment = QDateTime::fromMSecsSinceEpoch(qint64(c_Start / 1000));
    const int batch = 400;
    for (auto _ : state) {
        double start = cpuSeconds();
        for (int i = 0; i < batch; ++i) {
            label.setDateTime(moment.addMSecs(i), Qt::ISODate, Qt::ISODate);
        }
        same.push_back((cpuSeconds() - start) / batch);
        start = cpuSeconds();
        for (int i = 0; i < batch; ++i) {
            moment = moment.addSecs(1);
            label.setDateTime(moment, Qt::ISODate, Qt::ISODate);
            label.repaint();
        }
        next.push_back((cpuSeconds() - start) / batch);
        state.SetIterationTime(same.back());
    }
    state.counters["same_second_us"] = median(same) * 1e6;
    state.counters["next_second_us"] = median(next) * 1e6;
}

// With the clock of the wall itself. The rate is that of the machine in its present state.
void liveWall(benchmark::State& state)
{
    zelkov::theme::apply(app(), zelkov::theme::Name::Dark);
    client::Fleet fleet;
    client::LiveWall wall(fleet);
    wall.setViewCount(c_Views);
    wall.resize(c_Wall);
    wall.show();
    int seconds = 0;
    int most = 0;
    std::vector<double> rates;
    double start = 0;
    QElapsedTimer elapsed;
    double cpu = 0;
    QEventLoop loop;
    QObject::connect(&wall, &client::LiveWall::frameRateChanged, &loop, [&] {
        ++seconds;
        if (seconds == 2) { // the grounds are painted by then
            start = cpuSeconds();
            elapsed.start();
        } else if (seconds > 2) {
            rates.push_back(wall.framesPerSecond());
            most = std::max(most, wall.framesPerSecond());
        }
        if (seconds == 8) {
            cpu = (cpuSeconds() - start) / (double(elapsed.nsecsElapsed()) * 1e-9);
            loop.quit();
        }
    });
    for (auto _ : state) {
        loop.exec();
        state.SetIterationTime(double(elapsed.nsecsElapsed()) * 1e-9);
    }
    state.counters["wanted_fps"] = c_Views * c_Rate;
    state.counters["median_fps"] = median(rates);
    state.counters["core_percent"] = cpu * 100;
    state.counters["ms_per_frame"] = cpu * 1000 / (median(rates) / c_Views);
}

BENCHMARK(wallOf64)->ArgName("theme")->Arg(0)->Arg(1)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(12);
BENCHMARK(timeLabel)->UseManualTime()->Unit(benchmark::kMicrosecond)->Iterations(15);
BENCHMARK(nameTimeLabel)->UseManualTime()->Unit(benchmark::kMicrosecond)->Iterations(15);
BENCHMARK(liveWall)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(1);
}

int main(int argc, char* argv[])
{
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication application(argc, argv);
    QFont font(QStringLiteral("DejaVu Sans"));
    font.setPixelSize(13);
    QApplication::setFont(font);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 1;
    }
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
