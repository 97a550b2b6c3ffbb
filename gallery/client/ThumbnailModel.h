// SPDX-License-Identifier: MIT
// The rows of a filtered fleet as the cells of a wall.
#pragma once

#include "models/FlexibleTableModel.h"

#include <QtCore/QVector>

namespace client
{
/// Follows whatever happens to the rows of another model, which has the cameras in its first column.
class ThumbnailModel : public vx::FlexibleTableModel
{
    Q_OBJECT

public:
    explicit ThumbnailModel(QAbstractItemModel* rows, QObject* parent = nullptr);

    /// -1 for an index without a camera.
    int idAt(const QModelIndex& index) const;
    /// Invalid for a camera that is not shown.
    QModelIndex indexOf(int id) const;

    int cellCount(const QModelIndex& parent) const override;
    QVariant cellData(int cell, int role) const override;
    /// The places after the last camera can be neither chosen nor entered.
    Qt::ItemFlags flags(const QModelIndex& index) const override;

private:
    void follow();

    QAbstractItemModel* m_rows;
    QVector<int> m_ids;
};
}
