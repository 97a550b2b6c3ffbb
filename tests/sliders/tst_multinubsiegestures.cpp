// SPDX-License-Identifier: MIT
// What the user does with the handles of a slider, by real mouse events; every signal and slot in order.
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "TimeLineScene.h"

#include <QtCore/QElapsedTimer>
#include <QtGui/QHelpEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QToolTip>

using timelinetest::list;
using timelinetest::Scene;
using vx::MultiNubsieSlider;
using vx::Nubsie;
using zelkovtest::Pointer;

namespace
{
// On a handle drawn at 0.5.
const QPoint middle(109, 17);

QMouseEvent mouse(QEvent::Type type, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    return QMouseEvent(type, QPointF(position), button, button, Qt::NoModifier);
}

// For what must not happen, or goes by the clock of the system.
bool waited(int milliseconds)
{
    QElapsedTimer clock;
    clock.start();
    return QTest::qWaitFor([&] { return clock.elapsed() > milliseconds; });
}
}

class TestMultiNubsieGestures : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    // Hits
    void aPressBesideTheDiscIsIgnored();
    void disabledHiddenAndFixedHandlesAreNotHit();
    void aPressMovesTheHandleToTheEndOfTheList();

    // Clicks
    void aClickIsSettledAfterTheDoubleClickInterval();
    void aClickThatNobodyTakesStepsTheValue();
    void aTakenClickDoesNotStep();
    void aDoubleClickIsOneGesture();
    void aDoubleClickCanReset();
    void aDoubleClickElsewhereSettlesTheNextClickAtOnce();
    void aMovedPointerWithoutAChangeIsAClick();
    void aPressOnAnotherHandlePutsTheFirstOneBack();

    // Drags
    void aLiveDragReportsEachChange();
    void aDragWithoutLiveDragReportsOnceBeforeTheRelease();
    void aDragEndsAtBothEndsOfTheScale();
    void aHandleThatWasPushedAsideStartsWithoutAJump();
    void neighboursDriftHomeWhileAHandleIsHeld();
    void aDragOnAVerticalSliderGoesUpward();
    void aSpringGoesBackWithDoubledSignals();
    void featuresByValueSwitchTheDragOff();
    void anotherButtonDoesNotSettleTheDrag();

    // Fine scrubbing
    void twentyFourPixelsOffTheLineIsOneToOne();
    void twentyFivePixelsOffTheLineIsSlower();
    void aDateHandleIsSlowest();

    // Steps
    void discreteStepsGoByTheSizeOfTheHandle();
    void aFlickUpStepsUp();
    void aFlickDownStepsDown();
    void aFlickDownThatRestsStepsUp();
    void aStepThatChangedTheValueIsNoFlick();

    // Long clicks
    void aLongClickEndsTheGesture();
    void aLongClickCanHold();
    void aLongClickThatNobodyTakesGoesOn();
    void withoutTheFeatureTheDragGoesOn();
    void thirtyPixelsAwayIsStillALongClickThirtyOneIsNot();

    // The rest
    void aClickOnTheTrackMovesTheOnlyHandle();
    void aClickOnAVerticalTrackIsNotTurnedRound();
    void aClickOnTheTrackNeedsTheFeatureAndOneHandle();
    void aValueFromOutsideWaitsForTheRelease();
    void aRangeFromOutsideMovesTheHeldHandle();
    void aValueFromOutsideStopsTheWaitForASecondClick();
    void handlesRemovedInMidGestureAreForgotten();
    void aHandleRemovedInASlotOfItsOwn_data();
    void aHandleRemovedInASlotOfItsOwn();
    void aSliderDeletedInASlot_data();
    void aSliderDeletedInASlot();
    void toolTipsOfHandles();
    void eventsOfAnotherWidgetDriveTheSlider();
    void thePointerFadesTheSlider();
};

// --- Hits
// --------------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::aPressBesideTheDiscIsIgnored()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    QVERIFY(scene.slider->getNubsieForPos(QPoint(101, 10)) != nullptr);
    QMouseEvent press = mouse(QEvent::MouseButtonPress, QPoint(101, 10));
    QVERIFY(!scene.slider->handleEvent(&press));
    QCOMPARE(scene.journal.lines, QStringList());
    QVERIFY(!scene.slider->nubsieGrabbed(1));

    // On the disc, at its very edge.
    QMouseEvent inside = mouse(QEvent::MouseButtonPress, QPoint(100, 17));
    QVERIFY(scene.slider->handleEvent(&inside));
    QCOMPARE(scene.journal.lines, list({"started 1"}));
    QVERIFY(scene.slider->nubsieGrabbed(1));
}

