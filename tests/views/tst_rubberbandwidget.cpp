// SPDX-License-Identifier: MIT
// The rubber band: its geometry, its drags, its signals and its looks.
#include "ZelkovUtils/LinearCoordinateSystem.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/RubberBandWidget.h"

#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include <limits>

using vx::CoordinateSystem;
using vx::RubberBandWidget;
using zelkovtest::SignalRecorder;

namespace
{
QString word(const char* text)
{
    return QString::fromLatin1(text);
}

/// Lets a test call what is protected and see which of the virtual functions were asked.
class OpenBand : public RubberBandWidget
{
public:
    using RubberBandWidget::RubberBandWidget;
    using RubberBandWidget::calcDrag;

    void setContentsGeometry(const QRect& rect) override
    {
        asked << word("setContentsGeometry");
        RubberBandWidget::setContentsGeometry(rect);
    }
    void startDragging(QPoint position, Grip grip) override
    {
        asked << word("startDragging");
        RubberBandWidget::startDragging(position, grip);
    }
    QStringList asked;

protected:
    void drawFrame(QPainter* painter) override
    {
        asked << word("drawFrame");
        RubberBandWidget::drawFrame(painter);
    }
    void drawContents(QPainter* painter) override
    {
        asked << word("drawContents");
        RubberBandWidget::drawContents(painter);
    }
};

/// A view of 500 by 250 pixels that shows 1000 by 500 units, and a band over (100, 50) to (199, 124) pixels.
struct Scene
{
    Scene()
        : system(QRectF(0, 0, 1000, 500), &view)
    {
        view.resize(500, 250);
        view.setFocusPolicy(Qt::StrongFocus);
        view.setFocus();
        band = new OpenBand(&system, &view);
        band->setApplicationGeometry(QRectF(200, 100, 200, 150));
        view.show();
        (void)QTest::qWaitForWindowExposed(&view);
        band->asked.clear();
    }

    void send(QEvent::Type type, const QPoint& inView, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
        Qt::MouseButton button = Qt::LeftButton)
    {
        const bool isMove = type == QEvent::MouseMove;
        const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : button;
        QMouseEvent event(type, band->mapFrom(&view, inView), view.mapToGlobal(inView),
            isMove ? Qt::NoButton : button, buttons, modifiers);
        QApplication::sendEvent(band, &event);
    }

    void drag(const QPoint& from, const QPoint& to, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        send(QEvent::MouseButtonPress, from, modifiers);
        send(QEvent::MouseMove, to, modifiers);
        send(QEvent::MouseButtonRelease, to, modifiers);
    }

    QWidget view;
    vx::LinearCoordinateSystem system;
    OpenBand* band;
};

const QPoint c_Inside(150, 90);
const QPoint c_BottomRight(199, 124);
}

class TestRubberBandWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theMetaTypeIsKnownFromTheStart();
    void theNumbersOfTheGripsStand();
    void aNewBandIsSetUpAsTold();
    void itIsFourPixelsLargerOnEachSide();
    void theApplicationGeometryIsShownThroughTheSystem();
    void aRatioIsKeptUntilAnotherIsSet();
    void anotherSystemShowsTheBandAnew();
    void withoutASystemNothingIsShownAnew();

    void theWidgetsGripCountsItsMarginAndItsPen_data();
    void theWidgetsGripCountsItsMarginAndItsPen();
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

    void enterAndLeaveAreReported();
    void focusRaisesAndIsReported();
    void selectingReportsChangesOnly();
    void theCloseButtonReportsAndDoesNothing();
    void anEmptyLabelIsHidden();
    void theLabelDoesNotStandInTheWay();

    void theFrameIsDrawnInsideTheMarkedArea();
    void theFrameOfASelectedBandIsTwiceAsWide();
    void contentsComeBeforeTheFrame();
    void theTransparencyIsCutToAWholeAlpha_data();
    void theTransparencyIsCutToAWholeAlpha();
    void oneColourForBoth();
    void penWordsChangeOnlyThemselves();
    void aSlotMayDeleteTheBandAtAnyTime_data();
    void aSlotMayDeleteTheBandAtAnyTime();
    void clientsMayQueueTheSignals();
};

