// SPDX-License-Identifier: MIT
// vx::CustomToolBar: a tool bar that takes part in customising tool bars.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtCore/QString>
#include <QtWidgets/QAction>
#include <QtWidgets/QToolBar>

namespace vx
{
/// A QToolBar onto which actions and whole tool bars can be dropped, and that can itself be dragged by its body.
/// It reports and changes nothing by itself: insert, move or remove the action when actionDropped() or
/// actionRemoved() says so.
///
/// Drags carry one QString in a QDataStream: an id that the client chose, as "application/action-id" or as
/// "application/toolbar-id". The drag of an action is started by the client, mostly in a dialog with all actions;
/// the drag of a bar starts here. A bar dropped onto itself reports its own id.
///
/// The context menu of an action has the entry "Customize Toolbar...", which calls the slot customizeToolBar() of
/// the parent widget. An empty part of the bar has the menu of QToolBar.
class ZELKOV_WIDGETS_EXPORT CustomToolBar : public QToolBar
{
    Q_OBJECT

public:
    /// \a draggable: by its body, with the left button, as \a toolBarId.
    CustomToolBar(const QString& title, QWidget* parent, bool draggable, const QString& toolBarId);
    /// The same without a title.
    CustomToolBar(QWidget* parent, bool draggable, const QString& toolBarId);
    ~CustomToolBar() override;

Q_SIGNALS:
    /// An action was dropped before another one of this bar; null means at the end.
    void actionDropped(QToolBar* toolBar, QString actionID, QAction* before);
    /// "Remove Item" was chosen in the context menu of the action, which is still there.
    void actionRemoved(QToolBar* toolBar, QAction* action);
    /// A tool bar was dropped onto this one, or this one onto itself.
    void toolBarDropped(QString toolBarID);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dragLeaveEvent(QDragLeaveEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    /// A gap before the place of the drop, 32 pixels for icons of 16 by 16, else 64.
    void addSpacer();
    void removeSpacer();

    QPointer<QAction> m_spacerAction;
    QPointer<QAction> m_dropBefore;
    bool m_draggable;
    QPoint m_pressPos;
    QString m_toolBarId;
};
}
