// SPDX-License-Identifier: MIT
// The classes of input/.
#include "input/MouseAdapter.h"

#include <QtWidgets/QAbstractScrollArea>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
constexpr QPoint c_here(20, 20);
constexpr QPoint c_there(60, 20);

using vx::MouseAdapter;

Entry mouseAdapter()
{
    Entry entry;
    entry.name = "MouseAdapter";
    entry.header = "input/MouseAdapter.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        QWidget* const widget = new QWidget(host);
        widget->resize(150, 100);
        MouseAdapter* const adapter = new MouseAdapter(widget, false);
        adapter->setMouseTracking(true);
        adapter->setDoubleClickInterval(30);
        adapter->setLongClickInterval(60);
        return Subject{adapter, widget};
    };
    entry.exercise = {
        {"hover", {"entered", "moved", "left"},
            {enter(c_here), mouseMove(c_here, 0, Qt::NoButton), leave()}},
        {"click", {"pressed", "released", "clicked", "finished"},
            {mousePress(c_here, 0), mouseRelease(c_here, 10), waitFor("finished")}},
        {"double click", {"doubleClicked"},
            {call(&MouseAdapter::setDoubleClickInterval, 500), mousePress(c_here, 0), mouseRelease(c_here, 10),
                mouseDoubleClick(c_here, 20), mouseRelease(c_here, 30)}},
        {"long click", {"longPressed", "longClicked"},
            {call(&MouseAdapter::setDoubleClickInterval, 0), call(&MouseAdapter::setLongClickInterval, 20),
                mousePress(c_here, 0), waitFor("longPressed"), mouseRelease(c_here, 100)}},
        // The auto click timer starts when the long click timer ends a gesture that has been released.
        {"auto click", {"autoClicked"},
            {call(&MouseAdapter::setDoubleClickInterval, 5000), call(&MouseAdapter::setLongClickInterval, 20),
                call(&MouseAdapter::setAutoClickInterval, 20), mousePress(c_here, 0), mouseRelease(c_here, 10),
                waitFor("autoClicked")}},
        {"swipe", {"panning", "swiped"},
            {mousePress(c_here, 0), mouseMove(c_there, 20), mouseRelease(c_there, 50)}},
        {"pan", {"panned"},
            {call(&MouseAdapter::setSwipeInterval, 10), mousePress(c_here, 0), mouseMove(c_there, 50),
                mouseRelease(c_there, 100)}},
    };
    entry.setters = {
        setter("setClickRadius", &MouseAdapter::setClickRadius),
        setter("setDoubleClickRadius", &MouseAdapter::setDoubleClickRadius),
        setter("setDoubleClickInterval", &MouseAdapter::setDoubleClickInterval),
        setter("setLongClickInterval", &MouseAdapter::setLongClickInterval),
        setter("setAutoClickInterval", &MouseAdapter::setAutoClickInterval),
        setter("setSwipeInterval", &MouseAdapter::setSwipeInterval),
        setter("setMouseTracking", &MouseAdapter::setMouseTracking),
        setter("attachTo", &MouseAdapter::attachTo),
        setter("detachFrom", &MouseAdapter::detachFrom),
        setter("scroll", &MouseAdapter::scroll),
        setter("scrollPage", &MouseAdapter::scrollPage),
        setter("scrollContinous", &MouseAdapter::scrollContinous),
    };
    return entry;
}
}

std::vector<Entry> inputEntries()
{
    return {
        valueClass("GeometryUtils", "input/GeometryUtils.h"),
        mouseAdapter(),
        valueClass("MouseEvent", "input/MouseEvent.h"),
        valueClass("MouseGesture", "input/MouseGesture.h"),
    };
}
}
