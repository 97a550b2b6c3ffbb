// SPDX-License-Identifier: MIT
// Words for entries of rows.
#pragma once

#include "Registry.h"

namespace zelkovtest
{
/// Gives the row a context menu, opens it and chooses its one entry.
Script resetByMenu();
}
