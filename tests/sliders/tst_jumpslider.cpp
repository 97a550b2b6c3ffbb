// SPDX-License-Identifier: MIT
// Presses on a slider whose handle jumps to the pointer.
#include "sliders/JumpSlider.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionSlider>

#include <memory>

namespace
{
class Slider : public vx::JumpSlider
{
public:
    explicit Slider(Qt::Orientation orientation, int minimum = 0, int maximum = 100)
        : vx::JumpSlider(orientation)
    {
        setRange(minimum, maximum);
        setAttribute(Qt::WA_DontShowOnScreen);
        resize(orientation == Qt::Horizontal ? QSize(300, 30) : QSize(30, 300));
        show();
    }

    QRect handle() const
    {
        QStyleOptionSlider option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_Slider, &option, QStyle::SC_SliderHandle, this);
    }
};

void send(QWidget* widget, QEvent::Type type, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    const bool held = type != QEvent::MouseButtonRelease;
    QMouseEvent event(type, position, widget->mapToGlobal(position),
        type == QEvent::MouseMove ? Qt::NoButton : button, held ? button : Qt::NoButton, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
}

void press(QWidget* widget, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
{
    send(widget, QEvent::MouseButtonPress, position, button);
}
}

class TestJumpSlider : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theOrientationIsQSlidersOrTheGivenOne();
    void theMetaObjectAddsNothing();
    void aPressAtTheFarEndGivesTheMaximum();
    void aPressNearTheStartGivesTheMinimum();
    void aPressInTheMiddleBringsTheHandleUnderThePointer_data();
    void aPressInTheMiddleBringsTheHandleUnderThePointer();
    void aVerticalSliderHasItsLowEndAtTheBottom();
    void aPressOnTheHandleIsQSliders();
    void theHandleEndsAtItsEdges();
    void otherButtonsDoNotJump_data();
    void otherButtonsDoNotJump();
    void theJumpIsReportedInOrder();
    void theJumpGoesOnAsADrag();
    void theEventIsAccepted();
    void anInvertedSliderFromZeroIsMirrored_data();
    void anInvertedSliderFromZeroIsMirrored();
    void anInvertedSliderThatStartsElsewhereIsOffByItsMinimum();
    void theLayoutDirectionIsNotLookedAt();
    void aSliderWithoutRoomKeepsItsMinimum();
    void aSliderMayBeDeletedByItsOwnSignals_data();
    void aSliderMayBeDeletedByItsOwnSignals();
};

void TestJumpSlider::theOrientationIsQSlidersOrTheGivenOne()
{
    QWidget parent;
    QCOMPARE((new vx::JumpSlider(&parent))->orientation(), Qt::Vertical);
    const auto* horizontal = new vx::JumpSlider(Qt::Horizontal, &parent);
    QCOMPARE(horizontal->orientation(), Qt::Horizontal);
    QCOMPARE(horizontal->parentWidget(), &parent);
    QCOMPARE((new vx::JumpSlider(Qt::Vertical, &parent))->orientation(), Qt::Vertical);
}

void TestJumpSlider::theMetaObjectAddsNothing()
{
    const QMetaObject& meta = vx::JumpSlider::staticMetaObject;
    QCOMPARE(meta.className(), "vx::JumpSlider");
    QCOMPARE(meta.superClass(), &QSlider::staticMetaObject);
    QCOMPARE(meta.methodCount(), QSlider::staticMetaObject.methodCount());
    QCOMPARE(meta.propertyCount(), QSlider::staticMetaObject.propertyCount());
}

void TestJumpSlider::aPressAtTheFarEndGivesTheMaximum()
{
    Slider slider(Qt::Horizontal);
    press(&slider, QPoint(299, 15));
    QCOMPARE(slider.value(), 100);
    slider.setValue(0);
    press(&slider, QPoint(300 - (slider.handle().width() + 1) / 2, 15));
    QCOMPARE(slider.value(), 100);
}

void TestJumpSlider::aPressNearTheStartGivesTheMinimum()
{
    Slider slider(Qt::Horizontal);
    slider.setValue(70);
    press(&slider, QPoint((slider.handle().width() + 1) / 2, 15));
    QCOMPARE(slider.value(), 0);
    slider.setValue(70);
    press(&slider, QPoint(0, 15));
    QCOMPARE(slider.value(), 0);
}

