// SPDX-License-Identifier: MIT
// Who is logged in, and what they may do.
#pragma once

#include "ZelkovUtils/ISecurityManager.h"

#include <QtCore/QMap>
#include <QtCore/QObject>
#include <QtCore/QString>
#include <QtCore/QStringList>

#include <memory>

namespace client
{
/// The rights of the present user. While it lives it answers for all buttons and rows that ask for rights.
///
/// Two users exist: "user" with the password "camera1!" and "admin" with "camera2!". New passwords hold as long as the
/// session lives.
class Session
    : public QObject
    , public vx::ISecurityManager
{
    Q_OBJECT

public:
    enum class Role : int
    {
        None,
        User,
        Administrator
    };
    Q_ENUM(Role)

    explicit Session(QObject* parent = nullptr);
    ~Session() override;

    /// Makes this session the one that is asked, after somebody else has been.
    void takeOver();

    Role role() const { return m_role; }
    QString user() const { return m_user; }

    /// \return false for a wrong name or password; the present user then stays.
    bool logIn(const QString& user, const QString& password);
    void logOut();
    /// Takes over another role without a password, to show what it may do. Nothing while nobody is logged in.
    void setRole(Role role);

    /// Of the present user. \return false while nobody is logged in, and for a password that was used before.
    bool setPassword(const QString& password);
    /// Whether the present user has or had this password.
    bool wasUsed(const QString& password) const;

    /// Users are refused "ptz", "edit-devices" and "export"; nobody else but an administrator has them.
    bool isRightRefused(const QString& right, bool first, bool second, bool third) override;
    bool isAdministrator(bool first, bool second) override;

Q_SIGNALS:
    /// With each log-in, log-out and change of the role.
    void roleChanged();

private:
    Role m_role = Role::None;
    QString m_user;
    QMap<QString, QStringList> m_passwords; // the last is the one that holds
    std::shared_ptr<vx::ISecurityManager> m_manager;
};
}
