// SPDX-License-Identifier: MIT
// Rows of the table: the rows of popovers and what stands in them.
#include "StylingTable.h"

#include "indicators/BadgeWidget.h"
#include "indicators/ElidedButton.h"
#include "popover/Container.h"
#include "popover/Manager.h"
#include "popover/WidgetItem.h"
#include "popover/items/CheckItem.h"
#include "popover/items/ClearEditItem.h"
#include "popover/items/ComboBoxItem.h"
#include "popover/items/DateTimeItem.h"
#include "popover/items/ImageItem.h"
#include "popover/items/LabelItem.h"
#include "popover/items/MultiStateItem.h"
#include "popover/items/MultipleValuesEditItem.h"
#include "popover/items/PushItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/SearchItem.h"
#include "popover/items/Separator.h"
#include "popover/items/SliderItem.h"
#include "popover/items/SpinItem.h"
#include "popover/items/Submenu.h"
#include "popover/items/TristateCheckItem.h"
#include "popover/items/UnitValueItem.h"
#include "popover/items/iOSCheckItem.h"

#include <QtGui/QIcon>
#include <QtGui/QPixmap>
#include <QtWidgets/QLabel>

namespace styling
{
namespace
{
namespace pop = vx::PopoverWidget;

const pop::EItemFlags c_allParts
    = pop::eifControl | pop::eifText | pop::eifIcon | pop::eifAdditionalText;

QString rowWord()
{
    return QStringLiteral("row");
}
QString rowName()
{
    return QStringLiteral("yourRow");
}
QString none()
{
    return {};
}

template <typename Row>
Build rowOf(Row* (*make)(QWidget*))
{
    return [make](QWidget* window) -> QWidget* { return placed(make(window), QRect(10, 10, 360, 60)); };
}

const Build pushRow = rowOf<pop::PushItem>(
    [](QWidget* w) { return new pop::PushItem(rowWord(), rowWord(), rowName(), 1, c_allParts, w); });
const Build labelRow = rowOf<pop::LabelItem>(
    [](QWidget* w) { return new pop::LabelItem(rowWord(), rowWord(), rowName(), 1, c_allParts, w); });
const Build imageRow = rowOf<pop::ImageItem>([](QWidget* w) {
    QPixmap pixmap(20, 20); // it fills the row
    pixmap.fill(Qt::transparent);
    return new pop::ImageItem(rowName(), 1, pixmap, w);
});
const Build editRow = rowOf<pop::EditItem>(
    [](QWidget* w) { return new pop::EditItem(rowWord(), rowWord(), rowName(), 1, c_allParts, w); });
const Build clearRow = rowOf<pop::ClearEditItem>(
    [](QWidget* w) { return new pop::ClearEditItem(rowWord(), rowWord(), rowName(), none(), 1, c_allParts, w); });
const Build multipleRow = rowOf<pop::MultipleValuesEditItem>([](QWidget* w) {
    return new pop::MultipleValuesEditItem(rowWord(), rowWord(), rowName(), none(), none(), 1, c_allParts, w);
});
const Build searchRow = rowOf<pop::SearchItem>(
    [](QWidget* w) { return new pop::SearchItem(rowWord(), rowWord(), rowName(), 1, c_allParts, w); });
const Build comboRow = rowOf<pop::ComboBoxItem>(
    [](QWidget* w) { return new pop::ComboBoxItem(rowWord(), rowName(), 1, {rowWord()}, c_allParts, w); });
const Build checkRow = rowOf<pop::CheckItem>(
    [](QWidget* w) { return new pop::CheckItem(rowWord(), rowName(), 1, true, c_allParts, w); });
const Build tristateRow = rowOf<pop::TristateCheckItem>(
    [](QWidget* w) { return new pop::TristateCheckItem(rowWord(), rowName(), 1, true, 1, c_allParts, w); });
const Build switchRow = rowOf<pop::iOSCheckItem>(
    [](QWidget* w) { return new pop::iOSCheckItem(rowWord(), rowName(), 1, true, c_allParts, w); });
const Build radioRow = rowOf<pop::RadioItem>(
    [](QWidget* w) { return new pop::RadioItem(rowWord(), rowName(), 1, true, nullptr, c_allParts, w); });
const Build statesRow = rowOf<pop::MultiStateItem>(
    [](QWidget* w) { return new pop::MultiStateItem(rowWord(), rowName(), {3, 4}, 1, c_allParts, w); });
const Build sliderRow = rowOf<pop::SliderItem>(
    [](QWidget* w) { return new pop::SliderItem(rowWord(), rowName(), 1, c_allParts, w); });
const Build spinRow = rowOf<pop::SpinItem>(
    [](QWidget* w) { return new pop::SpinItem(rowWord(), rowName(), 1, nullptr, 3, c_allParts, w); });
const Build dateRow = rowOf<pop::DateTimeItem>([](QWidget* w) {
    return new pop::DateTimeItem(rowWord(), QDateTime(QDate(2020, 1, 2), QTime(3, 4)), Qt::LocalTime,
        QStringLiteral("yyyy"), rowName(), 1, c_allParts, w);
});
const Build unitRow = rowOf<pop::UnitValueItem>(
    [](QWidget* w) { return new pop::UnitValueItem(rowWord(), {rowWord()}, rowName(), nullptr, 1, c_allParts, w); });
const Build widgetRow = rowOf<pop::WidgetItem>(
    [](QWidget* w) { return new pop::WidgetItem(new QLabel(rowWord()), rowName(), 1, w); });
const Build separator = rowOf<pop::Separator>([](QWidget* w) { return new pop::Separator(w); });

QWidget* submenu(QWidget* window)
{
    if (pop::Manager::instance() == nullptr) {
        pop::Manager::init(1);
    }
    auto* const rows = new pop::Container(nullptr, rowWord(), Qt::Vertical, Qt::AlignLeft);
    auto* const row = new pop::Submenu(
        0, rowWord(), rowWord(), rowWord(), rowName(), window, rows, nullptr, 1, c_allParts);
    row->setParent(window);
    return placed(row, QRect(10, 10, 360, 60));
}

QWidget* disabledRow(QWidget* window)
{
    QWidget* const row = pushRow(window);
    row->setEnabled(false);
    return row;
}

QWidget* busyRow(QWidget* window)
{
    auto* const row = static_cast<pop::PushItem*>(pushRow(window));
    row->setBusy(true, false);
    row->busyWidget()->setFixedSize(30, 30);
    return row;
}

QWidget* picturedRow(QWidget* window)
{
    auto* const row = static_cast<pop::PushItem*>(pushRow(window));
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::darkGreen);
    row->iconElement()->setIcon(QIcon(pixmap));
    return row;
}

// The colours are kept for the program; nothing is painted in them.
const char* const c_edit = "vx--PopoverWidget--EditItem";
}