void TestJumpSlider::aPressInTheMiddleBringsTheHandleUnderThePointer_data()
{
    QTest::addColumn<bool>("vertical");
    QTest::addColumn<int>("position");
    for (const bool vertical : {false, true}) {
        for (int position = 12; position < 290; position += 31) {
            QTest::newRow(qPrintable(QStringLiteral("%1 %2").arg(vertical).arg(position))) << vertical << position;
        }
    }
}

void TestJumpSlider::aPressInTheMiddleBringsTheHandleUnderThePointer()
{
    QFETCH(bool, vertical);
    QFETCH(int, position);
    Slider slider(vertical ? Qt::Vertical : Qt::Horizontal, 0, 1000);
    slider.setValue(position < 150 ? (vertical ? 0 : 1000) : (vertical ? 1000 : 0));
    press(&slider, vertical ? QPoint(15, position) : QPoint(position, 15));
    const QPoint centre = slider.handle().center();
    QVERIFY(qAbs((vertical ? centre.y() : centre.x()) - position) <= 1);
    QVERIFY(slider.isSliderDown());
}

void TestJumpSlider::aVerticalSliderHasItsLowEndAtTheBottom()
{
    Slider slider(Qt::Vertical);
    press(&slider, QPoint(15, 0));
    QCOMPARE(slider.value(), 100);
    press(&slider, QPoint(15, 299));
    QCOMPARE(slider.value(), 0);
    press(&slider, QPoint(15, 75));
    QVERIFY(slider.value() > 70 && slider.value() < 80);
}

void TestJumpSlider::aPressOnTheHandleIsQSliders()
{
    Slider slider(Qt::Horizontal);
    slider.setValue(40);
    QSignalSpy pressed(&slider, &QSlider::sliderPressed);
    QSignalSpy changed(&slider, &QSlider::valueChanged);
    press(&slider, slider.handle().center() + QPoint(3, 0));
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(changed.count(), 0);
    QCOMPARE(slider.value(), 40);
    QVERIFY(slider.isSliderDown());
}

void TestJumpSlider::theHandleEndsAtItsEdges()
{
    for (const int offset : {0, 1}) {
        Slider slider(Qt::Horizontal, 0, 10000);
        slider.setValue(5000);
        QSignalSpy pressed(&slider, &QSlider::sliderPressed);
        press(&slider, QPoint(slider.handle().right() + offset, slider.handle().center().y()));
        QCOMPARE(slider.value() != 5000, offset == 1);
        QCOMPARE(pressed.count(), 1 + offset);
    }
}

void TestJumpSlider::otherButtonsDoNotJump_data()
{
    QTest::addColumn<int>("button");
    QTest::newRow("right") << static_cast<int>(Qt::RightButton);
    QTest::newRow("back") << static_cast<int>(Qt::BackButton);
}

void TestJumpSlider::otherButtonsDoNotJump()
{
    QFETCH(int, button);
    Slider slider(Qt::Horizontal);
    slider.setValue(10);
    QSignalSpy pressed(&slider, &QSlider::sliderPressed);
    press(&slider, QPoint(250, 15), static_cast<Qt::MouseButton>(button));
    QCOMPARE(slider.value(), 10);
    QCOMPARE(pressed.count(), 0);
    QVERIFY(!slider.isSliderDown());
}

void TestJumpSlider::theJumpIsReportedInOrder()
{
    Slider slider(Qt::Horizontal);
    QStringList events;
    connect(&slider, &QSlider::sliderPressed, this,
        [&] { events << QStringLiteral("pressed %1 at %2").arg(slider.isSliderDown()).arg(slider.value()); });
    connect(&slider, &QSlider::valueChanged, this,
        [&](int value) { events << QStringLiteral("value %1").arg(value); });
    press(&slider, QPoint(299, 15));
    QCOMPARE(events,
        (QStringList {
            QStringLiteral("pressed 0 at 0"), QStringLiteral("value 100"), QStringLiteral("pressed 1 at 100")}));
}

