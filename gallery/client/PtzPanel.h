// SPDX-License-Identifier: MIT
// Turns and zooms a camera.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
class LiveWall;
class Session;

/// A stick and dials for the current camera of a wall, for those who have the right "ptz".
class PtzPanel : public QWidget
{
    Q_OBJECT

public:
    PtzPanel(LiveWall& wall, Session& session, QWidget* parent = nullptr);

private:
    LiveWall& m_wall;
    Session& m_session;
};
}
