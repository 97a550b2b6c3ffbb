// SPDX-License-Identifier: MIT
// Popovers beside what Qt offers for the same: a list of buttons in a scroll area, a menu shown again. Each figure
// that counts is a ratio of the two, taken in turns in one run. Where a floor is given, it is what Qt takes for as
// many widgets and layouts as a popover has, without a line of the library: "ratio" cannot come below
// "floor_ratio".
#include "popover/Balloon.h"
#include "popover/BalloonGeometry.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"

#include <benchmark/benchmark.h>

#include <QtCore/QEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QMenu>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QVBoxLayout>

#include <algorithm>
#include <ctime>
#include <memory>
#include <vector>

namespace
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
namespace BalloonGeometry = vx::PopoverWidget::BalloonGeometry;

constexpr int c_PopoverId = 0;

class Row : public Item
{
public:
    explicit Row(int id)
        : Item(nullptr, vx::PopoverWidget::eifText, id, QStringLiteral("row"), QStringLiteral("Camera"), QString())
    {
    }
};

void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

// The window that everything opens in.
struct Stage
{
    Stage()
    {
        window.resize(800, 600);
        target = new QPushButton(QStringLiteral("Target"), &window);
        target->move(360, 40);
        window.show();
        settle();
    }

    QPointer<Controller> makePopover(int rows)
    {
        QPointer<Controller> controller = Manager::instance()->createController(c_PopoverId, false, false, &window,
            target, QStringLiteral("Cameras"), QString(), Balloon::eadTop | Balloon::eadBottom, QSizeF(),
            Balloon::ESizeConstraints());
        auto* const content = new Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
        for (int i = 0; i < rows; ++i) {
            content->addItem(new Row(i));
        }
        controller->setContainer(content, Balloon::ebfTitle | Balloon::ebfClose);
        return controller;
    }

    QWidget window;
    QPushButton* target = nullptr;
};

// Of this process, so that what else the machine does is left out.
double cpuSeconds()
{
    return static_cast<double>(std::clock()) / CLOCKS_PER_SEC;
}

double median(std::vector<double> values)
{
    std::nth_element(values.begin(), values.begin() + static_cast<long>(values.size() / 2), values.end());
    return values.at(values.size() / 2);
}

// Runs all in turns until the benchmark has enough, and reports their medians and the ratios to the second.
template <class Ours, class Theirs, class Floor>
void besideEachOther(
    benchmark::State& state, int repetitions, const Ours& ours, const Theirs& theirs, const Floor& floor)
{
    ours();
    theirs();
    floor();
    std::vector<double> ourTimes;
    std::vector<double> theirTimes;
    std::vector<double> floorTimes;
    for (auto _ : state) {
        const double start = cpuSeconds();
        for (int i = 0; i < repetitions; ++i) {
            ours();
        }
        const double middle = cpuSeconds();
        for (int i = 0; i < repetitions; ++i) {
            theirs();
        }
        const double last = cpuSeconds();
        for (int i = 0; i < repetitions; ++i) {
            floor();
        }
        ourTimes.push_back((middle - start) / repetitions);
        theirTimes.push_back((last - middle) / repetitions);
        floorTimes.push_back((cpuSeconds() - last) / repetitions);
        state.SetIterationTime(middle - start);
    }
    state.counters["popover_ms"] = 1e3 * median(ourTimes);
    state.counters["baseline_ms"] = 1e3 * median(theirTimes);
    state.counters["ratio"] = median(ourTimes) / median(theirTimes);
    if (median(floorTimes) > 1e-6) {
        state.counters["floor_ratio"] = median(floorTimes) / median(theirTimes);
    }
}

template <class Ours, class Theirs>
void besideEachOther(benchmark::State& state, int repetitions, const Ours& ours, const Theirs& theirs)
{
    besideEachOther(state, repetitions, ours, theirs, [] {});
}

QHBoxLayout* makeRowLayout()
{
    auto* const layout = new QHBoxLayout;
    layout->setContentsMargins(0, 0, 0, 0);
    return layout;
}

// The widgets and layouts of a row: a button at the left, a hidden mark at the right.
QWidget* makePlainRow()
{
    auto* const row = new QWidget;
    QHBoxLayout* const whole = makeRowLayout();
    QHBoxLayout* const left = makeRowLayout();
    QHBoxLayout* const right = makeRowLayout();
    whole->addLayout(left);
    whole->addLayout(right);
    row->setLayout(whole);
    auto* const button = new QPushButton(QStringLiteral("Camera"), row);
    button->setFlat(true);
    button->setAutoFillBackground(true);
    button->setAttribute(Qt::WA_TransparentForMouseEvents);
    left->addWidget(button);
    auto* const mark = new QWidget(row);
    right->addWidget(mark);
    mark->hide();
    return row;
}

