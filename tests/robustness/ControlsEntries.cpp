// SPDX-License-Identifier: MIT
// The dial, the password form and the phone-style list of controls/.
#include "controls/DialButton.h"
#include "controls/PasswordCheckWidget.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "controls/iOSListWidgetItem.h"

#include <QtCore/QCoreApplication>
#include <QtGui/QDropEvent>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
Entry dialButton()
{
    Entry entry;
    entry.name = "DialButton";
    entry.header = "controls/DialButton.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const dial = new vx::DialButton(3, host);
        dial->resize(90, 90);
        dial->setReboundEnabled(true);
        return Subject{dial, dial};
    };
    entry.exercise = {
        {"turn and let go", {"toggled", "pressed", "released", "reboundPerformed"},
            {mousePress(QPoint(20, 20), 0), mouseMove(QPoint(70, 22), 20), mouseRelease(QPoint(70, 22), 40)}},
        // Only clients emit this one.
        {"a client's click", {"clicked"}, {call(&vx::DialButton::clicked, true)}},
    };
    entry.setters = {
        setter("setDefaultValue", &vx::DialButton::setDefaultValue),
        setter("setMouseClickSensitivity", &vx::DialButton::setMouseClickSensitivity),
        setter("setHorizontalMouseTracking", &vx::DialButton::setHorizontalMouseTracking),
    };
    return entry;
}

Entry passwordForm()
{
    Entry entry;
    entry.name = "PasswordCheckWidget";
    entry.header = "controls/PasswordCheckWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const form = new vx::PasswordCheckWidget(
            true, vx::PasswordCheckWidget::esrMinimumLength | vx::PasswordCheckWidget::esrPasswordsMatch, host);
        return Subject{form, form};
    };
    entry.exercise = {{"type", {"passwordChanged"}, {[](const Subject& subject) {
                           QKeyEvent key(QEvent::KeyPress, Qt::Key_A, Qt::NoModifier, QStringLiteral("a"));
                           QCoreApplication::sendEvent(
                               static_cast<vx::PasswordCheckWidget*>(subject.object.data())->firstLineEdit(), &key);
                       }}}};
    entry.setters = {setter("setAllowedCharacters", &vx::PasswordCheckWidget::setAllowedCharacters)};
    return entry;
}

vx::iOSListWidgetItem* addRow(vx::iOSListWidget* list)
{
    return new vx::iOSListWidgetItem(list, new QLabel(QStringLiteral("row")), QStringLiteral("row"), QSize(),
        new QLineEdit, new QLabel(QStringLiteral("*")), nullptr);
}

Entry list()
{
    Entry entry;
    entry.name = "iOSListWidget";
    entry.header = "controls/iOSListWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const list = new vx::iOSListWidget(host, QStringLiteral("list"));
        for (int i = 0; i < 3; ++i) {
            addRow(list);
        }
        list->resize(180, 120);
        return Subject{list, list};
    };
    entry.exercise = {
        {"add and delete", {"itemAdded", "itemRemoved", "layoutChanged"},
            {[](const Subject& subject) { addRow(static_cast<vx::iOSListWidget*>(subject.object.data())); },
                call(&vx::iOSListWidget::setEditMode, true),
                [](const Subject& subject) {
                    auto* const list = static_cast<vx::iOSListWidget*>(subject.object.data());
                    list->setDeleteMode(list->getIOSItem(0));
                },
                [](const Subject& subject) {
                    auto* const list = static_cast<vx::iOSListWidget*>(subject.object.data());
                    list->deleteItem(list->item(0));
                }}},
        // A drop of the list's own comes from a drag, which has no place here.
        {"a client's move", {"itemMoved", "dataMoved"},
            {call(&vx::iOSListWidget::itemMoved, 0, 1),
                call(&vx::iOSListWidget::dataMoved, QVariant(1), QVariant(2))}},
    };
    return entry;
}

Entry listRow()
{
    Entry entry;
    entry.name = "iOSListWidgetItem";
    entry.header = "controls/iOSListWidgetItem.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        auto* const list = new vx::iOSListWidget(host, QStringLiteral("list"));
        vx::iOSListWidgetItem* const row = addRow(list);
        list->resize(180, 60);
        return Subject{row, list};
    };
    entry.exercise = {{"delete", {"itemToBeDeleted"},
        {[](const Subject& subject) {
            auto* const row = static_cast<vx::iOSListWidgetItem*>(subject.object.data());
            row->setEditMode(true);
            row->setDeleteMode(true, true);
            if (auto* const button = subject.widget->findChild<QPushButton*>(QStringLiteral("deleteButton"))) {
                button->click();
            }
        }}}};
    entry.setters = {
        setter("setEditMode", &vx::iOSListWidgetItem::setEditMode),
        setter("setTooltipImageFilePath", &vx::iOSListWidgetItem::setTooltipImageFilePath),
        setter("setToolTipEnabled", &vx::iOSListWidgetItem::setToolTipEnabled),
    };
    return entry;
}

Entry deleteIcon()
{
    Entry entry
        = widgetClass<vx::iOSListWidgetDeleteIcon>("iOSListWidgetDeleteIcon", "controls/iOSListWidgetDeleteIcon.h");
    entry.exercise = {{"turn", {}, {call(&vx::iOSListWidgetDeleteIcon::setDeleteMode, true, true)}}};
    return entry;
}
}

std::vector<Entry> controlsEntries()
{
    return {
        dialButton(),
        passwordForm(),
        list(),
        deleteIcon(),
        listRow(),
    };
}
}
