// SPDX-License-Identifier: MIT
// The classes of sliders/.
#include "sliders/HSlider.h"
#include "sliders/JumpSlider.h"
#include "sliders/NicerScrollBar.h"
#include "sliders/VSlider.h"

#include <QtWidgets/QAbstractScrollArea>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
// QSlider's own signals are Qt's; the scripts press, so that what the classes add is run through.
std::vector<Script> presses()
{
    return {{"press and drag", {}, {mousePress(QPoint(60, 10), 0), mouseMove(QPoint(20, 14), 10),
        mouseRelease(QPoint(20, 14), 20)}}};
}

template<class Class>
Entry slider(const char* name, const char* header)
{
    Entry entry = widgetClass<Class>(name, header);
    entry.exercise = presses();
    // Not setRange: Qt's styles divide by zero where a range is 2147483648 wide.
    entry.setters = {setter("setValue", &QSlider::setValue)};
    return entry;
}

Entry nicerScrollBar()
{
    Entry entry;
    entry.name = "NicerScrollBar";
    entry.header = "sliders/NicerScrollBar.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const area = new QAbstractScrollArea(host);
        area->resize(180, 120);
        area->verticalScrollBar()->setRange(0, 1000);
        auto* const bar = new NicerScrollBar(area, Qt::Vertical, NicerScrollBar::epAutomatic, area);
        return Subject{bar, bar};
    };
    entry.exercise = {
        {"drag", {"nicerValueChanged"},
            {call(&QAbstractSlider::setSliderDown, true), call(&QAbstractSlider::setValue, 40),
                waitFor("nicerValueChanged"), call(&QAbstractSlider::setSliderDown, false)}},
        {"press, drag and release", {},
            {mousePress(QPoint(7, 25), 0), mouseMove(QPoint(7, 60), 10), mouseRelease(QPoint(7, 60), 20)}},
    };
    // Not setNicerRange, for the same reason as above.
    entry.setters = {
        setter("setNicerValue", &NicerScrollBar::setNicerValue),
        setter("setFadingEnabled", &NicerScrollBar::setFadingEnabled),
        setter("setScrollBarPolicy", &NicerScrollBar::setScrollBarPolicy),
    };
    return entry;
}
}

std::vector<Entry> slidersEntries()
{
    return {
        slider<vx::HSlider>("HSlider", "sliders/HSlider.h"),
        slider<vx::JumpSlider>("JumpSlider", "sliders/JumpSlider.h"),
        nicerScrollBar(),
        slider<vx::VSlider>("VSlider", "sliders/VSlider.h"),
    };
}
}
