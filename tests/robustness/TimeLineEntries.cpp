// SPDX-License-Identifier: MIT
// The time line.
#include "popover/Manager.h"
#include "sliders/MultiNubsieSlider.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QTimer>
#include <QtCore/QTimerEvent>
#include <QtGui/QPixmap>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
constexpr QPoint timeLineHandle(89, 22);
constexpr QPoint timeLineAway(120, 22);
constexpr QPoint timeLineFirstFlag(160, 5);
constexpr QPoint timeLineSecondFlag(135, 5);
constexpr QPoint timeLineTrack(40, 5);

// Three handles, the middle one like a spring, and both flags.
struct RobustTimeLine : vx::MultiNubsieSlider
{
    explicit RobustTimeLine(QWidget* host)
        : MultiNubsieSlider(host, host)
    {
        setGeometry(10, 50, 180, 50);
        setDrawTrack(true);
        setDrawProgress(true);
        QPixmap icon(32, 32);
        icon.fill(Qt::blue);
        const int values[] = {20, 50, 53};
        for (int id = 0; id < 3; ++id) {
            addNubsie(QStringLiteral("handle"), values[id], 0, 100, id);
            setStandardSize(id, QSize(20, 20));
            setDraggedSize(id, QSize(30, 30));
            setIcon(id, icon);
        }
        addFeatures(1, vx::Nubsie::enfResetOnRelease | vx::Nubsie::enfLongClick | vx::Nubsie::enfStepOnClick);
        showFlags(true);
        getFirstFlag()->setGeometry(150, 0, 20, 20);
        getSecondFlag()->setGeometry(125, 0, 20, 20);
    }

    // What the base class leaves to subclasses.
    void tell() { Q_EMIT static_cast<MultiNubsieSlider*>(this)->nubsieValueChanged(vx::NubsieID(1), 5); }
};

// Lets the timer run out now, if it runs.
Step timeLineTimeout(int interval)
{
    return [interval](const Subject& subject) {
        const QList<QTimer*> timers = subject.object->findChildren<QTimer*>();
        for (QTimer* timer : timers) {
            if (timer->interval() == interval && timer->isActive()) {
                QTimerEvent event(timer->timerId());
                QCoreApplication::sendEvent(timer, &event);
                return;
            }
        }
    };
}

Entry multiNubsieSlider()
{
    using Slider = vx::MultiNubsieSlider;
    Entry entry;
    entry.name = "MultiNubsieSlider";
    entry.header = "sliders/MultiNubsieSlider.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        vx::PopoverWidget::Manager::init(0);
        auto* const slider = new RobustTimeLine(host);
        return Subject {slider, slider};
    };
    entry.exercise = {
        {"drag", {"nubsieDragStarted", "nubsieValueChangedByUser", "nubsieDragEnded"},
            {mousePress(timeLineHandle, 0), mouseMove(timeLineAway, 10), mouseRelease(timeLineAway, 20)}},
        {"click, then double click", {},
            {mousePress(timeLineHandle, 0), mouseRelease(timeLineHandle, 10), mouseDoubleClick(timeLineHandle, 20),
                mouseRelease(timeLineHandle, 30)}},
        {"long click", {},
            {mousePress(timeLineHandle, 0), timeLineTimeout(1500), mouseRelease(timeLineHandle, 10)}},
        {"jump", {},
            {call(&Slider::removeNubsie, 0), call(&Slider::removeNubsie, 2),
                [](const Subject& subject) {
                    static_cast<Slider*>(subject.object.data())->setFeatures(Slider::emfJumpOnTrackClick);
                },
                mousePress(timeLineTrack, 0), mouseRelease(timeLineTrack, 10)}},
        {"first flag", {"firstFlagClicked"},
            {mousePress(timeLineFirstFlag, 0), mouseRelease(timeLineFirstFlag, 10)}},
        {"second flag", {"secondFlagClicked"},
            {mousePress(timeLineSecondFlag, 0), mouseRelease(timeLineSecondFlag, 10)}},
        {"first flag, long", {"firstFlagLongClicked"},
            {mousePress(timeLineFirstFlag, 0), timeLineTimeout(1000), mouseRelease(timeLineFirstFlag, 10)}},
        {"second flag, long", {"secondFlagLongClicked"},
            {mousePress(timeLineSecondFlag, 0), timeLineTimeout(1000), mouseRelease(timeLineSecondFlag, 10)}},
        {"first flag, right", {"firstFlagRightClicked"},
            {mousePress(timeLineFirstFlag, 0, Qt::RightButton),
                mouseRelease(timeLineFirstFlag, 10, Qt::RightButton)}},
        {"second flag, right", {"secondFlagRightClicked"},
            {mousePress(timeLineSecondFlag, 0, Qt::RightButton),
                mouseRelease(timeLineSecondFlag, 10, Qt::RightButton)}},
        {"first flag, double", {"firstFlagDoubleClicked"},
            {mousePress(timeLineFirstFlag, 0), mouseRelease(timeLineFirstFlag, 10),
                mouseDoubleClick(timeLineFirstFlag, 20), mouseRelease(timeLineFirstFlag, 30)}},
        {"second flag, double", {"secondFlagDoubleClicked"},
            {mousePress(timeLineSecondFlag, 0), mouseRelease(timeLineSecondFlag, 10),
                mouseDoubleClick(timeLineSecondFlag, 20), mouseRelease(timeLineSecondFlag, 30)}},
        {"lay out later", {"triggerNubsieRepaintQueued"}, {call(&Slider::repaintNubsiesQueued)}},
        {"subclass", {"nubsieValueChanged"}, {call(&RobustTimeLine::tell)}},
    };
    entry.setters = {
        setter("setValue", &Slider::setValue),
        setter("setValues", &Slider::setValues),
        setter("setRange", &Slider::setRange),
        setter("setDefaultValues", &Slider::setDefaultValues),
        setter("setDate", &Slider::setDate),
        setter("setStartEndDates", &Slider::setStartEndDates),
        setter("setDateDiff", &Slider::setDateDiff),
        setter("addFeatures", &Slider::addFeatures),
        setter("setStandardSize", &Slider::setStandardSize),
        setter("setDraggedSize", &Slider::setDraggedSize),
        setter("setText", &Slider::setText),
        setter("setNubsieVisible", &Slider::setNubsieVisible),
        setter("setNubsiesVisible", &Slider::setNubsiesVisible),
        setter("startBlinkingNubsie", &Slider::startBlinkingNubsie),
        setter("setProgress", &Slider::setProgress),
        setter("setDrawProgress", &Slider::setDrawProgress),
        setter("showFlags", &Slider::showFlags),
        setter("setFirstFlagColor", &Slider::setFirstFlagColor),
        setter("setSecondFlagColor", &Slider::setSecondFlagColor),
        setter("updateNubsiePositions", &Slider::updateNubsiePositions),
        setter("removeNubsie", &Slider::removeNubsie),
    };
    return entry;
}
}

std::vector<Entry> timeLineEntries()
{
    return {multiNubsieSlider()};
}
}
