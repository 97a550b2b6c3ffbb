// SPDX-License-Identifier: MIT
// The classes of indicators/.
#include "indicators/BadgeDrawer.h"
#include "indicators/BadgeWidget.h"

#include <QtGui/QPainter>

#include "Registry.h"
#include "Suites.h"

namespace zelkovtest
{
namespace
{
using vx::BadgeDrawer;
using vx::BadgeWidget;

// A host as a client writes it: a widget that draws its badge last.
class BadgeHost : public QWidget
{
public:
    explicit BadgeHost(QWidget* parent)
        : QWidget(parent)
        , m_drawer(new BadgeDrawer(this, this))
    {
        resize(120, 60);
    }

    BadgeDrawer* drawer() const { return m_drawer; }

protected:
    void paintEvent(QPaintEvent* /*event*/) override
    {
        QPainter painter(this);
        if (m_drawer) {
            m_drawer->drawBadge(painter, Qt::AlignRight | Qt::AlignTop);
        }
    }

private:
    QPointer<BadgeDrawer> m_drawer;
};

Entry badgeDrawer()
{
    Entry entry;
    entry.name = "BadgeDrawer";
    entry.header = "indicators/BadgeDrawer.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        BadgeHost* const widget = new BadgeHost(host);
        return Subject{widget->drawer(), widget};
    };
    entry.exercise = {
        {"busy", {"pixmapChanged"}, {call(&BadgeDrawer::setBadgeBusy, true), waitFor("pixmapChanged")}},
    };
    using Full = void (BadgeDrawer::*)(const QString&, const QSize&, bool, bool);
    using Short = void (BadgeDrawer::*)(const QString&, bool);
    entry.setters = {
        setter("setBadgeLabel", static_cast<Full>(&BadgeDrawer::setBadgeLabel)),
        setter("setBadgeLabel", static_cast<Short>(&BadgeDrawer::setBadgeLabel)),
        setter("unsetBadgeLabel", &BadgeDrawer::unsetBadgeLabel),
        setter("setBadgeBusy", &BadgeDrawer::setBadgeBusy),
        setter("setBadgeWidget", &BadgeDrawer::setBadgeWidget),
        setter("setBadgeSize", &BadgeDrawer::setBadgeSize),
        setter("setBadgeStroke", &BadgeDrawer::setBadgeStroke),
        setter("setBadgeColor", &BadgeDrawer::setBadgeColor),
        setter("setBadgeBackground", &BadgeDrawer::setBadgeBackground),
        setter("setBusyColor1", &BadgeDrawer::setBusyColor1),
        setter("setBusyColor2", &BadgeDrawer::setBusyColor2),
        setter("setBusyBadgeType", &BadgeDrawer::setBusyBadgeType),
    };
    return entry;
}

Entry badgeWidget()
{
    Entry entry = widgetClass<BadgeWidget>("BadgeWidget", "indicators/BadgeWidget.h");
    // No signals of its own; the script is what gives an extreme property something to show.
    entry.exercise = {
        {"label and busy", {},
            {[](const Subject& subject) {
                BadgeWidget* const widget = static_cast<BadgeWidget*>(subject.object.data());
                widget->setBadgeLabel(QStringLiteral("3"));
                paint(widget);
                widget->setBadgeBusy(true);
                paint(widget);
                widget->setBadgeBusy(false);
                paint(widget);
            }}},
    };
    entry.setters = {
        setter("setBadgeBusy", &BadgeWidget::setBadgeBusy),
        setter("setBadgeLabel", &BadgeWidget::setBadgeLabel),
    };
    return entry;
}
}

std::vector<Entry> indicatorsEntries()
{
    return {badgeDrawer(), badgeWidget()};
}
}
