// SPDX-License-Identifier: MIT
#include "indicators/TimeDifference.h"

#include "ZelkovUtils/TimeUtils.h"

#include <limits>

namespace vx
{
QString frameTimeDifference(quint64 frameTime, quint64 anchorTime)
{
    constexpr quint64 second = 1000000;
    if (frameTime == c_NoFrameTime || anchorTime == c_NoFrameTime) {
        return QString();
    }
    const quint64 difference = anchorTime - frameTime; // wraps for a frame after the anchor: clients rely on it
    if (difference < second) {
        return QString();
    }
    if (frameTime > anchorTime) {
        return QLatin1String(" +")
            + TimeUtils::formatTimeConstantLength(static_cast<long long>((frameTime - anchorTime) / second));
    }
    return QLatin1String(" -") + TimeUtils::formatTimeConstantLength(static_cast<long long>(difference / second));
}

QDateTime frameDateTime(quint64 frameTime)
{
    return QDateTime::fromSecsSinceEpoch(static_cast<quint32>(frameTime / 1000000));
}

quint32 secondsOfTime(const QDateTime& dateTime)
{
    constexpr quint32 none = std::numeric_limits<quint32>::max();
    if (!dateTime.isValid()) {
        return none;
    }
    const qint64 seconds = dateTime.toSecsSinceEpoch();
    return seconds < 0 || seconds > none ? none : static_cast<quint32>(seconds);
}
}
