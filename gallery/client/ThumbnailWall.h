// SPDX-License-Identifier: MIT
// All cameras as small pictures.
#pragma once

#include <QtCore/QBasicTimer>
#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

class QLabel;
class QModelIndex;
class QTableView;

namespace vx
{
class MultiFilterModel;
class SearchEdit;
}

namespace client
{
class Fleet;
class FleetModel;
class ThumbnailModel;

/// A searchable wall of thumbnails whose columns follow the width.
///
/// Object names: "thumbnailSearch", "thumbnailCount", "thumbnailTable", "thumbnailNothing".
class ThumbnailWall : public QWidget
{
    Q_OBJECT

public:
    explicit ThumbnailWall(Fleet& fleet, QWidget* parent = nullptr);

Q_SIGNALS:
    /// A double click of the user on a picture, or Return.
    void cameraChosen(int id);

protected:
    void changeEvent(QEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void timerEvent(QTimerEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void makeTable();
    void makeLayout();
    void retranslate();
    void showCount();
    void followWidth();
    void choose(const QModelIndex& index);
    void refreshNext();

    QPointer<Fleet> m_fleet;
    FleetModel* const m_model;
    vx::MultiFilterModel* const m_filter;
    ThumbnailModel* const m_cells;
    vx::SearchEdit* const m_search;
    QLabel* const m_count;
    QTableView* const m_table;
    QLabel* const m_nothing;
    QBasicTimer m_refreshing;
    int m_current = -1; // kept while cells change
    int m_next = 0;
};
}
