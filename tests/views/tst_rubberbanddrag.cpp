// SPDX-License-Identifier: MIT
// The rubber band under the pointer: grips, drags, proportions, flips.
#include "BandScene.h"
#include "support/TestMain.h"

using bandscene::c_BottomRight;
using bandscene::c_Inside;
using bandscene::OpenBand;
using bandscene::Scene;
using bandscene::word;

using vx::CoordinateSystem;
using vx::RubberBandWidget;
using zelkovtest::SignalRecorder;

class TestRubberBandDrag : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hoveringFindsTheGripAndItsCursor_data();
    void hoveringFindsTheGripAndItsCursor();
    void resizeDraggingIsAnyEdgeButNotTheInside();
    void aDragEmitsStartEveryMoveAndEnd();
    void aPressWithoutAMoveIsADragToo();
    void everyGripDragsItsSides_data();
    void everyGripDragsItsSides();
    void aDragIsMeasuredFromThePress();
    void aFlippedBandComesBackAsItWas();
    void shiftKeepsTheProportions();
    void shiftCanBeTakenInMidDrag();
    void aStoredRatioMakesShiftMeaningless();
    void theCalculatedRatioCanBeStored();
    void aDragFromTheProgramIsLikeAPress();
    void gripZeroMovesNothingAndStillReports();
    void thePressRaisesTheBand();
    void aLeaveForgetsTheGrip();
};

void TestRubberBandDrag::hoveringFindsTheGripAndItsCursor_data()
{
    QTest::addColumn<QPoint>("point");
    QTest::addColumn<int>("cursor");
    QTest::addColumn<bool>("resizes");
    QTest::newRow("left") << QPoint(100, 90) << int(Qt::SizeHorCursor) << true;
    QTest::newRow("top") << QPoint(150, 50) << int(Qt::SizeVerCursor) << true;
    QTest::newRow("bottom right") << c_BottomRight << int(Qt::SizeFDiagCursor) << true;
    QTest::newRow("bottom left") << QPoint(100, 124) << int(Qt::SizeBDiagCursor) << true;
    QTest::newRow("inside") << c_Inside << int(Qt::OpenHandCursor) << false;
}

void TestRubberBandDrag::hoveringFindsTheGripAndItsCursor()
{
    QFETCH(QPoint, point);
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.send(QEvent::MouseMove, point, Qt::NoModifier, Qt::NoButton);
    QTEST(int(scene.band->cursor().shape()), "cursor");
    QTEST(scene.band->isResizeDragging(), "resizes");
    QCOMPARE(recorder.names(), QStringList());
}

void TestRubberBandDrag::resizeDraggingIsAnyEdgeButNotTheInside()
{
    Scene scene;
    for (const int grip : {1, 4, 16, 17, 20, 64, 65, 68}) {
        scene.band->startDragging(QPoint(5, 5), RubberBandWidget::Grip(grip));
        QVERIFY(scene.band->isResizeDragging());
    }
    for (const int grip : {0, 34}) {
        scene.band->startDragging(QPoint(5, 5), RubberBandWidget::Grip(grip));
        QVERIFY(!scene.band->isResizeDragging());
    }
}

void TestRubberBandDrag::aDragEmitsStartEveryMoveAndEnd()
{
    Scene scene;
    zelkovtest::Pointer pointer(&scene.view);
    pointer.move(c_Inside);
    SignalRecorder recorder(scene.band);
    pointer.press();
    QCOMPARE(recorder.names(), (QStringList {word("focused"), word("startDrag")}));
    QCOMPARE(scene.band->cursor().shape(), Qt::ClosedHandCursor);
    recorder.clear();
    pointer.move(c_Inside + QPoint(10, 5));
    pointer.move(c_Inside + QPoint(20, 15));
    QCOMPARE(recorder.names(), (QStringList {word("dragging"), word("dragging")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(120, 65, 100, 75));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(240, 130, 200, 150));
    recorder.clear();
    pointer.release();
    QCOMPARE(recorder.names(), QStringList {word("endDrag")});
    QCOMPARE(recorder.entries().first().arguments.first().value<RubberBandWidget*>(), scene.band);
    QCOMPARE(scene.band->cursor().shape(), Qt::OpenHandCursor);
    // The drag is over: a further move is hovering.
    recorder.clear();
    pointer.move(c_Inside + QPoint(25, 15));
    QCOMPARE(recorder.names(), QStringList());
    QCOMPARE(scene.band->contentsGeometry(), QRect(120, 65, 100, 75));
}

void TestRubberBandDrag::aPressWithoutAMoveIsADragToo()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.send(QEvent::MouseButtonPress, c_Inside, Qt::NoModifier, Qt::RightButton);
    scene.send(QEvent::MouseButtonRelease, c_Inside, Qt::NoModifier, Qt::RightButton);
    QCOMPARE(recorder.names(), (QStringList {word("startDrag"), word("endDrag")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
}

void TestRubberBandDrag::everyGripDragsItsSides_data()
{
    QTest::addColumn<QPoint>("press");
    QTest::addColumn<QRect>("result");
    QTest::newRow("left") << QPoint(100, 90) << QRect(110, 50, 90, 75);
    QTest::newRow("right") << QPoint(199, 90) << QRect(100, 50, 110, 75);
    QTest::newRow("top") << QPoint(150, 50) << QRect(100, 56, 100, 69);
    QTest::newRow("bottom") << QPoint(150, 124) << QRect(100, 50, 100, 81);
    QTest::newRow("top left") << QPoint(100, 50) << QRect(110, 56, 90, 69);
    QTest::newRow("top right") << QPoint(199, 50) << QRect(100, 56, 110, 69);
    QTest::newRow("bottom left") << QPoint(100, 124) << QRect(110, 50, 90, 81);
    QTest::newRow("bottom right") << c_BottomRight << QRect(100, 50, 110, 81);
    QTest::newRow("inside") << c_Inside << QRect(110, 56, 100, 75);
    // Not on the edge, but within its reach: the edge does not jump to the pointer.
    QTest::newRow("beside the right edge") << QPoint(202, 90) << QRect(100, 50, 110, 75);
}

void TestRubberBandDrag::everyGripDragsItsSides()
{
    QFETCH(QPoint, press);
    QFETCH(QRect, result);
    Scene scene;
    scene.drag(press, press + QPoint(10, 6));
    QCOMPARE(scene.band->contentsGeometry(), result);
    const QRectF units(result.x() * 2, result.y() * 2, result.width() * 2, result.height() * 2);
    QCOMPARE(scene.band->applicationGeometry(), units);
}

void TestRubberBandDrag::aDragIsMeasuredFromThePress()
{
    Scene scene;
    // A scale that does not divide: 500 pixels show 333 units.
    scene.system.setApplicationRect(QRectF(0, 0, 333, 777));
    const QRectF before(50.3, 60.7, 100.1, 200.9);
    scene.band->setApplicationGeometry(before);
    const QPoint centre = scene.band->contentsGeometry().center();
    scene.send(QEvent::MouseButtonPress, centre);
    for (int i = 0; i < 500; ++i) {
        scene.send(QEvent::MouseMove, centre + QPoint((i * 37) % 101 - 50, (i * 53) % 67 - 30));
    }
    scene.send(QEvent::MouseMove, centre);
    scene.send(QEvent::MouseButtonRelease, centre);
    QCOMPARE(scene.band->applicationGeometry(), before);
}

void TestRubberBandDrag::aFlippedBandComesBackAsItWas()
{
    Scene scene;
    scene.send(QEvent::MouseButtonPress, c_BottomRight);
    scene.send(QEvent::MouseMove, c_BottomRight - QPoint(150, 100));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(100, 50, 100, 50));
    QCOMPARE(scene.band->contentsGeometry(), QRect(50, 25, 50, 25));
    scene.send(QEvent::MouseMove, c_BottomRight);
    scene.send(QEvent::MouseButtonRelease, c_BottomRight);
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
}

void TestRubberBandDrag::shiftKeepsTheProportions()
{
    Scene scene;
    scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5), Qt::ShiftModifier);
    // 200 x 150 units, the width doubled.
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 300));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 150));
}

