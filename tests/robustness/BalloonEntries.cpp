// SPDX-License-Identifier: MIT
// The balloon of popovers.
#include "popover/Balloon.h"
#include "popover/BalloonLook.h"
#include "popover/Container.h"

#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;

Step clickPart(const char* objectName)
{
    return [objectName](const Subject& subject) {
        if (auto* const button = subject.widget->findChild<QPushButton*>(QLatin1String(objectName))) {
            button->click();
        }
    };
}

Entry balloonEntry()
{
    Entry entry;
    entry.name = "Balloon";
    entry.header = "popover/Balloon.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const target = new QWidget(host);
        target->setGeometry(40, 10, 30, 10);
        auto* const rows = new Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
        for (int i = 0; i < 12; ++i) {
            rows->addWidgetItem(new QPushButton(QStringLiteral("Row")), QStringLiteral("row"), i);
        }
        auto* const balloon
            = new Balloon(host, target, rows, Balloon::ebfTitle | Balloon::ebfClose | Balloon::ebfHelp,
                Balloon::eadTop, QSizeF(), Balloon::ESizeConstraints());
        balloon->setTitle(QStringLiteral("Title"));
        return Subject {balloon, balloon};
    };
    entry.exercise = {
        {"close button", {"dismiss"}, {clickPart("popoverCloseButton")}},
        {"arrow strip", {"dismiss"}, {mousePress(QPoint(2, 2), 0), mouseRelease(QPoint(2, 2), 10)}},
        {"help button", {"help"}, {clickPart("popoverHelpButton")}},
        {"scroll", {"contentScrolled"}, {[](const Subject& subject) {
             QScrollBar* const bar = static_cast<Balloon*>(subject.object.data())->content()->verticalScrollBar();
             bar->setRange(0, 100);
             bar->setValue(40);
         }}},
        // Nobody but a subclass emits it.
        {"subclass", {"layoutUpdated"}, {call(&Balloon::layoutUpdated)}},
    };
    entry.setters = {
        setter("setForRect", &Balloon::setForRect),
        setter("setMargins", &Balloon::setMargins),
        setter("setPreferredArrowDirections", &Balloon::setPreferredArrowDirections),
        setter("setFeatures", &Balloon::setFeatures),
        setter("setTitle", &Balloon::setTitle),
        setter("setupLayout", &Balloon::setupLayout),
    };
    return entry;
}
}

std::vector<Entry> balloonEntries()
{
    return {
        balloonEntry(),
        valueClass("BalloonLook", "popover/BalloonLook.h"),
        valueClass("PopoverBalloonWidget", "popover/PopoverBalloonWidget.h"),
    };
}
}
