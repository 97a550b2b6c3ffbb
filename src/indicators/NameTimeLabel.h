// SPDX-License-Identifier: MIT
// A line with device name, date and time that drops what has no room.
#pragma once

#include "foundation/Export.h"
#include "indicators/NameTimeText.h"

#include <QtCore/QDateTime>
#include <QtWidgets/QLabel>

class QTimer;

namespace vx
{
/// A single line with device name, date and time. When the width runs out the date goes first, then the time; where
/// not even name and time fit together it shows the name, and after a click time and date.
///
/// With the check of the clock on, the line blinks (date and time go and come every 750 ms) while the device's clock
/// and the local one differ: by more than 60 seconds if the device is behind, at all if it is ahead. A check that
/// finds a difference starts the blinking, and the next one stops it: clients rely on it.
class ZELKOV_WIDGETS_EXPORT NameTimeLabel : public QLabel
{
    Q_OBJECT

public:
    explicit NameTimeLabel(QWidget* parent = nullptr);
    ~NameTimeLabel() override;

    // The parts of the line; it is fitted anew at once.
    void setText(QString name, QString time, QString date);
    void setDeviceName(QString name);
    void setDate(QString date);
    /// Checks the clock after setting the text.
    void setTime(QString time);
    /// The device's time, and date and time as texts in the given formats. Checks the clock after setting the text.
    void setDateTime(QDateTime dateTime, Qt::DateFormat dateFormat, Qt::DateFormat timeFormat);
    /// The name as it was set, whether or not it is shown.
    QString getDeviceName();
    /// Default off. Turning it off ends the blinking.
    void setCheckTimeSync(bool on);

Q_SIGNALS:
    /// The label was released, with any button.
    void clicked();

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void contentSwitch();
    void timeBlink();

private:
    bool isFitting(QString text);
    QString resizeLabel();
    void checkTimeSync();
    void init();
    void refresh();

    bool m_checkTimeSync = false;
    NameTimeText m_parts;
    QDateTime m_dateTime;
    QTimer* m_blinkTimer = nullptr;
    qint64 m_syncTolerance = 60; // seconds
    int m_blinkInterval = 750;   // ms
};
}
