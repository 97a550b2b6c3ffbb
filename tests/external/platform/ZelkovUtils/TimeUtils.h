// SPDX-License-Identifier: MIT
// Second platform set: durations and times, without manners.
#pragma once

#include <QtCore/QDateTime>
#include <QtCore/QString>

class TimeUtils
{
public:
    static QString formatTimeUserFriendly(long long seconds) { return QString::number(seconds); }
    static QString formatTimeConstantLength(long long seconds) { return QString::number(seconds); }
    static QString formatTimeInterval(qint64 seconds, bool) { return QString::number(seconds); }
    static QString formatDateTimeRelative(const QDateTime& when, bool, bool, bool, bool, bool)
    {
        return when.toString(Qt::ISODate);
    }
    static QString getDateTimeFormat(bool, bool) { return QStringLiteral("yyyy-MM-dd HH:mm:ss"); }
};