// Before anything names the type.
static const int s_typeAtStart = QMetaType::type("vx::RubberBandWidget*");

void TestRubberBandWidget::theMetaTypeIsKnownFromTheStart()
{
    QVERIFY(s_typeAtStart != QMetaType::UnknownType);
    QVERIFY(QMetaType(s_typeAtStart).flags().testFlag(QMetaType::PointerToQObject));
    QCOMPARE(QMetaType::metaObjectForType(s_typeAtStart), &RubberBandWidget::staticMetaObject);
}

void TestRubberBandWidget::theNumbersOfTheGripsStand()
{
    QCOMPARE(int(RubberBandWidget::gNone), 0);
    QCOMPARE(int(RubberBandWidget::gLeft), 1);
    QCOMPARE(int(RubberBandWidget::gRight), 4);
    QCOMPARE(int(RubberBandWidget::gTop), 16);
    QCOMPARE(int(RubberBandWidget::gTopLeft), 17);
    QCOMPARE(int(RubberBandWidget::gTopRight), 20);
    QCOMPARE(int(RubberBandWidget::gInside), 34);
    QCOMPARE(int(RubberBandWidget::gBottom), 64);
    QCOMPARE(int(RubberBandWidget::gBottomLeft), 65);
    QCOMPARE(int(RubberBandWidget::gBottomRight), 68);
}

void TestRubberBandWidget::aNewBandIsSetUpAsTold()
{
    RubberBandWidget band(nullptr);
    QVERIFY(band.hasMouseTracking());
    QCOMPARE(band.focusPolicy(), Qt::StrongFocus);
    QCOMPARE(band.cursor().shape(), Qt::OpenHandCursor);
    QCOMPARE(band.minimumSize(), QSize(1, 1));
    QVERIFY(!band.isSelected());
    QVERIFY(!band.isResizeDragging());
    QVERIFY(band.applicationGeometry().isNull());
    QCOMPARE(band.framePen().style(), Qt::SolidLine);
    QCOMPARE(band.framePen().color(), QColor(Qt::black));
    QCOMPARE(band.framePen().width(), 1);
    QVERIFY(band.label().isEmpty());

    const auto* button = band.findChild<QPushButton*>();
    QVERIFY(button);
    QCOMPARE(button->text(), word("x"));
    QVERIFY(button->isFlat());
    QCOMPARE(button->maximumSize(), QSize(16, 16));
    QCOMPARE(button->cursor().shape(), Qt::ArrowCursor);
    QCOMPARE(button->focusPolicy(), Qt::NoFocus);
    auto* label = band.findChild<QLabel*>();
    QVERIFY(label && label->isHidden());
    const auto* grid = qobject_cast<QGridLayout*>(band.layout());
    QVERIFY(grid);
    QCOMPARE(grid->itemAtPosition(0, 0)->widget(), label);
    QCOMPARE(grid->itemAtPosition(0, 0)->alignment(), Qt::AlignLeft | Qt::AlignTop);
    QCOMPARE(grid->itemAtPosition(0, 1)->widget(), button);
    QCOMPARE(grid->itemAtPosition(0, 1)->alignment(), Qt::AlignRight | Qt::AlignTop);
}

void TestRubberBandWidget::itIsFourPixelsLargerOnEachSide()
{
    Scene scene;
    scene.band->setContentsGeometry(QRect(20, 30, 40, 50));
    QCOMPARE(scene.band->geometry(), QRect(16, 26, 48, 58));
    QCOMPARE(scene.band->contentsGeometry(), QRect(20, 30, 40, 50));
    QCOMPARE(scene.band->contentsRect(), QRect(4, 4, 40, 50));
    QCOMPARE(scene.band->frameRect(), QRect(4, 4, 40, 50));
    // Showing it somewhere does not edit it.
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 200, 150));
}

