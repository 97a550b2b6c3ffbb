// SPDX-License-Identifier: MIT
#include "Reconnection.h"

#include "Fleet.h"

#include <limits>

namespace client
{
Reconnection::Reconnection(Fleet& fleet, QObject* parent)
    : QObject(parent)
    , m_fleet(fleet)
{
    m_clock.start();
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &Reconnection::bringBack);
    connect(&fleet, &Fleet::onlineChanged, this, &Reconnection::note);
    connect(&fleet, &Fleet::orderChanged, this, &Reconnection::forgetRemoved);
    for (const Camera& camera : fleet.cameras()) {
        note(camera.id, camera.online);
    }
}

void Reconnection::setActive(bool active)
{
    m_active = active;
    wait();
}

void Reconnection::setDelay(int milliseconds)
{
    m_delay = milliseconds;
    wait();
}

int Reconnection::secondsOffline(int id) const
{
    const auto found = m_lost.find(id);
    return found == m_lost.end() ? 0 : int((m_clock.elapsed() - found.value()) / 1000);
}

void Reconnection::note(int id, bool online)
{
    if (online) {
        m_lost.remove(id);
    } else {
        m_lost.insert(id, m_clock.elapsed());
    }
    wait();
}

void Reconnection::forgetRemoved()
{
    for (auto each = m_lost.begin(); each != m_lost.end();) {
        if (m_fleet.camera(each.key())) {
            ++each;
        } else {
            each = m_lost.erase(each);
        }
    }
    wait();
}

void Reconnection::wait()
{
    if (!m_active || m_lost.isEmpty()) {
        m_timer.stop();
        return;
    }
    qint64 next = std::numeric_limits<qint64>::max();
    for (const qint64 lost : m_lost) {
        next = qMin(next, lost + m_delay);
    }
    m_timer.start(int(qMax<qint64>(0, next - m_clock.elapsed())));
}

void Reconnection::bringBack()
{
    // One at a time: whoever hears of it may change the fleet.
    const qint64 due = m_clock.elapsed() - m_delay;
    for (auto each = m_lost.begin(); each != m_lost.end(); ++each) {
        if (each.value() <= due) {
            m_fleet.setOnline(each.key(), true); // note() waits for the next one
            return;
        }
    }
    wait();
}
}
