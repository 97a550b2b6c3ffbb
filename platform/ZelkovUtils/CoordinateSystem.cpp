// SPDX-License-Identifier: MIT
// Anchor of the interface.
#include "ZelkovUtils/CoordinateSystem.h"

namespace vx
{
CoordinateSystem::~CoordinateSystem() = default;
}
