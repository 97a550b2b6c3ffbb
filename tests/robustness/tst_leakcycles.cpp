// SPDX-License-Identifier: MIT
// A thousand short lives of every class. Under the sanitizers the end of the program also looks for lost memory.
#include <QtTest/QtTest>

#include "Suites.h"
#include "TestCase.h"
#include "TestMain.h"

class TestLeakCycles : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void noWidgetOutlivesItsHost_data()
    {
        QTest::addColumn<int>("index");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            if (zelkovtest::registry()[i].kind != zelkovtest::Kind::Value) {
                QTest::newRow(zelkovtest::registry()[i].name) << static_cast<int>(i);
            }
        }
    }

    void noWidgetOutlivesItsHost()
    {
        QFETCH(int, index);
        const QString fault
            = zelkovtest::runLeakCycles(zelkovtest::registry()[static_cast<std::size_t>(index)], 1000);
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }
};

ZELKOV_TEST_MAIN(TestLeakCycles)
#include "tst_leakcycles.moc"
