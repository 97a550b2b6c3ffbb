// SPDX-License-Identifier: MIT
// Asks who is there.
#include "LoginPanel.h"

namespace client
{
LoginPanel::LoginPanel(Session& session, QWidget* parent)
    : QWidget(parent)
    , m_session(session)
{
    Q_UNUSED(m_session)
}
}