void TestMultiNubsieGestures::disabledHiddenAndFixedHandlesAreNotHit()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.show();
    QCOMPARE(scene.slider->getNubsieForPos(middle), handle);
    handle->setEnabled(false);
    QVERIFY(scene.slider->getNubsieForPos(middle) == nullptr);
    handle->setEnabled(true);
    scene.slider->setNubsieVisible(1, false);
    QVERIFY(scene.slider->getNubsieForPos(middle) == nullptr);
    scene.slider->setNubsieVisible(1, true);

    // The handle's own features count, not those in force at the value.
    QMap<vx::ValueRange, Nubsie::ENubsieFeatures> map;
    map.insert(vx::ValueRange(0, 200), Nubsie::enfLiveDrag);
    handle->setFeatureMap(map);
    QCOMPARE(scene.slider->getNubsieForPos(middle), handle);
    scene.slider->setFeatures(1, Nubsie::enfLiveDrag);
    QVERIFY(scene.slider->getNubsieForPos(middle) == nullptr);
}

void TestMultiNubsieGestures::aPressMovesTheHandleToTheEndOfTheList()
{
    Scene scene;
    Nubsie* const one = scene.add(1, 100);
    Nubsie* const two = scene.add(2, 20);
    Nubsie* const three = scene.add(3, 180);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    const QList<QPointer<Nubsie>> expected {two, three, one};
    QCOMPARE(scene.slider->getNubsies(), expected);
    pointer.release();
}

// --- Clicks
// ------------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::aClickIsSettledAfterTheDoubleClickInterval()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QVERIFY(scene.slider->nubsieGrabbed(1));
    // The end of the growing clears what the click leaves.
    QTRY_COMPARE(handle->sizeAnimator()->state(), QAbstractAnimation::Stopped);
    QVERIFY(scene.slider->nubsieMaximized(1));
    pointer.release();
    QVERIFY(!scene.slider->nubsieGrabbed(1));
    QVERIFY(handle->clickOrLongClickOccured());
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100", "click 100"}));
    // It shrinks only when no second click can follow.
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100", "click 100"}));
    QCOMPARE(scene.slider->value(1), 100);
}

void TestMultiNubsieGestures::aClickThatNobodyTakesStepsTheValue()
{
    Scene scene;
    scene.add(1, 200);
    scene.slider->addFeatures(1, Nubsie::enfStepOnClick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(209, 17));
    // One up from the end is 0.
    QCOMPARE(scene.slider->value(1), 0);
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 0"}));

    // Not with discrete steps.
    scene.slider->addFeatures(1, Nubsie::enfDiscreteSteps);
    pointer.wait(1000);
    pointer.click(QPoint(9, 17));
    QCOMPARE(scene.slider->value(1), 0);
}

void TestMultiNubsieGestures::aTakenClickDoesNotStep()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfStepOnClick);
    scene.slider->setClickSlot(1, scene.journal.slot("click"));
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    QCOMPARE(scene.journal.lines, list({"started 1", "click 100"}));
    QCOMPARE(scene.slider->value(1), 100);
}

void TestMultiNubsieGestures::aDoubleClickIsOneGesture()
{
    Scene scene;
    scene.add(1, 100);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    pointer.press();
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "click 100", "doubleClick 100", "click 100", "ended 1"}));
    QVERIFY(!scene.slider->nubsieGrabbed(1));
}

void TestMultiNubsieGestures::aDoubleClickCanReset()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->setDefaultValues(1, 50);
    scene.slider->addFeatures(1, Nubsie::enfResetOnDoubleClick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    pointer.press();
    QCOMPARE(scene.slider->value(1), 50);
    const QStringList reset = list({"started 1", "press 100", "click 100", "doubleClick 100", "changed 1 50",
        "queued", "ended 1", "changed 1 50"});
    QCOMPARE(scene.journal.lines, reset);
    // The value is not that of the press any more, so that the release ends a drag.
    pointer.release();
    QCOMPARE(scene.journal.lines, reset + list({"release 50 at 109,17", "ended 1"}));
}

