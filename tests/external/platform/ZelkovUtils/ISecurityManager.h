// SPDX-License-Identifier: MIT
// Second platform set: the security interface.
#pragma once

#include <QtCore/QString>

namespace vx
{
class ISecurityManager
{
public:
    virtual ~ISecurityManager() = default;
    virtual bool isRightRefused(const QString& right, bool first, bool second, bool third) = 0;
    virtual bool isAdministrator(bool first, bool second) = 0;
};
}
