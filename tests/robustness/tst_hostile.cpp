// SPDX-License-Identifier: MIT
// Every signal of every class against slots that attack its sender. One row a case: a sanitizer ends the process at
// its first finding, and the row's name says where.
#include <QtTest/QtTest>

#include "Saboteur.h"
#include "Suites.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Entry;
using zelkovtest::Kind;
using zelkovtest::Sabotage;

class TestHostile : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everySignalIsPromisedByAScript_data()
    {
        QTest::addColumn<int>("index");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            if (zelkovtest::registry()[i].kind != Kind::Value) {
                QTest::newRow(zelkovtest::registry()[i].name) << static_cast<int>(i);
            }
        }
    }

    void everySignalIsPromisedByAScript()
    {
        QFETCH(int, index);
        const Entry& entry = zelkovtest::registry()[static_cast<std::size_t>(index)];
        const QList<QByteArray> forgotten = zelkovtest::unpromisedSignals(entry);
        QVERIFY2(forgotten.isEmpty(), forgotten.join(", ").constData());
        QWidget host;
        const zelkovtest::Subject subject = entry.create(&host);
        for (const QByteArray& signal : entry.expectedSignals()) {
            QVERIFY2(zelkovtest::signalIndex(subject.object, signal) >= 0, signal.constData());
        }
    }

    void slotsMayDoAnything_data()
    {
        QTest::addColumn<int>("index");
        QTest::addColumn<QByteArray>("signal");
        QTest::addColumn<int>("sabotage");
        for (std::size_t i = 0; i < zelkovtest::registry().size(); ++i) {
            const Entry& entry = zelkovtest::registry()[i];
            if (entry.kind == Kind::Value) {
                continue;
            }
            QWidget host;
            const QList<QByteArray> signalNames = zelkovtest::declaredSignals(entry.create(&host).object);
            for (const QByteArray& signal : signalNames) {
                const auto sabotages = zelkovtest::allSabotages();
                for (const auto& sabotage : sabotages) {
                    if (entry.farewells.contains(signal) && zelkovtest::deletes(sabotage.second)) {
                        continue;
                    }
                    QTest::newRow(entry.name + "." + signal + "." + sabotage.first)
                        << static_cast<int>(i) << signal << static_cast<int>(sabotage.second);
                }
            }
        }
    }

    void slotsMayDoAnything()
    {
        QFETCH(int, index);
        QFETCH(QByteArray, signal);
        QFETCH(int, sabotage);
        const QString fault = zelkovtest::runHostile(
            zelkovtest::registry()[static_cast<std::size_t>(index)], signal, static_cast<Sabotage>(sabotage));
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
    }
};

ZELKOV_TEST_MAIN(TestHostile)
#include "tst_hostile.moc"