void TestRubberBandWidget::theApplicationGeometryIsShownThroughTheSystem()
{
    Scene scene;
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
    scene.band->setApplicationGeometry(QRectF(0, 0, 1000, 500));
    QCOMPARE(scene.band->contentsGeometry(), QRect(0, 0, 500, 250));
    QCOMPARE(scene.band->asked, QStringList{word("setContentsGeometry")});
    QCOMPARE(scene.band->applicationGeometry(), QRectF(0, 0, 1000, 500));
}

void TestRubberBandWidget::aRatioIsKeptUntilAnotherIsSet()
{
    Scene scene;
    scene.band->setApplicationGeometry(QRectF(200, 100, 200, 100), 2.0);
    // IGNORE_ASPECT_RATIO leaves it.
    scene.band->setApplicationGeometry(QRectF(200, 100, 200, 100));
    scene.drag(QPoint(199, 99), QPoint(249, 99));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 300, 150));
    scene.band->setAspectRatio(CoordinateSystem::IGNORE_ASPECT_RATIO);
    scene.band->setApplicationGeometry(QRectF(200, 100, 200, 100));
    scene.drag(QPoint(199, 99), QPoint(249, 99));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 300, 100));
}

void TestRubberBandWidget::anotherSystemShowsTheBandAnew()
{
    Scene scene;
    vx::LinearCoordinateSystem half(QRectF(0, 0, 2000, 1000), &scene.view);
    scene.band->setCoordinateSystem(&half);
    QCOMPARE(scene.band->contentsGeometry(), QRect(50, 25, 50, 38));
    // A band that has no geometry yet is left where it is.
    RubberBandWidget bare(nullptr, &scene.view);
    bare.setContentsGeometry(QRect(7, 8, 30, 40));
    bare.setCoordinateSystem(&half);
    QCOMPARE(bare.contentsGeometry(), QRect(7, 8, 30, 40));
}

void TestRubberBandWidget::withoutASystemNothingIsShownAnew()
{
    Scene scene;
    scene.band->setCoordinateSystem(nullptr);
    scene.band->setApplicationGeometry(QRectF(0, 0, 10, 10));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
    scene.drag(c_Inside, c_Inside + QPoint(20, 20));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
}

void TestRubberBandWidget::theWidgetsGripCountsItsMarginAndItsPen_data()
{
    QTest::addColumn<int>("penWidth");
    QTest::addColumn<QPoint>("point");
    QTest::addColumn<int>("grip");
    // The widget is 108 by 83 pixels; the bands are 4 and the pen's width wide.
    QTest::newRow("left end of the left band") << 1 << QPoint(0, 40) << 1;
    QTest::newRow("right end of the left band") << 1 << QPoint(5, 40) << 1;
    QTest::newRow("past it") << 1 << QPoint(6, 40) << 34;
    QTest::newRow("past it with a wide pen") << 6 << QPoint(10, 40) << 1;
    QTest::newRow("past that") << 6 << QPoint(11, 40) << 34;
    QTest::newRow("just inside the right band") << 1 << QPoint(102, 40) << 4;
    QTest::newRow("just outside of it") << 1 << QPoint(101, 40) << 34;
    QTest::newRow("the corner") << 1 << QPoint(107, 82) << 68;
    QTest::newRow("outside, within reach") << 1 << QPoint(112, 87) << 68;
    QTest::newRow("outside, out of reach") << 1 << QPoint(113, 87) << 0;
}

void TestRubberBandWidget::theWidgetsGripCountsItsMarginAndItsPen()
{
    QFETCH(int, penWidth);
    QFETCH(QPoint, point);
    Scene scene;
    scene.band->setFrameWidth(penWidth);
    QTEST(int(scene.band->findGrip(point)), "grip");
}

void TestRubberBandWidget::hoveringFindsTheGripAndItsCursor_data()
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

void TestRubberBandWidget::hoveringFindsTheGripAndItsCursor()
{
    QFETCH(QPoint, point);
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.send(QEvent::MouseMove, point, Qt::NoModifier, Qt::NoButton);
    QTEST(int(scene.band->cursor().shape()), "cursor");
    QTEST(scene.band->isResizeDragging(), "resizes");
    QCOMPARE(recorder.names(), QStringList());
}

void TestRubberBandWidget::resizeDraggingIsAnyEdgeButNotTheInside()
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

