// SPDX-License-Identifier: MIT
// The rows of popovers and their containers.
#include "popover/HeaderContainer.h"
#include "popover/Item.h"
#include "popover/WidgetItem.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLineEdit>

#include "Registry.h"
#include "RowSteps.h"

namespace zelkovtest
{
namespace
{
namespace pw = vx::PopoverWidget;

/// A row as a client subclasses it.
class ExercisedRow : public pw::Item
{
public:
    explicit ExercisedRow(QWidget* parent)
        : Item(parent,
            pw::eifIcon | pw::eifText | pw::eifAdditionalText | pw::eifDoubleClick | pw::eifBoldSelection, 1,
            QStringLiteral("row"), QStringLiteral("Pan & tilt"), QStringLiteral("on"))
    {
        resize(160, 24);
        setDragEnabled(true);
        setUserData(QStringLiteral("data"));
    }
};

Entry popoverItem()
{
    Entry entry;
    entry.name = "Item";
    entry.header = "popover/Item.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const row = new ExercisedRow(host);
        return Subject {row, row};
    };
    entry.exercise = {
        {"double click", {"itemPerformed"},
            {mousePress(QPoint(30, 10), 0), mouseRelease(QPoint(30, 10), 20), mouseDoubleClick(QPoint(30, 10), 40),
                mouseRelease(QPoint(30, 10), 60)}},
        {"texts and busy states", {"layoutChanged"},
            {call(&pw::Item::setChecked, true), call(&pw::Item::setText, QStringLiteral("Zoom")),
                call(&pw::Item::setIconText, QStringLiteral("Z")),
                call(&pw::Item::setAdditionalText, QStringLiteral("off")),
                call(&pw::Item::setValue, QVariant(QStringLiteral("A & B"))), call(&pw::Item::setBusy, true, true),
                call(&pw::Item::setBusy, false, true), call(&pw::Item::setBusyText, QStringLiteral("12"), false),
                call(&pw::Item::setEnableShadow, true), call(&pw::Item::setEnableShadow, false)}},
        {"drag", {"itemDragStarted"},
            {mousePress(QPoint(20, 10), 1000), mouseMove(QPoint(25, 10), 1010), mouseMove(QPoint(60, 12), 1020),
                mouseRelease(QPoint(60, 12), 1030)}},
        resetByMenu(),
    };
    entry.setters = {
        setter("setText", &pw::Item::setText),
        setter("setAdditionalText", &pw::Item::setAdditionalText),
        setter("setValue", &pw::Item::setValue),
        setter("setChecked", &pw::Item::setChecked),
        setter("setBusy", &pw::Item::setBusy),
        setter("setBusyText", &pw::Item::setBusyText),
        setter("setElideMode", &pw::Item::setElideMode),
        setter("setUserData", &pw::Item::setUserData),
        setter("setIconText", &pw::Item::setIconText),
        setter("setDragMimeType", &pw::Item::setDragMimeType),
        setter("setAdminOnly", &pw::Item::setAdminOnly),
        setter("setSecurityCheck", &pw::Item::setSecurityCheck),
    };
    return entry;
}

Entry popoverWidgetItem()
{
    Entry entry;
    entry.name = "WidgetItem";
    entry.header = "popover/WidgetItem.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const item = new pw::WidgetItem(new QLineEdit, QStringLiteral("holder"), 1, host);
        item->setDragEnabled(true);
        return Subject {item, item};
    };
    entry.exercise = {
        {"as a bare row", {"itemPerformed", "layoutChanged"},
            {call(&pw::Item::setChecked, true), call(&pw::Item::setBusy, true, true),
                call(&pw::Item::setBusy, false, true),
                call(&pw::Item::performSingleClick, QFlags<pw::EItemPerformedFlag>())}},
        {"drag", {"itemDragStarted"},
            {mousePress(QPoint(2, 2), 1000), mouseMove(QPoint(30, 2), 1010), mouseRelease(QPoint(30, 2), 1020)}},
        resetByMenu(),
    };
    entry.setters = {setter("setValue", &pw::Item::setValue)};
    return entry;
}

