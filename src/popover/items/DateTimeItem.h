// SPDX-License-Identifier: MIT
// A row with a date and a time.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtCore/QDateTime>
#include <QtWidgets/QDateTimeEdit>

namespace vx
{
namespace PopoverWidget
{

/// A row with a date and time edit at its right end. Each change by the user performs it, with the date and time as
/// value and without any flag; a click on the row does nothing. Values from code perform nothing.
class ZELKOV_WIDGETS_EXPORT DateTimeItem : public Item
{
    Q_OBJECT

public:
    /// Starts at \a dateTime, without a signal.
    DateTimeItem(const QString& text, const QDateTime& dateTime, Qt::TimeSpec timeSpec, const QString& displayFormat,
        const QString& objectName, int id, QFlags<EItemFlag> flags, QWidget* parent);
    ~DateTimeItem() override;

    /// The date and time that the value gives; an invalid one is ignored.
    void setValue(const QVariant& value) override;
    QVariant value() override;

    /// The edit; null when it has been deleted by someone else.
    QDateTimeEdit* dateTimeEdit() const;

private Q_SLOTS:
    void onDateTimeChanged(const QDateTime& dateTime);

private:
    ControlHolder<QDateTimeEdit> m_edit;
};

} // namespace PopoverWidget
} // namespace vx
