// SPDX-License-Identifier: MIT
// Second platform set: a log that writes everything to the standard output. Its levels have other names.
#pragma once

#include <mutex>
#include <ostream>
#include <string>

namespace vx
{
class Log : public std::recursive_mutex
{
public:
    enum ELevel : int
    {
        elChatty = 1,
        elSerious = 3
    };

    static Log& instance();
    static std::wostream* getStream(ELevel level);
    static ELevel logLevel();
    static void pre(ELevel level, std::wstring& line);
};
}
