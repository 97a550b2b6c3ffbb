// SPDX-License-Identifier: MIT
// Classes with faults on purpose, put through the robustness suites. Run by tst_selftest, which wants each function
// but the first to fail.
#include <QtTest/QtTest>

#include "Suites.h"
#include "TestCase.h"
#include "TestMain.h"

using zelkovtest::Entry;
using zelkovtest::Sabotage;
using zelkovtest::Subject;

class Planted : public QWidget
{
    Q_OBJECT

public:
    enum class Fault : int { None, UseAfterFree, LeakedWidget, Warning, Silence };

    Planted(Fault fault, QWidget* parent)
        : QWidget(parent)
        , m_fault(fault)
    {
        if (m_fault == Fault::LeakedWidget) {
            new QWidget;
        }
    }

    void count()
    {
        if (m_fault == Fault::Silence) {
            return;
        }
        if (m_fault == Fault::UseAfterFree) {
            Q_EMIT counted();
            ++m_count;
            return;
        }
        ++m_count;
        Q_EMIT counted();
    }

Q_SIGNALS:
    void counted();

protected:
    void paintEvent(QPaintEvent* /*event*/) override
    {
        if (m_fault == Fault::Warning) {
            qWarning("a planted warning");
        }
    }

private:
    Fault m_fault;
    int m_count = 0;
};

namespace
{
Entry planted(Planted::Fault fault)
{
    Entry entry;
    entry.name = "Planted";
    entry.kind = zelkovtest::Kind::Widget;
    entry.create = [fault](QWidget* host) {
        Planted* const widget = new Planted(fault, host);
        return Subject{widget, widget};
    };
    entry.exercise = {{"count", {"counted"}, {zelkovtest::call(&Planted::count)}}};
    return entry;
}
}

class TestPlanted : public zelkovtest::TestCase
{
    Q_OBJECT

    void everything(Planted::Fault fault)
    {
        const Entry entry = planted(fault);
        QVERIFY(zelkovtest::unpromisedSignals(entry).isEmpty());
        const auto sabotages = zelkovtest::allSabotages();
        for (const auto& sabotage : sabotages) {
            const QString found = zelkovtest::runHostile(entry, "counted", sabotage.second);
            QVERIFY2(found.isEmpty(), qPrintable(found));
        }
        const QString found = zelkovtest::runLeakCycles(entry, 20);
        QVERIFY2(found.isEmpty(), qPrintable(found));
        zelkovtest::runMonkey(entry, 1, 1000);
    }

private Q_SLOTS:
    void faultless() { everything(Planted::Fault::None); }
    void useAfterFree() { everything(Planted::Fault::UseAfterFree); }
    void silentSignal() { everything(Planted::Fault::Silence); }
    void printedWarning() { everything(Planted::Fault::Warning); }

    void leakedWidget()
    {
        const QString found = zelkovtest::runLeakCycles(planted(Planted::Fault::LeakedWidget), 20);
        QVERIFY2(found.isEmpty(), qPrintable(found));
    }

    void forgottenSignal()
    {
        Entry entry = planted(Planted::Fault::None);
        entry.exercise.clear();
        QVERIFY(zelkovtest::unpromisedSignals(entry).isEmpty());
    }
};

ZELKOV_TEST_MAIN(TestPlanted)
#include "PlantedFault.moc"
