// SPDX-License-Identifier: MIT
// One camera of the wall.
#pragma once

#include <QtWidgets/QWidget>

#include "Scene.h"
#include "indicators/BadgeDrawer.h"

namespace gallery
{
/// Shows the moving picture of a camera with its name and its time burned in, a badge with the number of
/// events that nobody has looked at yet, and a busy mark while the line is down.
///
/// It has no timer of its own: whoever owns the tile calls advance() for each frame.
class CameraTile : public QWidget
{
    Q_OBJECT

public:
    CameraTile(const QString& name, int seed, QWidget* parent);

    QString name() const { return m_name; }

    /// The next frame. Does nothing while the line is down.
    void advance(qint64 epochMillis);

    bool isSelected() const { return m_selected; }
    /// Selecting also takes the count of events away.
    void setSelected(bool selected);

    bool isDropped() const { return m_dropped; }
    void setDropped(bool dropped);

    /// Turns the camera sideways, by pixels, as far as its scene goes.
    void lookBy(int pixels);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void showEvents(int count);
    void drawCaption(QPainter& painter, const QPointF& corner, const QString& text);

    QString m_name;
    Scene m_scene;
    QPixmap m_ground;
    vx::BadgeDrawer m_count;
    vx::BadgeDrawer m_spinner;
    int m_events;
    int m_seed;
    int m_look = -1;
    qint64 m_millis = 0;
    qint64 m_nextEvent = 0;
    bool m_selected = false;
    bool m_dropped = false;
};
}
