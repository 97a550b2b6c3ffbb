// SPDX-License-Identifier: MIT
// What the user has chosen about the desk.
#include "Settings.h"

namespace client
{
}
