// SPDX-License-Identifier: MIT
// One row of the phone-style list.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMap>
#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtCore/QStringList>
#include <QtCore/QTimer>
#include <QtWidgets/QListWidgetItem>

class QHBoxLayout;
class QLabel;
class QPushButton;

namespace vx
{
class iOSListWidget;
class iOSListWidgetDeleteIcon;

/// A row of an iOSListWidget, made of up to four widgets of the client: the content, one that replaces it in edit
/// mode, one that shows only while the row is selected, and an accessory after the content. Between a delete sign on
/// the left and a grip on the right, both of which show in edit mode only.
///
/// The row widget (whose object name is given to the constructor) owns all of them and belongs to the list; it goes
/// when the row is taken out. The row may show pictures as tool tips that take turns every 2.5 seconds.
class ZELKOV_WIDGETS_EXPORT iOSListWidgetItem : public QObject, public QListWidgetItem
{
    Q_OBJECT

public:
    /// QListWidgetItem::type() of these rows.
    enum : int
    {
        Type = 1000
    };

    /// Adds itself to the end of \a list. A valid \a size fixes that of \a itemWidget and \a editWidget. All widgets
    /// but \a itemWidget may be null.
    iOSListWidgetItem(iOSListWidget* list, QWidget* itemWidget, const QString& objectName,
        const QSize& size = QSize(), QWidget* editWidget = nullptr, QWidget* selectedWidget = nullptr,
        QWidget* accessoryWidget = nullptr);
    ~iOSListWidgetItem() override;

    /// Shows or hides delete sign and grip, puts the edit widget in the place of the content, and ends the
    /// delete mode. The list calls it.
    virtual void setEditMode(bool on);
    /// Brings out the delete button in place of the grip.
    virtual void setDeleteMode(bool on, bool animated);

    bool deletable() const; //!< default true
    /// Whether the delete sign shows in edit mode, from the next change of the mode.
    void setDeletable(bool deletable);
    bool movable() const; //!< default true
    /// Whether the row can be dragged; the grip follows with the next change of the mode.
    void setMovable(bool movable);

    // The widgets of the row; null for those that it was not given.
    QWidget* accessoryWidget() const;
    QWidget* editWidget() const;
    QWidget* itemWidget() const;
    /// Deletes the present one. Null leaves none.
    void setAccessoryWidget(QWidget* widget);
    /// Puts another content in the place of the present one, which is deleted.
    void setItemWidget(QWidget* widget);
    void setEditWidgetEnabled(bool enabled);
    bool editWidgetEnabled() const; //!< false without an edit widget

    /// What a drag outside of edit mode carries.
    void setMimeData(const QString& type, const QByteArray& data);
    QByteArray mimeData(const QString& type) const;
    /// The formats set by setMimeData().
    QStringList mimeTypes() const;

    /// Shows or hides the widget for selected rows; nothing in edit mode. The selection itself is the list's.
    void setSelected(bool selected);

    /// Off suppresses the tool tip until it is turned on again or a drag over the row ends.
    void setToolTipEnabled(bool enabled);
    void setTooltipImageFilePath(const QString& path); //!< one picture; empty for none
    /// Several pictures, which take turns every 2.5 seconds.
    void setTooltipImageFilePaths(const QStringList& paths);

    /// Animated.
    void toggleDeleteMode();
    /// Whether the delete button is out.
    bool isInDeleteMode() const;

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// The delete button was released. The list takes the row out with the next turn of the event loop.
    void itemToBeDeleted(QListWidgetItem* itemToBeDeleted);

protected Q_SLOTS:
    /// The delete button was released: emits itemToBeDeleted().
    void deleteItem();
    /// The delete sign was clicked: asks the list for the delete mode.
    void enableDeleteMode();
    // Start the tool tip anew, and end it, as the pointer goes over the row.
    void mouseMoved();
    void mouseLeft();
    void mouseEntered();
    // Shows the first picture, and the next one; nothing without pictures.
    void showTooltip();
    void toggleTooltip();
    /// Allows tool tips again.
    void dragEnded(QObject* target);

protected:
    /// Shows the picture at the pointer, 320 pixels wide.
    void showTooltipForFilePath(const QString& path) const;

private:
    friend class iOSListWidget;

    void watchContent();
    void hideTooltip();

    bool m_deletable = true;
    bool m_movable = true;
    QPointer<iOSListWidgetDeleteIcon> m_deleteIcon;
    QPointer<QPushButton> m_deleteButton;
    QPointer<iOSListWidget> m_list;
    QPointer<QWidget> m_itemWidget;
    QPointer<QWidget> m_editWidget;
    QPointer<QWidget> m_selectedWidget;
    QPointer<QWidget> m_accessoryWidget;
    QPointer<QWidget> m_container;
    QPointer<QLabel> m_riffleLabel;
    QPointer<QHBoxLayout> m_layout;
    QStringList m_tooltipPaths;
    QTimer m_tooltipDelayTimer;
    QTimer m_tooltipCycleTimer;
    int m_tooltipIndex = 0;
    bool m_tooltipSuppressed = false;
    QMap<QString, QByteArray> m_mimeData;
    bool m_inEditMode = false;
};
}
