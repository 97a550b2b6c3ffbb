// SPDX-License-Identifier: MIT
// A model that shows a flat list of cells as a table whose number of columns can change.
#pragma once

#include <utility>

#include <QtCore/QAbstractTableModel>

#include "foundation/Export.h"
#include "models/TableShape.h"

namespace vx
{
/// Shows a one-dimensional list of cells as a table: one long row, or a fixed number of columns into which the cells
/// wrap row by row. A subclass supplies the number of cells and the data of a cell by its flat index; changing the
/// layout does not touch the data. Use it for walls of thumbnails whose columns follow the width of the view.
///
/// The last row may be short: the cells past the end are part of the table, and cellData() is asked for them with an
/// index that is not less than the count. A subclass whose list changes resets the model, since one more cell may
/// move all that follow.
class ZELKOV_WIDGETS_EXPORT FlexibleTableModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    explicit FlexibleTableModel(QObject* parent = nullptr);
    ~FlexibleTableModel() override;

    /// Qt::Horizontal (one row) at first.
    Qt::Orientation orientation() const;

    /// The index that shows @p cell; invalid if the table has no such place.
    QModelIndex modelIndex(int cell) const;

    QModelIndex index(int row, int column, const QModelIndex& parent = QModelIndex()) const override;
    /// 0 below a valid @p parent: a flat list has no children.
    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    /// 0 below a valid @p parent.
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    /// cellData() of the cell that @p index shows; an invalid index does not reach the subclass.
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;

    /// Row and column of @p cell.
    virtual std::pair<int, int> modelIndexPair(int cell) const;
    /// The cell at a row and column.
    virtual int cellIndex(const std::pair<int, int>& position) const;
    /// The cell that @p index shows, -1 for an invalid index.
    virtual int cellIndex(const QModelIndex& index) const;

    /// Changes the layout; resets the model and returns true if that makes a difference. @p dimension is the number
    /// of columns of Qt::Vertical, at least 1; Qt::Horizontal always has one row and sets it to 1.
    virtual bool setOrientation(Qt::Orientation orientation, int dimension);

    /// The number of cells. @p parent is always invalid.
    virtual int cellCount(const QModelIndex& parent) const = 0;
    /// The data of a cell by its flat index; has to be an empty variant for an index past the end.
    virtual QVariant cellData(int cell, int role) const = 0;

protected:
    /// Row and column that follow the last of @p cellCount cells, with 1 added to both; (cellCount, cellCount) for 0
    /// and 1. This is not the size of the table: an exact multiple gives a row too many and a column of 1, which
    /// subclasses rely on. Use rowCount() and columnCount() for the size.
    std::pair<int, int> dimension(int cellCount) const;

    /// Rows that @p cellCount cells take up, by modelIndexPair().
    int rowCount(int cellCount) const;
    /// Columns that @p cellCount cells take up.
    int columnCount(int cellCount) const;

private:
    Qt::Orientation m_orientation = Qt::Horizontal;
    int m_dimension = 1;
};
}