void TestMultiNubsieGestures::aDoubleClickElsewhereSettlesTheNextClickAtOnce()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(30, 17));
    pointer.press();
    pointer.release();
    QCOMPARE(scene.journal.lines, QStringList());
    pointer.wait(1000);
    pointer.click(middle);
    QCOMPARE(scene.journal.lines, list({"started 1", "ended 1"}));
    pointer.wait(1000);
    pointer.click(middle);
    QCOMPARE(scene.journal.lines, list({"started 1", "ended 1", "started 1"}));
}

void TestMultiNubsieGestures::aMovedPointerWithoutAChangeIsAClick()
{
    Scene scene;
    scene.add(1, 100);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    // A handle's middle for hits is one pixel to the left of where the same place puts it in motion.
    pointer.move(QPoint(110, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "drag 119", "changed 1 119", "drag 100", "changed 1 100", "click 100"}));
}

void TestMultiNubsieGestures::aPressOnAnotherHandlePutsTheFirstOneBack()
{
    Scene scene;
    Nubsie* const one = scene.add(1, 50);
    scene.add(2, 150);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(QPoint(59, 17));
    pointer.press();
    QTRY_VERIFY(scene.slider->nubsieMaximized(1));
    pointer.release();
    pointer.move(QPoint(159, 17));
    pointer.press();
    QTRY_COMPARE(one->getCurrentSize(), QSize(20, 20));
    // The interval of the first click is over; the second handle is still in hand.
    QVERIFY(waited(QApplication::doubleClickInterval() + 100));
    QVERIFY(scene.slider->nubsieMaximized(2));
    pointer.move(QPoint(169, 17));
    QCOMPARE(scene.slider->value(2), 159);
    pointer.release();
}

// --- Drags
// -------------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::aLiveDragReportsEachChange()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100"}));
    pointer.move(QPoint(119, 17));
    pointer.move(QPoint(129, 18));
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "drag 109", "changed 1 109", "drag 119", "changed 1 119"}));
    QCOMPARE(scene.drawn(1), 0.595);
    QCOMPARE(handle->normalizedValue(), 0.595);
    // Under the pointer, with its dragged size: 15 + 190 * 0.595 from the left end.
    QCOMPARE(handle->getPosition(), QPointF(228, 248));
    scene.journal.lines.clear();
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"release 119 at 129,18", "ended 1"}));
    QCOMPARE(scene.slider->value(1), 119);
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QTRY_COMPARE(handle->getPosition(), scene.slider->nubsiePos(handle));
}

void TestMultiNubsieGestures::aDragWithoutLiveDragReportsOnceBeforeTheRelease()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->setFeatures(1, Nubsie::enfDraggable);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(119, 17));
    pointer.move(QPoint(129, 17));
    QCOMPARE(scene.slider->value(1), 119);
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100"}));
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "changed 1 119", "release 119 at 129,17", "ended 1"}));
}

void TestMultiNubsieGestures::aDragEndsAtBothEndsOfTheScale()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(210, 17));
    QCOMPARE(scene.slider->value(1), 200);
    pointer.move(QPoint(450, 17));
    QCOMPARE(scene.slider->value(1), 200);
    QCOMPARE(scene.drawn(1), 1.0);
    pointer.move(QPoint(-90, 17));
    QCOMPARE(scene.slider->value(1), 0);
    QCOMPARE(scene.drawn(1), 0.0);
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 200", "changed 1 0", "ended 1"}));
}

void TestMultiNubsieGestures::aHandleThatWasPushedAsideStartsWithoutAJump()
{
    Scene scene;
    scene.add(1, 100);
    Nubsie* const pushed = scene.add(2, 104);
    scene.show();
    QCOMPARE(scene.drawn(1), 0.46);
    QCOMPARE(scene.drawn(2), 0.56);
    Pointer pointer(scene.slider);
    pointer.move(QPoint(121, 17));
    pointer.press();
    // One pixel to the right is where it is drawn.
    pointer.move(QPoint(122, 17));
    QVERIFY(qAbs(pushed->normalizedValue() - 0.52) < 1e-9);
    QCOMPARE(scene.journal.lines, list({"started 2"}));
    // Halfway to the top in place and value.
    pointer.move(QPoint(166, 17));
    QCOMPARE(scene.drawn(2), 0.78);
    QVERIFY(qAbs(pushed->normalizedValue() - 0.76) < 1e-9);
    pointer.move(QPoint(210, 17));
    QCOMPARE(pushed->normalizedValue(), 1.0);
    // From an end on it is one to one.
    pointer.move(QPoint(166, 17));
    QVERIFY(qAbs(pushed->normalizedValue() - 0.78) < 1e-9);
    pointer.release();
}

