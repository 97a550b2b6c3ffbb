// SPDX-License-Identifier: MIT
// What an application answers about the rights of its present user.
#pragma once

#include "ZelkovUtils/Export.h"

#include <QtCore/QString>

namespace vx
{
/// The application implements this and hands it to the classes that guard a control by a right. The order of the
/// two queries is part of the binary interface. Mind that they answer in opposite senses. What the further arguments
/// mean is between the application and its own callers: ZelkovWidgets always passes true, then false.
class ZELKOV_UTILS_EXPORT ISecurityManager
{
public:
    ISecurityManager() = default;
    virtual ~ISecurityManager();

    /// Whether the present user is refused the named right.
    virtual bool isRightRefused(const QString& right, bool first, bool second, bool third) = 0;
    /// Whether the present user is an administrator.
    virtual bool isAdministrator(bool first, bool second) = 0;

protected:
    ISecurityManager(const ISecurityManager&) = default;
    ISecurityManager& operator=(const ISecurityManager&) = default;
};
}
