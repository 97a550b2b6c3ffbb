// SPDX-License-Identifier: MIT
// The devices: searched, renamed, deleted, put in another order.
#include "DevicePanel.h"

namespace client
{
DevicePanel::DevicePanel(Fleet& fleet, Session& session, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
    , m_session(session)
{
    Q_UNUSED(m_fleet)
    Q_UNUSED(m_session)
}
}
