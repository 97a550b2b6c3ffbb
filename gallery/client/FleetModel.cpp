// SPDX-License-Identifier: MIT
// The fleet as an item model.
#include "FleetModel.h"

#include "cameras/Scene.h"
#include "Fleet.h"
#include "models/MultiFilterModel.h"

#include <QtGui/QPainter>

namespace client
{
namespace
{
const QSize c_picture(320, 180);

QVector<int> idsOf(const Fleet& fleet)
{
    QVector<int> ids;
    ids.reserve(fleet.cameras().size());
    for (const Camera& camera : fleet.cameras()) {
        ids.append(camera.id);
    }
    return ids;
}

QImage paintPicture(int id, bool online, qint64 millis)
{
    const gallery::Scene scene(id);
    const QPixmap ground = scene.ground(c_picture, 1);
    QImage image(c_picture, QImage::Format_RGB32);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate((c_picture.width() - ground.width()) / 2, 0);
    painter.drawPixmap(0, 0, ground);
    if (online) {
        scene.drawMovers(painter, ground.size(), millis);
        return image;
    }
    painter.end();
    image = image.convertToFormat(QImage::Format_Grayscale8).convertToFormat(QImage::Format_RGB32);
    painter.begin(&image);
    painter.fillRect(image.rect(), QColor(0, 0, 0, 130));
    return image;
}
}

FleetModel::FleetModel(Fleet& fleet, QObject* parent)
    : QAbstractTableModel(parent)
    , m_fleet(&fleet)
    , m_ids(idsOf(fleet))
{
    m_clock.start();
    connect(&fleet, &Fleet::renamed, this, &FleetModel::changed);
    connect(&fleet, &Fleet::onlineChanged, this, [this](int id) {
        m_pictures.remove(id);
        changed(id);
    });
    connect(&fleet, &Fleet::orderChanged, this, [this] {
        beginResetModel();
        m_ids = m_fleet ? idsOf(*m_fleet) : QVector<int>();
        endResetModel();
    });
}

void FleetModel::search(vx::MultiFilterModel& filter, const QString& text)
{
    QVector<vx::MultiFilterModel::SearchFilter> filters;
    const QStringList words = text.simplified().split(QLatin1Char(' '));
    for (const QString& word : words) {
        filters.append({{Name, Place, Address}, QRegExp(word, Qt::CaseInsensitive, QRegExp::FixedString)});
    }
    filter.setSearchFilters(filters);
}

void FleetModel::changed(int id)
{
    const int row = rowOf(id);
    if (row >= 0) {
        Q_EMIT dataChanged(index(row, 0), index(row, ColumnCount - 1));
    }
}

void FleetModel::refreshPicture(int id)
{
    if (m_pictures.remove(id) > 0) {
        const int row = rowOf(id);
        if (row >= 0) {
            Q_EMIT dataChanged(index(row, Name), index(row, Name), {Qt::DecorationRole});
        }
    }
}

int FleetModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_ids.size();
}

int FleetModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(ColumnCount);
}

QVariant FleetModel::data(const QModelIndex& index, int role) const
{
    // The camera may be gone already while its row is not.
    const Camera* const camera = index.isValid() && m_fleet ? m_fleet->camera(m_ids.value(index.row(), -1)) : nullptr;
    if (!camera) {
        return {};
    }
    if (role == IdRole) {
        return camera->id;
    }
    if (role == OnlineRole) {
        return camera->online;
    }
    if (role == Qt::DecorationRole && index.column() == Name) {
        return picture(camera->id, camera->online);
    }
    if (role != Qt::DisplayRole) {
        return {};
    }
    switch (index.column()) {
    case Name: return camera->name;
    case Place: return camera->place;
    default: return camera->address;
    }
}

QImage FleetModel::picture(int id, bool online) const
{
    QImage& image = m_pictures[id];
    if (image.isNull()) {
        image = paintPicture(id, online, m_clock.elapsed());
    }
    return image;
}
}
