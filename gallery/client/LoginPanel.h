// SPDX-License-Identifier: MIT
// Asks who is there.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
class Session;

/// Name, password and the way to a new password.
class LoginPanel : public QWidget
{
    Q_OBJECT

public:
    explicit LoginPanel(Session& session, QWidget* parent = nullptr);

private:
    Session& m_session;
};
}
