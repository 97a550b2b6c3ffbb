// SPDX-License-Identifier: MIT
// Every writable property and every setter of every class with values at and beyond the edge.
#include <QtTest/QtTest>

#include "Suites.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Entry;
using zelkovtest::Kind;

class TestExtremes : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyPropertyTakesExtremes_data()
    {
        QTest::addColumn<int>("index");
        QTest::addColumn<QByteArray>("property");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            const Entry& entry = zelkovtest::registry()[i];
            if (entry.kind == Kind::Value) {
                continue;
            }
            for (const QByteArray& property : zelkovtest::writableProperties(entry)) {
                QTest::newRow(entry.name + "." + property) << static_cast<int>(i) << property;
            }
        }
    }

    void everyPropertyTakesExtremes()
    {
        QFETCH(int, index);
        QFETCH(QByteArray, property);
        const QString fault
            = zelkovtest::runExtremeProperty(zelkovtest::registry()[static_cast<std::size_t>(index)], property);
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }

    void everySetterTakesExtremes_data()
    {
        QTest::addColumn<int>("index");
        QTest::addColumn<int>("setter");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            const Entry& entry = zelkovtest::registry()[i];
            for (std::size_t k = 0; k < entry.setters.size(); ++k) {
                QTest::newRow(entry.name + "." + entry.setters[k].name + "/"
                    + QByteArray::number(static_cast<int>(entry.setters[k].types.size())))
                    << static_cast<int>(i) << static_cast<int>(k);
            }
        }
    }

    void everySetterTakesExtremes()
    {
        QFETCH(int, index);
        QFETCH(int, setter);
        const Entry& entry = zelkovtest::registry()[static_cast<std::size_t>(index)];
        const QString fault = zelkovtest::runExtremeSetter(entry, entry.setters[static_cast<std::size_t>(setter)]);
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }

    void everyClassStandsExtremeSurroundings_data()
    {
        QTest::addColumn<int>("index");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            if (zelkovtest::registry()[i].kind != Kind::Value) {
                QTest::newRow(zelkovtest::registry()[i].name) << static_cast<int>(i);
            }
        }
    }

    void everyClassStandsExtremeSurroundings()
    {
        QFETCH(int, index);
        const QString fault
            = zelkovtest::runExtremeSurroundings(zelkovtest::registry()[static_cast<std::size_t>(index)]);
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }
};

ZELKOV_TEST_MAIN(TestExtremes)
#include "tst_extremes.moc"
