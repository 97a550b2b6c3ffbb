// SPDX-License-Identifier: MIT
// Brings cameras back that have gone offline.
#pragma once

#include <QtCore/QElapsedTimer>
#include <QtCore/QHash>
#include <QtCore/QObject>
#include <QtCore/QTimer>

namespace client
{
class Fleet;

/// Remembers since when cameras are offline and sets each online again after the delay, as a network does. Sleeps
/// while nobody looks; what is due by then comes back as soon as somebody does.
class Reconnection : public QObject
{
    Q_OBJECT

public:
    explicit Reconnection(Fleet& fleet, QObject* parent = nullptr);

    /// Off at first.
    void setActive(bool active);
    bool isWaiting() const { return m_timer.isActive(); }
    /// In milliseconds, 8000 by default. Counts for cameras that are offline already, too.
    void setDelay(int milliseconds);
    /// 0 for a camera that is online.
    int secondsOffline(int id) const;

private:
    void note(int id, bool online);
    void forgetRemoved();
    void wait();
    void bringBack();

    Fleet& m_fleet;
    QHash<int, qint64> m_lost; // milliseconds of the clock
    QElapsedTimer m_clock;
    QTimer m_timer;
    int m_delay = 8000;
    bool m_active = false;
};
}