void TestRubberBandWidget::aDragEmitsStartEveryMoveAndEnd()
{
    Scene scene;
    zelkovtest::Pointer pointer(&scene.view);
    pointer.move(c_Inside);
    SignalRecorder recorder(scene.band);
    pointer.press();
    QCOMPARE(recorder.names(), (QStringList{word("focused"), word("startDrag")}));
    QCOMPARE(scene.band->cursor().shape(), Qt::ClosedHandCursor);
    recorder.clear();
    pointer.move(c_Inside + QPoint(10, 5));
    pointer.move(c_Inside + QPoint(20, 15));
    QCOMPARE(recorder.names(), (QStringList{word("dragging"), word("dragging")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(120, 65, 100, 75));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(240, 130, 200, 150));
    recorder.clear();
    pointer.release();
    QCOMPARE(recorder.names(), QStringList{word("endDrag")});
    QCOMPARE(recorder.entries().first().arguments.first().value<RubberBandWidget*>(), scene.band);
    QCOMPARE(scene.band->cursor().shape(), Qt::OpenHandCursor);
    // The drag is over: a further move is hovering.
    recorder.clear();
    pointer.move(c_Inside + QPoint(25, 15));
    QCOMPARE(recorder.names(), QStringList());
    QCOMPARE(scene.band->contentsGeometry(), QRect(120, 65, 100, 75));
}

void TestRubberBandWidget::aPressWithoutAMoveIsADragToo()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.send(QEvent::MouseButtonPress, c_Inside, Qt::NoModifier, Qt::RightButton);
    scene.send(QEvent::MouseButtonRelease, c_Inside, Qt::NoModifier, Qt::RightButton);
    QCOMPARE(recorder.names(), (QStringList{word("startDrag"), word("endDrag")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
}

void TestRubberBandWidget::everyGripDragsItsSides_data()
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

void TestRubberBandWidget::everyGripDragsItsSides()
{
    QFETCH(QPoint, press);
    QFETCH(QRect, result);
    Scene scene;
    scene.drag(press, press + QPoint(10, 6));
    QCOMPARE(scene.band->contentsGeometry(), result);
    const QRectF units(result.x() * 2, result.y() * 2, result.width() * 2, result.height() * 2);
    QCOMPARE(scene.band->applicationGeometry(), units);
}

void TestRubberBandWidget::aDragIsMeasuredFromThePress()
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

void TestRubberBandWidget::aFlippedBandComesBackAsItWas()
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

void TestRubberBandWidget::shiftKeepsTheProportions()
{
    Scene scene;
    scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5), Qt::ShiftModifier);
    // 200 x 150 units, the width doubled.
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 300));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 150));
}

void TestRubberBandWidget::shiftCanBeTakenInMidDrag()
{
    Scene scene;
    scene.send(QEvent::MouseButtonPress, c_BottomRight);
    scene.send(QEvent::MouseMove, c_BottomRight + QPoint(100, 5), Qt::ShiftModifier);
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 150));
    scene.send(QEvent::MouseMove, c_BottomRight + QPoint(100, 5));
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 200, 80));
    scene.send(QEvent::MouseButtonRelease, c_BottomRight + QPoint(100, 5));
}

void TestRubberBandWidget::aStoredRatioMakesShiftMeaningless()
{
    for (const auto modifiers : {Qt::NoModifier, Qt::ShiftModifier}) {
        Scene scene;
        scene.band->setAspectRatio(1.0);
        scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5), modifiers);
        QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 400));
    }
}

void TestRubberBandWidget::theCalculatedRatioCanBeStored()
{
    Scene scene;
    scene.band->setAspectRatio(CoordinateSystem::CALC_ASPECT_RATIO);
    scene.drag(c_BottomRight, c_BottomRight + QPoint(100, 5));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 300));
}