Table rowTable()
{
    const char* const row = "vx--PopoverWidget--Item";
    return {
        box(row, pushRow),
        box("#yourRow", pushRow),
        rule("vx--PopoverWidget--Item:disabled", "vx--PopoverWidget--Item:disabled { background: #ff00ff; }",
            disabledRow),
        picture(row, "spacing", "21", pushRow),
        picture(row, "leftMargin", "22", picturedRow),
        picture(row, "rightMargin", "23", picturedRow),
        look(row, "shadow", "true", picturedRow),
        box("#icon", pushRow),
        box("#text", pushRow),
        box("#additionalText", pushRow),
        rule("#icon:checked", "#icon:checked { background: #ff00ff; }", checkRow),
        rule("#text:checked", "#text:checked { background: #ff00ff; }", checkRow),
        rule("#popoverBusy", "#popoverBusy { qproperty-busyColor1: #ff00ff; qproperty-busyColor2: #ff00ff; }", busyRow),

        box("vx--PopoverWidget--PushItem", pushRow),
        box("vx--PopoverWidget--LabelItem", labelRow),
        box("#label", labelRow),
        box("vx--PopoverWidget--ImageItem", imageRow),
        box("#image", imageRow),
        box(c_edit, editRow),
        value(c_edit, "placeholderColor", "#112233", editRow),
        value(c_edit, "textColor", "#445566", editRow),
        box("#edit", editRow),
        box("vx--PopoverWidget--ClearEditItem", clearRow),
        box("vx--PopoverWidget--MultipleValuesEditItem", multipleRow),
        box("vx--PopoverWidget--SearchItem", searchRow),
        box("vx--PopoverWidget--ComboBoxItem", comboRow),
        box("#combo", comboRow),
        box("vx--PopoverWidget--CheckItem", checkRow),
        box("vx--PopoverWidget--TristateCheckItem", tristateRow),
        box("#tristate", tristateRow),
        box("vx--PopoverWidget--iOSCheckItem", switchRow),
        box("vx--PopoverWidget--RadioItem", radioRow),
        box("vx--PopoverWidget--MultiStateItem", statesRow),
        box("#multiStateWidget", statesRow),
        rule("#multiStateWidget[state=\"3\"]", "#multiStateWidget[state=\"3\"] { background: #ff00ff; }", statesRow),
        box("vx--PopoverWidget--SliderItem", sliderRow),
        box("#slider", sliderRow),
        box("vx--PopoverWidget--SpinItem", spinRow),
        box("vx--PopoverWidget--DateTimeItem", dateRow),
        box("#dateTimeEdit", dateRow),
        box("vx--PopoverWidget--UnitValueItem", unitRow),
        box("vx--PopoverWidget--WidgetItem", widgetRow),
        box("vx--PopoverWidget--Submenu", submenu),
        box("#disclosureIcon", submenu),
        box("vx--PopoverWidget--Separator", separator),
    };
}
}
