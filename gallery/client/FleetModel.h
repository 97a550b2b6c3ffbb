// SPDX-License-Identifier: MIT
// The fleet as an item model.
#pragma once

#include <QtCore/QAbstractTableModel>
#include <QtCore/QElapsedTimer>
#include <QtCore/QHash>
#include <QtCore/QPointer>
#include <QtCore/QVector>
#include <QtGui/QImage>

namespace vx
{
class MultiFilterModel;
}

namespace client
{
class Fleet;

/// One row for each camera, in the order of the fleet. Qt::DecorationRole of the first column is a picture of what the
/// camera sees; it is painted when it is asked for and stays the same until refreshPicture().
class FleetModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column : int
    {
        Name,
        Place,
        Address,
        ColumnCount
    };
    enum Role : int
    {
        IdRole = Qt::UserRole,
        OnlineRole
    };

    explicit FleetModel(Fleet& fleet, QObject* parent = nullptr);

    /// -1 if there is none.
    int rowOf(int id) const { return m_ids.indexOf(id); }
    void refreshPicture(int id);

    /// Shows the rows in which each word of \a text is found in one of the columns.
    static void search(vx::MultiFilterModel& filter, const QString& text);

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;

private:
    void changed(int id);
    QImage picture(int id, bool online) const;

    QPointer<Fleet> m_fleet;
    QVector<int> m_ids;
    QElapsedTimer m_clock;
    mutable QHash<int, QImage> m_pictures;
};
}
