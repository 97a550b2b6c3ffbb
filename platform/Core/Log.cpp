// SPDX-License-Identifier: MIT
// The process-wide log.
#include "Core/Log.h"

#include <array>
#include <atomic>
#include <chrono>
#include <cstddef>
#include <ctime>
#include <cwchar>

namespace vx
{
namespace
{
// Constant-initialised, so that static initialisers of other libraries may log.
std::array<std::atomic<std::wostream*>, Log::elNothing> s_streams{};
std::atomic<int> s_threshold{Log::elFault};

bool isLevel(Log::ELevel level)
{
    return level >= Log::elTrace && level < Log::elNothing;
}

const wchar_t* levelName(Log::ELevel level)
{
    switch (level) {
    case Log::elTrace: return L"TRACE";
    case Log::elInfo: return L"INFO";
    case Log::elFault: return L"FAULT";
    case Log::elError: return L"ERROR";
    case Log::elNothing: break;
    }
    return L"LOG";
}
}

Log& Log::instance()
{
    // Never destroyed: threads of the client may still log while the process ends.
    static Log* const log = new Log;
    return *log;
}

std::wostream* Log::getStream(ELevel level)
{
    return isLevel(level) ? s_streams[static_cast<std::size_t>(level)].load() : nullptr;
}

void Log::setStream(ELevel level, std::wostream* stream)
{
    if (isLevel(level)) {
        s_streams[static_cast<std::size_t>(level)].store(stream);
    }
}

Log::ELevel Log::logLevel()
{
    return static_cast<ELevel>(s_threshold.load());
}

void Log::setLogLevel(ELevel threshold)
{
    s_threshold.store(threshold);
}

void Log::pre(ELevel level, std::wstring& line)
{
    using namespace std::chrono;
    const system_clock::time_point now = system_clock::now();
    const std::time_t seconds = system_clock::to_time_t(now);
    const auto milliseconds = duration_cast<std::chrono::milliseconds>(now.time_since_epoch()).count() % 1000;
    std::tm local{};
#ifdef _WIN32
    localtime_s(&local, &seconds);
#else
    localtime_r(&seconds, &local);
#endif
    std::array<wchar_t, 64> text{};
    std::swprintf(text.data(), text.size(), L"%04d-%02d-%02d %02d:%02d:%02d.%03d %ls ", local.tm_year + 1900,
        local.tm_mon + 1, local.tm_mday, local.tm_hour, local.tm_min, local.tm_sec, static_cast<int>(milliseconds),
        levelName(level));
    line += text.data();
}

void Log::lock()
{
    m_mutex.lock();
}

void Log::unlock()
{
    m_mutex.unlock();
}

bool Log::try_lock()
{
    return m_mutex.try_lock();
}
}