void TestMultiNubsieGestures::neighboursDriftHomeWhileAHandleIsHeld()
{
    Scene scene;
    Nubsie* const neighbour = scene.add(1, 100);
    scene.add(2, 104);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(QPoint(121, 17));
    pointer.press();
    QCOMPARE(scene.drawn(1), 0.5);
    QCOMPARE(neighbour->positionAnimator()->state(), QAbstractAnimation::Running);
    QTRY_COMPARE(neighbour->getPosition(), scene.slider->nubsiePos(neighbour));
    QCOMPARE(scene.drawn(2), 0.56);
    // Put back at the release, the two are pushed apart again.
    pointer.move(QPoint(119, 17));
    pointer.release();
    QVERIFY(qAbs(scene.drawn(2) - scene.drawn(1) - 0.1) < 1e-9);
}

void TestMultiNubsieGestures::aDragOnAVerticalSliderGoesUpward()
{
    Scene scene(Qt::Vertical);
    Nubsie* const handle = scene.add(1, 50);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    // From the bottom, half a handle and a quarter of the way, and one pixel.
    QCOMPARE(scene.slider->nubsiePos(handle), QPointF(117.5, 230 + 220 - 10 - 50 - 1));
    Pointer pointer(scene.slider);
    pointer.move(QPoint(17, 159));
    pointer.press();
    pointer.move(QPoint(17, 149));
    // The pixel works the other way round here.
    QCOMPARE(scene.slider->value(1), 61);
    // The width of the dragged size counts upright, too: 15 + 190 * (1 - 0.305).
    QCOMPARE(handle->getPosition(), QPointF(118, 230 + 147));
    pointer.move(QPoint(17, -80));
    QCOMPARE(scene.slider->value(1), 200);
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 50", "drag 61", "changed 1 61", "drag 200", "changed 1 200",
            "release 200 at 17,-80", "ended 1"}));
}

void TestMultiNubsieGestures::aSpringGoesBackWithDoubledSignals()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfResetOnRelease);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    scene.journal.lines.clear();
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"release 119 at 129,17", "changed 1 100", "queued", "ended 1", "changed 1 100", "ended 1"}));
    QCOMPARE(scene.slider->value(1), 100);
    QCOMPARE(scene.drawn(1), 0.5);
}

void TestMultiNubsieGestures::featuresByValueSwitchTheDragOff()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    QMap<vx::ValueRange, Nubsie::ENubsieFeatures> map;
    map.insert(vx::ValueRange(110, 120), Nubsie::enfDraggable);
    handle->setFeatureMap(map);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17)); // 119: silent there
    pointer.move(QPoint(139, 17)); // 129
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 129"}));
    pointer.move(QPoint(127, 17)); // 117
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 129", "changed 1 117", "ended 1"}));
}

void TestMultiNubsieGestures::anotherButtonDoesNotSettleTheDrag()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.press(Qt::RightButton);
    pointer.release(Qt::RightButton);
    // Any release lets the handle go, but the gesture is settled by the left one.
    QVERIFY(!scene.slider->nubsieGrabbed(1));
    pointer.move(QPoint(129, 17));
    QCOMPARE(scene.slider->value(1), 119);
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 119", "ended 1"}));
}

// --- Fine scrubbing
// ----------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::twentyFourPixelsOffTheLineIsOneToOne()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    pointer.move(QPoint(149, 44));
    QCOMPARE(scene.drawn(1), 0.695);
    pointer.move(QPoint(129, -4));
    QCOMPARE(scene.drawn(1), 0.595);
    pointer.release();
}

void TestMultiNubsieGestures::twentyFivePixelsOffTheLineIsSlower()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    QCOMPARE(scene.drawn(1), 0.595);
    pointer.move(QPoint(149, 45));
    // 25 of 270 pixels.
    const double speed = 25.0 / 270.0 * 0.05 + (1.0 - 25.0 / 270.0);
    const double slow = 0.595 + speed * 20.0 / 220.0;
    QCOMPARE(scene.drawn(1), slow);
    // On the other side too.
    pointer.move(QPoint(144, -5));
    QCOMPARE(scene.drawn(1), slow - speed * 5.0 / 220.0);
    // Back near the bar it is under the pointer again.
    pointer.move(QPoint(144, 17));
    QCOMPARE(scene.drawn(1), 0.67);
    pointer.release();

    // The first step of a drag counts from the origin, so that a drag that starts far away is as far ahead of the
    // pointer as it may be.
    QTRY_COMPARE(scene.slider->nubsie(1)->getCurrentSize(), QSize(20, 20));
    pointer.wait(1000);
    pointer.move(QPoint(143, 17));
    pointer.press();
    pointer.move(QPoint(145, 45));
    QCOMPARE(scene.drawn(1), 135.0 / 200.0 + 1.0 - speed);
    pointer.release();
}

