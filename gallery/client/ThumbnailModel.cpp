// SPDX-License-Identifier: MIT
// The rows of a filtered fleet as the cells of a wall.
#include "ThumbnailModel.h"

#include "FleetModel.h"

namespace client
{
ThumbnailModel::ThumbnailModel(QAbstractItemModel* rows, QObject* parent)
    : FlexibleTableModel(parent)
    , m_rows(rows)
{
    const auto changed = [this] { follow(); };
    connect(rows, &QAbstractItemModel::modelReset, this, changed);
    connect(rows, &QAbstractItemModel::layoutChanged, this, changed);
    connect(rows, &QAbstractItemModel::rowsInserted, this, changed);
    connect(rows, &QAbstractItemModel::rowsRemoved, this, changed);
    connect(rows, &QAbstractItemModel::dataChanged, this, [this](const QModelIndex& first, const QModelIndex& last) {
        for (int row = first.row(); row <= last.row(); ++row) {
            const QModelIndex cell = modelIndex(row);
            Q_EMIT dataChanged(cell, cell);
        }
    });
    follow();
}

void ThumbnailModel::follow()
{
    QVector<int> ids;
    for (int row = 0; row < m_rows->rowCount(); ++row) {
        ids.append(m_rows->index(row, 0).data(FleetModel::IdRole).toInt());
    }
    if (ids != m_ids) {
        beginResetModel();
        m_ids = ids;
        endResetModel();
    }
}

int ThumbnailModel::idAt(const QModelIndex& index) const
{
    return m_ids.value(cellIndex(index), -1);
}

QModelIndex ThumbnailModel::indexOf(int id) const
{
    const int cell = m_ids.indexOf(id);
    return cell < 0 ? QModelIndex() : modelIndex(cell);
}

int ThumbnailModel::cellCount(const QModelIndex&) const
{
    return m_ids.size();
}

QVariant ThumbnailModel::cellData(int cell, int role) const
{
    if (cell >= m_ids.size()) {
        return {};
    }
    if (role == Qt::TextAlignmentRole) {
        return int(Qt::AlignAbsolute | Qt::AlignCenter);
    }
    const QModelIndex row = m_rows->index(cell, 0);
    if (role != Qt::DisplayRole && role != Qt::ToolTipRole) {
        return row.data(role);
    }
    const QString name = row.data(Qt::DisplayRole).toString();
    return row.data(FleetModel::OnlineRole).toBool() ? name : tr("%1 (offline)").arg(name);
}

Qt::ItemFlags ThumbnailModel::flags(const QModelIndex& index) const
{
    return idAt(index) < 0 ? Qt::ItemFlags(Qt::NoItemFlags) : FlexibleTableModel::flags(index);
}
}
