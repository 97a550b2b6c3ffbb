// SPDX-License-Identifier: MIT
// The flat list shown as a table.
#include "models/FlexibleTableModel.h"

namespace vx
{
FlexibleTableModel::FlexibleTableModel(QObject* parent)
    : QAbstractTableModel(parent)
{
}

FlexibleTableModel::~FlexibleTableModel() = default;

Qt::Orientation FlexibleTableModel::orientation() const
{
    return m_orientation;
}

QModelIndex FlexibleTableModel::modelIndex(int cell) const
{
    const std::pair<int, int> position = modelIndexPair(cell);
    return index(position.first, position.second, QModelIndex());
}

QModelIndex FlexibleTableModel::index(int row, int column, const QModelIndex& parent) const
{
    return QAbstractTableModel::index(row, column, parent);
}

int FlexibleTableModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : TableShape {m_orientation, m_dimension}.rows(cellCount(parent));
}

int FlexibleTableModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : TableShape {m_orientation, m_dimension}.columns(cellCount(parent));
}

QVariant FlexibleTableModel::data(const QModelIndex& index, int role) const
{
    const int cell = cellIndex(index);
    return cell < 0 ? QVariant() : cellData(cell, role);
}

std::pair<int, int> FlexibleTableModel::modelIndexPair(int cell) const
{
    return TableShape {m_orientation, m_dimension}.position(cell);
}

int FlexibleTableModel::cellIndex(const std::pair<int, int>& position) const
{
    return TableShape {m_orientation, m_dimension}.cell(position);
}

int FlexibleTableModel::cellIndex(const QModelIndex& index) const
{
    return index.isValid() ? cellIndex(std::make_pair(index.row(), index.column())) : -1;
}

bool FlexibleTableModel::setOrientation(Qt::Orientation orientation, int dimension)
{
    const TableShape shape = TableShape::of(orientation, dimension);
    if (shape == TableShape {m_orientation, m_dimension}) {
        return false;
    }
    beginResetModel();
    m_orientation = shape.orientation;
    m_dimension = shape.dimension;
    endResetModel();
    return true;
}

std::pair<int, int> FlexibleTableModel::dimension(int cellCount) const
{
    if (cellCount == 0 || cellCount == 1) {
        return std::make_pair(cellCount, cellCount);
    }
    const std::pair<int, int> position = modelIndexPair(cellCount);
    return std::make_pair(position.first + 1, position.second + 1);
}

int FlexibleTableModel::rowCount(int cellCount) const
{
    if (m_orientation == Qt::Horizontal) {
        return m_dimension;
    }
    if (cellCount < 1) {
        return 0;
    }
    return cellCount < m_dimension ? 1 : modelIndexPair(cellCount - 1).first + 1;
}

int FlexibleTableModel::columnCount(int cellCount) const
{
    return m_orientation == Qt::Horizontal ? qMax(cellCount, 0) : m_dimension;
}
}
