// SPDX-License-Identifier: MIT
// The one form of a log line, to the character.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/LogStatement.h"
#include "support/LogCapture.h"

#include <QtCore/QRegularExpression>
#include <QtTest/QtTest>

#include <future>
#include <iomanip>

using vx::Log;
using zelkovtest::LogCapture;

namespace
{
int s_evaluated = 0;

int counted()
{
    return ++s_evaluated;
}

// An output operator that logs on its own.
struct Talkative
{
};

std::wostream& operator<<(std::wostream& stream, const Talkative&)
{
    ZELKOV_LOG(vx::c_LogFault, "Talkative", "inner");
    return stream << L"outer";
}

// Tells while it is written whether another thread could take the lock.
struct LockProbe
{
};

std::wostream& operator<<(std::wostream& stream, const LockProbe&)
{
    const bool free = std::async(std::launch::async, [] {
        const bool locked = Log::instance().try_lock();
        if (locked) {
            Log::instance().unlock();
        }
        return locked;
    }).get();
    return stream << (free ? L"free" : L"locked");
}
}

class TestLogStatement : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aLineIsPrefixFunctionAndMessage()
    {
        LogCapture log(vx::c_LogFault);
        ZELKOV_LOG(vx::c_LogFault, "vx::FadingWidget::preparePaint", "no room for " << 7 << L" pixels");
        const QRegularExpression form(QStringLiteral(
            "\\A\\d{4}-\\d\\d-\\d\\d \\d\\d:\\d\\d:\\d\\d\\.\\d{3} FAULT "
            "\\[vx::FadingWidget::preparePaint\\] no room for 7 pixels\\n\\z"));
        QVERIFY2(form.match(log.text()).hasMatch(), qPrintable(log.text()));
    }

    void thePrefixIsTheLogsOwn()
    {
        LogCapture log(vx::c_LogTrace);
        std::wstring before;
        std::wstring after;
        QString expectedBefore;
        QString expectedAfter;
        Log::pre(Log::elTrace, before);
        ZELKOV_LOG(vx::c_LogTrace, "OpacityAnimation::onValueChanged", L"x");
        Log::pre(Log::elTrace, after);
        // Equal to the character when both prefixes are of the same millisecond, else between them.
        const QString rest = QStringLiteral("[OpacityAnimation::onValueChanged] x\n");
        expectedBefore = QString::fromStdWString(before) + rest;
        expectedAfter = QString::fromStdWString(after) + rest;
        QCOMPARE(log.text().size(), expectedBefore.size());
        QVERIFY(expectedBefore <= log.text() && log.text() <= expectedAfter);
    }

    void theSharedConstantsAreTheBrackets()
    {
        QCOMPARE(QString::fromWCharArray(vx::s_LogFunctionOpen), QStringLiteral("["));
        QCOMPARE(QString::fromWCharArray(vx::s_LogFunctionClose), QStringLiteral("] "));
    }

    void theFunctionsNameIsUtf8()
    {
        LogCapture log(vx::c_LogTrace);
        ZELKOV_LOG(vx::c_LogTrace, "vx::Gr\xc3\xb6\xc3\x9f" "e", "");
        QCOMPARE(log.messages(), QStringList(QString::fromUtf8("[vx::Gr\xc3\xb6\xc3\x9f" "e] ")));
    }

    void theThresholdIsTheLowestLevelWritten_data()
    {
        QTest::addColumn<int>("threshold");
        QTest::addColumn<int>("level");
        QTest::addColumn<bool>("written");
        for (int threshold = 0; threshold <= 5; ++threshold) {
            for (const int level : {1, 3}) {
                QTest::addRow("level %d, threshold %d", level, threshold) << threshold << level
                                                                          << (threshold <= level);
            }
        }
    }
    void theThresholdIsTheLowestLevelWritten()
    {
        QFETCH(int, threshold);
        QFETCH(int, level);
        QFETCH(bool, written);
        LogCapture log(level);
        Log::setLogLevel(static_cast<Log::ELevel>(threshold));
        s_evaluated = 0;
        ZELKOV_LOG(level, "f", counted());
        QCOMPARE(log.messages(), written ? QStringList(QStringLiteral("[f] 1")) : QStringList());
        QCOMPARE(s_evaluated, written ? 1 : 0);
    }

    void withoutAStreamNothingIsEvaluated()
    {
        LogCapture log(vx::c_LogFault);
        Log::setStream(Log::elFault, nullptr);
        s_evaluated = 0;
        ZELKOV_LOG(vx::c_LogFault, "f", counted());
        ZELKOV_LOG(0, "f", counted());
        ZELKOV_LOG(1000, "f", counted());
        QCOMPARE(s_evaluated, 0);
        QCOMPARE(log.text(), QString());
    }

    void eachLevelGoesToItsStream()
    {
        LogCapture faults(vx::c_LogFault);
        LogCapture traces(vx::c_LogTrace);
        ZELKOV_LOG(vx::c_LogFault, "f", "fault");
        ZELKOV_LOG(vx::c_LogTrace, "f", "trace");
        QCOMPARE(faults.messages(), QStringList(QStringLiteral("[f] fault")));
        QCOMPARE(traces.messages(), QStringList(QStringLiteral("[f] trace")));
    }

    void theFormatFlagsAreRestored()
    {
        LogCapture log(vx::c_LogFault);
        log.stream() << std::uppercase << std::oct;
        const std::ios_base::fmtflags before = log.stream().flags();
        ZELKOV_LOG(vx::c_LogFault, "f", std::hex << std::showbase << 255 << std::boolalpha << true);
        QVERIFY(log.stream().flags() == before);
        ZELKOV_LOG(vx::c_LogFault, "f", 8);
        QCOMPARE(log.messages(), QStringList({QStringLiteral("[f] 0XFFtrue"), QStringLiteral("[f] 10")}));
    }

    void everyStatementEndsItsLine()
    {
        LogCapture log(vx::c_LogTrace);
        ZELKOV_LOG(vx::c_LogTrace, "a", "one");
        ZELKOV_LOG(vx::c_LogTrace, "b", "two");
        QCOMPARE(log.messages(), QStringList({QStringLiteral("[a] one"), QStringLiteral("[b] two")}));
    }

    void theLogIsLockedWhileTheLineIsWritten()
    {
        LogCapture log(vx::c_LogFault);
        ZELKOV_LOG(vx::c_LogFault, "f", LockProbe());
        QCOMPARE(log.messages(), QStringList(QStringLiteral("[f] locked")));
        const bool free = std::async(std::launch::async, [] {
            const bool locked = Log::instance().try_lock();
            if (locked) {
                Log::instance().unlock();
            }
            return locked;
        }).get();
        QVERIFY(free);
    }

    void aMessageMayLogOnItsOwn()
    {
        LogCapture log(vx::c_LogFault);
        ZELKOV_LOG(vx::c_LogFault, "f", Talkative());
        QVERIFY(log.text().contains(QLatin1String("[Talkative] inner\n")));
        QVERIFY(log.text().endsWith(QLatin1String("outer\n")));
    }

    void itIsOneStatement()
    {
        LogCapture log(vx::c_LogTrace);
        if (s_evaluated < 0)
            ZELKOV_LOG(vx::c_LogTrace, "f", "never");
        else
            ZELKOV_LOG(vx::c_LogTrace, "f", "else");
        QCOMPARE(log.messages(), QStringList(QStringLiteral("[f] else")));
    }
};

ZELKOV_TEST_MAIN(TestLogStatement)
#include "tst_logstatement.moc"
