// SPDX-License-Identifier: MIT
// Who is logged in.
#include "Session.h"

#include <memory>

#include "input/CustomClickAdapter.h"

namespace client
{
Session::Session(QObject* parent)
    : QObject(parent)
{
    vx::CustomClickAdapter::setSecurityManager(std::shared_ptr<vx::ISecurityManager>(this, [](vx::ISecurityManager*) {})); // not owned
}

Session::~Session()
{
    vx::CustomClickAdapter::setSecurityManager(nullptr);
}

bool Session::logIn(const QString& user, const QString& password)
{
    const bool isAdministrator = user == QLatin1String("admin") && password == QLatin1String("camera2!");
    const bool isUser = user == QLatin1String("user") && password == QLatin1String("camera1!");
    if (!isAdministrator && !isUser) {
        return false;
    }
    m_user = user;
    m_role = isAdministrator ? Role::Administrator : Role::User;
    Q_EMIT roleChanged();
    return true;
}

void Session::logOut()
{
    m_user.clear();
    m_role = Role::None;
    Q_EMIT roleChanged();
}

void Session::setRole(Role role)
{
    if (m_role != Role::None && m_role != role) {
        m_role = role;
        Q_EMIT roleChanged();
    }
}

bool Session::isRightRefused(const QString& right, bool, bool, bool)
{
    return m_role != Role::Administrator
        && (right == QLatin1String("ptz") || right == QLatin1String("edit-devices") || right == QLatin1String("export"));
}

bool Session::isAdministrator(bool, bool)
{
    return m_role == Role::Administrator;
}
}
