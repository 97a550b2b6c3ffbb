// SPDX-License-Identifier: MIT
// The log's streams, threshold, prefix and lock, and the conversion of text.
#include "Core/Log.h"
#include "Core/tconvert.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtTest/QtTest>

#include <future>
#include <mutex>
#include <sstream>

using vx::Log;

class TestLog : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void noLevelHasAStreamAtFirst()
    {
        for (int level = -1; level <= 6; ++level) {
            QVERIFY(Log::getStream(static_cast<Log::ELevel>(level)) == nullptr);
        }
    }

    void theThresholdStartsAtFaults() { QCOMPARE(Log::logLevel(), Log::elFault); }

    void theLevelsHaveTheirNumbers()
    {
        QCOMPARE(int(Log::elTrace), 1);
        QCOMPARE(int(Log::elFault), 3);
    }

    void eachLevelHasItsOwnStream()
    {
        std::wostringstream one;
        std::wostringstream three;
        Log::setStream(Log::elTrace, &one);
        Log::setStream(Log::elFault, &three);
        QCOMPARE(Log::getStream(Log::elTrace), static_cast<std::wostream*>(&one));
        QCOMPARE(Log::getStream(Log::elFault), static_cast<std::wostream*>(&three));
        QVERIFY(Log::getStream(Log::elInfo) == nullptr);
        Log::setStream(Log::elTrace, nullptr);
        Log::setStream(Log::elFault, nullptr);
        QVERIFY(Log::getStream(Log::elTrace) == nullptr);
        QVERIFY(Log::getStream(Log::elFault) == nullptr);
    }

    void valuesThatAreNoLevelHaveNoStream()
    {
        std::wostringstream stream;
        for (const int level : {-1, 0, int(Log::elNothing), 6, 1000000}) {
            Log::setStream(static_cast<Log::ELevel>(level), &stream);
            QVERIFY(Log::getStream(static_cast<Log::ELevel>(level)) == nullptr);
        }
    }

    void theThresholdCanBeSet()
    {
        Log::setLogLevel(Log::elTrace);
        QCOMPARE(Log::logLevel(), Log::elTrace);
        Log::setLogLevel(Log::elFault);
        QCOMPARE(Log::logLevel(), Log::elFault);
    }

    void thePrefixIsAppendedAndNamesTimeAndLevel_data()
    {
        QTest::addColumn<int>("level");
        QTest::addColumn<QString>("name");
        QTest::newRow("trace") << 1 << QStringLiteral("TRACE");
        QTest::newRow("info") << 2 << QStringLiteral("INFO");
        QTest::newRow("fault") << 3 << QStringLiteral("FAULT");
        QTest::newRow("error") << 4 << QStringLiteral("ERROR");
        QTest::newRow("none") << 77 << QStringLiteral("LOG");
    }
    void thePrefixIsAppendedAndNamesTimeAndLevel()
    {
        QFETCH(int, level);
        QFETCH(QString, name);
        const QDateTime before = QDateTime::currentDateTime();
        std::wstring line = L"kept:";
        Log::pre(static_cast<Log::ELevel>(level), line);
        const QDateTime after = QDateTime::currentDateTime();
        const QString text = QString::fromStdWString(line);
        QVERIFY2(text.startsWith(QLatin1String("kept:")), qPrintable(text));
        QCOMPARE(text.mid(28), QLatin1Char(' ') + name + QLatin1Char(' '));
        const QDateTime when
            = QDateTime::fromString(text.mid(5, 23), QStringLiteral("yyyy-MM-dd hh:mm:ss.zzz"));
        QVERIFY2(when.isValid(), qPrintable(text));
        QVERIFY(before <= when && when <= after);
    }

    void thereIsOneLog() { QCOMPARE(&Log::instance(), &Log::instance()); }

    void theLockIsHeldAgainstOtherThreads()
    {
        const auto otherThreadCanLock = [] {
            return std::async(std::launch::async, [] {
                const bool locked = Log::instance().try_lock();
                if (locked) {
                    Log::instance().unlock();
                }
                return locked;
            }).get();
        };
        QVERIFY(otherThreadCanLock());
        {
            const std::lock_guard<Log> outer(Log::instance());
            QVERIFY(!otherThreadCanLock());
            const std::lock_guard<Log> inner(Log::instance());
        }
        QVERIFY(otherThreadCanLock());
    }

    void textIsConvertedFromUtf8_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("text");
        QTest::newRow("empty") << QByteArray("") << QString();
        QTest::newRow("ascii") << QByteArray("vx::A::b") << QStringLiteral("vx::A::b");
        QTest::newRow("two bytes") << QByteArray("\xc3\xa4x") << QString::fromUtf8("\xc3\xa4x");
        QTest::newRow("three bytes") << QByteArray("\xe2\x82\xac") << QString(QChar(0x20AC));
        QTest::newRow("four bytes") << QByteArray("\xf0\x9f\x98\x80") << QString::fromUtf8("\xf0\x9f\x98\x80");
        QTest::newRow("lone continuation") << QByteArray("a\x80z") << QStringLiteral("a\uFFFDz");
        QTest::newRow("cut off") << QByteArray("a\xe2\x82") << QStringLiteral("a\uFFFD\uFFFD");
        QTest::newRow("broken off") << QByteArray("\xc3z") << QStringLiteral("\uFFFDz");
        QTest::newRow("overlong") << QByteArray("\xc0\x80") << QStringLiteral("\uFFFD\uFFFD");
        QTest::newRow("surrogate") << QByteArray("\xed\xa0\x80") << QStringLiteral("\uFFFD\uFFFD\uFFFD");
        QTest::newRow("too large") << QByteArray("\xf4\x90\x80\x80") << QStringLiteral("\uFFFD\uFFFD\uFFFD\uFFFD");
        QTest::newRow("never a start") << QByteArray("\xff") << QStringLiteral("\uFFFD");
    }
    void textIsConvertedFromUtf8()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, text);
        QCOMPARE(QString::fromStdWString(vx::tconvert(bytes.constData())), text);
    }

    void nullTextIsEmpty() { QVERIFY(vx::tconvert(nullptr).empty()); }
};

ZELKOV_TEST_MAIN(TestLog)
#include "tst_log.moc"
