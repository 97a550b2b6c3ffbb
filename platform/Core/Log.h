// SPDX-License-Identifier: MIT
// The process-wide log: a stream per level, a threshold, and a lock that keeps lines whole.
#pragma once

#include "Core/Export.h"

#include <iosfwd>
#include <mutex>
#include <string>

namespace vx
{
/// Where messages go. The log owns no stream and opens no file: the application hands it a wide-character stream
/// for each level that it wants to see, and keeps that stream alive until it takes it back with a null pointer.
///
/// At first no level has a stream, so nothing is written anywhere. Not even the standard error stream is taken: its
/// first wide character would shut out every narrow one for the rest of the process. The threshold starts at
/// elFault, so an application that only sets streams sees faults and errors and no tracing.
///
/// The streams and the threshold may be read from any thread. Lock instance() around writing a line; the lock is
/// recursive, so that the output operator of a value may log on its own.
class ZELKOV_CORE_EXPORT Log
{
public:
    /// The smaller, the more talkative.
    enum ELevel : int
    {
        elTrace = 1,   ///< what the program does, step by step
        elInfo = 2,    ///< what an operator may want to know
        elFault = 3,   ///< a fault that the program survived
        elError = 4,   ///< a fault that lost something
        elNothing = 5  ///< as a threshold: no message at all; has no stream
    };

    /// The one log of the process; what it has that is not static is its lock.
    static Log& instance();

    /// The stream of the level; null if it has none, and for values that are no level.
    static std::wostream* getStream(ELevel level);
    /// Sets the stream of the level, null for none. Not owned. Ignored for values that are no level.
    static void setStream(ELevel level, std::wostream* stream);

    /// A message is written when its level is the threshold or above.
    static ELevel logLevel();
    static void setLogLevel(ELevel threshold);

    /// Appends what a line of this level starts with: local date, time with milliseconds and the level's name, as
    /// in "2026-03-01 12:30:05.250 FAULT ". It holds no square brackets.
    static void pre(ELevel level, std::wstring& line);

    // The recursive lock, in the form that std::lock_guard and std::unique_lock take.
    void lock();
    void unlock();
    bool try_lock();

    Log(const Log&) = delete;
    Log& operator=(const Log&) = delete;

private:
    Log() = default;
    ~Log() = default;

    std::recursive_mutex m_mutex;
};
}
