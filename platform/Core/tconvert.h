// SPDX-License-Identifier: MIT
// Narrow text to wide text.
#pragma once

#include "Core/Export.h"

#include <string>

namespace vx
{
/// The UTF-8 text as a wide string. Bytes that are no UTF-8 become U+FFFD, one each; null gives an empty string.
ZELKOV_CORE_EXPORT std::wstring tconvert(const char* text);
}
