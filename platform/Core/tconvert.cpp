// SPDX-License-Identifier: MIT
// UTF-8 to wide text.
#include "Core/tconvert.h"

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace vx
{
namespace
{
constexpr std::uint32_t c_Replacement = 0xFFFD;

void append(std::wstring& out, std::uint32_t code)
{
    if (sizeof(wchar_t) == 2 && code > 0xFFFF) {
        code -= 0x10000;
        out += static_cast<wchar_t>(0xD800 + (code >> 10));
        out += static_cast<wchar_t>(0xDC00 + (code & 0x3FF));
    } else {
        out += static_cast<wchar_t>(code);
    }
}

struct Sequence
{
    std::uint32_t code;
    std::size_t length;  // bytes; 0 for no UTF-8
};

Sequence decode(const unsigned char* s, std::size_t available)
{
    if (s[0] < 0x80) {
        return {s[0], 1};
    }
    std::size_t length = 0;
    std::uint32_t code = 0;
    std::uint32_t smallest = 0;
    if ((s[0] & 0xE0) == 0xC0) {
        length = 2, code = s[0] & 0x1FU, smallest = 0x80;
    } else if ((s[0] & 0xF0) == 0xE0) {
        length = 3, code = s[0] & 0x0FU, smallest = 0x800;
    } else if ((s[0] & 0xF8) == 0xF0) {
        length = 4, code = s[0] & 0x07U, smallest = 0x10000;
    }
    if (length == 0 || length > available) {
        return {c_Replacement, 0};
    }
    for (std::size_t i = 1; i < length; ++i) {
        if ((s[i] & 0xC0) != 0x80) {
            return {c_Replacement, 0};
        }
        code = (code << 6) | (s[i] & 0x3FU);
    }
    const bool surrogate = code >= 0xD800 && code <= 0xDFFF;
    if (code < smallest || code > 0x10FFFF || surrogate) {
        return {c_Replacement, 0};
    }
    return {code, length};
}
}

std::wstring tconvert(const char* text)
{
    std::wstring out;
    if (text == nullptr) {
        return out;
    }
    const std::size_t size = std::strlen(text);
    out.reserve(size);
    const auto* bytes = reinterpret_cast<const unsigned char*>(text);
    for (std::size_t i = 0; i < size;) {
        const Sequence sequence = decode(bytes + i, size - i);
        append(out, sequence.code);
        i += sequence.length == 0 ? 1 : sequence.length;
    }
    return out;
}
}
