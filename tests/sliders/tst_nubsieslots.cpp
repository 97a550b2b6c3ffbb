// SPDX-License-Identifier: MIT
// What a handle calls when it is pressed, clicked, dragged, long-clicked, double-clicked or released.
#include "NubsieScene.h"
#include "sliders/Nubsie.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>

using nubsietest::Receiver;
using vx::Nubsie;
using zelkovtest::SignalRecorder;

namespace
{
struct Event
{
    const char* slot;
    void (Nubsie::*setSlot)(const vx::QtSlot&);
    void (Nubsie::*setMap)(const QMap<vx::ValueRange, vx::QtSlot>&);
    bool (Nubsie::*perform)();
};

const Event s_events[] = {
    {"pressed", &Nubsie::setPressSlot, &Nubsie::setPressSlotMap, &Nubsie::performPress},
    {"clicked", &Nubsie::setClickSlot, &Nubsie::setClickSlotMap, &Nubsie::performClick},
    {"dragged", &Nubsie::setDragSlot, &Nubsie::setDragSlotMap, &Nubsie::performDrag},
    {"longPressed", &Nubsie::setLongPressSlot, &Nubsie::setLongPressSlotMap, &Nubsie::performLongClick},
    {"doubleClicked", &Nubsie::setDoubleClickSlot, &Nubsie::setDoubleClickSlotMap, &Nubsie::performDoubleClick},
};

struct Handle : Nubsie
{
    Handle()
        : Nubsie(QStringLiteral("handle"), 3, 0, 10, 5, nullptr, 1)
    {
    }
};

QStringList one(const QString& text)
{
    return QStringList(text);
}
}

class TestNubsieSlots : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyEventCallsItsOwnSlotWithTheValue_data();
    void everyEventCallsItsOwnSlotWithTheValue();
    void theFirstRangeThatHoldsTheValueWins_data();
    void theFirstRangeThatHoldsTheValueWins();
    void aSlotInTheMapMayBeEmpty();
    void theReleaseGetsThePointToo();
    void theReleaseGoesByItsMap();
    void withoutASlotNothingIsCalled();
    void aDeadReceiverIsNotCalled();
    void aSlotThatIsNotThereIsNotCalled();
    void theArgumentsOfTheClientArePassedOn();
    void theSlotItselfKeepsItsArguments();
    void aQueuedSlotIsCalledLater();
    void theTrueValueIsPassedByAnInvertedHandle();
    void aDragStepWithinOneValueDoesNothing();
    void aDragStepCallsTheSlotThenTellsTheValue();
    void withoutLiveDragAStepCallsAndTellsNothing();
    void liveDragGoesByTheFeaturesOfTheNewValue();
    void everyDragStepEndsTheIntervalMode();
    void aTakenClickIsForgottenWhenTheHandleHasShrunk();
    void aSlotMayDeleteTheHandle();
};

void TestNubsieSlots::everyEventCallsItsOwnSlotWithTheValue_data()
{
    QTest::addColumn<int>("event");
    for (int i = 0; i < 5; ++i) {
        QTest::newRow(s_events[i].slot) << i;
    }
}

void TestNubsieSlots::everyEventCallsItsOwnSlotWithTheValue()
{
    QFETCH(int, event);
    Handle nubsie;
    Receiver receiver;
    SignalRecorder recorder(&nubsie);
    for (const Event& each : s_events) {
        (nubsie.*each.setSlot)(receiver.slot(each.slot));
    }
    QVERIFY((nubsie.*s_events[event].perform)());
    QCOMPARE(receiver.calls, one(QString::fromLatin1(s_events[event].slot) + QStringLiteral(" 3")));
    QVERIFY(recorder.entries().isEmpty());
}

void TestNubsieSlots::theFirstRangeThatHoldsTheValueWins_data()
{
    everyEventCallsItsOwnSlotWithTheValue_data();
}

void TestNubsieSlots::theFirstRangeThatHoldsTheValueWins()
{
    QFETCH(int, event);
    Handle nubsie;
    Receiver receiver;
    const Event& each = s_events[event];
    (nubsie.*each.setSlot)(receiver.slot(each.slot));
    (nubsie.*each.setMap)({{{4, 8}, receiver.slot("high")}, {{3, 5}, receiver.slot("low")}});
    for (const int value : {2, 3, 5, 6, 8, 9}) {
        nubsie.setValue(value);
        QVERIFY((nubsie.*each.perform)());
    }
    const QString own = QString::fromLatin1(each.slot);
    QCOMPARE(receiver.calls,
        QStringList({own + QStringLiteral(" 2"), QStringLiteral("low 3"), QStringLiteral("low 5"),
            QStringLiteral("high 6"), QStringLiteral("high 8"), own + QStringLiteral(" 9")}));
}