void TestRubberBandWidget::aDragFromTheProgramIsLikeAPress()
{
    Scene scene;
    scene.band->setApplicationGeometry(QRectF(20, 20, 2, 2));
    SignalRecorder recorder(scene.band);
    scene.band->startDragging(scene.view.mapToGlobal(QPoint(10, 10)), RubberBandWidget::gBottomRight);
    scene.send(QEvent::MouseMove, QPoint(60, 40));
    scene.send(QEvent::MouseButtonRelease, QPoint(60, 40));
    QCOMPARE(recorder.names(), (QStringList{word("startDrag"), word("dragging"), word("endDrag")}));
    QCOMPARE(scene.band->contentsGeometry(), QRect(10, 10, 51, 31));
}

void TestRubberBandWidget::gripZeroMovesNothingAndStillReports()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.band->startDragging(scene.view.mapToGlobal(c_Inside), RubberBandWidget::gNone);
    scene.band->asked.clear();
    scene.send(QEvent::MouseMove, c_Inside + QPoint(30, 30));
    QCOMPARE(recorder.names(), (QStringList{word("startDrag"), word("dragging")}));
    QCOMPARE(scene.band->asked, QStringList{word("setContentsGeometry")});
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 100, 75));
    scene.send(QEvent::MouseButtonRelease, c_Inside);
}

void TestRubberBandWidget::thePressRaisesTheBand()
{
    Scene scene;
    auto* other = new QWidget(&scene.view);
    other->show();
    QVERIFY(scene.view.children().last() == other);
    scene.send(QEvent::MouseButtonPress, c_Inside);
    QVERIFY(scene.view.children().last() == scene.band);
    scene.send(QEvent::MouseButtonRelease, c_Inside);
}

void TestRubberBandWidget::aLeaveForgetsTheGrip()
{
    Scene scene;
    scene.send(QEvent::MouseMove, c_BottomRight, Qt::NoModifier, Qt::NoButton);
    QVERIFY(scene.band->isResizeDragging());
    QEvent leave(QEvent::Leave);
    QApplication::sendEvent(scene.band, &leave);
    QVERIFY(!scene.band->isResizeDragging());
    QCOMPARE(scene.band->cursor().shape(), Qt::OpenHandCursor);
}

void TestRubberBandWidget::enterAndLeaveAreReported()
{
    Scene scene;
    zelkovtest::Pointer pointer(&scene.view);
    SignalRecorder recorder(scene.band);
    pointer.move(c_Inside);
    QCOMPARE(recorder.names(), QStringList{word("mouseEntered")});
    pointer.move(QPoint(10, 10));
    QCOMPARE(recorder.names(), (QStringList{word("mouseEntered"), word("mouseLeft")}));
}

void TestRubberBandWidget::focusRaisesAndIsReported()
{
    Scene scene;
    auto* other = new QWidget(&scene.view);
    other->setFocusPolicy(Qt::StrongFocus);
    other->show();
    QApplication::setActiveWindow(&scene.view);
    SignalRecorder recorder(scene.band);
    scene.band->setFocus();
    QCOMPARE(recorder.names(), QStringList{word("focused")});
    QVERIFY(scene.view.children().last() == scene.band);
    other->setFocus();
    QCOMPARE(recorder.names(), (QStringList{word("focused"), word("focusLost")}));
}

void TestRubberBandWidget::selectingReportsChangesOnly()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    scene.band->select(false);
    QCOMPARE(recorder.names(), QStringList());
    scene.band->select(true);
    scene.band->select(true);
    QVERIFY(scene.band->isSelected());
    QCOMPARE(recorder.names(), QStringList{word("selected")});
    scene.band->select(false);
    scene.band->select(false);
    QCOMPARE(recorder.names(), (QStringList{word("selected"), word("selectionLost")}));
}

void TestRubberBandWidget::theCloseButtonReportsAndDoesNothing()
{
    Scene scene;
    SignalRecorder recorder(scene.band);
    QTest::mouseClick(scene.band->findChild<QPushButton*>(), Qt::LeftButton);
    QCOMPARE(recorder.count(word("closeClicked")), 1);
    QCOMPARE(recorder.count(word("startDrag")), 0);
    QVERIFY(scene.band->isVisible());
}

