// SPDX-License-Identifier: MIT
// Names, places and addresses of the synthetic cameras.
#include "Fleet.h"

#include <algorithm>

namespace client
{
namespace
{
const char* const s_places[] = {"Gate", "Yard", "Hall", "Stairs", "Garage", "Ramp", "Office", "Roof"};
}

Fleet::Fleet(QObject* parent)
    : QObject(parent)
{
    m_cameras.reserve(s_count);
    for (int i = 0; i < s_count; ++i) {
        Camera camera;
        camera.id = i;
        camera.place = QLatin1String(s_places[i % 8]);
        camera.name = QStringLiteral("%1 %2").arg(camera.place).arg(i / 8 + 1);
        // Addresses from the range that is kept for documentation.
        camera.address = QStringLiteral("192.0.2.%1").arg(10 + i);
        camera.steerable = i % 4 == 0;
        camera.events = i % 7 == 2 ? 1 + i % 5 : 0;
        m_cameras.append(camera);
    }
}

const Camera* Fleet::camera(int id) const
{
    const int index = indexOf(id);
    return index < 0 ? nullptr : &m_cameras.at(index);
}

int Fleet::indexOf(int id) const
{
    const auto found = std::find_if(m_cameras.begin(), m_cameras.end(), [id](const Camera& each) { return each.id == id; });
    return found == m_cameras.end() ? -1 : int(found - m_cameras.begin());
}

void Fleet::rename(int id, const QString& name)
{
    const int index = indexOf(id);
    if (index >= 0 && m_cameras.at(index).name != name) {
        m_cameras[index].name = name;
        Q_EMIT renamed(id);
    }
}

void Fleet::move(int from, int to)
{
    if (from != to && from >= 0 && to >= 0 && from < m_cameras.size() && to < m_cameras.size()) {
        m_cameras.move(from, to);
        Q_EMIT orderChanged();
    }
}

void Fleet::remove(int id)
{
    const int index = indexOf(id);
    if (index >= 0) {
        m_cameras.remove(index);
        Q_EMIT orderChanged();
    }
}

void Fleet::setOnline(int id, bool online)
{
    const int index = indexOf(id);
    if (index >= 0 && m_cameras.at(index).online != online) {
        m_cameras[index].online = online;
        Q_EMIT onlineChanged(id, online);
    }
}

void Fleet::setEvents(int id, int count)
{
    const int index = indexOf(id);
    if (index >= 0 && m_cameras.at(index).events != count) {
        m_cameras[index].events = count;
        Q_EMIT eventsChanged(id);
    }
}
}