void TestMultiNubsieGestures::aDateHandleIsSlowest()
{
    Scene scene;
    scene.add(1, 43200, 0, 86400);
    scene.slider->addFeatures(1, Nubsie::enfDateMode);
    const QDateTime start(QDate(2026, 3, 2), QTime(0, 0), Qt::UTC);
    scene.slider->setStartEndDates(1, start, start.addDays(1));
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(110, 17));
    QCOMPARE(scene.drawn(1), 0.5);
    // As far as it goes: one pixel for about a second.
    pointer.move(QPoint(130, 20 + 270));
    QVERIFY(qAbs(scene.drawn(1) - 0.5 - 220.0 / 86500.0 * 20.0 / 220.0) < 1e-12);
    QCOMPARE(scene.slider->value(1), 43200 + 20);
    pointer.release();
}

// --- Steps
// -------------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::discreteStepsGoByTheSizeOfTheHandle()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 2, 0, 4);
    scene.slider->addFeatures(1, Nubsie::enfDiscreteSteps);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    // 180 pixels for the whole range; the handle itself goes with the pointer.
    pointer.move(QPoint(109 + 45, 17));
    QCOMPARE(handle->normalizedValue(), 0.75);
    QCOMPARE(scene.drawn(1), (109 + 45 - 10) / 200.0);
    QCOMPARE(scene.slider->value(1), 3);
    pointer.move(QPoint(109 + 45 + 22, 17));
    QCOMPARE(scene.slider->value(1), 3);
    pointer.move(QPoint(109 + 45 + 23, 17));
    QCOMPARE(scene.slider->value(1), 4);
    // Far off the line it is no slower.
    pointer.move(QPoint(109 - 45, 200));
    QCOMPARE(scene.slider->value(1), 1);
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 2", "drag 3", "changed 1 3", "drag 4", "changed 1 4", "drag 1", "changed 1 1",
            "release 1 at 64,200", "ended 1"}));
    // At rest it stands at its value.
    QCOMPARE(scene.drawn(1), 0.25);
}

void TestMultiNubsieGestures::aFlickUpStepsUp()
{
    Scene scene;
    scene.add(1, 0, 0, 1);
    scene.slider->addFeatures(1, Nubsie::enfStepOnFlick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(QPoint(9, 17));
    pointer.press();
    pointer.move(QPoint(9 + 99, 17));
    QCOMPARE(scene.slider->value(1), 0);
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 0", "changed 1 1", "changed 1 1", "release 1 at 108,17", "ended 1"}));
}

void TestMultiNubsieGestures::aFlickDownStepsDown()
{
    Scene scene;
    scene.add(1, 1, 0, 1);
    scene.slider->addFeatures(1, Nubsie::enfStepOnFlick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(QPoint(209, 17));
    pointer.press();
    pointer.move(QPoint(209 - 97, 17));
    QCOMPARE(scene.slider->value(1), 1);
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 1", "changed 1 0", "changed 1 0", "release 0 at 112,17", "ended 1"}));
}

void TestMultiNubsieGestures::aFlickDownThatRestsStepsUp()
{
    Scene scene;
    scene.add(1, 1, 0, 2);
    scene.slider->addFeatures(1, Nubsie::enfStepOnFlick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(109 - 45, 17));
    QCOMPARE(scene.slider->value(1), 1);
    QVERIFY(waited(510));
    pointer.release();
    QCOMPARE(scene.slider->value(1), 2);
}

void TestMultiNubsieGestures::aStepThatChangedTheValueIsNoFlick()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfStepOnFlick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(189, 17));
    pointer.release();
    QCOMPARE(scene.slider->value(1), 179);

    // Nor is any with discrete steps, however fast the last move was before that.
    scene.slider->setRange(1, 0, 1);
    scene.slider->setFeatures(1, Nubsie::enfDraggable);
    QCOMPARE(scene.slider->value(1), 1);
    pointer.wait(1000);
    pointer.move(QPoint(209, 17));
    pointer.press();
    pointer.move(QPoint(209 - 90, 17));
    pointer.release();
    QCOMPARE(scene.slider->value(1), 1);
    scene.slider->addFeatures(1, Nubsie::enfStepOnFlick | Nubsie::enfDiscreteSteps);
    pointer.wait(1000);
    pointer.move(QPoint(209, 17));
    pointer.press();
    pointer.move(QPoint(199, 17));
    pointer.release();
    QCOMPARE(scene.slider->value(1), 1);
}

