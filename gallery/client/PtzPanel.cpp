// SPDX-License-Identifier: MIT
// Turns and zooms a camera.
#include "PtzPanel.h"

namespace client
{
PtzPanel::PtzPanel(LiveWall& wall, Session& session, QWidget* parent)
    : QWidget(parent)
    , m_wall(wall)
    , m_session(session)
{
    Q_UNUSED(m_wall)
    Q_UNUSED(m_session)
}
}
