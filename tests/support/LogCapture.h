// SPDX-License-Identifier: MIT
// Catches what is written to one level of the log.
#pragma once

#include "Core/Log.h"

#include <QtCore/QString>
#include <QtCore/QStringList>

#include <sstream>

namespace zelkovtest
{
/// While it lives, the level writes here and the threshold is that level; afterwards both are as before. Takes
/// numbers as well as names of levels: `LogCapture log(3)`.
class LogCapture
{
public:
    explicit LogCapture(int level = 1)
        : m_level(static_cast<vx::Log::ELevel>(level))
        , m_oldThreshold(vx::Log::logLevel())
        , m_oldStream(vx::Log::getStream(m_level))
    {
        vx::Log::setStream(m_level, &m_stream);
        vx::Log::setLogLevel(m_level);
    }
    ~LogCapture()
    {
        vx::Log::setStream(m_level, m_oldStream);
        vx::Log::setLogLevel(m_oldThreshold);
    }
    LogCapture(const LogCapture&) = delete;
    LogCapture& operator=(const LogCapture&) = delete;

    /// All that was written, to the character.
    QString text() const { return QString::fromStdWString(m_stream.str()); }
    /// The lines without their ends.
    QStringList lines() const
    {
        QStringList result = text().split(QLatin1Char('\n'));
        result.removeLast();
        return result;
    }
    /// The lines without the prefix, which holds the time: "[vx::Class::function] message".
    QStringList messages() const
    {
        QStringList result;
        for (const QString& line : lines()) {
            result << line.mid(line.indexOf(QLatin1Char('[')));
        }
        return result;
    }
    void clear() { m_stream.str(std::wstring()); }
    std::wostream& stream() { return m_stream; }

private:
    vx::Log::ELevel m_level;
    vx::Log::ELevel m_oldThreshold;
    std::wostream* m_oldStream;
    std::wostringstream m_stream;
};
}
