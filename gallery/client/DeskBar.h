// SPDX-License-Identifier: MIT
// The tool bar of the desk.
#pragma once

#include <QtCore/QMap>
#include <QtCore/QVector>
#include <QtWidgets/QWidget>

#include "Signs.h"

class ElidedButton;
class QAction;
class QToolBar;
class QToolButton;

namespace vx
{
class CustomToolBar;
class MultiStateCustomToolButton;
class MultiStateToolButton;
}

namespace client
{
class BarEditor;
class Session;

/// The tools, which can be put in another order, and at the right end the settings and the user. Buttons for which the
/// user lacks the right show a lock and do not react.
class DeskBar : public QWidget
{
    Q_OBJECT

public:
    explicit DeskBar(Session& session, QWidget* parent = nullptr);

    // What the buttons show. None of these emits anything.
    void setViewCount(int count);
    void setThumbnails(bool on);
    void setLive(bool live);
    void setSteering(bool on);
    void setMarking(bool on);
    void setCounting(bool on);
    /// Whether the current camera is online: it can be dropped, else restored.
    void setCameraOnline(bool online);
    void setUserText(const QString& text);

    /// Names of the tools in the bar, from the left.
    QStringList tools() const;

public Q_SLOTS:
    /// Shows the strip with the other tools. The menu of the bar calls it.
    void customizeToolBar();
    void endCustomizing();

Q_SIGNALS:
    /// A short click on the number of views.
    void nextViewCountWanted();
    /// A click on its arrow or a right click.
    void viewCountChoiceWanted(QWidget* button);
    void thumbnailsWanted(bool on);
    void liveWanted(bool live);
    void markingWanted(bool on);
    void countingWanted(bool on);
    void exportWanted(QWidget* button);
    void steeringWanted(bool on);
    void dropWanted();
    void settingsWanted(QWidget* button);
    void userWanted(QWidget* button);

protected:
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    struct Tool
    {
        QString id;
        QString right;
        QToolButton* button;
        QAction* action;
        Sign sign;
    };

    QToolButton* addTool(const QString& id, QToolButton* button, Sign sign, const QString& right = QString());
    void makeTools();
    void connectBar();
    void placeTools();
    void fillList();
    void moveTool(const QString& id, QAction* before);
    void retranslate();
    void drawSigns();
    void redraw();
    QString textOf(const QString& id) const;

    Session& m_session;
    vx::CustomToolBar* m_bar;
    BarEditor* m_editor;
    QVector<Tool> m_tools;
    QToolButton* m_views = nullptr;
    vx::MultiStateCustomToolButton* m_thumbnails = nullptr;
    vx::MultiStateToolButton* m_live = nullptr;
    QToolButton* m_mark = nullptr;
    QToolButton* m_line = nullptr;
    QToolButton* m_ptz = nullptr;
    QToolButton* m_drop = nullptr;
    QToolButton* m_settings = nullptr;
    ElidedButton* m_user = nullptr;
    int m_viewCount = 0;
    bool m_cameraOnline = true;
    bool m_redrawing = false;
};
}
