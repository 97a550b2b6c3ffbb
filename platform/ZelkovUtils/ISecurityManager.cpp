// SPDX-License-Identifier: MIT
// Anchor of the interface.
#include "ZelkovUtils/ISecurityManager.h"

namespace vx
{
ISecurityManager::~ISecurityManager() = default;
}
