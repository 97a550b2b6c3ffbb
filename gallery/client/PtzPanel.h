// SPDX-License-Identifier: MIT
// Turns and zooms a camera.
#pragma once

#include <QtWidgets/QWidget>

class JoystickViewWidget;
class QLabel;

namespace vx
{
class DialButton;
}

namespace client
{
class Fleet;
class LiveWall;
class Session;

/// A stick and dials for the current camera of a wall, for those who have the right "ptz". Everything springs back
/// when it is let go. Where nothing can be steered a hint says why.
class PtzPanel : public QWidget
{
    Q_OBJECT

public:
    PtzPanel(LiveWall& wall, Session& session, QWidget* parent = nullptr);

    bool eventFilter(QObject* watched, QEvent* event) override;

protected:
    void changeEvent(QEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    vx::DialButton* makeDial(const QString& name);
    void drawPictures();
    void retranslate();
    void checkRights();
    void steer();
    void letGo();

    LiveWall& m_wall;
    Session& m_session;
    QWidget* m_controls;
    QLabel* m_heading;
    QLabel* m_hint;
    JoystickViewWidget* m_stick;
    vx::DialButton* m_pan;
    vx::DialButton* m_tilt;
    vx::DialButton* m_zoom;
    QLabel* m_panName;
    QLabel* m_tiltName;
    QLabel* m_zoomName;
    QPointF m_held; // what the mouse does with the stick
    bool m_isHeld = false;
    bool m_isDrawing = false;
};
}