// --- Long clicks
// -------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::aLongClickEndsTheGesture()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfLongClick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QTRY_VERIFY(scene.slider->nubsieMaximized(1));
    Scene::fire(scene.longClickTimer());
    QVERIFY(handle->clickOrLongClickOccured());
    QVERIFY(scene.slider->nubsieGrabbed(1));
    // Moves and the release find no handle any more.
    pointer.move(QPoint(150, 17));
    QCOMPARE(scene.slider->value(1), 100);
    pointer.release();
    QVERIFY(!scene.slider->nubsieGrabbed(1));
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100", "longClick 100"}));
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QTRY_VERIFY(!handle->clickOrLongClickOccured());
}

void TestMultiNubsieGestures::aLongClickCanHold()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfLongClick | Nubsie::enfHoldAfterLongClick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    Scene::fire(scene.longClickTimer());
    QVERIFY(!handle->clickOrLongClickOccured());
    pointer.move(QPoint(129, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "longClick 100", "drag 119", "changed 1 119", "release 119 at 129,17",
            "ended 1"}));
}

void TestMultiNubsieGestures::aLongClickThatNobodyTakesGoesOn()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfLongClick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    Scene::fire(scene.longClickTimer());
    pointer.move(QPoint(129, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 119", "ended 1"}));
}

void TestMultiNubsieGestures::withoutTheFeatureTheDragGoesOn()
{
    Scene scene;
    scene.add(1, 100);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    Scene::fire(scene.longClickTimer());
    QCOMPARE(scene.journal.lines, list({"started 1", "press 100"}));
    pointer.move(QPoint(129, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "drag 119", "changed 1 119", "release 119 at 129,17", "ended 1"}));
}

void TestMultiNubsieGestures::thirtyPixelsAwayIsStillALongClickThirtyOneIsNot()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfLongClick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QVERIFY(scene.longClickTimer()->isActive());
    pointer.move(middle + QPoint(30, -30));
    QVERIFY(scene.longClickTimer()->isActive());
    pointer.move(middle + QPoint(0, 31));
    QVERIFY(!scene.longClickTimer()->isActive());
    // For good.
    pointer.move(middle);
    QVERIFY(!scene.longClickTimer()->isActive());
    pointer.release();

    pointer.wait(1000);
    pointer.move(QPoint(9, 17) + QPoint(scene.slider->value(1), 0));
    pointer.press();
    QVERIFY(scene.longClickTimer()->isActive());
    pointer.move(QPoint(9 - 31, 17) + QPoint(scene.slider->value(1), 0));
    QVERIFY(!scene.longClickTimer()->isActive());
    pointer.release();
}

// --- The rest
// ----------------------------------------------------------------------------------------------------

void TestMultiNubsieGestures::aClickOnTheTrackMovesTheOnlyHandle()
{
    Scene scene;
    scene.add(1, 20);
    scene.slider->setFeatures(MultiNubsieSlider::emfJumpOnTrackClick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(165, 5));
    QCOMPARE(scene.slider->value(1), 150);
    QCOMPARE(scene.drawn(1), 0.75);
    QCOMPARE(scene.journal.lines, list({"changed 1 150", "changed 1 150"}));
}

void TestMultiNubsieGestures::aClickOnAVerticalTrackIsNotTurnedRound()
{
    Scene scene(Qt::Vertical);
    scene.add(1, 20);
    scene.slider->setFeatures(MultiNubsieSlider::emfJumpOnTrackClick);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(5, 55));
    QCOMPARE(scene.slider->value(1), 50);
    QCOMPARE(scene.journal.lines, list({"changed 1 50", "changed 1 50"}));
}

