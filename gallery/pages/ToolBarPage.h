// SPDX-License-Identifier: MIT
// Page "Tool bars": CustomToolBar, and the list of actions that a client's dialog would have.
#pragma once

#include <QtCore/QVector>
#include <QtWidgets/QListWidget>

#include "../Page.h"

class QAction;
class QLabel;
class QToolBar;

namespace vx
{
class CustomToolBar;
}

namespace gallery
{
/// The actions that are there to be dragged. A drag carries the id of the action.
class ActionList : public QListWidget
{
    Q_OBJECT

public:
    explicit ActionList(QWidget* parent = nullptr);

protected:
    QMimeData* mimeData(const QList<QListWidgetItem*> items) const override;
    QStringList mimeTypes() const override;
};

/// What stands for a client's window: the parent of the bars, with the slot that their menus call.
class ToolBarWindow : public QWidget
{
    Q_OBJECT

public:
    using QWidget::QWidget;

Q_SIGNALS:
    void customizeAsked();

public Q_SLOTS:
    void customizeToolBar() { Q_EMIT customizeAsked(); }
};

class ToolBarPage : public Page
{
    Q_OBJECT

public:
    explicit ToolBarPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    struct Tool
    {
        const char* id;
        const char* text;
    };
    static const QVector<Tool>& tools();

    vx::CustomToolBar* makeBar(const QString& id, Qt::Orientation orientation, const QStringList& ids);
    QAction* makeAction(const QString& id);
    QIcon icon(const QString& id) const;
    QWidget* makeList();
    void say(const QString& text);

    ToolBarWindow* m_window;
    vx::CustomToolBar* m_across = nullptr;
    vx::CustomToolBar* m_down = nullptr;
    ActionList* m_list = nullptr;
    QLabel* m_said = nullptr;
};
}
