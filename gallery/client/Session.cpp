// SPDX-License-Identifier: MIT
// Who is logged in.
#include "Session.h"

#include "input/CustomClickAdapter.h"
#include "popover/Item.h"

namespace client
{
Session::Session(QObject* parent)
    : QObject(parent)
    , m_passwords{{QStringLiteral("user"), {QStringLiteral("camera1!")}},
          {QStringLiteral("admin"), {QStringLiteral("camera2!")}}}
    , m_manager(this, [](vx::ISecurityManager*) {}) // not owned
{
    takeOver();
}

Session::~Session()
{
    if (vx::CustomClickAdapter::securityManager() == m_manager) {
        vx::CustomClickAdapter::setSecurityManager(nullptr);
    }
    if (vx::PopoverWidget::Item::securityManager() == m_manager) {
        vx::PopoverWidget::Item::setSecurityManager(nullptr);
    }
}

void Session::takeOver()
{
    vx::CustomClickAdapter::setSecurityManager(m_manager);
    vx::PopoverWidget::Item::setSecurityManager(m_manager);
}

bool Session::logIn(const QString& user, const QString& password)
{
    const QStringList known = m_passwords.value(user);
    if (known.isEmpty() || known.last() != password) {
        return false;
    }
    m_user = user;
    m_role = user == QLatin1String("admin") ? Role::Administrator : Role::User;
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

bool Session::setPassword(const QString& password)
{
    if (m_role == Role::None || wasUsed(password)) {
        return false;
    }
    m_passwords[m_user].append(password);
    return true;
}

bool Session::wasUsed(const QString& password) const
{
    return m_passwords.value(m_user).contains(password);
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
