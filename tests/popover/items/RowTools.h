// SPDX-License-Identifier: MIT
// What the tests of rows share.
#pragma once

#include "SignalRecorder.h"
#include "indicators/ElidedButton.h"
#include "popover/Item.h"
#include "popover/ItemTools.h"

#include <QtCore/QStringList>
#include <QtWidgets/QWidget>

#include <memory>

namespace rowtest
{
/// The rights of all rows for the length of a test: the right "no" is refused.
class SharedRights
{
public:
    SharedRights()
        : rights(std::make_shared<itemtest::Rights>())
    {
        vx::PopoverWidget::Item::setSecurityManager(rights);
    }
    ~SharedRights() { vx::PopoverWidget::Item::setSecurityManager(nullptr); }
    SharedRights(const SharedRights&) = delete;
    SharedRights& operator=(const SharedRights&) = delete;

    std::shared_ptr<itemtest::Rights> rights;
};

/// The user data of the first itemPerformed that was recorded.
inline QVariant userDataOf(const zelkovtest::SignalRecorder& recorder)
{
    const QVariant argument = recorder.entries().first().arguments.at(2);
    return argument.userType() == QMetaType::QVariant ? argument.value<QVariant>() : argument;
}

/// Signals in order, each with what matters: "itemPerformed 7 true 18", "toggled true name", "layoutChanged".
inline QStringList told(const zelkovtest::SignalRecorder& recorder)
{
    QStringList result;
    for (const zelkovtest::SignalRecorder::Entry& entry : recorder.entries()) {
        QString text = entry.name;
        if (entry.name == QLatin1String("itemPerformed")) {
            const QVariant value = entry.arguments.at(1).canConvert<QVariant>()
                    && entry.arguments.at(1).userType() == QMetaType::QVariant
                ? entry.arguments.at(1).value<QVariant>()
                : entry.arguments.at(1);
            text += QStringLiteral(" %1 %2 %3").arg(entry.arguments.at(0).toInt())
                        .arg(value.isNull() ? QStringLiteral("null") : value.toString())
                        .arg(int(entry.arguments.at(3).value<vx::PopoverWidget::EItemPerformedFlags>()));
        } else {
            for (const QVariant& argument : entry.arguments) {
                text += QLatin1Char(' ') + argument.toString();
            }
        }
        result << text;
    }
    return result;
}

/// Without layoutChanged, which many changes bring.
inline QStringList events(const zelkovtest::SignalRecorder& recorder)
{
    QStringList result = told(recorder);
    result.removeAll(QStringLiteral("layoutChanged"));
    return result;
}

/// A window with one row of 400 x 40 pixels, whose elements begin 150 pixels from the left.
template<class Row>
class Host
{
public:
    explicit Host(Row* given)
        : row(given)
    {
        window.resize(420, 100);
        row->setParent(&window);
        row->setGeometry(10, 10, 400, 40);
        row->setLeftMargin(150);
        row->show();
        window.show();
    }
    QPoint middle(const QWidget* part) const
    {
        return part->mapTo(row, part->rect().center());
    }
    /// In the window's coordinates.
    QPoint inWindow(const QWidget* part) const { return part->mapTo(const_cast<QWidget*>(&window), part->rect().center()); }

    QWidget window;
    Row* row;
};
}