void TestRubberBandWidget::anEmptyLabelIsHidden()
{
    Scene scene;
    auto* label = scene.band->findChild<QLabel*>();
    scene.band->setLabel(word("Door"));
    QCOMPARE(scene.band->label(), word("Door"));
    QVERIFY(label->isVisible());
    scene.band->setLabel(QString());
    QVERIFY(label->isHidden());
}

void TestRubberBandWidget::theLabelDoesNotStandInTheWay()
{
    Scene scene;
    scene.band->setLabel(word("Door"));
    auto* label = scene.band->findChild<QLabel*>();
    QVERIFY(!label->autoFillBackground());
    QVERIFY(!label->hasMouseTracking());
    QCoreApplication::processEvents();
    zelkovtest::Pointer pointer(&scene.view);
    const QPoint onLabel = label->mapTo(&scene.view, label->rect().center());
    SignalRecorder recorder(scene.band);
    pointer.move(onLabel);
    pointer.press();
    pointer.move(onLabel + QPoint(10, 10));
    pointer.release();
    QVERIFY(recorder.names().contains(word("dragging")));
    QCOMPARE(scene.band->contentsGeometry(), QRect(110, 60, 100, 75));
}

void TestRubberBandWidget::theFrameIsDrawnInsideTheMarkedArea()
{
    Scene scene;
    scene.view.setStyleSheet(word("background: white"));
    scene.band->setBackgroundColor(QColor(0, 0, 255));
    scene.band->findChild<QPushButton*>()->hide();
    for (const int width : {1, 2, 3}) {
        scene.band->setFrameWidth(width);
        scene.band->setFrameColor(Qt::red);
        QImage image(scene.band->size(), QImage::Format_ARGB32);
        image.fill(Qt::white);
        scene.band->render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
        const QRect area = scene.band->contentsRect();
        const int y = area.center().y();
        QCOMPARE(image.pixelColor(area.left() - 1, y), QColor(Qt::white));
        QCOMPARE(image.pixelColor(area.right() + 1, y), QColor(Qt::white));
        for (int i = 0; i < width; ++i) {
            QCOMPARE(image.pixelColor(area.left() + i, y), QColor(Qt::red));
            QCOMPARE(image.pixelColor(area.right() - i, y), QColor(Qt::red));
            QCOMPARE(image.pixelColor(area.center().x(), area.top() + i), QColor(Qt::red));
            QCOMPARE(image.pixelColor(area.center().x(), area.bottom() - i), QColor(Qt::red));
        }
        QCOMPARE(image.pixelColor(area.left() + width, y), QColor(Qt::blue));
        QCOMPARE(image.pixelColor(area.right() - width, y), QColor(Qt::blue));
    }
}

void TestRubberBandWidget::theFrameOfASelectedBandIsTwiceAsWide()
{
    Scene scene;
    scene.band->setBackgroundColor(QColor(0, 0, 255));
    scene.band->setFrameColor(Qt::red);
    scene.band->setFrameWidth(2);
    scene.band->select(true);
    const QImage image = scene.band->grab().toImage();
    const QRect area = scene.band->contentsRect();
    QCOMPARE(image.pixelColor(area.left() + 3, area.center().y()), QColor(Qt::red));
    QCOMPARE(image.pixelColor(area.left() + 4, area.center().y()), QColor(Qt::blue));
    // Only what is drawn; the pen and the grips stay.
    QCOMPARE(scene.band->framePen().width(), 2);
}

void TestRubberBandWidget::contentsComeBeforeTheFrame()
{
    Scene scene;
    QCoreApplication::processEvents();
    scene.band->asked.clear();
    scene.band->repaint();
    QCOMPARE(scene.band->asked, (QStringList{word("drawContents"), word("drawFrame")}));
}

void TestRubberBandWidget::theTransparencyIsCutToAWholeAlpha_data()
{
    QTest::addColumn<float>("transparency");
    QTest::addColumn<int>("alpha");
    QTest::newRow("none") << 0.0F << 0;
    QTest::newRow("a tenth") << 0.1F << 25;
    QTest::newRow("half") << 0.5F << 127;
    QTest::newRow("nearly full") << 0.999F << 254;
    QTest::newRow("full") << 1.0F << 255;
    QTest::newRow("too much") << 7.0F << 255;
    QTest::newRow("too little") << -1.0F << 0;
    QTest::newRow("no number") << std::numeric_limits<float>::quiet_NaN() << 0;
}

