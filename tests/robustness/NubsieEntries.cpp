// SPDX-License-Identifier: MIT
// The handle of a time line.
#include "popover/Item.h"
#include "popover/Manager.h"
#include "sliders/Nubsie.h"

#include <QtGui/QPixmap>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
// A row that is performed by a call.
struct NubsieRow : vx::PopoverWidget::Item
{
    explicit NubsieRow(int value)
        : Item(
            nullptr, vx::PopoverWidget::eifText, value, QString::number(value), QString::number(value), QString())
    {
        setUserData(value);
    }
    QVariant userData() override { return m_userData; }
    void pick() { performSingleClick(QFlags<vx::PopoverWidget::EItemPerformedFlag>()); }
};

// A subclass that announces what the base class leaves to it.
struct RobustNubsie : vx::Nubsie
{
    explicit RobustNubsie(QWidget* host)
        : Nubsie(QStringLiteral("handle"), 3, 0, 10, 5, host, 1)
        , row(new NubsieRow(8))
    {
        setSize(QSize(20, 20));
        setDraggedSize(QSize(40, 40));
        setPosition(QPointF(60, 50));
        QPixmap icon(32, 32);
        icon.fill(Qt::blue);
        setIcon(icon);
        setItemMap({{{3}, new NubsieRow(3)}, {{8}, row.data()}});
    }

    void grow()
    {
        setDraggedSize(getDraggedSize() + QSize(1, 1));
        Q_EMIT dragSizeChanged(this, getDraggedSize());
    }
    void pick()
    {
        if (!row.isNull()) {
            row->pick();
        }
    }
    void step() { ++*this; }
    void drag()
    {
        setNormalizedValue(normalizedValue() < 0.5 ? 0.9 : 0.1);
        performDragAction();
    }

    QPointer<NubsieRow> row;
};

Entry nubsieEntry()
{
    Entry entry;
    entry.name = "Nubsie";
    entry.header = "sliders/Nubsie.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        vx::PopoverWidget::Manager::init(0);
        auto* const handle = new RobustNubsie(host);
        return Subject {handle, handle};
    };
    entry.exercise = {
        {"set", {"valueChanged"},
            {call(&RobustNubsie::drag), call(&RobustNubsie::step), call(&vx::Nubsie::reset)}},
        {"pick in the popover", {"valueChangedbyPopover", "valuePopoverClosing"},
            {call(&vx::Nubsie::showValuePopover), call(&RobustNubsie::pick), call(&vx::Nubsie::hideBalloon)}},
        {"grow, glow and move", {"dragSizeChanged"},
            {call(&vx::Nubsie::setCurrent), call(&vx::Nubsie::startBlinking, 100), call(&RobustNubsie::grow),
                call(&vx::Nubsie::moveTo, QPointF(90, 50)), call(&vx::Nubsie::resetSize),
                call(&vx::Nubsie::stopBlinking), call(&vx::Nubsie::cancelAnimations)}},
    };
    entry.setters = {
        setter("setValue", &vx::Nubsie::setValue),
        setter("setRange", &vx::Nubsie::setRange),
        setter("setNormalizedValue", &vx::Nubsie::setNormalizedValue),
        setter("setDisplayValue", &vx::Nubsie::setDisplayValue),
        setter("setStartEndDate", &vx::Nubsie::setStartEndDate),
        setter("setDate", &vx::Nubsie::setDate),
        setter("setAnchorTimeDiff", &vx::Nubsie::setAnchorTimeDiff),
        setter("setDeltaTimeMode", &vx::Nubsie::setDeltaTimeMode),
        setter("setFeatures", &vx::Nubsie::setFeatures),
        setter("setText", &vx::Nubsie::setText),
        setter("setTextColor", &vx::Nubsie::setTextColor),
        setter("setBackColor", &vx::Nubsie::setBackColor),
        setter("moveTo", &vx::Nubsie::moveTo),
        setter("startBlinking", &vx::Nubsie::startBlinking),
    };
    return entry;
}
}

std::vector<Entry> nubsieEntries()
{
    return {nubsieEntry()};
}
}