void TestNubsieSlots::aSlotInTheMapMayBeEmpty()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setClickSlot(receiver.slot("clicked"));
    nubsie.setClickSlotMap({{{3}, vx::QtSlot()}});
    QVERIFY(!nubsie.performClick());
    QVERIFY(receiver.calls.isEmpty());
}

void TestNubsieSlots::theReleaseGetsThePointToo()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setReleaseSlot(receiver.slot("released"));
    QVERIFY(nubsie.performRelease(QPoint(40, -6)));
    QCOMPARE(receiver.calls, one(QStringLiteral("released 3 at 40,-6")));
}

void TestNubsieSlots::theReleaseGoesByItsMap()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setReleaseSlotMap({{{3, 5}, receiver.slot("released")}});
    QVERIFY(nubsie.performRelease(QPoint(1, 2)));
    nubsie.setValue(6);
    QVERIFY(!nubsie.performRelease(QPoint(1, 2)));
    QCOMPARE(receiver.calls, one(QStringLiteral("released 3 at 1,2")));
}

void TestNubsieSlots::withoutASlotNothingIsCalled()
{
    Handle nubsie;
    for (const Event& each : s_events) {
        QVERIFY(!(nubsie.*each.perform)());
    }
    QVERIFY(!nubsie.performRelease(QPoint()));
    Receiver receiver;
    nubsie.setClickSlot(vx::QtSlot(&receiver, std::string()));
    QVERIFY(!nubsie.performClick());
}

void TestNubsieSlots::aDeadReceiverIsNotCalled()
{
    Handle nubsie;
    {
        Receiver receiver;
        nubsie.setPressSlot(receiver.slot("pressed"));
    }
    QVERIFY(!nubsie.performPress());
}

void TestNubsieSlots::aSlotThatIsNotThereIsNotCalled()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setPressSlot(receiver.slot("nowhere"));
    expectWarning(QRegularExpression(QStringLiteral("No such method .*nowhere")));
    QVERIFY(!nubsie.performPress());
}

void TestNubsieSlots::theArgumentsOfTheClientArePassedOn()
{
    Handle nubsie;
    Receiver receiver;
    vx::QtSlot slot = receiver.slot("labelled");
    slot.setParameter(1, Q_ARG(QString, QStringLiteral("text")));
    nubsie.setClickSlot(slot);
    QVERIFY(nubsie.performClick());
    QCOMPARE(receiver.calls, one(QStringLiteral("text 3")));
}

void TestNubsieSlots::theSlotItselfKeepsItsArguments()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setReleaseSlot(receiver.slot("released"));
    QVERIFY(nubsie.performRelease(QPoint(1, 1)));
    // Had the point stayed behind in the slot, the press would come with two arguments.
    vx::QtSlot press = receiver.slot("pressed");
    nubsie.setPressSlot(press);
    QVERIFY(nubsie.performPress());
    nubsie.setValue(9);
    QVERIFY(nubsie.performPress());
    QCOMPARE(receiver.calls.mid(1), QStringList({QStringLiteral("pressed 3"), QStringLiteral("pressed 9")}));
}

void TestNubsieSlots::aQueuedSlotIsCalledLater()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setClickSlot(receiver.slot("clicked", Qt::QueuedConnection));
    QVERIFY(nubsie.performClick());
    QVERIFY(receiver.calls.isEmpty());
    nubsie.setValue(4);
    QTRY_COMPARE(receiver.calls, one(QStringLiteral("clicked 3")));
}

void TestNubsieSlots::theTrueValueIsPassedByAnInvertedHandle()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setFeatures(nubsie.features() | Nubsie::enfInverted);
    nubsie.setClickSlot(receiver.slot("clicked"));
    QVERIFY(nubsie.performClick());
    QCOMPARE(receiver.calls, one(QStringLiteral("clicked 3")));
}