void TestJumpSlider::theJumpGoesOnAsADrag()
{
    Slider slider(Qt::Horizontal);
    QSignalSpy moved(&slider, &QSlider::sliderMoved);
    QSignalSpy released(&slider, &QSlider::sliderReleased);
    press(&slider, QPoint(150, 15));
    const int jumped = slider.value();
    QVERIFY(slider.isSliderDown());
    send(&slider, QEvent::MouseMove, QPoint(220, 15));
    QVERIFY(slider.value() > jumped + 15);
    QCOMPARE(moved.count(), 1);
    send(&slider, QEvent::MouseButtonRelease, QPoint(220, 15));
    QVERIFY(!slider.isSliderDown());
    QCOMPARE(released.count(), 1);
}

void TestJumpSlider::theEventIsAccepted()
{
    Slider slider(Qt::Horizontal);
    QMouseEvent event(QEvent::MouseButtonPress, QPoint(200, 15), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    event.ignore();
    QCoreApplication::sendEvent(&slider, &event);
    QVERIFY(event.isAccepted());
}

void TestJumpSlider::anInvertedSliderFromZeroIsMirrored_data()
{
    QTest::addColumn<bool>("vertical");
    QTest::addColumn<QPoint>("position");
    QTest::addColumn<int>("expected");
    QTest::newRow("left") << false << QPoint(0, 15) << 100;
    QTest::newRow("right") << false << QPoint(299, 15) << 0;
    QTest::newRow("bottom") << true << QPoint(15, 299) << 100;
    QTest::newRow("top") << true << QPoint(15, 0) << 0;
}

void TestJumpSlider::anInvertedSliderFromZeroIsMirrored()
{
    QFETCH(bool, vertical);
    QFETCH(QPoint, position);
    Slider slider(vertical ? Qt::Vertical : Qt::Horizontal);
    slider.setInvertedAppearance(true);
    slider.setValue(50);
    press(&slider, position);
    QTEST(slider.value(), "expected");
}

void TestJumpSlider::anInvertedSliderThatStartsElsewhereIsOffByItsMinimum()
{
    Slider slider(Qt::Horizontal, 10, 110);
    slider.setInvertedAppearance(true);
    slider.setValue(60);
    QSignalSpy changed(&slider, &QSlider::valueChanged);
    press(&slider, QPoint(0, 15));
    // The left end stands for 110. The jump misses the pointer by 10, so the rest is QSlider's page step.
    QVERIFY(changed.count() >= 1);
    QCOMPARE(changed.at(0).at(0).toInt(), 100);

    slider.setValue(60);
    changed.clear();
    press(&slider, QPoint(299, 15));
    QCOMPARE(changed.at(0).at(0).toInt(), 10); // 0, held by the range
}

void TestJumpSlider::theLayoutDirectionIsNotLookedAt()
{
    Slider slider(Qt::Horizontal);
    slider.setLayoutDirection(Qt::RightToLeft);
    slider.setValue(50);
    QSignalSpy changed(&slider, &QSlider::valueChanged);
    press(&slider, QPoint(299, 15));
    QCOMPARE(changed.at(0).at(0).toInt(), 100);
}

void TestJumpSlider::aSliderWithoutRoomKeepsItsMinimum()
{
    Slider slider(Qt::Horizontal, 5, 20);
    slider.resize(4, 30);
    slider.setValue(20);
    press(&slider, QPoint(0, 29));
    QVERIFY(slider.value() >= 5 && slider.value() <= 20);
}

void TestJumpSlider::aSliderMayBeDeletedByItsOwnSignals_data()
{
    QTest::addColumn<int>("signal");
    QTest::newRow("pressed before the jump") << 0;
    QTest::newRow("value changed") << 1;
}

void TestJumpSlider::aSliderMayBeDeletedByItsOwnSignals()
{
    QFETCH(int, signal);
    auto* slider = new Slider(Qt::Horizontal);
    const QPointer<Slider> alive(slider);
    if (signal == 0) {
        connect(slider, &QSlider::sliderPressed, this, [slider] { delete slider; });
    } else {
        connect(slider, &QSlider::valueChanged, this, [slider] { delete slider; });
    }
    press(slider, QPoint(200, 15));
    QVERIFY(alive.isNull());
}

ZELKOV_TEST_MAIN(TestJumpSlider)
#include "tst_jumpslider.moc"