/// The row with that id gets a double click, if it still lives.
Step performRow(int id)
{
    return [id](const Subject& subject) {
        const auto* const container = static_cast<pw::Container*>(subject.object.data());
        QWidget* const row = container->getItem(id);
        if (row) {
            QMouseEvent event(QEvent::MouseButtonDblClick, QPoint(5, 5), row->mapToGlobal(QPoint(5, 5)),
                Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
            QApplication::sendEvent(row, &event);
        }
    };
}

Step addRow(QFlags<pw::EContainerFlag> flags)
{
    return [flags](const Subject& subject) {
        static_cast<pw::Container*>(subject.object.data())->addItem(new ExercisedRow(nullptr), flags);
    };
}

Step addParts()
{
    return [](const Subject& subject) {
        auto* const container = static_cast<pw::Container*>(subject.object.data());
        auto* const header
            = new pw::HeaderContainer(nullptr, QStringLiteral("header"), Qt::Horizontal, Qt::AlignLeft);
        header->addItem(new ExercisedRow(nullptr));
        auto* const nested = new pw::Container(nullptr, QStringLiteral("nested"), Qt::Vertical, Qt::AlignTop);
        nested->addItem(new ExercisedRow(nullptr));
        nested->addHeader(header);
        container->addContainer(nested);
    };
}

template <class Class> Entry popoverContainer(const char* name, const char* header)
{
    Entry entry;
    entry.name = name;
    entry.header = header;
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const container = new Class(host, QStringLiteral("container"), Qt::Vertical, Qt::AlignTop);
        container->resize(200, 200);
        container->addItem(new ExercisedRow(nullptr), pw::ecfDismiss | pw::ecfDismissAll);
        container->addItem(new ExercisedRow(nullptr));
        return Subject {container, container};
    };
    entry.exercise = {
        {"performing a row", {"dismissPopover", "dismissAllPopover", "itemPerformed"}, {performRow(1)}},
        {"building", {"layoutChanged"},
            {addRow(pw::ecfDismiss), addParts(), call(&pw::Container::addStretch, 1),
                call(&pw::Container::addSpacing, 4),
                call(&pw::Container::addSpacer, QSizePolicy::Expanding, 10, 10)}},
        {"opening and closing", {"popoverAboutToOpen", "popoverAboutToClose"},
            {call(&pw::Container::popoverOpening), call(&pw::Container::popoverOpened),
                call(&pw::Container::setAutoFocusItem, 1), call(&pw::Container::setAutoFocus),
                call(&pw::Container::onScrolled), call(&pw::Container::updateItems),
                call(&pw::Container::popoverClosing)}},
        {"changing rows", {},
            {call(&pw::Container::setItemText, 1, QStringLiteral("x"), true),
                call(&pw::Container::setItemBusy, 1, true, true, true),
                call(&pw::Container::setItemsChecked, 1, true, true),
                call(&pw::Container::setItemsVisibility, 1, false, true)}},
        {"emptying", {},
            {call(&pw::Container::removeItem, 1), addRow(pw::ecfDismiss), call(&pw::Container::clear)}},
    };
    using Visibility = void (pw::Container::*)(int, bool, bool);
    entry.setters = {
        setter("addStretch", &pw::Container::addStretch),
        setter("setItemText", &pw::Container::setItemText),
        setter("setItemCurrentText", &pw::Container::setItemCurrentText),
        setter("setItemUserData", &pw::Container::setItemUserData),
        setter("setItemValue", &pw::Container::setItemValue),
        setter("setItemBusy", &pw::Container::setItemBusy),
        setter("setItemVisibility", static_cast<Visibility>(&pw::Container::setItemVisibility)),
        setter("setItemEnabled", &pw::Container::setItemEnabled),
        setter("setItemsChecked", &pw::Container::setItemsChecked),
        setter("setAutoFocusItem", &pw::Container::setAutoFocusItem),
        setter("removeItem", &pw::Container::removeItem),
    };
    return entry;
}
}

std::vector<Entry> popoverItemEntries()
{
    return {
        popoverContainer<pw::Container>("Container", "popover/Container.h"),
        popoverContainer<pw::HeaderContainer>("HeaderContainer", "popover/HeaderContainer.h"),
        popoverItem(),
        popoverWidgetItem(),
    };
}
}
