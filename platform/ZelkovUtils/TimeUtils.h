// SPDX-License-Identifier: MIT
// Texts for durations, dates and times.
#pragma once

#include "ZelkovUtils/Export.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QDateTime>
#include <QtCore/QString>

/// All texts are translated in the context "TimeUtils" and follow the default QLocale at the time of the call.
class ZELKOV_UTILS_EXPORT TimeUtils
{
    Q_DECLARE_TR_FUNCTIONS(TimeUtils)

public:
    TimeUtils() = delete;

    /// A short text for people, of the two largest units that count: "45 s", "3 min 20 s", "2 h", "4 d 3 h".
    /// Smaller units are cut off, not rounded. Negative numbers get a leading "-".
    static QString formatTimeUserFriendly(long long seconds);

    /// "hh:mm:ss", always eight characters up to "99:59:59"; from 100 hours on the hours take the room they need.
    /// Negative numbers get a leading "-".
    static QString formatTimeConstantLength(long long seconds);

    /// An interval to the second: "0:01:05", "26:00:00" as "1 d 2:00:00". Negative ones get a leading "-", positive
    /// ones a "+" if \a withSign; 0 gets none.
    static QString formatTimeInterval(qint64 seconds, bool withSign);

    /// A point in time as seen from now: the day is "Today", "Yesterday" or "Tomorrow" where that is true, else the
    /// locale's short date with a four-digit year. The flags choose the parts; without seconds there are no
    /// milliseconds, without time neither, and the weekday (short name) stands before a date only. Empty for an
    /// invalid time.
    static QString formatDateTimeRelative(const QDateTime& dateTime, bool withDate, bool withTime, bool withSeconds,
        bool withMilliseconds, bool withWeekday);

    /// The same, as seen from the given moment.
    static QString formatDateTimeRelative(const QDateTime& dateTime, const QDateTime& now, bool withDate,
        bool withTime, bool withSeconds, bool withMilliseconds, bool withWeekday);

    /// A display format for date and time edits: the short formats of the locale, with a year of four digits and
    /// with seconds. Both parts are joined by a blank; empty if none is wanted.
    static QString getDateTimeFormat(bool withDate, bool withTime);
};
