// SPDX-License-Identifier: MIT
// The suites catch what they are there to catch. The program with the planted faults carries the address sanitizer
// in every build, so that this holds without the sanitizer preset too.
#include <QtCore/QProcess>
#include <QtTest/QtTest>

#include "TestCase.h"
#include "TestMain.h"

class TestSelf : public zelkovtest::TestCase
{
    Q_OBJECT

    struct Outcome
    {
        int code;
        QString text;
    };

    // A run of one function of the program with the planted faults.
    static Outcome run(const QString& function)
    {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("ASAN_OPTIONS"), QStringLiteral("detect_leaks=1:detect_stack_use_after_return=1"));
        environment.insert(QStringLiteral("LSAN_OPTIONS"),
            QStringLiteral("suppressions=" ZELKOV_LSAN_SUPPRESSIONS ":print_suppressions=0"));
        QProcess process;
        process.setProcessEnvironment(environment);
        process.setProcessChannelMode(QProcess::MergedChannels);
        process.start(QStringLiteral(ZELKOV_PLANTED_FAULT), {function});
        if (!process.waitForFinished(90000)) {
            process.kill();
            process.waitForFinished();
            return {-1, QStringLiteral("no end: ") + process.errorString()};
        }
        const int code = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -2;
        return {code, QString::fromUtf8(process.readAll())};
    }

private Q_SLOTS:
    void aFaultlessClassPasses()
    {
        const Outcome outcome = run(QStringLiteral("faultless"));
        QVERIFY2(outcome.code == 0, qPrintable(outcome.text));
    }

    void plantedFaultsAreCaught_data()
    {
        QTest::addColumn<QString>("function");
        QTest::addColumn<QStringList>("words");
        QTest::newRow("use after free behind an emit") << QStringLiteral("useAfterFree")
            << QStringList{QStringLiteral("heap-use-after-free"), QStringLiteral("Planted::count")};
        QTest::newRow("leaked widget") << QStringLiteral("leakedWidget")
            << QStringList{QStringLiteral("20 widgets outlived 20 cycles"),
                   QStringLiteral("left over: widget QWidget"), QStringLiteral("LeakSanitizer: detected memory leaks"),
                   QStringLiteral("Planted::Planted")};
        QTest::newRow("printed warning") << QStringLiteral("printedWarning")
            << QStringList{QStringLiteral("unexpected: a planted warning")};
        QTest::newRow("signal that never fires") << QStringLiteral("silentSignal")
            << QStringList{QStringLiteral("counted did not fire")};
        QTest::newRow("signal that no script promises") << QStringLiteral("forgottenSignal")
            << QStringList{QStringLiteral("unpromisedSignals.*returned FALSE")};
    }

    void plantedFaultsAreCaught()
    {
        QFETCH(QString, function);
        QFETCH(QStringList, words);
        const Outcome outcome = run(function);
        QVERIFY2(outcome.code != 0, qPrintable(outcome.text));
        for (const QString& word : words) {
            QVERIFY2(outcome.text.contains(QRegularExpression(word)), qPrintable(word + QLatin1Char('\n') + outcome.text));
        }
    }
};

ZELKOV_TEST_MAIN(TestSelf)
#include "tst_selftest.moc"
