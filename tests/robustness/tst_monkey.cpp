// SPDX-License-Identifier: MIT
// Random events to every class. ZELKOV_MONKEY_SEED and ZELKOV_MONKEY_EVENTS choose another run.
#include <QtTest/QtTest>

#include "Suites.h"
#include "TestCase.h"
#include "TestMain.h"

class TestMonkey : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyClassStandsRandomEvents_data()
    {
        QTest::addColumn<int>("index");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            if (zelkovtest::registry()[i].kind != zelkovtest::Kind::Value) {
                QTest::newRow(zelkovtest::registry()[i].name) << static_cast<int>(i);
            }
        }
    }

    void everyClassStandsRandomEvents()
    {
        QFETCH(int, index);
        bool given = false;
        quint32 seed = qEnvironmentVariable("ZELKOV_MONKEY_SEED").toUInt(&given);
        if (!given) {
            seed = 20260401;
        }
        int events = qEnvironmentVariableIntValue("ZELKOV_MONKEY_EVENTS", &given);
        if (!given) {
            events = 20000;
        }
        const zelkovtest::Entry& entry = zelkovtest::registry()[static_cast<std::size_t>(index)];
        // Printed before the run, so that a crash leaves it on the screen.
        qInfo("%s: ZELKOV_MONKEY_SEED=%u, %d events", entry.name.constData(), seed, events);
        zelkovtest::setPatience(50);
        const QString fault = zelkovtest::runMonkey(entry, seed, events);
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }
};

ZELKOV_TEST_MAIN(TestMonkey)
#include "tst_monkey.moc"
