// SPDX-License-Identifier: MIT
// What a time line paints itself, and how its handles are seen with it.
#include "NubsieScene.h"
#include "sliders/MultiNubsieSlider.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>

using nubsietest::isColor;
using nubsietest::picture;
using vx::MultiNubsieSlider;
using vx::Nubsie;

namespace
{
const QColor s_ground(10, 200, 30);
const QColor s_ink(200, 10, 30);

// A window with a slider in it, away from the corner. The slider's colours are known.
struct Scene
{
    explicit Scene(Qt::Orientation orientation = Qt::Horizontal)
    {
        window.resize(500, 400);
        slider = new MultiNubsieSlider(&window, &window);
        slider->setOrientation(orientation);
        slider->setGeometry(orientation == Qt::Horizontal ? QRect(50, 20, 300, 60) : QRect(50, 20, 60, 300));
        QPalette palette;
        palette.setColor(QPalette::Window, s_ground);
        palette.setColor(QPalette::WindowText, s_ink);
        slider->setPalette(palette);
        slider->setSliderBarExtent(12.0);
        slider->addNubsie(QStringLiteral("handle"), 42, 0, 100, 1);
        slider->setStandardSize(1, QSize(20, 20));
        slider->setDraggedSize(1, QSize(30, 30));
        window.show();
        (void)QTest::qWaitForWindowExposed(&window);
        QCoreApplication::processEvents();
    }

    QImage painted()
    {
        QImage image(slider->size(), QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::white);
        slider->render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
        return image;
    }

    // The middle of the handle, in the slider's coordinates.
    QPoint handle() const { return slider->nubsieRect(slider->nubsie(1)).center().toPoint() - slider->pos(); }

    QWidget window;
    MultiNubsieSlider* slider;
};

// The smallest rectangle around all pixels that differ.
QRect difference(const QImage& a, const QImage& b)
{
    QRect result;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            if (a.pixel(x, y) != b.pixel(x, y)) {
                result |= QRect(x, y, 1, 1);
            }
        }
    }
    return result;
}

QSizeF sizeOf(const QString& number)
{
    return QFontMetricsF(QFont()).boundingRect(number).size();
}
}

class TestSliderPainting : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theGroundLeavesTheLastRowAndColumn();
    void withoutATrackThereIsNoBar();
    void theTrackIsTheBar();
    void progressCoversThePartThatIsDone();
    void progressRunsAlongTheWidthOfAVerticalBar();
    void progressWithoutATrackIsNotPainted();
    void progressIsHeldBetweenZeroAndOne();
    void numbersShowOnlyWhileAHandleIsInUse();
    void theNumberOfTheValueIsOffByThePlaceInTheWindow();
    void theNumbersOfTheRangeStandUnderTheEndsOfTheBar();
    void theNumberOfTheValueIsNotTurnedRound();
    void everythingFadesTogether();
    void handlesDoNotFade();
    void aDisabledSliderKeepsItsColours();
    void aStyleSheetPaintsUnderTheGround();
    void whatOnlyStoresDoesNotRepaint();
    void whatIsShownAtOnceRepaints();
    void aHandleOfACoveredSliderIsNotPainted();
    void theWishToShowGoesByTheSlider();
    void aStateDoesNotKeepAHandleFromHidingWithItsSlider();
};

void TestSliderPainting::theGroundLeavesTheLastRowAndColumn()
{
    Scene scene;
    const QImage image = scene.painted();
    QVERIFY(isColor(image, QPoint(0, 0), s_ground));
    QVERIFY(isColor(image, QPoint(298, 58), s_ground));
    QVERIFY(!isColor(image, QPoint(299, 30), s_ground));
    QVERIFY(!isColor(image, QPoint(30, 59), s_ground));
}

void TestSliderPainting::withoutATrackThereIsNoBar()
{
    Scene scene;
    QVERIFY(!scene.slider->getDrawTrack());
    QVERIFY(isColor(scene.painted(), QPoint(100, 27), s_ground));
}

