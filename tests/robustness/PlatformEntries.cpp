// SPDX-License-Identifier: MIT
// The classes of the platform libraries of the product family that come with the library.
#include "ZelkovUtils/ClickHelper.h"

#include "Registry.h"

namespace zelkovtest
{
std::vector<Entry> platformEntries()
{
    Entry entry;
    entry.name = "ClickHelper";
    entry.header = "ZelkovUtils/ClickHelper.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        QWidget* const widget = new QWidget(host);
        widget->resize(150, 100);
        vx::ClickHelper* const helper
            = new vx::ClickHelper(widget, vx::ClickHelper::efClick | vx::ClickHelper::efDoubleClick);
        helper->setReceiver(widget);
        helper->setActive(true);
        return Subject{helper, widget};
    };
    constexpr QPoint here(20, 20);
    entry.exercise = {
        {"click", {"clicked"}, {mousePress(here, 0), mouseRelease(here, 10)}},
        {"double click", {"doubleClicked"},
            {mousePress(here, 0), mouseRelease(here, 10), mouseDoubleClick(here, 20), mouseRelease(here, 30)}},
    };
    entry.setters = {
        setter("setReceiver", &vx::ClickHelper::setReceiver),
        setter("setActive", &vx::ClickHelper::setActive),
    };
    return {
        entry,
        valueClass("CoordinateSystem", "ZelkovUtils/CoordinateSystem.h"),
        valueClass("ISecurityManager", "ZelkovUtils/ISecurityManager.h"),
        valueClass("LinearCoordinateSystem", "ZelkovUtils/LinearCoordinateSystem.h"),
        valueClass("Log", "Core/Log.h"),
        valueClass("QtSlot", "CoreQt/QtSlot.h"),
        valueClass("TimeUtils", "ZelkovUtils/TimeUtils.h"),
    };
}
}
