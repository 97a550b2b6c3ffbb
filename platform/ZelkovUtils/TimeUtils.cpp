// SPDX-License-Identifier: MIT
// Texts for durations, dates and times.
#include "ZelkovUtils/TimeUtils.h"

#include <QtCore/QLocale>
#include <QtCore/QStringList>

namespace
{
constexpr unsigned long long c_Minute = 60;
constexpr unsigned long long c_Hour = 60 * c_Minute;
constexpr unsigned long long c_Day = 24 * c_Hour;

// Also right for the smallest number, which has no positive counterpart.
unsigned long long magnitude(long long value)
{
    return value < 0 ? 0ULL - static_cast<unsigned long long>(value) : static_cast<unsigned long long>(value);
}

QString minus(long long value)
{
    return value < 0 ? QStringLiteral("-") : QString();
}

QString digits(unsigned long long value, int count)
{
    return QStringLiteral("%1").arg(value, count, 10, QLatin1Char('0'));
}

// Calls `edit(run)` for every run of the same letter outside quotes, and copies the rest.
template<typename Edit>
QString editedFormat(const QString& format, Edit edit)
{
    QString result;
    bool quoted = false;
    for (int i = 0; i < format.size();) {
        const QChar c = format.at(i);
        int end = i + 1;
        if (c == QLatin1Char('\'')) {
            quoted = !quoted;
            result += c;
        } else if (quoted) {
            result += c;
        } else {
            while (end < format.size() && format.at(end) == c) {
                ++end;
            }
            result += edit(format.mid(i, end - i));
        }
        i = end;
    }
    return result;
}

QString dateFormat(const QLocale& locale)
{
    return editedFormat(locale.dateFormat(QLocale::ShortFormat),
        [](const QString& run) { return run == QLatin1String("yy") ? QStringLiteral("yyyy") : run; });
}

QString timeFormat(const QLocale& locale, bool withSeconds, bool withMilliseconds)
{
    const QString given = locale.timeFormat(QLocale::ShortFormat);
    // What stands between hours and minutes will also do between minutes and seconds. Seconds that the locale's
    // format has already go, together with that separator, and come back where they are wanted.
    QString separator;
    QString previous;
    editedFormat(given, [&](const QString& run) {
        if (run.startsWith(QLatin1Char('m')) && !previous.isEmpty() && !previous.at(0).isLetter()) {
            separator = previous;
        }
        previous = run;
        return run;
    });
    if (separator.isEmpty()) {
        separator = QStringLiteral(":");
    }
    QString seconds;
    if (withSeconds) {
        seconds = separator + QStringLiteral("ss");
        if (withMilliseconds) {
            seconds += QStringLiteral(".zzz");
        }
    }
    QString result = editedFormat(given, [&](const QString& run) {
        if (run.startsWith(QLatin1Char('s'))) {
            return QString();
        }
        return run.startsWith(QLatin1Char('m')) ? run + seconds : run;
    });
    if (given.contains(QLatin1Char('s'))) {
        // The separator of the seconds that were there stands alone now.
        const int after = result.indexOf(QLatin1Char('m')) + result.count(QLatin1Char('m')) + seconds.size();
        if (result.midRef(after).startsWith(separator)) {
            result.remove(after, separator.size());
        }
    }
    return result;
}
}

QString TimeUtils::formatTimeUserFriendly(long long seconds)
{
    const unsigned long long all = magnitude(seconds);
    const unsigned long long parts[] = {all / c_Day, all % c_Day / c_Hour, all % c_Hour / c_Minute, all % c_Minute};
    const QString texts[] = {tr("%1 d"), tr("%1 h"), tr("%1 min"), tr("%1 s")};
    int first = 0;
    while (first < 3 && parts[first] == 0) {
        ++first;
    }
    QString result = minus(seconds) + texts[first].arg(parts[first]);
    if (first < 3 && parts[first + 1] != 0) {
        result += QLatin1Char(' ') + texts[first + 1].arg(parts[first + 1]);
    }
    return result;
}

QString TimeUtils::formatTimeConstantLength(long long seconds)
{
    const unsigned long long all = magnitude(seconds);
    return minus(seconds) + digits(all / c_Hour, 2) + QLatin1Char(':') + digits(all % c_Hour / c_Minute, 2)
        + QLatin1Char(':') + digits(all % c_Minute, 2);
}

QString TimeUtils::formatTimeInterval(qint64 seconds, bool withSign)
{
    const unsigned long long all = magnitude(seconds);
    QString result = minus(seconds);
    if (withSign && seconds > 0) {
        result += QLatin1Char('+');
    }
    if (all >= c_Day) {
        result += tr("%1 d").arg(all / c_Day) + QLatin1Char(' ');
    }
    return result + digits(all % c_Day / c_Hour, 1) + QLatin1Char(':') + digits(all % c_Hour / c_Minute, 2)
        + QLatin1Char(':') + digits(all % c_Minute, 2);
}

QString TimeUtils::formatDateTimeRelative(const QDateTime& dateTime, bool withDate, bool withTime, bool withSeconds,
    bool withMilliseconds, bool withWeekday)
{
    return formatDateTimeRelative(dateTime, QDateTime::currentDateTime(), withDate, withTime, withSeconds,
        withMilliseconds, withWeekday);
}

QString TimeUtils::formatDateTimeRelative(const QDateTime& dateTime, const QDateTime& now, bool withDate,
    bool withTime, bool withSeconds, bool withMilliseconds, bool withWeekday)
{
    if (!dateTime.isValid()) {
        return {};
    }
    const QLocale locale;
    const QDateTime local = dateTime.toLocalTime();
    QStringList parts;
    if (withDate) {
        const QDate date = local.date();
        switch (now.isValid() ? now.toLocalTime().date().daysTo(date) : 2) {
        case -1: parts << tr("Yesterday"); break;
        case 0: parts << tr("Today"); break;
        case 1: parts << tr("Tomorrow"); break;
        default:
            if (withWeekday) {
                parts << locale.dayName(date.dayOfWeek(), QLocale::ShortFormat);
            }
            parts << locale.toString(date, dateFormat(locale));
        }
    }
    if (withTime) {
        parts << locale.toString(local.time(), timeFormat(locale, withSeconds, withMilliseconds));
    }
    return parts.join(QLatin1Char(' '));
}

QString TimeUtils::getDateTimeFormat(bool withDate, bool withTime)
{
    const QLocale locale;
    QStringList parts;
    if (withDate) {
        parts << dateFormat(locale);
    }
    if (withTime) {
        parts << timeFormat(locale, true, false);
    }
    return parts.join(QLatin1Char(' '));
}