void TestRubberBandDrag::shiftCanBeTakenInMidDrag()
{
    Scene scene;
    scene.send(QEvent::MouseButtonPress, c_BottomRight);
    scene.send(QEvent::MouseMove, c_BottomRight + QPoint(100, 5), Qt::ShiftModifier);
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 150));
    scene.send(QEvent::MouseMove, c_BottomRight + QPoint(100, 5));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 80));
    scene.send(QEvent::MouseButtonRelease, c_BottomRight + QPoint(100, 5));
}

void TestRubberBandDrag::aStoredRatioMakesShiftMeaningless()
{
    for (const auto modifiers : {Qt::NoModifier, Qt::ShiftModifier}) {
        Scene scene;
        scene.band->setAspectRatio(1.0);
        scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5), modifiers);
        QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 400));
    }
}

void TestRubberBandDrag::theCalculatedRatioCanBeStored()
{
    Scene scene;
    scene.band->setAspectRatio(CoordinateSystem::CALC_ASPECT_RATIO);
    scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 300));
}

void TestRubberBandDrag::aDragFromTheProgramIsLikeAPress()
{
    Scene scene;
    scene.band->setApplicationGeometry(QRectF(20, 20, 2, 2));
    SignalRecorder recorder(scene.band);
    scene.band->startDragging(scene.view.mapToGlobal(QPoint(10, 10)), RubberBandWidget::gBottomRight);
    scene.send(QEvent::MouseMove, QPoint(60, 40));
    scene.send(QEvent::MouseButtonRelease, QPoint(60, 40));
    QCOMPARE(recorder.names(), (QStringList {word("startDrag"), word("dragging"), word("endDrag")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(10, 10, 51, 31));
}

void TestRubberBandDrag::gripZeroMovesNothingAndStillReports()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.band->startDragging(scene.view.mapToGlobal(c_Inside), RubberBandWidget::gNone);
    scene.band->asked.clear();
    scene.send(QEvent::MouseMove, c_Inside + QPoint(30, 30));
    QCOMPARE(recorder.names(), (QStringList {word("startDrag"), word("dragging")}));
    QCOMPARE(scene.band->asked, QStringList {word("setContentsGeometry")});
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
    scene.send(QEvent::MouseButtonRelease, c_Inside);
}

void TestRubberBandDrag::thePressRaisesTheBand()
{
    Scene scene;
    auto* other = new QWidget(&scene.view);
    other->show();
    QVERIFY(scene.view.children().last() == other);
    scene.send(QEvent::MouseButtonPress, c_Inside);
    QVERIFY(scene.view.children().last() == scene.band);
    scene.send(QEvent::MouseButtonRelease, c_Inside);
}

void TestRubberBandDrag::aLeaveForgetsTheGrip()
{
    Scene scene;
    scene.send(QEvent::MouseMove, c_BottomRight, Qt::NoModifier, Qt::NoButton);
    QVERIFY(scene.band->isResizeDragging());
    QEvent leave(QEvent::Leave);
    QApplication::sendEvent(scene.band, &leave);
    QVERIFY(!scene.band->isResizeDragging());
    QCOMPARE(scene.band->cursor().shape(), Qt::OpenHandCursor);
}

ZELKOV_TEST_MAIN(TestRubberBandDrag)
#include "tst_rubberbanddrag.moc"