void TestMultiNubsieGestures::aClickOnTheTrackNeedsTheFeatureAndOneHandle()
{
    Scene scene;
    scene.add(1, 20);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(165, 5));
    QCOMPARE(scene.slider->value(1), 20);
    scene.slider->setFeatures(MultiNubsieSlider::emfJumpOnTrackClick);
    pointer.wait(1000);
    pointer.click(QPoint(165, 5), Qt::RightButton);
    QCOMPARE(scene.slider->value(1), 20);
    scene.add(2, 100);
    pointer.wait(1000);
    pointer.click(QPoint(165, 5));
    QCOMPARE(scene.slider->value(1), 20);
    QCOMPARE(scene.journal.lines, QStringList());
}

void TestMultiNubsieGestures::aValueFromOutsideWaitsForTheRelease()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    scene.slider->setValue(1, 40, true, false);
    QCOMPARE(scene.slider->value(1), 40);
    QCOMPARE(scene.drawn(1), 0.5);
    QVERIFY(scene.slider->nubsieGrabbed(1));
    QCOMPARE(scene.journal.lines, list({"started 1"}));
    scene.slider->setValue(1, 60, true, true);
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 60"}));
    QCOMPARE(scene.drawn(1), 0.5);
    pointer.release();
    // The value differs from that of the press: a drag.
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 60", "ended 1"}));
    QCOMPARE(scene.drawn(1), 0.3);
    QTRY_COMPARE(handle->getPosition(), scene.slider->nubsiePos(handle));
}

void TestMultiNubsieGestures::aRangeFromOutsideMovesTheHeldHandle()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    scene.slider->setRange(1, 0, 400);
    QCOMPARE(scene.drawn(1), 0.25);
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 100"}));
    // The next step puts it under the pointer again.
    pointer.move(QPoint(129, 17));
    QCOMPARE(scene.drawn(1), 0.595);
    QCOMPARE(scene.slider->value(1), 238);
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 100", "changed 1 238", "ended 1"}));
}

void TestMultiNubsieGestures::aValueFromOutsideStopsTheWaitForASecondClick()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->setFeatures(MultiNubsieSlider::emfShowValueLabel);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    scene.slider->setValue(1, 60, false, false);
    // The handle is at rest at once, and stays the one in use: forwarded moves still drag it.
    QCOMPARE(handle->getCurrentSize(), QSize(20, 20));
    QVERIFY(waited(QApplication::doubleClickInterval() + 100));
    QMouseEvent move = mouse(QEvent::MouseMove, QPoint(129, 17));
    scene.slider->handleEvent(&move);
    QCOMPARE(scene.slider->value(1) != 60, true);
}

void TestMultiNubsieGestures::handlesRemovedInMidGestureAreForgotten()
{
    Scene scene;
    scene.add(1, 100);
    scene.add(2, 20);
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    scene.slider->removeNubsie(1);
    QVERIFY(!scene.slider->nubsieExists(1));
    pointer.move(QPoint(150, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1"}));

    pointer.wait(1000);
    pointer.move(QPoint(29, 17));
    pointer.press();
    QVERIFY(scene.slider->nubsieGrabbed(2));
    scene.slider->removeAllNubsies();
    QVERIFY(scene.slider->getNubsies().isEmpty());
    pointer.move(QPoint(150, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "started 2"}));
}

void TestMultiNubsieGestures::aHandleRemovedInASlotOfItsOwn_data()
{
    QTest::addColumn<QString>("moment");
    for (const char* moment : {"started 1", "press 100", "drag 119", "changed 1 119", "release", "changed 1 100",
             "ended 1", "click 100", "doubleClick 100", "longClick 100"}) {
        QTest::newRow(moment) << QString::fromLatin1(moment);
    }
}

// Every gesture once, with a slot that does its worst at one moment.
static void everyGesture(Scene& scene, const QPointer<MultiNubsieSlider>& slider)
{
    Pointer pointer(&scene.host);
    const QPoint offset(100, 230);
    pointer.click(middle + offset);
    pointer.press();
    pointer.release();
    pointer.wait(1000);
    pointer.press();
    if (slider && scene.longClickTimer()->isActive()) {
        Scene::fire(scene.longClickTimer());
    }
    pointer.release();
    pointer.wait(1000);
    pointer.press();
    pointer.move(QPoint(129, 17) + offset);
    pointer.release();
    QCoreApplication::processEvents();
}

void TestMultiNubsieGestures::aHandleRemovedInASlotOfItsOwn()
{
    QFETCH(QString, moment);
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfResetOnRelease | Nubsie::enfLongClick | Nubsie::enfStepOnClick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    bool done = false;
    scene.journal.action = [&](const QString& line) {
        if (line.startsWith(moment)) {
            done = true;
            scene.slider->removeNubsie(1);
        }
    };
    everyGesture(scene, scene.slider);
    QVERIFY(done);
    QVERIFY(!scene.slider->nubsieExists(1));
}

void TestMultiNubsieGestures::aSliderDeletedInASlot_data()
{
    aHandleRemovedInASlotOfItsOwn_data();
    QTest::newRow("queued") << QStringLiteral("queued");
}

void TestMultiNubsieGestures::aSliderDeletedInASlot()
{
    QFETCH(QString, moment);
    Scene scene;
    scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfResetOnRelease | Nubsie::enfLongClick | Nubsie::enfStepOnClick);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    const QPointer<MultiNubsieSlider> slider(scene.slider);
    scene.journal.action = [&](const QString& line) {
        if (line.startsWith(moment)) {
            delete slider.data();
        }
    };
    everyGesture(scene, slider);
    QVERIFY(!slider);
    // The handles went with it.
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(scene.host.findChildren<Nubsie*>().isEmpty());
}

