// SPDX-License-Identifier: MIT
// Texts for durations, dates and times, in several locales.
#include "TestCase.h"
#include "TestMain.h"
#include "ZelkovUtils/TimeUtils.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QLocale>
#include <QtCore/QTranslator>
#include <QtTest/QtTest>

#include <limits>

namespace
{
// Sets the default locale and puts the old one back.
class LocaleGuard
{
public:
    explicit LocaleGuard(const QString& name) { QLocale::setDefault(QLocale(name)); }
    ~LocaleGuard() { QLocale::setDefault(m_old); }
    LocaleGuard(const LocaleGuard&) = delete;
    LocaleGuard& operator=(const LocaleGuard&) = delete;

private:
    QLocale m_old;
};

class UpperCase : public QTranslator
{
public:
    bool isEmpty() const override { return false; }
    QString translate(const char* context, const char* text, const char*, int) const override
    {
        return qstrcmp(context, "TimeUtils") == 0 ? QString::fromLatin1(text).toUpper() : QString();
    }
};
}

class TestTimeUtils : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aFriendlyTextHasAtMostTwoUnits_data()
    {
        QTest::addColumn<qint64>("seconds");
        QTest::addColumn<QString>("text");
        const auto row = [](qint64 seconds, const char* text) {
            QTest::newRow(text) << seconds << QString::fromLatin1(text);
        };
        row(0, "0 s");
        row(1, "1 s");
        row(59, "59 s");
        row(60, "1 min");
        row(61, "1 min 1 s");
        row(3599, "59 min 59 s");
        row(3600, "1 h");
        row(3659, "1 h");
        QTest::newRow("next but one unit is cut") << qint64(7261) << QStringLiteral("2 h 1 min");
        row(86399, "23 h 59 min");
        row(86400, "1 d");
        row(90000, "1 d 1 h");
        row(-61, "-1 min 1 s");
        row(std::numeric_limits<qint64>::min(), "-106751991167300 d 15 h");
    }
    void aFriendlyTextHasAtMostTwoUnits()
    {
        QFETCH(qint64, seconds);
        QFETCH(QString, text);
        QCOMPARE(TimeUtils::formatTimeUserFriendly(seconds), text);
    }

    void theConstantLengthIsEightCharacters_data()
    {
        QTest::addColumn<qint64>("seconds");
        QTest::addColumn<QString>("text");
        QTest::newRow("zero") << qint64(0) << QStringLiteral("00:00:00");
        QTest::newRow("a second") << qint64(1) << QStringLiteral("00:00:01");
        QTest::newRow("under a minute") << qint64(59) << QStringLiteral("00:00:59");
        QTest::newRow("a minute") << qint64(60) << QStringLiteral("00:01:00");
        QTest::newRow("an hour") << qint64(3600) << QStringLiteral("01:00:00");
        QTest::newRow("over a day") << qint64(90061) << QStringLiteral("25:01:01");
        QTest::newRow("the last") << qint64(359999) << QStringLiteral("99:59:59");
        QTest::newRow("one more") << qint64(360000) << QStringLiteral("100:00:00");
        QTest::newRow("negative") << qint64(-65) << QStringLiteral("-00:01:05");
        QTest::newRow("smallest") << std::numeric_limits<qint64>::min() << QStringLiteral("-2562047788015215:30:08");
    }
    void theConstantLengthIsEightCharacters()
    {
        QFETCH(qint64, seconds);
        QFETCH(QString, text);
        QCOMPARE(TimeUtils::formatTimeConstantLength(seconds), text);
    }

    void intervalsShowTheirSign_data()
    {
        QTest::addColumn<qint64>("seconds");
        QTest::addColumn<bool>("sign");
        QTest::addColumn<QString>("text");
        QTest::newRow("zero") << qint64(0) << true << QStringLiteral("0:00:00");
        QTest::newRow("plus") << qint64(65) << true << QStringLiteral("+0:01:05");
        QTest::newRow("no plus") << qint64(65) << false << QStringLiteral("0:01:05");
        QTest::newRow("minus") << qint64(-65) << true << QStringLiteral("-0:01:05");
        QTest::newRow("minus always") << qint64(-65) << false << QStringLiteral("-0:01:05");
        QTest::newRow("under a day") << qint64(86399) << true << QStringLiteral("+23:59:59");
        QTest::newRow("a day") << qint64(86400) << true << QStringLiteral("+1 d 0:00:00");
        QTest::newRow("days") << qint64(-2 * 86400 - 3661) << true << QStringLiteral("-2 d 1:01:01");
    }
    void intervalsShowTheirSign()
    {
        QFETCH(qint64, seconds);
        QFETCH(bool, sign);
        QFETCH(QString, text);
        QCOMPARE(TimeUtils::formatTimeInterval(seconds, sign), text);
    }

    void editFormatsFollowTheLocale_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<QString>("date");
        QTest::addColumn<QString>("time");
        QTest::newRow("C") << QStringLiteral("C") << QStringLiteral("d MMM yyyy") << QStringLiteral("HH:mm:ss");
        QTest::newRow("de") << QStringLiteral("de_DE") << QStringLiteral("dd.MM.yyyy") << QStringLiteral("HH:mm:ss");
        QTest::newRow("fr") << QStringLiteral("fr_FR") << QStringLiteral("dd/MM/yyyy") << QStringLiteral("HH:mm:ss");
        QTest::newRow("en_US") << QStringLiteral("en_US") << QStringLiteral("M/d/yyyy")
                               << QStringLiteral("h:mm:ss AP");
        QTest::newRow("da") << QStringLiteral("da_DK") << QStringLiteral("dd.MM.yyyy") << QStringLiteral("HH.mm.ss");
    }
    void editFormatsFollowTheLocale()
    {
        QFETCH(QString, locale);
        QFETCH(QString, date);
        QFETCH(QString, time);
        const LocaleGuard guard(locale);
        QCOMPARE(TimeUtils::getDateTimeFormat(true, false), date);
        QCOMPARE(TimeUtils::getDateTimeFormat(false, true), time);
        QCOMPARE(TimeUtils::getDateTimeFormat(true, true), date + QLatin1Char(' ') + time);
        QCOMPARE(TimeUtils::getDateTimeFormat(false, false), QString());
    }

    void everyLocalesFormatKeepsDateAndTimeToTheSecond()
    {
        const QDateTime when(QDate(2031, 2, 13), QTime(14, 5, 9));
        QSet<QString> failed;
        int skipped = 0;
        const QList<QLocale> all
            = QLocale::matchingLocales(QLocale::AnyLanguage, QLocale::AnyScript, QLocale::AnyCountry);
        QVERIFY(all.size() > 200);
        for (const QLocale& locale : all) {
            const LocaleGuard guard(locale.name());
            // Qt cannot read back the day halves of a few languages at all.
            const QTime minute(14, 5);
            if (locale.toTime(locale.toString(minute, QLocale::ShortFormat), QLocale::ShortFormat) != minute) {
                ++skipped;
                continue;
            }
            const QString format = TimeUtils::getDateTimeFormat(true, true);
            const QDateTime back = QLocale().toDateTime(QLocale().toString(when, format), format);
            if (back != when) {
                failed << locale.name() + QLatin1Char(' ') + format;
            }
        }
        QVERIFY(skipped < all.size() / 20);
        QVERIFY2(failed.isEmpty(), qPrintable(QStringList(failed.values()).join(QLatin1Char('\n'))));
    }

    void relativeDays_data()
    {
        QTest::addColumn<QDateTime>("when");
        QTest::addColumn<QString>("text");
        const auto at = [](int day, int hour, int minute, int second) {
            return QDateTime(QDate(2026, 3, day), QTime(hour, minute, second));
        };
        QTest::newRow("two days ago") << at(8, 23, 59, 59) << QStringLiteral("8 Mar 2026 23:59:59");
        QTest::newRow("start of yesterday") << at(9, 0, 0, 0) << QStringLiteral("Yesterday 00:00:00");
        QTest::newRow("end of yesterday") << at(9, 23, 59, 59) << QStringLiteral("Yesterday 23:59:59");
        QTest::newRow("start of today") << at(10, 0, 0, 0) << QStringLiteral("Today 00:00:00");
        QTest::newRow("now") << at(10, 12, 0, 0) << QStringLiteral("Today 12:00:00");
        QTest::newRow("tomorrow") << at(11, 23, 59, 59) << QStringLiteral("Tomorrow 23:59:59");
        QTest::newRow("in two days") << at(12, 0, 0, 0) << QStringLiteral("12 Mar 2026 00:00:00");
        QTest::newRow("invalid") << QDateTime() << QString();
    }
    void relativeDays()
    {
        QFETCH(QDateTime, when);
        QFETCH(QString, text);
        const QDateTime now(QDate(2026, 3, 10), QTime(12, 0));
        QCOMPARE(TimeUtils::formatDateTimeRelative(when, now, true, true, true, false, false), text);
    }

    void theFlagsChooseTheParts_data()
    {
        QTest::addColumn<QString>("flags");
        QTest::addColumn<QString>("text");
        const auto row = [](const char* flags, const char* text) {
            QTest::newRow(flags) << QString::fromLatin1(flags) << QString::fromLatin1(text);
        };
        row("-----", "");
        row("d----", "1 Mar 2026");
        row("d---w", "Sun 1 Mar 2026");
        row("----w", "");
        row("-t---", "14:05");
        row("-ts--", "14:05:09");
        row("-tsm-", "14:05:09.123");
        row("-t-m-", "14:05");
        row("--sm-", "");
        row("dtsmw", "Sun 1 Mar 2026 14:05:09.123");
    }
    void theFlagsChooseTheParts()
    {
        QFETCH(QString, flags);
        QFETCH(QString, text);
        const QDateTime when(QDate(2026, 3, 1), QTime(14, 5, 9, 123));
        const QDateTime now(QDate(2026, 3, 10), QTime(12, 0));
        const auto on = [&](char c) { return flags.contains(QLatin1Char(c)); };
        QCOMPARE(TimeUtils::formatDateTimeRelative(when, now, on('d'), on('t'), on('s'), on('m'), on('w')), text);
    }

    void relativeTextsFollowTheLocale()
    {
        const QDateTime when(QDate(2026, 3, 1), QTime(14, 5, 9, 123));
        const QDateTime now(QDate(2026, 3, 10), QTime(12, 0));
        const LocaleGuard guard(QStringLiteral("de_DE"));
        QCOMPARE(TimeUtils::formatDateTimeRelative(when, now, true, true, true, false, false),
            QStringLiteral("01.03.2026 14:05:09"));
        QCOMPARE(TimeUtils::formatDateTimeRelative(when, now, true, true, false, false, true),
            QStringLiteral("So. 01.03.2026 14:05"));
    }

    void withoutAMomentNowIsMeant()
    {
        const QDateTime midday(QDate::currentDate(), QTime(12, 0));
        const QString text
            = TimeUtils::formatDateTimeRelative(midday.addDays(-1), true, false, false, false, false);
        // The day may change between the two calls.
        QVERIFY(text == QLatin1String("Yesterday") || QDate::currentDate() != midday.date());
    }

    void otherTimeZonesAreShownInLocalTime()
    {
        const QDateTime utc(QDate(2026, 3, 1), QTime(23, 30), Qt::OffsetFromUTC, -7200);
        const QDateTime now(QDate(2026, 3, 2), QTime(12, 0));
        QCOMPARE(TimeUtils::formatDateTimeRelative(utc, now, true, true, false, false, false),
            QStringLiteral("Today 01:30"));
    }

    void textsAreTranslatedInTheirContext()
    {
        UpperCase translator;
        QCoreApplication::installTranslator(&translator);
        QCOMPARE(TimeUtils::formatTimeUserFriendly(3720), QStringLiteral("1 H 2 MIN"));
        QCOMPARE(TimeUtils::formatTimeInterval(86400, true), QStringLiteral("+1 D 0:00:00"));
        const QDateTime now(QDate(2026, 3, 10), QTime(12, 0));
        QCOMPARE(TimeUtils::formatDateTimeRelative(now, now, true, false, false, false, false),
            QStringLiteral("TODAY"));
        QCoreApplication::removeTranslator(&translator);
    }
};

ZELKOV_TEST_MAIN(TestTimeUtils)
#include "tst_timeutils.moc"
