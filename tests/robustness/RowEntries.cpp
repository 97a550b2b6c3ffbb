// SPDX-License-Identifier: MIT
// The rows of popovers that show, ask and choose.
#include "popover/Manager.h"
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

#include <QtGui/QContextMenuEvent>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QApplication>

#include "Registry.h"
#include "RowSteps.h"

namespace zelkovtest
{
namespace
{
namespace rows = vx::PopoverWidget;

constexpr QPoint c_onRow(90, 28);
constexpr QPoint c_away(150, 28);

QString word(const char* text)
{
    return QString::fromLatin1(text);
}

rows::EItemFlags rowFlags()
{
    return rows::eifControl | rows::eifText | rows::eifIcon | rows::eifAdditionalText | rows::eifBoldSelection;
}

/// A key to the part of the row that takes keys.
template<class Row>
Step keyTo(QWidget* (*part)(Row*), Qt::Key key, const QString& text = QString())
{
    return [part, key, text](const Subject& subject) {
        QKeyEvent event(QEvent::KeyPress, key, Qt::NoModifier, text);
        QApplication::sendEvent(part(static_cast<Row*>(subject.object.data())), &event);
    };
}

template<class Row>
Entry rowEntry(const char* name, Row* (*make)(QWidget* host))
{
    Entry entry;
    entry.name = name;
    entry.header = QByteArray("popover/items/") + name + ".h";
    entry.kind = Kind::Widget;
    entry.create = [make](QWidget* host) {
        Row* const row = make(host);
        row->resize(180, 32);
        row->setDragEnabled(true);
        return Subject{row, row};
    };
    entry.exercise = {
        {"busy states", {"layoutChanged"},
            {call(&rows::Item::setBusy, true, true), call(&rows::Item::setBusy, false, true),
                call(&rows::Item::setChecked, true), call(&rows::Item::setBusyText, word("12"), true)}},
        {"drag", {"itemDragStarted"},
            {mousePress(c_onRow, 1000), mouseMove(c_away, 1010), mouseMove(c_onRow, 1020),
                mouseRelease(c_onRow, 1030)}},
        resetByMenu(),
    };
    entry.setters = {
        setter("setValue", &Row::setValue),
        setter("setChecked", &rows::Item::setChecked),
        setter("setText", &rows::Item::setText),
        setter("setAdminOnly", &rows::Item::setAdminOnly),
    };
    return entry;
}

template<class Row>
Entry clickedRow(const char* name, Row* (*make)(QWidget* host), const QList<QByteArray>& fires)
{
    Entry entry = rowEntry<Row>(name, make);
    entry.exercise.push_back({"click", fires, {mousePress(c_onRow, 0), mouseRelease(c_onRow, 10)}});
    return entry;
}

template<class Row>
Entry editedRow(const char* name, Row* (*make)(QWidget* host))
{
    Entry entry = rowEntry<Row>(name, make);
    QWidget* (*edit)(Row*) = [](Row* row) -> QWidget* { return row->lineEdit(); };
    entry.exercise.push_back({"typing", {"itemPerformed"},
        {keyTo<Row>(edit, Qt::Key_A, word("a")), keyTo<Row>(edit, Qt::Key_Return)}});
    return entry;
}
}

void freshManager(QWidget* host)
{
    rows::Manager::deleteInstance();
    rows::Manager::init(1000);
    rows::Manager::instance()->setParent(host);
}

Script resetByMenu()
{
    return {"reset menu", {"contextMenuRequested", "resetContextMenuPerformed"},
        {[](const Subject& subject) {
             freshManager(subject.widget->window());
             static_cast<rows::Item*>(subject.object.data())->setResetPopover(word("Reset"));
         },
            [](const Subject& subject) {
                QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(3, 3));
                QApplication::sendEvent(subject.widget, &event);
            },
            [](const Subject&) {
                rows::Manager* const manager = rows::Manager::instance();
                const QPointer<QWidget> entry = manager ? manager->getItem(0, -1) : nullptr;
                for (QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
                    if (entry) {
                        QMouseEvent event(type, QPoint(2, 2), entry->mapToGlobal(QPoint(2, 2)), Qt::LeftButton,
                            type == QEvent::MouseButtonPress ? Qt::LeftButton : Qt::NoButton, Qt::NoModifier);
                        QApplication::sendEvent(entry, &event);
                    }
                }
            }}};
}