// The widgets of a popover: an overlay over the window, a bubble with a title bar, rows in a scroll area.
QWidget* makePlainPopover(QWidget* window, int rows)
{
    auto* const overlay = new QWidget(window);
    overlay->setGeometry(window->rect());
    overlay->hide();
    auto* const bubble = new QWidget(overlay);
    bubble->setGeometry(300, 70, 200, 500);
    auto* const layout = new QVBoxLayout(bubble);
    auto* const title = new QHBoxLayout;
    title->addWidget(new QLabel(QStringLiteral("Cameras")));
    title->addWidget(new QPushButton);
    title->addWidget(new QPushButton);
    layout->addLayout(title);
    auto* const area = new QScrollArea;
    auto* const content = new QWidget;
    auto* const column = new QVBoxLayout(content);
    column->setSpacing(0);
    for (int i = 0; i < rows; ++i) {
        column->addWidget(makePlainRow());
    }
    area->setWidgetResizable(true);
    area->setFrameShape(QFrame::NoFrame);
    area->setWidget(content);
    layout->addWidget(area);
    return overlay;
}

void buildShowDestroy(benchmark::State& state)
{
    Stage stage;
    const int rows = static_cast<int>(state.range(0));
    besideEachOther(
        state, 1,
        [&stage, rows] {
            const QPointer<Controller> controller = stage.makePopover(rows);
            controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
            settle();
            delete controller.data();
            settle();
        },
        [&stage, rows] {
            auto* const area = new QScrollArea(&stage.window);
            auto* const content = new QWidget;
            auto* const layout = new QVBoxLayout(content);
            layout->setSpacing(0);
            for (int i = 0; i < rows; ++i) {
                auto* const button = new QPushButton(QStringLiteral("Camera"));
                button->setFlat(true);
                layout->addWidget(button);
            }
            area->setWidgetResizable(true);
            area->setWidget(content);
            area->setGeometry(300, 70, 200, 500);
            area->show();
            settle();
            delete area;
            settle();
        },
        [&stage, rows] {
            QWidget* const plain = makePlainPopover(&stage.window, rows);
            plain->show();
            stage.window.update();
            settle();
            delete plain;
            settle();
        });
}
BENCHMARK(buildShowDestroy)
    ->Arg(10)
    ->Arg(100)
    ->Arg(1000)
    ->UseManualTime()
    ->MinTime(1)
    ->Unit(benchmark::kMillisecond);

void reopen(benchmark::State& state)
{
    Stage stage;
    const QPointer<Controller> controller = stage.makePopover(10);
    controller->setPersistence(true);
    QMenu menu(&stage.window);
    for (int i = 0; i < 10; ++i) {
        menu.addAction(QStringLiteral("Camera"));
    }
    QWidget* const plain = makePlainPopover(&stage.window, 10);
    besideEachOther(
        state, 10,
        [&controller] {
            controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
            settle();
            controller->dismiss(false, true);
            settle();
        },
        [&stage, &menu] {
            menu.popup(stage.window.mapToGlobal(QPoint(360, 70)));
            settle();
            menu.hide();
            settle();
        },
        [&stage, plain] {
            plain->show();
            stage.window.update();
            settle();
            plain->hide();
            settle();
        });
    delete controller.data();
}
BENCHMARK(reopen)->UseManualTime()->Unit(benchmark::kMillisecond);

// One layout pass for each step of the target, and what follows from it, beside the steps of a plain widget.
void followTarget(benchmark::State& state)
{
    Stage stage;
    const QPointer<Controller> controller = stage.makePopover(static_cast<int>(state.range(0)));
    controller->setActive(true, Controller::epsBalloon | Controller::epsNoFade, true);
    settle();
    auto* const plain = new QWidget(&stage.window);
    plain->setGeometry(controller->balloon()->geometry());
    int x = 0;
    int plainX = 0;
    besideEachOther(
        state, 1000,
        [&stage, &x] {
            x = (x + 3) % 300;
            stage.target->move(200 + x, 40);
        },
        [plain, &plainX] {
            plainX = (plainX + 3) % 300;
            plain->move(200 + plainX, 40);
        });
    settle();
    delete controller.data();
}
BENCHMARK(followTarget)->Arg(10)->Arg(1000)->UseManualTime()->Iterations(20)->Unit(benchmark::kMillisecond);

// From the target to frame and outline, without a widget.
void geometry(benchmark::State& state)
{
    using namespace BalloonGeometry;
    const QRect parent(0, 0, 800, 600);
    int x = 0;
    for (auto _ : state) {
        x = (x + 7) % 760;
        const QRect target(x, 120, 40, 20);
        const int side = preferredSide(parent, target, target.topLeft(), 15);
        const QPointF anchor = anchorPoint(target, QPointF(-1, 0), side, target.topLeft());
        const QSize size = sizeFromContent(contentSize(QSize(180, 240), QSize(0, 0), QSize(16777215, 16777215)),
            side, 4, 15, 0, {Strip {true, QSize(120, 24)}, Strip(), Strip()});
        const QRect rect
            = toRect(frame(limits(QRectF(parent), QMargins(4, 4, 4, 4)), QSizeF(size), anchor, side, 4));
        const QPointF tip = anchor - rect.topLeft();
        const QRectF inner = innerRect(QRectF(0, 0, rect.width(), rect.height()), side, 15);
        benchmark::DoNotOptimize(outline(inner, 6, arrowDrawn(15, inner, tip), 15, side, tip));
    }
}
BENCHMARK(geometry);
}

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    qInstallMessageHandler(
        [](QtMsgType, const QMessageLogContext&, const QString&) {}); // the offscreen plugin chats
    QApplication application(argc, argv);
    Manager::init(1000);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    Manager::deleteInstance();
    return 0;
}
