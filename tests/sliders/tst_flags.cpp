// SPDX-License-Identifier: MIT
// The two flags of a time line: their pictures, sizes and tool tips.
#include "NubsieScene.h"
#include "sliders/MultiNubsieSlider.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLabel>

using vx::MultiNubsieSlider;
using zelkovtest::SignalRecorder;

namespace
{
QLabel* label(QWidget* flag)
{
    return qobject_cast<QLabel*>(flag);
}

QPixmap pictureOf(QWidget* flag)
{
    return flag->property("pixmap").value<QPixmap>();
}

QImage scaled(const char* name, int side)
{
    return QPixmap(QStringLiteral(":/views/btn_flag_") + QLatin1String(name) + QStringLiteral(".png"))
        .scaled(QSize(side, side), Qt::KeepAspectRatio, Qt::SmoothTransformation)
        .toImage();
}

struct Slider : MultiNubsieSlider
{
    explicit Slider(const QSize& size = QSize(300, 40))
        : MultiNubsieSlider(nullptr, nullptr)
    {
        resize(size);
    }
};
}

class TestFlags : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePicturesAreThere();
    void coloursHaveTheirNumbers();
    void flagsAreLabelsInTheSliderHiddenAtFirst();
    void flagsExplainThemselves();
    void showingConcernsBoth();
    void showingDoesNotPlaceThem();
    void everyColourHasItsPicture_data();
    void everyColourHasItsPicture();
    void aColourOutsideTheTableKeepsThePicture();
    void flagsAreHalfAsHighAsTheSlider();
    void onAVerticalSliderTheWidthCounts();
    void withoutAColourAFlagIsScaledUpFromThreePixels();
    void repeatedScalingScalesWhatWasScaled();
    void aColourOfOneFlagScalesBoth();
    void resizingTheSliderLeavesThemAsTheyAre();
    void aFlagThatIsGoneIsLeftAlone();
    void withOneFlagGoneTheOtherIsNotShown();
    void settingAColourTellsNothing();
};

void TestFlags::thePicturesAreThere()
{
    for (const char* name : {"red1", "red2", "green1", "green2", "gray1", "gray2"}) {
        QVERIFY2(!scaled(name, 20).isNull(), name);
    }
}

void TestFlags::coloursHaveTheirNumbers()
{
    QCOMPARE(int(MultiNubsieSlider::efcRed), 0);
    QCOMPARE(int(MultiNubsieSlider::efcGreen), 1);
    QCOMPARE(int(MultiNubsieSlider::efcGray), 2);
}

void TestFlags::flagsAreLabelsInTheSliderHiddenAtFirst()
{
    Slider slider;
    slider.show();
    QVERIFY(label(slider.getFirstFlag()) != nullptr);
    QVERIFY(label(slider.getSecondFlag()) != nullptr);
    QVERIFY(slider.getFirstFlag() != slider.getSecondFlag());
    QCOMPARE(slider.getFirstFlag()->parentWidget(), &slider);
    QVERIFY(!slider.getFirstFlag()->isVisible());
    QVERIFY(!slider.getSecondFlag()->isVisible());
}

void TestFlags::flagsExplainThemselves()
{
    Slider slider;
    QCOMPARE(slider.getFirstFlag()->toolTip(), QStringLiteral("Export range start marker"));
    QCOMPARE(slider.getSecondFlag()->toolTip(), QStringLiteral("Export range end marker"));
}

void TestFlags::showingConcernsBoth()
{
    Slider slider;
    slider.show();
    slider.showFlags(true);
    QVERIFY(slider.getFirstFlag()->isVisible());
    QVERIFY(slider.getSecondFlag()->isVisible());
    slider.showFlags(false);
    QVERIFY(!slider.getFirstFlag()->isVisible());
    QVERIFY(!slider.getSecondFlag()->isVisible());
}

void TestFlags::showingDoesNotPlaceThem()
{
    Slider slider;
    slider.show();
    slider.getFirstFlag()->setGeometry(30, 5, 20, 20);
    slider.showFlags(true);
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    slider.resize(500, 60);
    QCOMPARE(slider.getFirstFlag()->geometry(), QRect(30, 5, 20, 20));
}

void TestFlags::everyColourHasItsPicture_data()
{
    QTest::addColumn<int>("color");
    QTest::addColumn<QByteArray>("first");
    QTest::addColumn<QByteArray>("second");
    QTest::newRow("red") << 0 << QByteArray("red1") << QByteArray("red2");
    QTest::newRow("green") << 1 << QByteArray("green1") << QByteArray("green2");
    QTest::newRow("gray") << 2 << QByteArray("gray1") << QByteArray("gray2");
}