std::vector<Entry> rowEntries()
{
    std::vector<Entry> entries;
    entries.push_back(clickedRow<rows::CheckItem>("CheckItem", [](QWidget* host) {
        return new rows::CheckItem(word("Check"), word("row"), 1, false, rowFlags(), host);
    }, {"toggled", "itemPerformed"}));
    entries.push_back(editedRow<rows::ClearEditItem>("ClearEditItem", [](QWidget* host) {
        return new rows::ClearEditItem(word("Clear"), word("type"), word("row"), word("All"), 1, rowFlags(), host);
    }));
    Entry combo = rowEntry<rows::ComboBoxItem>("ComboBoxItem", [](QWidget* host) {
        return new rows::ComboBoxItem(word("Combo"), word("row"), 1, {word("a"), word("b")}, rowFlags(), host);
    });
    QWidget* (*box)(rows::ComboBoxItem*) = [](rows::ComboBoxItem* row) -> QWidget* { return row->comboBox(); };
    combo.exercise.push_back({"choice", {"itemPerformed"},
        {keyTo<rows::ComboBoxItem>(box, Qt::Key_Down), keyTo<rows::ComboBoxItem>(box, Qt::Key_Up)}});
    combo.setters.push_back(setter("setValueByUserData", &rows::ComboBoxItem::setValueByUserData));
    combo.setters.push_back(setter("getUserDataForValue", &rows::ComboBoxItem::getUserDataForValue));
    combo.setters.push_back(setter("enableItem", &rows::ComboBoxItem::enableItem));
    entries.push_back(combo);
    entries.push_back(valueClass("ControlHolder", "popover/items/ControlHolder.h"));
    entries.push_back(valueClass("ControlRules", "popover/items/ControlRules.h"));
    Entry date = rowEntry<rows::DateTimeItem>("DateTimeItem", [](QWidget* host) {
        return new rows::DateTimeItem(word("Date"), QDateTime(QDate(2024, 5, 6), QTime(7, 8)), Qt::LocalTime,
            word("dd.MM.yyyy hh:mm"), word("row"), 1, rowFlags(), host);
    });
    QWidget* (*edit)(rows::DateTimeItem*) = [](rows::DateTimeItem* row) -> QWidget* { return row->dateTimeEdit(); };
    date.exercise.push_back({"step", {"itemPerformed"}, {keyTo<rows::DateTimeItem>(edit, Qt::Key_Up)}});
    entries.push_back(date);
    entries.push_back(editedRow<rows::EditItem>("EditItem", [](QWidget* host) {
        return new rows::EditItem(word("Edit"), word("type"), word("row"), 1, rowFlags(), host, nullptr);
    }));
    entries.push_back(clickedRow<rows::ImageItem>("ImageItem", [](QWidget* host) {
        QPixmap picture(20, 20);
        picture.fill(Qt::red);
        return new rows::ImageItem(word("row"), 1, picture, host);
    }, {"itemPerformed"}));
    entries.push_back(clickedRow<rows::LabelItem>("LabelItem", [](QWidget* host) {
        return new rows::LabelItem(word("Label"), word("more"), word("row"), 1, rowFlags(), host);
    }, {"itemPerformed"}));
    entries.push_back(clickedRow<rows::MultiStateItem>("MultiStateItem", [](QWidget* host) {
        return new rows::MultiStateItem(word("States"), word("row"), {0, 1, 2}, 1, rowFlags(), host);
    }, {"itemPerformed"}));
    Entry multiple = editedRow<rows::MultipleValuesEditItem>("MultipleValuesEditItem", [](QWidget* host) {
        return new rows::MultipleValuesEditItem(
            word("Several"), word("type"), word("row"), word("All"), word("Several"), 1, rowFlags(), host);
    });
    multiple.setters.push_back(setter("setMultipleValues", &rows::MultipleValuesEditItem::setMultipleValues));
    entries.push_back(multiple);
    entries.push_back(clickedRow<rows::PushItem>("PushItem", [](QWidget* host) {
        return new rows::PushItem(word("Push"), word("more"), word("row"), 1, rowFlags(), host);
    }, {"itemPerformed"}));
    entries.push_back(clickedRow<rows::RadioItem>("RadioItem", [](QWidget* host) {
        return new rows::RadioItem(
            word("Radio"), word("row"), 1, false, new QButtonGroup(host), rowFlags(), host);
    }, {"itemPerformed"}));
    Entry search = editedRow<rows::SearchItem>("SearchItem", [](QWidget* host) {
        return new rows::SearchItem(word("Search"), word("find"), word("row"), 1, rowFlags(), host);
    });
    search.exercise.back().fires << "searchChanged";
    entries.push_back(search);
    Entry separator = widgetClass<rows::Separator>("Separator", "popover/items/Separator.h");
    separator.exercise = {{"click", {}, {mousePress(QPoint(2, 2), 0), mouseRelease(QPoint(2, 2), 10)}}};
    entries.push_back(separator);
    Entry slider = rowEntry<rows::SliderItem>("SliderItem", [](QWidget* host) {
        auto* const row = new rows::SliderItem(word("Slider"), word("row"), 1, rowFlags(), host);
        row->slider()->addNubsie(word("handle"), 5, 0, 10, 1);
        return row;
    });
    slider.exercise.push_back({"values", {"itemPerformed"}, {[](const Subject& subject) {
        static_cast<rows::SliderItem*>(subject.object.data())->slider()->setValue(1, 7, false, true);
    }}});
    entries.push_back(slider);
    entries.push_back(clickedRow<rows::SpinItem>("SpinItem", [](QWidget* host) {
        return new rows::SpinItem(word("Spin"), word("row"), 1, nullptr, 5, rowFlags(), host);
    }, {"itemPerformed"}));
    entries.push_back(clickedRow<rows::Submenu>("Submenu", [](QWidget* host) {
        freshManager(host);
        auto* const container = new rows::Container(nullptr, word("nested"), Qt::Vertical, Qt::AlignTop);
        container->addItem(new rows::PushItem(word("Nested"), QString(), word("nested"), 2, rowFlags(), nullptr));
        auto* const row = new rows::Submenu(1, word("Title"), word("Submenu"), word("more"), word("row"), host,
            container, nullptr, 1, rowFlags());
        row->setParent(host);
        return row;
    }, {"itemPerformed"}));
    Entry three = clickedRow<rows::TristateCheckItem>("TristateCheckItem", [](QWidget* host) {
        return new rows::TristateCheckItem(word("Three"), word("row"), 1, true, 0, rowFlags(), host);
    }, {"stateChanged", "itemPerformed"});
    three.setters.push_back(setter("setCheckState", &rows::TristateCheckItem::setCheckState));
    three.setters.push_back(setter("setTristate", &rows::TristateCheckItem::setTristate));
    entries.push_back(three);
    entries.push_back(clickedRow<rows::UnitValueItem>("UnitValueItem", [](QWidget* host) {
        return new rows::UnitValueItem(
            word("Unit"), {word("s"), word("min")}, word("row"), new QButtonGroup(host), 1, rowFlags(), host);
    }, {"itemPerformed"}));
    entries.push_back(clickedRow<rows::iOSCheckItem>("iOSCheckItem", [](QWidget* host) {
        return new rows::iOSCheckItem(word("Switch"), word("row"), 1, false, rowFlags(), host);
    }, {"toggled", "itemPerformed"}));
    return entries;
}
}