void TestNubsieSlots::aDragStepWithinOneValueDoesNothing()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setDragSlot(receiver.slot("dragged"));
    nubsie.setDateDiffer(true);
    nubsie.setNormalizedValue(0.32);
    SignalRecorder recorder(&nubsie);
    QVERIFY(!nubsie.performDragAction());
    QVERIFY(receiver.calls.isEmpty());
    QVERIFY(recorder.entries().isEmpty());
    QVERIFY(nubsie.dateDiffer());
}

void TestNubsieSlots::aDragStepCallsTheSlotThenTellsTheValue()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setDragSlot(receiver.slot("dragged"));
    connect(&nubsie, &Nubsie::valueChanged, &receiver,
        [&receiver](int value) { receiver.calls << QStringLiteral("told %1").arg(value); });
    nubsie.setNormalizedValue(0.4);
    QVERIFY(nubsie.performDragAction());
    QCOMPARE(receiver.calls, QStringList({QStringLiteral("dragged 4"), QStringLiteral("told 4")}));
}

void TestNubsieSlots::withoutLiveDragAStepCallsAndTellsNothing()
{
    Handle nubsie;
    Receiver receiver;
    nubsie.setFeatures(QFlags<Nubsie::ENubsieFeatures>(Nubsie::enfDraggable));
    nubsie.setDragSlot(receiver.slot("dragged"));
    SignalRecorder recorder(&nubsie);
    nubsie.setNormalizedValue(0.4);
    QVERIFY(nubsie.performDragAction());
    QVERIFY(receiver.calls.isEmpty());
    QVERIFY(recorder.entries().isEmpty());
}

void TestNubsieSlots::liveDragGoesByTheFeaturesOfTheNewValue()
{
    Handle nubsie;
    nubsie.setFeatureMap({{{4, 6}, Nubsie::enfDraggable}});
    SignalRecorder recorder(&nubsie);
    nubsie.setNormalizedValue(0.4);
    QVERIFY(nubsie.performDragAction());
    QVERIFY(recorder.entries().isEmpty());
    nubsie.setNormalizedValue(0.7);
    QVERIFY(nubsie.performDragAction());
    QCOMPARE(recorder.names(), one(QStringLiteral("valueChanged")));
}

void TestNubsieSlots::everyDragStepEndsTheIntervalMode()
{
    Handle nubsie;
    nubsie.setFeatures(QFlags<Nubsie::ENubsieFeatures>(Nubsie::enfDraggable));
    nubsie.setDeltaTimeMode(true);
    nubsie.setDateDiffer(true);
    nubsie.setAnchorTimeDiff(5000);
    nubsie.setNormalizedValue(0.4);
    QVERIFY(nubsie.performDragAction());
    QVERIFY(!nubsie.deltaTimeMode());
    QVERIFY(!nubsie.dateDiffer());
    QCOMPARE(nubsie.anchorTimeDiff(), qint64(5000));
}

void TestNubsieSlots::aTakenClickIsForgottenWhenTheHandleHasShrunk()
{
    Handle nubsie;
    nubsie.setSize(QSize(20, 20));
    nubsie.setDraggedSize(QSize(40, 40));
    nubsie.setCurrentSize(QSize(40, 40));
    nubsie.setClickOrLongClickOccured(true);
    nubsie.resetSize();
    QVERIFY(nubsie.clickOrLongClickOccured());
    QTRY_VERIFY(!nubsie.clickOrLongClickOccured());
    QCOMPARE(nubsie.getCurrentSize(), QSize(20, 20));
    nubsie.setClickOrLongClickOccured(true);
    nubsie.clearClickOrLongClickOccured();
    QVERIFY(!nubsie.clickOrLongClickOccured());
}

void TestNubsieSlots::aSlotMayDeleteTheHandle()
{
    Receiver receiver;
    for (const Event& each : s_events) {
        QPointer<Nubsie> nubsie(new Handle);
        receiver.action = [nubsie] { delete nubsie.data(); };
        (nubsie->*each.setSlot)(receiver.slot("act"));
        QVERIFY((nubsie->*each.perform)());
        QVERIFY(nubsie.isNull());
    }
    QPointer<Nubsie> nubsie(new Handle);
    receiver.action = [nubsie] { delete nubsie.data(); };
    nubsie->setDragSlot(receiver.slot("act"));
    nubsie->setNormalizedValue(0.9);
    QVERIFY(nubsie->performDragAction());
    QVERIFY(nubsie.isNull());
}

ZELKOV_TEST_MAIN(TestNubsieSlots)
#include "tst_nubsieslots.moc"
