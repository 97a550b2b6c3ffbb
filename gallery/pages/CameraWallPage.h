// SPDX-License-Identifier: MIT
// Page "Camera wall": moving pictures that are used with the mouse.
#pragma once

#include <QtCore/QElapsedTimer>
#include <QtCore/QTimer>

#include "../Page.h"

namespace vx
{
class MouseAdapter;
}

namespace gallery
{
class CameraTile;
class CameraWall;

class CameraWallPage : public Page
{
    Q_OBJECT

public:
    explicit CameraWallPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    void connectCamera(CameraTile* tile);
    void nextFrame();
    void showState();

    CameraWall* m_wall;
    QLabel* m_place;
    QLabel* m_state;
    QTimer m_frames;
    QTimer m_second;
    QElapsedTimer m_since;
    int m_frameCount = 0;
    int m_framesPerSecond = 25;
};
}
