// SPDX-License-Identifier: MIT
// The rubber band: its geometry, its signals and its looks.
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

// Before anything names the type.
static const int s_typeAtStart = QMetaType::type("vx::RubberBandWidget*");

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
    QCOMPARE(scene.band->asked, QStringList {word("setContentsGeometry")});
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

void TestRubberBandWidget::enterAndLeaveAreReported()
{
    Scene scene;
    zelkovtest::Pointer pointer(&scene.view);
    SignalRecorder recorder(scene.band);
    pointer.move(c_Inside);
    QCOMPARE(recorder.names(), QStringList {word("mouseEntered")});
    pointer.move(QPoint(10, 10));
    QCOMPARE(recorder.names(), (QStringList {word("mouseEntered"), word("mouseLeft")}));
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
    QCOMPARE(recorder.names(), QStringList {word("focused")});
    QVERIFY(scene.view.children().last() == scene.band);
    other->setFocus();
    QCOMPARE(recorder.names(), (QStringList {word("focused"), word("focusLost")}));
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
    QCOMPARE(recorder.names(), QStringList {word("selected")});
    scene.band->select(false);
    scene.band->select(false);
    QCOMPARE(recorder.names(), (QStringList {word("selected"), word("selectionLost")}));
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
    QCOMPARE(scene.band->asked, (QStringList {word("drawContents"), word("drawFrame")}));
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
    connect(
        scene.band, &RubberBandWidget::selected, this, [&](RubberBandWidget* band) { seen = band; },
        Qt::QueuedConnection);
    scene.band->select(true);
    QVERIFY(!seen);
    QCoreApplication::processEvents();
    QCOMPARE(seen, scene.band);
}

ZELKOV_TEST_MAIN(TestRubberBandWidget)
#include "tst_rubberbandwidget.moc"