void TestSliderPainting::theTrackIsTheBar()
{
    Scene scene;
    scene.slider->setDrawTrack(true);
    // From 30 - 6 on, half of 12 thick.
    QCOMPARE(scene.slider->sliderBarRect(), QRectF(0, 24, 300, 6));
    const QImage image = scene.painted();
    QVERIFY(isColor(image, QPoint(100, 23), s_ground));
    QVERIFY(isColor(image, QPoint(100, 24), s_ink));
    QVERIFY(isColor(image, QPoint(100, 29), s_ink));
    QVERIFY(isColor(image, QPoint(100, 30), s_ground));
    QVERIFY(isColor(image, QPoint(299, 26), s_ink));
}

void TestSliderPainting::progressCoversThePartThatIsDone()
{
    Scene scene;
    scene.slider->setDrawTrack(true);
    scene.slider->setDrawProgress(true);
    scene.slider->setProgress(0.5);
    QImage image = scene.painted();
    QVERIFY(isColor(image, QPoint(149, 26), Qt::yellow));
    QVERIFY(isColor(image, QPoint(150, 26), s_ink));
    scene.slider->setProgressColor(Qt::blue);
    image = scene.painted();
    QVERIFY(isColor(image, QPoint(0, 24), Qt::blue));
    QVERIFY(isColor(image, QPoint(149, 29), Qt::blue));
}

void TestSliderPainting::progressRunsAlongTheWidthOfAVerticalBar()
{
    Scene scene(Qt::Vertical);
    scene.slider->setDrawTrack(true);
    scene.slider->setDrawProgress(true);
    scene.slider->setProgress(0.5);
    QCOMPARE(scene.slider->sliderBarRect(), QRectF(24, 0, 6, 300));
    const QImage image = scene.painted();
    for (const int y : {0, 150, 298}) {
        QVERIFY(isColor(image, QPoint(24, y), Qt::yellow));
        QVERIFY(isColor(image, QPoint(26, y), Qt::yellow));
        QVERIFY(isColor(image, QPoint(27, y), s_ink));
    }
}

void TestSliderPainting::progressWithoutATrackIsNotPainted()
{
    Scene scene;
    scene.slider->setDrawProgress(true);
    scene.slider->setProgress(1.0);
    QVERIFY(isColor(scene.painted(), QPoint(100, 26), s_ground));
}

void TestSliderPainting::progressIsHeldBetweenZeroAndOne()
{
    Scene scene;
    scene.slider->setProgress(1.5);
    QCOMPARE(scene.slider->getProgress(), 1.0);
    scene.slider->setProgress(-1.0);
    QCOMPARE(scene.slider->getProgress(), 0.0);
}

void TestSliderPainting::numbersShowOnlyWhileAHandleIsInUse()
{
    Scene scene;
    const QImage before = scene.painted();
    scene.slider->setFeatures(
        QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>(MultiNubsieSlider::emfShowRangeLabels)
        | MultiNubsieSlider::emfShowValueLabel);
    QCOMPARE(difference(before, scene.painted()), QRect());
    zelkovtest::Pointer pointer(&scene.window);
    pointer.move(scene.handle() + scene.slider->pos());
    pointer.press();
    QVERIFY(scene.slider->nubsieGrabbed(1));
    QVERIFY(!difference(before, scene.painted()).isNull());
    pointer.move(scene.handle() + scene.slider->pos() + QPoint(40, 0));
    pointer.release();
    QTRY_COMPARE(difference(before, scene.painted()), QRect());
}

void TestSliderPainting::theNumberOfTheValueIsOffByThePlaceInTheWindow()
{
    Scene scene;
    // Room for the number: it is painted far from the handle.
    scene.slider->resize(300, 140);
    QCoreApplication::processEvents();
    const QImage before = scene.painted();
    scene.slider->setFeatures(
        QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>(MultiNubsieSlider::emfShowValueLabel));
    zelkovtest::Pointer pointer(&scene.window);
    pointer.move(scene.handle() + scene.slider->pos());
    pointer.press();
    const QRect found = difference(before, scene.painted());
    const QSizeF text = sizeOf(QStringLiteral("42"));
    const QPointF base = scene.slider->nubsiePos(scene.slider->nubsie(1)) + QPointF(0, text.height() + 20 + 14);
    // The point is in the window's coordinates and used in the slider's.
    QVERIFY(base.x() > scene.handle().x() + 40);
    QVERIFY2(qAbs(found.left() - base.x()) <= 2 && qAbs(found.bottom() + 1 - base.y()) <= 2,
        qPrintable(QStringLiteral("%1,%2 %3x%4")
                       .arg(found.left())
                       .arg(found.top())
                       .arg(found.width())
                       .arg(found.height())));
    pointer.release();
}