void TestRubberBandWidget::theTransparencyIsCutToAWholeAlpha()
{
    QFETCH(float, transparency);
    QFETCH(int, alpha);
    Scene scene;
    scene.band->setBackgroundColor(Qt::black);
    scene.band->setBackgroundTransparency(transparency);
    QImage image(scene.band->size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    scene.band->render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    QCOMPARE(image.pixelColor(scene.band->rect().center()).alpha(), alpha);
}

void TestRubberBandWidget::oneColourForBoth()
{
    Scene scene;
    scene.band->setColors(QColor(10, 200, 30), 1.0F);
    QCOMPARE(scene.band->framePen().color(), QColor(10, 200, 30));
    QCOMPARE(scene.band->grab().toImage().pixelColor(scene.band->rect().center()), QColor(10, 200, 30));
}

void TestRubberBandWidget::penWordsChangeOnlyThemselves()
{
    Scene scene;
    const QPen pen(QBrush(Qt::green), 3, Qt::DashLine);
    scene.band->setFramePen(pen);
    QCOMPARE(scene.band->framePen(), pen);
    scene.band->setFrameColor(Qt::yellow);
    scene.band->setFrameStyle(Qt::DotLine);
    scene.band->setFrameWidth(5);
    QCOMPARE(scene.band->framePen().color(), QColor(Qt::yellow));
    QCOMPARE(scene.band->framePen().style(), Qt::DotLine);
    QCOMPARE(scene.band->framePen().width(), 5);
    scene.band->setFrameWidth(-3);
    QCOMPARE(scene.band->framePen().width(), 0);
}

void TestRubberBandWidget::aSlotMayDeleteTheBandAtAnyTime_data()
{
    QTest::addColumn<QByteArray>("signal");
    for (const char* signal : {"startDrag", "dragging", "endDrag", "selected", "closeClicked", "focused"}) {
        QTest::newRow(signal) << QByteArray(signal);
    }
}

void TestRubberBandWidget::aSlotMayDeleteTheBandAtAnyTime()
{
    QFETCH(QByteArray, signal);
    Scene scene;
    const QPointer<OpenBand> band(scene.band);
    const auto die = [&] { delete band; };
    if (signal == "startDrag") {
        connect(band, &RubberBandWidget::startDrag, this, die);
    } else if (signal == "dragging") {
        connect(band, &RubberBandWidget::dragging, this, die);
    } else if (signal == "endDrag") {
        connect(band, &RubberBandWidget::endDrag, this, die);
    } else if (signal == "focused") {
        // Not by a press or setFocus(): with these Qt itself would go on with the dead widget.
        connect(band, &RubberBandWidget::focused, this, die);
        QFocusEvent event(QEvent::FocusIn);
        QApplication::sendEvent(band, &event);
        QVERIFY(!band);
    } else if (signal == "selected") {
        connect(band, &RubberBandWidget::selected, this, die);
        band->select(true);
    } else {
        connect(band, &RubberBandWidget::closeClicked, this, [&] { band->deleteLater(); });
        QTest::mouseClick(band->findChild<QPushButton*>(), Qt::LeftButton);
    }
    if (band) {
        zelkovtest::Pointer pointer(&scene.view);
        pointer.move(c_Inside);
        pointer.press();
        pointer.move(c_Inside + QPoint(3, 3));
        pointer.release();
    }
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(!band);
}

void TestRubberBandWidget::clientsMayQueueTheSignals()
{
    Scene scene;
    RubberBandWidget* seen = nullptr;
    connect(scene.band, &RubberBandWidget::selected, this, [&](RubberBandWidget* band) { seen = band; },
        Qt::QueuedConnection);
    scene.band->select(true);
    QVERIFY(!seen);
    QCoreApplication::processEvents();
    QCOMPARE(seen, scene.band);
}

ZELKOV_TEST_MAIN(TestRubberBandWidget)
#include "tst_rubberbandwidget.moc"
