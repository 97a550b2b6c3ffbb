// SPDX-License-Identifier: MIT
// The one form in which this library writes to the log.
#include "foundation/LogStatement.h"

#include "Core/tconvert.h"

#include <string>

namespace vx
{
const wchar_t s_LogFunctionOpen[] = L"[";
const wchar_t s_LogFunctionClose[] = L"] ";

LogStatement::LogStatement(int level, const char* function)
{
    const auto logLevel = static_cast<Log::ELevel>(level);
    std::wostream* const stream = Log::getStream(logLevel);
    if (stream == nullptr || Log::logLevel() > logLevel) {
        return;
    }
    std::wstring start;
    Log::pre(logLevel, start);
    start += s_LogFunctionOpen;
    start += tconvert(function);
    start += s_LogFunctionClose;

    m_lock = std::unique_lock<Log>(Log::instance());
    m_stream = stream;
    m_flags = stream->flags();
    *stream << start;
}

LogStatement::~LogStatement()
{
    if (m_stream == nullptr) {
        return;
    }
    try {
        *m_stream << std::endl;
    } catch (...) {
        // A stream that throws must not end the program: logging never changes its flow.
    }
    m_stream->flags(m_flags);
}
}
