// SPDX-License-Identifier: MIT
// Second platform set: text conversion.
#pragma once

#include <string>

namespace vx
{
std::wstring tconvert(const char* text);
}
