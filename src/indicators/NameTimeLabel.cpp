// SPDX-License-Identifier: MIT
#include "indicators/NameTimeLabel.h"

#include "CoreQt/Connect.h"
#include "indicators/TimeDifference.h"

#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtGui/QFontMetrics>
#include <QtGui/QMouseEvent>

namespace vx
{
NameTimeLabel::NameTimeLabel(QWidget* parent)
    : QLabel(parent)
{
    init();
}

NameTimeLabel::~NameTimeLabel() = default;

void NameTimeLabel::init()
{
    m_blinkTimer = new QTimer(this);
    m_blinkTimer->setSingleShot(false);
    m_blinkTimer->setInterval(m_blinkInterval);
    vx::connect(this, "2clicked()", this, "1contentSwitch()", Qt::AutoConnection);
    vx::connect(m_blinkTimer, "2timeout()", this, "1timeBlink()", Qt::AutoConnection);
}

void NameTimeLabel::refresh()
{
    QLabel::setText(resizeLabel());
}

void NameTimeLabel::setText(QString name, QString time, QString date)
{
    m_parts.name = name;
    m_parts.time = time;
    m_parts.date = date;
    refresh();
}

void NameTimeLabel::setDeviceName(QString name)
{
    m_parts.name = name;
    refresh();
}

void NameTimeLabel::setDate(QString date)
{
    m_parts.date = date;
    refresh();
}

void NameTimeLabel::setTime(QString time)
{
    m_parts.time = time;
    refresh();
    checkTimeSync();
}

void NameTimeLabel::setDateTime(QDateTime dateTime, Qt::DateFormat dateFormat, Qt::DateFormat timeFormat)
{
    m_dateTime = dateTime;
    m_parts.time = dateTime.time().toString(timeFormat);
    m_parts.date = dateTime.date().toString(dateFormat);
    refresh();
    checkTimeSync();
}

QString NameTimeLabel::getDeviceName()
{
    return m_parts.name;
}

void NameTimeLabel::setCheckTimeSync(bool on)
{
    m_checkTimeSync = on;
    if (!on) {
        m_blinkTimer->stop();
        refresh();
    }
}

bool NameTimeLabel::isFitting(QString text)
{
    return fontMetrics().horizontalAdvance(text) <= width();
}

QString NameTimeLabel::resizeLabel()
{
    return dropUntilFits(
        m_parts, [this](const QString& text) { return isFitting(text); },
        [this](const QString& text) { return fontMetrics().elidedText(text, Qt::ElideMiddle, width()); });
}

void NameTimeLabel::checkTimeSync()
{
    if (!m_checkTimeSync) {
        return;
    }
    // Without sign: a device ahead of the local clock gives a number near 2^32, so that the tolerance holds in one
    // direction only. Clients rely on it.
    const qint64 difference = secondsOfTime(QDateTime::currentDateTime()) - secondsOfTime(m_dateTime);
    if (!m_blinkTimer->isActive() && difference > m_syncTolerance) {
        m_blinkTimer->start();
    } else if (m_blinkTimer->isActive()) {
        // Stopped by any check, whether the clocks agree by now or not. Clients rely on it.
        m_blinkTimer->stop();
        m_parts.showTime = true;
        m_parts.showDate = true;
    }
}

void NameTimeLabel::timeBlink()
{
    m_parts.showTime = !m_parts.showTime;
    m_parts.showDate = m_parts.showTime;
    refresh();
}

void NameTimeLabel::contentSwitch()
{
    // The text changes with the next update of the time.
    if (!isFitting(m_parts.name + QLatin1Char(' ') + m_parts.time)) {
        m_parts.nameInNarrowMode = !m_parts.nameInNarrowMode;
    }
}

void NameTimeLabel::mouseReleaseEvent(QMouseEvent* event)
{
    const QPointer<NameTimeLabel> alive(this);
    Q_EMIT clicked();
    if (alive) {
        QLabel::mouseReleaseEvent(event);
    }
}

void NameTimeLabel::resizeEvent(QResizeEvent* event)
{
    QLabel::resizeEvent(event);
    m_parts.showTime = true;
    m_parts.showDate = true;
    m_parts.showName = true;
    m_parts.timeDropped = false;
    refresh();
}
}