void TestSliderPainting::theNumbersOfTheRangeStandUnderTheEndsOfTheBar()
{
    Scene scene;
    const QImage before = scene.painted();
    scene.slider->setFeatures(
        QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>(MultiNubsieSlider::emfShowRangeLabels));
    zelkovtest::Pointer pointer(&scene.window);
    pointer.move(scene.handle() + scene.slider->pos());
    pointer.press();
    const QRect found = difference(before, scene.painted());
    const QRectF bar = scene.slider->sliderBarRect();
    const QSizeF text = sizeOf(QStringLiteral("100"));
    QVERIFY(qAbs(found.left() - bar.left()) <= 2);
    QVERIFY(qAbs(found.right() + 1 - (bar.right() - 4)) <= 3);
    QVERIFY(qAbs(found.bottom() + 1 - (bar.bottom() + 4 + text.height())) <= 2);
    pointer.release();
}

void TestSliderPainting::theNumberOfTheValueIsNotTurnedRound()
{
    QImage plain;
    for (const bool inverted : {false, true}) {
        Scene scene;
        scene.slider->resize(300, 140);
        if (inverted) {
            scene.slider->setFeatures(1, scene.slider->nubsie(1)->features() | Nubsie::enfInverted);
        }
        scene.slider->setFeatures(
            QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>(MultiNubsieSlider::emfShowValueLabel));
        QCoreApplication::processEvents();
        zelkovtest::Pointer pointer(&scene.window);
        pointer.move(scene.handle() + scene.slider->pos());
        pointer.press();
        const QImage image = scene.painted();
        if (inverted) {
            QCOMPARE(difference(plain, image), QRect());
        }
        plain = image;
        pointer.release();
    }
}

void TestSliderPainting::everythingFadesTogether()
{
    Scene scene;
    scene.slider->setDrawTrack(true);
    scene.slider->setOpacity(0.5);
    const QImage image = scene.painted();
    const QColor under = image.pixelColor(299, 59);
    const auto mixed = [](const QColor& a, const QColor& b) {
        return QColor((a.red() + b.red()) / 2, (a.green() + b.green()) / 2, (a.blue() + b.blue()) / 2);
    };
    const QColor ground = mixed(under, s_ground);
    QVERIFY(isColor(image, QPoint(100, 10), ground));
    QVERIFY(isColor(image, QPoint(100, 26), mixed(ground, s_ink)));
    scene.slider->setOpacity(1.0);
    QVERIFY(isColor(scene.painted(), QPoint(100, 26), s_ink));
}

void TestSliderPainting::handlesDoNotFade()
{
    Scene scene;
    scene.slider->setIcon(1, picture(Qt::blue));
    scene.slider->setOpacity(0.1);
    const QImage image = scene.window.grab().toImage();
    QVERIFY(isColor(image, scene.slider->nubsie(1)->geometry().center(), Qt::blue));
}

void TestSliderPainting::aDisabledSliderKeepsItsColours()
{
    Scene scene;
    scene.slider->setPalette(QPalette());
    scene.slider->setDrawTrack(true);
    const QImage before = scene.painted();
    scene.slider->setEnabled(false);
    QCOMPARE(difference(before, scene.painted()), QRect());
    QVERIFY(!scene.slider->nubsie(1)->isEnabled());
}

