// SPDX-License-Identifier: MIT
// Rows of the table: the overlay, the balloon and what lays the rows out.
#include "StylingTable.h"

#include "indicators/ElidedButton.h"
#include "popover/Balloon.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/HeaderContainer.h"
#include "popover/Manager.h"
#include "popover/items/LabelItem.h"
#include "popover/items/PushItem.h"

#include <QtGui/QContextMenuEvent>
#include <QtGui/QIcon>
#include <QtGui/QPixmap>
#include <QtWidgets/QApplication>

namespace styling
{
namespace
{
namespace pop = vx::PopoverWidget;

pop::Container* rowsNamed(const QString& name, Qt::Orientation orientation = Qt::Vertical)
{
    auto* const rows = new pop::Container(nullptr, name, orientation, Qt::AlignLeft);
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::darkGreen);
    for (int i = 0; i < 2; ++i) {
        auto* const row = new pop::PushItem(
            QStringLiteral("Row"), QString(), QStringLiteral("yourRow"), i, pop::eifText | pop::eifIcon, nullptr);
        row->iconElement()->setIcon(QIcon(pixmap));
        rows->addItem(row);
    }
    return rows;
}

pop::Controller* opened(QWidget* window)
{
    if (pop::Manager::instance() == nullptr) {
        pop::Manager::init(1);
    }
    const QPointer<pop::Controller> controller = pop::Manager::instance()->createController(7, false, false, window,
        nullptr, QStringLiteral("Title"), QStringLiteral("yourPopover"), pop::Balloon::eadTop, QSizeF(),
        QFlags<pop::Balloon::ESizeConstraint>(QFlag(3)));
    controller->setContainer(rowsNamed(QStringLiteral("yourRows")),
        pop::Balloon::ebfTitle | pop::Balloon::ebfClose | pop::Balloon::ebfHelp);
    controller->setForRect(QRect(60, 30, 80, 20));
    // The overlay of a popover that opens without a fade stays transparent.
    controller->setActive(true, pop::Controller::epsBalloon, false);
    return controller;
}

QWidget* overlay(QWidget* window)
{
    return opened(window);
}

QWidget* balloon(QWidget* window)
{
    return opened(window)->balloon();
}

// In a corner, where the least distances from the edges are felt.
QWidget* cornered(QWidget* window)
{
    pop::Controller* const controller = opened(window);
    controller->setForRect(QRect(0, 0, 4, 4));
    return controller->balloon();
}

QWidget* corneredBelow(QWidget* window)
{
    pop::Controller* const controller = opened(window);
    controller->setForRect(QRect(window->width() - 4, window->height() - 4, 4, 4));
    controller->balloon()->setPreferredArrowDirections(pop::Balloon::eadBottom);
    controller->updateLayout(true);
    return controller->balloon();
}

QWidget* plainRows(QWidget* window)
{
    auto* const rows = rowsNamed(QStringLiteral("yourRows"));
    rows->setParent(window);
    return placed(rows, QRect(20, 20, 200, 120));
}

QWidget* sidewaysRows(QWidget* window)
{
    auto* const rows = rowsNamed(QStringLiteral("yourRows"), Qt::Horizontal);
    rows->setParent(window);
    return placed(rows, QRect(20, 20, 200, 120));
}

QWidget* headerRows(QWidget* window)
{
    return placed(new pop::HeaderContainer(window, QStringLiteral("yourRows"), Qt::Horizontal, Qt::AlignLeft));
}

QWidget* contextMenu(QWidget* window)
{
    if (pop::Manager::instance() == nullptr) {
        pop::Manager::init(1);
    }
    auto* const row = placed(new pop::LabelItem(QStringLiteral("Row"), QString(), QStringLiteral("yourRow"), 1,
                                 pop::eifText, window),
        QRect(0, 0, 300, 200));
    row->setResetPopover(QStringLiteral("Reset"));
    QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(20, 20), row->mapToGlobal(QPoint(20, 20)));
    QApplication::sendEvent(row, &event);
    return row;
}
}

Table popoverTable()
{
    const char* const body = "vx--PopoverWidget--Balloon";
    const char* const rows = "vx--PopoverWidget--Container";
    return {
        box("vx--PopoverWidget--Controller", overlay),
        box("#yourPopover", overlay),
        noBox("#contextMenuPopover", contextMenu),

        box(body, balloon),
        picture(body, "backgroundColor", "#102030", balloon),
        picture(body, "backgroundColor2", "#405060", balloon),
        picture(body, "borderColor", "#708090", balloon),
        picture(body, "borderRadius", "14", balloon),
        picture(body, "arrowLength", "30", balloon),
        picture(body, "arrowWidth", "9", balloon),
        later(body, "innerMargin", "12", balloon),
        picture(body, "spacing", "9", balloon),
        picture(body, "leftBorderMargin", "31", cornered),
        value(body, "topBorderMargin", "32", cornered),
        picture(body, "rightBorderMargin", "33", corneredBelow),
        value(body, "bottomBorderMargin", "34", corneredBelow),
        box("#popoverTitle", balloon),
        rule("#popoverSeparator", "#popoverSeparator { background: #ff00ff; min-height: 4px; }", balloon),
        box("#popoverCloseButton", balloon),
        box("#popoverHelpButton", balloon),

        box(rows, plainRows),
        box("#yourRows", plainRows),
        rule("vx--PopoverWidget--Container[layoutOrientation=\"1\"]",
            "vx--PopoverWidget--Container[layoutOrientation=\"1\"] { background: #ff00ff; }", sidewaysRows),
        rule("vx--PopoverWidget--Container[layoutOrientation=\"2\"]",
            "vx--PopoverWidget--Container[layoutOrientation=\"2\"] { background: #ff00ff; }", plainRows),
        picture(rows, "spacing", "17", plainRows),
        picture(rows, "leftMargin", "13", plainRows),
        picture(rows, "topMargin", "14", plainRows),
        picture(rows, "rightMargin", "15", plainRows),
        picture(rows, "bottomMargin", "16", plainRows),
        box("vx--PopoverWidget--HeaderContainer", headerRows),
    };
}
}
