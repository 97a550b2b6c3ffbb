// SPDX-License-Identifier: MIT
// Switches and buttons with states.
#include "controls/AnimatedCheckBox.h"
#include "controls/MultiStateCheckBox.h"
#include "controls/MultiStateCustomToolButton.h"
#include "controls/MultiStateItem.h"
#include "controls/MultiStatePushButton.h"
#include "controls/MultiStateToolButton.h"
#include "controls/MultiStateWidget.h"
#include "controls/iOSCheckBox.h"

#include "Registry.h"

namespace zelkovtest
{
namespace
{
constexpr QPoint c_left(8, 9);
constexpr QPoint c_right(60, 8);

// The signals are Qt's; the scripts run through what the classes add.
std::vector<Script> switchScripts()
{
    return {
        {"click", {}, {mousePress(c_left, 0), mouseRelease(c_left, 10)}},
        {"drag", {}, {mousePress(c_left, 0), mouseMove(c_right, 10), mouseRelease(c_right, 20)}},
        {"slide", {}, {call(&iOSCheckBox::setAnimationMode, true), call(&QAbstractButton::toggle)}},
    };
}

Entry slidingSwitch()
{
    Entry entry = widgetClass<iOSCheckBox>("iOSCheckBox", "controls/iOSCheckBox.h");
    entry.exercise = switchScripts();
    entry.setters = {
        setter("setAnimationMode", &iOSCheckBox::setAnimationMode),
        setter("animateTo", static_cast<void (iOSCheckBox::*)(bool)>(&iOSCheckBox::animateTo)),
    };
    return entry;
}

Entry animatedSwitch()
{
    Entry entry = widgetClass<AnimatedCheckBox>("AnimatedCheckBox", "controls/AnimatedCheckBox.h");
    entry.create = [](QWidget* host) {
        auto* const box = new AnimatedCheckBox(host, false, QStringLiteral(":/iOSCheckBox/iOSCheckBox.png"));
        return Subject{box, box};
    };
    entry.exercise = switchScripts();
    entry.setters = {setter("setAnimationMode", &iOSCheckBox::setAnimationMode)};
    return entry;
}

template<class Button>
Entry buttonWithStates(const char* name, const char* header)
{
    Entry entry;
    entry.name = name;
    entry.header = header;
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const button = new Button({0, 1, 2}, QStringLiteral("states"), host);
        return Subject{button, button};
    };
    entry.exercise = {{"click", {}, {mousePress(c_left, 0), mouseRelease(c_left, 10)}}};
    entry.setters = {
        setter("setState", &Button::setState),
        setter("setNextState", &Button::setNextState),
    };
    return entry;
}
}

std::vector<Entry> switchEntries()
{
    return {
        animatedSwitch(),
        buttonWithStates<vx::MultiStateCheckBox>("MultiStateCheckBox", "controls/MultiStateCheckBox.h"),
        buttonWithStates<vx::MultiStateCustomToolButton>(
            "MultiStateCustomToolButton", "controls/MultiStateCustomToolButton.h"),
        valueClass("MultiStateItem", "controls/MultiStateItem.h"),
        buttonWithStates<vx::MultiStatePushButton>("MultiStatePushButton", "controls/MultiStatePushButton.h"),
        buttonWithStates<vx::MultiStateToolButton>("MultiStateToolButton", "controls/MultiStateToolButton.h"),
        valueClass("MultiStateWidget", "controls/MultiStateWidget.h"),
        slidingSwitch(),
        valueClass("SwitchGeometry", "controls/SwitchGeometry.h"),
        valueClass("TMultiStateCustomWidget", "controls/TMultiStateCustomWidget.h"),
        valueClass("TMultiStateWidget", "controls/TMultiStateWidget.h"),
    };
}
}