void TestSliderPainting::aStyleSheetPaintsUnderTheGround()
{
    Scene scene;
    scene.slider->setObjectName(QStringLiteral("timeLine"));
    scene.slider->setStyleSheet(QStringLiteral("#timeLine { border: 3px solid rgb(0, 0, 255); }"));
    // The sheet's border shows where the ground does not reach.
    const QImage image = scene.painted();
    QVERIFY(isColor(image, QPoint(299, 30), Qt::blue));
    QVERIFY(isColor(image, QPoint(150, 59), Qt::blue));
    QVERIFY(!isColor(image, QPoint(0, 30), Qt::blue));
}

void TestSliderPainting::whatOnlyStoresDoesNotRepaint()
{
    struct Counted : MultiNubsieSlider
    {
        Counted()
            : MultiNubsieSlider(nullptr, nullptr)
        {
        }
        void paintEvent(QPaintEvent* event) override
        {
            ++paints;
            MultiNubsieSlider::paintEvent(event);
        }
        int paints = 0;
    } slider;
    slider.resize(300, 40);
    slider.show();
    QVERIFY(QTest::qWaitForWindowExposed(&slider));
    QTRY_VERIFY(slider.paints > 0);
    QCoreApplication::processEvents();
    slider.paints = 0;
    slider.setDrawTrack(true);
    slider.setProgressColor(Qt::blue);
    slider.setOpacity(0.5);
    QCoreApplication::processEvents();
    QCOMPARE(slider.paints, 0);
    slider.setDrawProgress(true);
    QTRY_VERIFY(slider.paints > 0);
    slider.paints = 0;
    slider.setProgress(0.4);
    QTRY_VERIFY(slider.paints > 0);
    slider.paints = 0;
    slider.setSliderBarExtent(8.0);
    QTRY_VERIFY(slider.paints > 0);
}

void TestSliderPainting::whatIsShownAtOnceRepaints()
{
    Scene scene;
    scene.slider->setDrawTrack(true);
    scene.slider->setSliderBarExtent(1.0);
    // At least one pixel, however thin.
    QCOMPARE(scene.slider->sliderBarRect().height(), 1.0);
    QVERIFY(scene.painted().width() == 300);
}

void TestSliderPainting::aHandleOfACoveredSliderIsNotPainted()
{
    Scene scene;
    scene.slider->setIcon(1, picture(Qt::blue));
    QWidget* const handle = scene.slider->nubsie(1);
    QVERIFY(isColor(nubsietest::painted(*handle), QPoint(10, 10), Qt::blue));
    // No part of the slider is seen, though it is visible.
    scene.slider->move(-1000, 20);
    QVERIFY(scene.slider->isVisible());
    QVERIFY(scene.slider->visibleRegion().isEmpty());
    QVERIFY(isColor(nubsietest::painted(*handle), QPoint(10, 10), Qt::white));
    scene.slider->move(50, 20);
    QVERIFY(isColor(nubsietest::painted(*handle), QPoint(10, 10), Qt::blue));
    scene.slider->hide();
    handle->show();
    QVERIFY(isColor(nubsietest::painted(*handle), QPoint(10, 10), Qt::white));
}

void TestSliderPainting::theWishToShowGoesByTheSlider()
{
    Scene scene;
    Nubsie* const handle = scene.slider->nubsie(1);
    handle->setExternallyVisible(false);
    QVERIFY(handle->isVisible());
    handle->hide();
    handle->setExternallyVisible(true);
    QVERIFY(handle->isVisible());
    scene.slider->hide();
    QVERIFY(!handle->isVisible());
    handle->setExternallyVisible(true);
    QVERIFY(!handle->isVisible());
    handle->setExternallyVisible(false);
    scene.slider->show();
    QVERIFY(!handle->isVisible());
}

void TestSliderPainting::aStateDoesNotKeepAHandleFromHidingWithItsSlider()
{
    Scene scene;
    Nubsie* const handle = scene.slider->nubsie(1);
    handle->setState(QFlags<Nubsie::ENubsieState>(QFlag(1)));
    scene.slider->hide();
    QVERIFY(!handle->isVisible());
    scene.slider->show();
    QVERIFY(handle->isVisible());
}

ZELKOV_TEST_MAIN(TestSliderPainting)
#include "tst_sliderpainting.moc"
