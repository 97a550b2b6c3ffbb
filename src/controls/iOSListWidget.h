// SPDX-License-Identifier: MIT
// A list in the manner of a phone's settings list.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMetaType>
#include <QtCore/QSharedPointer>
#include <QtCore/QVariant>
#include <QtWidgets/QListWidget>

namespace vx
{
class iOSListWidgetItem;

/// A list of rows that are composite widgets (iOSListWidgetItem). In edit mode each row shows a round delete sign and
/// a grip; a click on the sign brings out a "Delete" button, a drag of the row reorders the list. Outside edit mode a
/// drag of a row carries the row's own data to other widgets.
///
/// The list is as high as its rows: its maximum height follows each row that is added or deleted. Rows belong to the
/// list until they are deleted; then itemRemoved() hands them over.
class ZELKOV_WIDGETS_EXPORT iOSListWidget : public QListWidget
{
    Q_OBJECT

public:
    /// The last holder deletes the row.
    using TListWidgetItemPointer = QSharedPointer<QListWidgetItem>;

    /// An empty list outside of edit mode.
    explicit iOSListWidget(QWidget* parent = nullptr, const QString& objectName = QString());
    ~iOSListWidget() override;

    /// Default off. Leaving it ends the delete mode of all rows at once.
    void setEditMode(bool on);
    /// Turns the edit mode over.
    void toggleEditMode();
    bool editMode() const;
    /// Turns the delete mode of this row over and ends that of all others: at most one row has it. Emits
    /// layoutChanged() if the list is visible.
    void setDeleteMode(iOSListWidgetItem* item);
    /// Null for no row and for a row of another class.
    iOSListWidgetItem* getIOSItem(int row) const;
    /// Whether the last row refuses to be deleted. Default off.
    void setKeepLastItem(bool keep);
    /// Whether the label of a selected row is bold; for rows whose content is a QLabel. Default on.
    void setBoldSelectionIndication(bool bold);
    /// Rows call it when they have been added: fits the height and emits itemAdded().
    void itemHasBeenAdded();

    /// The sum of the heights of the rows that are not hidden.
    QSize sizeHint() const override;

public Q_SLOTS:
    /// Deletes all rows, without itemRemoved(), and makes the list 0 pixels high.
    void clear();
    /// Takes the row out and hands it over by itemRemoved(). Null and a row of no or another list are ignored.
    void deleteItem(QListWidgetItem* item);
    /// Makes the labels of selected rows bold, unless setBoldSelectionIndication() turned that off.
    void itemSelectionChanged();
    /// The size hint has changed: lays out anew and emits layoutChanged() if the list is visible.
    void layoutUpdated();

Q_SIGNALS:
    /// A drag moved a row. Comes before the rows have moved.
    void itemMoved(int fromRow, int toRow);
    /// After itemMoved(): the Qt::UserRole data of the dragged row and of the row that stands at the target before the
    /// move.
    void dataMoved(QVariant fromData, QVariant toData);
    /// The row is out of the list. Its widgets are deleted with the next turn of the event loop.
    void itemRemoved(vx::iOSListWidget::TListWidgetItemPointer item);
    /// A row was made and has joined the list.
    void itemAdded();
    /// Rows or their widgets have changed while the list is visible.
    void layoutChanged();

protected:
    /// Fills the list with the colour.
    void setBackgroundColor(const QColor& color);

    void dropEvent(QDropEvent* event) override;
    void selectionChanged(const QItemSelection& selected, const QItemSelection& deselected) override;
    void startDrag(Qt::DropActions supportedActions) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    void dragPayload(iOSListWidgetItem* item, Qt::DropActions supportedActions);
    void dropKeepingTheRows(QDropEvent* event);

    bool m_boldSelection = true;
    bool m_editMode = false;
    bool m_keepLastItem = false;
    int m_dragSourceRow = -1;
    QVariant m_dragSourceData;
};
}

Q_DECLARE_METATYPE(vx::iOSListWidget::TListWidgetItemPointer)
