// SPDX-License-Identifier: MIT
// The one form in which this library writes to the log.
#pragma once

#include "Core/Log.h"
#include "foundation/Export.h"

#include <ios>
#include <mutex>
#include <ostream>

/// Writes one line: the log's own prefix, "[", the function, "] " and the message.
///
///     ZELKOV_LOG(vx::c_LogFault, "vx::Badge::paint", "no picture for " << size.width() << " pixels");
///
/// The message is everything that may stand after `stream <<` of a wide-character stream; it is evaluated only if
/// the level is in use. The stream keeps its format flags whatever the message does to them.
#define ZELKOV_LOG(level, function, message)                                                 \
    do {                                                                                     \
        ::vx::LogStatement zelkovLogStatement(level, function);                              \
        if (zelkovLogStatement.stream() != nullptr) {                                        \
            *zelkovLogStatement.stream() << message;                                         \
        }                                                                                    \
    } while (false)

namespace vx
{
// The two levels that this library uses. Numbers, since the names of the levels are the platform's.
constexpr int c_LogTrace = 1;
constexpr int c_LogFault = 3;

// What stands around the function's name.
ZELKOV_WIDGETS_EXPORT extern const wchar_t s_LogFunctionOpen[];
ZELKOV_WIDGETS_EXPORT extern const wchar_t s_LogFunctionClose[];

/// What ZELKOV_LOG is made of: holds the log's lock from the start of the line to its end.
class ZELKOV_WIDGETS_EXPORT LogStatement
{
public:
    /// \a function is UTF-8.
    LogStatement(int level, const char* function);
    ~LogStatement();
    LogStatement(const LogStatement&) = delete;
    LogStatement& operator=(const LogStatement&) = delete;

    /// Null if the level has no stream or lies under the threshold.
    std::wostream* stream() const { return m_stream; }

private:
    std::wostream* m_stream = nullptr;
    std::ios_base::fmtflags m_flags{};
    std::unique_lock<Log> m_lock;
};
}
