// SPDX-License-Identifier: MIT
// The tools that are not in the tool bar, while it is customised.
#pragma once

#include <QtCore/QMap>
#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtWidgets/QFrame>
#include <QtWidgets/QListWidget>

class QLabel;
class QPushButton;

namespace client
{
/// Tools in a row. They are dragged from here as "application/action-id" and taken back by a drop.
class ToolList : public QListWidget
{
    Q_OBJECT

public:
    explicit ToolList(QWidget* parent = nullptr);

    /// What a drag of that tool carries.
    static QMimeData* dataOf(const QString& id);
    /// Empty for what is no tool.
    static QString idOf(const QMimeData* data);

Q_SIGNALS:
    void toolDropped(const QString& id);

protected:
    QStringList mimeTypes() const override;
    QMimeData* mimeData(const QList<QListWidgetItem*> items) const override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dropEvent(QDropEvent* event) override;
};

/// The strip below the tool bar while it is customised. The buttons in the bar can be dragged then, and not clicked.
class BarEditor : public QFrame
{
    Q_OBJECT

public:
    explicit BarEditor(QWidget* parent = nullptr);

    /// A button whose presses become drags while this is visible.
    void addButton(QWidget* button, const QString& id);
    ToolList& list() { return *m_list; }

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void resetWanted();
    void done();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();
    bool filterButton(QWidget* button, QEvent* event);

    ToolList* m_list;
    QLabel* m_hint;
    QPushButton* m_reset;
    QPushButton* m_done;
    QMap<QObject*, QString> m_ids;
    QPointer<QWidget> m_pressed;
    QPoint m_pressedAt;
};
}
