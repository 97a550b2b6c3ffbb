// SPDX-License-Identifier: MIT
// A row with a date and a time.
#include "popover/items/DateTimeItem.h"

#include "CoreQt/Connect.h"

#include <QtCore/QSignalBlocker>
#include <QtWidgets/QHBoxLayout>

namespace vx
{
namespace PopoverWidget
{

DateTimeItem::DateTimeItem(const QString& text, const QDateTime& dateTime, Qt::TimeSpec timeSpec,
    const QString& displayFormat, const QString& objectName, int id, QFlags<EItemFlag> flags, QWidget* parent)
    : Item(parent, flags, id, objectName, text, QString())
    , m_edit(new QDateTimeEdit)
{
    m_edit->setObjectName(QStringLiteral("dateTimeEdit"));
    m_edit->setTimeSpec(timeSpec);
    m_edit->setDisplayFormat(displayFormat);
    m_edit->setDateTime(dateTime);
    if (flags.testFlag(eifDisabled)) {
        m_edit->setEnabled(false);
    }
    (m_rightLayout ? m_rightLayout : m_mainLayout)->addWidget(m_edit.get());
    m_lastElement = m_edit.get();
    vx::connect(m_edit.get(), "2dateTimeChanged(const QDateTime&)", this, "1onDateTimeChanged(const QDateTime&)",
        Qt::AutoConnection);
}

DateTimeItem::~DateTimeItem() = default;

void DateTimeItem::setValue(const QVariant& value)
{
    if (m_edit) {
        const QSignalBlocker blocker(m_edit.get());
        m_edit->setDateTime(value.toDateTime());
    }
}

QVariant DateTimeItem::value()
{
    return m_edit ? QVariant(m_edit->dateTime()) : QVariant();
}

QDateTimeEdit* DateTimeItem::dateTimeEdit() const
{
    return m_edit.get();
}

void DateTimeItem::onDateTimeChanged(const QDateTime& dateTime)
{
    const auto reporting = m_edit.report();
    Q_EMIT itemPerformed(m_id, dateTime, userData(), EItemPerformedFlags());
}

} // namespace PopoverWidget
} // namespace vx