void TestMultiNubsieGestures::toolTipsOfHandles()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    const auto ask = [&](const QPoint& point) {
        QHelpEvent help(QEvent::ToolTip, point, scene.slider->mapToGlobal(point));
        return scene.slider->handleEvent(&help);
    };
    QToolTip::hideText();
    ask(middle);
    QVERIFY(!QToolTip::isVisible());
    scene.slider->setToolTipText(1, QStringLiteral("Now"));
    ask(middle);
    QCOMPARE(QToolTip::text(), QStringLiteral("Now"));
    QToolTip::hideText();
    ask(QPoint(20, 17));
    QTRY_VERIFY(!QToolTip::isVisible());

    scene.slider->showFlags(true);
    qobject_cast<QWidget*>(scene.slider->getFirstFlag())->setGeometry(10, 0, 20, 20);
    ask(QPoint(20, 17));
    QCOMPARE(QToolTip::text(), QStringLiteral("Time range to export"));
    QToolTip::hideText();
    QTRY_VERIFY(!QToolTip::isVisible());
}

void TestMultiNubsieGestures::eventsOfAnotherWidgetDriveTheSlider()
{
    Scene scene;
    scene.add(1, 100);
    QWidget pad(&scene.host);
    pad.setGeometry(100, 20, 220, 40);
    pad.installEventFilter(scene.slider);
    scene.journal.listen(scene.slider, 1);
    scene.show();
    Pointer pointer(&pad);
    // Positions are taken as they stand.
    pointer.move(middle);
    pointer.press();
    QVERIFY(scene.slider->nubsieGrabbed(1));
    pointer.move(QPoint(129, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 100", "drag 119", "changed 1 119", "release 119 at 129,17", "ended 1"}));
    scene.journal.lines.clear();
    pointer.wait(1000);
    pointer.click(QPoint(128, 17));
    pointer.press();
    pointer.release();
    QCOMPARE(scene.journal.lines,
        list({"started 1", "press 119", "click 119", "doubleClick 119", "click 119", "ended 1"}));
}

void TestMultiNubsieGestures::thePointerFadesTheSlider()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    Pointer pointer(scene.slider);
    QCOMPARE(scene.slider->getOpacity(), 1.0);
    scene.slider->setFeatures(MultiNubsieSlider::emfFadeWhenInactive);
    QTRY_COMPARE(scene.slider->getOpacity(), MultiNubsieSlider::s_OpacityFadeValue);
    pointer.move(QPoint(30, 17));
    QTRY_COMPARE(scene.slider->getOpacity(), 1.0);
    // Going, it starts from full opacity.
    pointer.move(QPoint(-30, -30));
    QTRY_VERIFY(scene.slider->getOpacity() < 1.0);
    scene.slider->setFeatures(MultiNubsieSlider::emfDirectMapping);
    const double left = scene.slider->getOpacity();
    pointer.move(QPoint(30, 17));
    QCoreApplication::processEvents();
    QCOMPARE(scene.slider->getOpacity(), left);
}

ZELKOV_TEST_MAIN(TestMultiNubsieGestures)
#include "tst_multinubsiegestures.moc"