void TestFlags::everyColourHasItsPicture()
{
    QFETCH(int, color);
    QFETCH(QByteArray, first);
    QFETCH(QByteArray, second);
    Slider slider;
    const auto wanted = static_cast<MultiNubsieSlider::EMultiNubsieSliderFlagColor>(color);
    slider.setFirstFlagColor(wanted);
    slider.setSecondFlagColor(wanted);
    QCOMPARE(slider.getFirstFlagColor(), wanted);
    QCOMPARE(slider.getSecondFlagColor(), wanted);
    QCOMPARE(pictureOf(slider.getFirstFlag()).toImage(), scaled(first, 20));
    QCOMPARE(pictureOf(slider.getSecondFlag()).toImage(), scaled(second, 20));
}

void TestFlags::aColourOutsideTheTableKeepsThePicture()
{
    Slider slider;
    slider.setFirstFlagColor(MultiNubsieSlider::efcGreen);
    const QImage before = pictureOf(slider.getFirstFlag()).toImage();
    for (const int color : {-1, 3}) {
        slider.setFirstFlagColor(static_cast<MultiNubsieSlider::EMultiNubsieSliderFlagColor>(color));
        QCOMPARE(int(slider.getFirstFlagColor()), color);
        QCOMPARE(pictureOf(slider.getFirstFlag()).toImage(), before);
    }
}

void TestFlags::flagsAreHalfAsHighAsTheSlider()
{
    for (const int height : {40, 41}) {
        Slider slider(QSize(300, height));
        slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
        QCOMPARE(pictureOf(slider.getFirstFlag()).size(), QSize(20, 20));
    }
}

void TestFlags::onAVerticalSliderTheWidthCounts()
{
    Slider slider(QSize(50, 300));
    slider.setOrientation(Qt::Vertical);
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    QCOMPARE(pictureOf(slider.getFirstFlag()).size(), QSize(25, 25));
}

void TestFlags::withoutAColourAFlagIsScaledUpFromThreePixels()
{
    Slider slider;
    slider.showFlags(true);
    QCOMPARE(pictureOf(slider.getFirstFlag()).size(), QSize(20, 20));
    QVERIFY(pictureOf(slider.getFirstFlag()).toImage() != scaled("gray1", 20));
    slider.setFirstFlagColor(MultiNubsieSlider::efcGray);
    QCOMPARE(pictureOf(slider.getFirstFlag()).toImage(), scaled("gray1", 20));
}

void TestFlags::repeatedScalingScalesWhatWasScaled()
{
    Slider slider;
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    slider.resize(300, 8);
    slider.showFlags(true);
    slider.resize(300, 40);
    slider.showFlags(true);
    const QImage twice = pictureOf(slider.getFirstFlag()).toImage();
    QCOMPARE(twice.size(), QSize(20, 20));
    QVERIFY(twice != scaled("red1", 20));
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    QCOMPARE(pictureOf(slider.getFirstFlag()).toImage(), scaled("red1", 20));
}

void TestFlags::aColourOfOneFlagScalesBoth()
{
    Slider slider;
    slider.setSecondFlagColor(MultiNubsieSlider::efcRed);
    slider.resize(300, 60);
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    QCOMPARE(pictureOf(slider.getSecondFlag()).size(), QSize(30, 30));
}

void TestFlags::resizingTheSliderLeavesThemAsTheyAre()
{
    Slider slider;
    slider.show();
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    slider.resize(300, 80);
    QCoreApplication::processEvents();
    QCOMPARE(pictureOf(slider.getFirstFlag()).size(), QSize(20, 20));
}

void TestFlags::aFlagThatIsGoneIsLeftAlone()
{
    Slider slider;
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    delete slider.getFirstFlag();
    QVERIFY(slider.getFirstFlag() == nullptr);
    slider.setFirstFlagColor(MultiNubsieSlider::efcGreen);
    QCOMPARE(slider.getFirstFlagColor(), MultiNubsieSlider::efcRed);
    slider.setSecondFlagColor(MultiNubsieSlider::efcGreen);
    QCOMPARE(pictureOf(slider.getSecondFlag()).toImage(), scaled("green2", 20));
    delete slider.getSecondFlag();
    slider.setSecondFlagColor(MultiNubsieSlider::efcRed);
    QCOMPARE(slider.getSecondFlagColor(), MultiNubsieSlider::efcGreen);
    slider.showFlags(true);
}

void TestFlags::withOneFlagGoneTheOtherIsNotShown()
{
    Slider slider;
    slider.show();
    delete slider.getSecondFlag();
    slider.showFlags(true);
    QVERIFY(!slider.getFirstFlag()->isVisible());
}

void TestFlags::settingAColourTellsNothing()
{
    Slider slider;
    SignalRecorder recorder(&slider);
    slider.showFlags(true);
    slider.setFirstFlagColor(MultiNubsieSlider::efcRed);
    slider.setSecondFlagColor(MultiNubsieSlider::efcGreen);
    QVERIFY(recorder.entries().isEmpty());
}

ZELKOV_TEST_MAIN(TestFlags)
#include "tst_flags.moc"
