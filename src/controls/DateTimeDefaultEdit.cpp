// SPDX-License-Identifier: MIT
#include "controls/DateTimeDefaultEdit.h"

#include "CoreQt/Connect.h"

#include <QtCore/QPointer>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>

namespace vx
{
DateTimeDefaultEdit::DateTimeDefaultEdit(QWidget* parent, EPosition position)
    : DateTimeEdit(parent)
    , m_resetButton(new QPushButton(this))
    , m_position(position)
{
    m_returnLeavesField = true;
    m_resetButton->setFlat(true);
    m_resetButton->setIcon(QIcon(QStringLiteral(":/SearchItem/searchClear.png")));
    m_resetButton->setToolTip(tr("Reset time"));
    m_resetButton->setCursor(Qt::ArrowCursor);
    m_resetButton->hide();
    vx::connect(m_resetButton, "2clicked(bool)", this, "1resetToDefault()", Qt::AutoConnection);
    vx::connect(this, "2dateTimeChanged(const QDateTime&)", this, "1onDateTimeChanged()", Qt::AutoConnection);
}

DateTimeDefaultEdit::~DateTimeDefaultEdit() = default;

void DateTimeDefaultEdit::setDefaultDateTime(const QDateTime& dateTime)
{
    m_defaultDateTime = dateTime;
    const QPointer<DateTimeDefaultEdit> alive(this);
    setDateTime(dateTime);
    if (alive) {
        // Where the value was the same already there was no change to judge the button by.
        onDateTimeChanged();
    }
}

const QDateTime& DateTimeDefaultEdit::defaultDateTime() const
{
    return m_defaultDateTime;
}

void DateTimeDefaultEdit::onDateTimeChanged()
{
    m_resetButton->setVisible(!m_defaultDateTime.isNull() && m_defaultDateTime != dateTime());
}

void DateTimeDefaultEdit::resetToDefault()
{
    const QPointer<DateTimeDefaultEdit> alive(this);
    setDateTime(m_defaultDateTime);
    if (!alive) {
        return;
    }
    Q_EMIT editingFinished();
    if (alive) {
        clearFocus();
    }
}

void DateTimeDefaultEdit::resizeEvent(QResizeEvent* event)
{
    // Without a horizontal alignment it is the direction that chooses the side.
    m_resetButton->setGeometry(QStyle::alignedRect(m_position == Right ? Qt::RightToLeft : Qt::LeftToRight,
        Qt::AlignVCenter, QSize(20, 20), rect()));
    DateTimeEdit::resizeEvent(event);
}
}
