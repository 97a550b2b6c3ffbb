// SPDX-License-Identifier: MIT
// The rotary control: its laws, its mouse, its pictures.
#include "controls/DialButton.h"
#include "controls/DialLaw.h"
#include "support/LogCapture.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QRandomGenerator>
#include <QtCore/QtMath>
#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QStyle>

#include <cmath>
#include <limits>

namespace
{
QStringList names(std::initializer_list<const char*> list)
{
    QStringList result;
    for (const char* const name : list) {
        result << QLatin1String(name);
    }
    return result;
}

struct Panel
{
    QWidget window;
    vx::DialButton* dial;

    explicit Panel(const QSize& size = QSize(100, 100))
    {
        window.resize(700, 300);
        dial = new vx::DialButton(100, &window);
        dial->setGeometry(QRect(QPoint(100, 100), size));
        dial->setRange(0, 255);
        dial->setValue(100);
        window.show();
    }
    QPoint at(int x, int y = 50) const { return dial->pos() + QPoint(x, y); }
    // Press at x 50, then moves; positions are the dial's own.
    void drag(std::initializer_list<int> xs, bool release = true)
    {
        zelkovtest::Pointer pointer(&window);
        pointer.move(at(50));
        pointer.press();
        for (const int x : xs) {
            pointer.move(at(x));
        }
        if (release) {
            pointer.release();
        }
    }
};

QPixmap filled(const QSize& size, const QColor& color)
{
    QPixmap pixmap(size);
    pixmap.fill(color);
    return pixmap;
}

QRect boxOf(const QImage& image, const QColor& color)
{
    QRect box;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) == color) {
                box |= QRect(x, y, 1, 1);
            }
        }
    }
    return box;
}
}

class TestDialButton : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void valuesHaveAngles_data()
    {
        QTest::addColumn<double>("value");
        QTest::addColumn<int>("minimum");
        QTest::addColumn<int>("maximum");
        QTest::addColumn<bool>("wrapping");
        QTest::addColumn<bool>("inverted");
        QTest::addColumn<double>("degrees");
        QTest::newRow("start") << 0.0 << 0 << 100 << false << false << -240.0;
        QTest::newRow("middle: the top") << 50.0 << 0 << 100 << false << false << -90.0;
        QTest::newRow("end") << 100.0 << 0 << 100 << false << false << 60.0;
        QTest::newRow("wrapping start: the bottom") << 0.0 << 0 << 100 << true << false << -270.0;
        QTest::newRow("wrapping middle") << 50.0 << 0 << 100 << true << false << -90.0;
        QTest::newRow("inverted") << 100.0 << 0 << 100 << false << true << -240.0;
        QTest::newRow("inverted, not from 0: shifted") << 10.0 << 10 << 110 << false << true << 30.0;
        QTest::newRow("one value") << 5.0 << 5 << 5 << false << false << -240.0;
    }
    void valuesHaveAngles()
    {
        QFETCH(double, value);
        QFETCH(int, minimum);
        QFETCH(int, maximum);
        QFETCH(bool, wrapping);
        QFETCH(bool, inverted);
        QFETCH(double, degrees);
        const double angle = vx::dialAngle(value, {minimum, maximum, wrapping, inverted});
        QVERIFY2(qAbs(qRadiansToDegrees(angle) - degrees) < 1e-9, qPrintable(QString::number(qRadiansToDegrees(angle))));
        vx::DialButton dial;
        dial.setRange(minimum, maximum);
        dial.setWrapping(wrapping);
        dial.setInvertedAppearance(inverted);
        QVERIFY(qAbs(qRadiansToDegrees(dial.angleFromValue(int(value))) - degrees) < 1e-9);
    }

    void threeWidthsCoverTheRange_data()
    {
        QTest::addColumn<int>("value");
        QTest::addColumn<int>("dx");
        QTest::addColumn<bool>("wrapping");
        QTest::addColumn<int>("result");
        // Range 0 to 255, width 100.
        QTest::newRow("one width") << 100 << 100 << false << 185;
        QTest::newRow("nothing") << 100 << 0 << false << 100;
        QTest::newRow("one pixel is no step") << 100 << 1 << false << 100;
        QTest::newRow("two pixels are one") << 100 << 2 << false << 101;
        QTest::newRow("one pixel back is no step: cut off towards 0") << 100 << -1 << false << 100;
        QTest::newRow("two back") << 100 << -2 << false << 99;
        QTest::newRow("past the end") << 200 << 100 << false << 255;
        QTest::newRow("past the start") << 20 << -100 << false << 0;
        QTest::newRow("wrapping is not clamped") << 200 << 100 << true << 285;
    }
    void threeWidthsCoverTheRange()
    {
        QFETCH(int, value);
        QFETCH(int, dx);
        QFETCH(bool, wrapping);
        QTEST(vx::dialValueAfterDrag(value, dx, 100, {0, 255, wrapping, false}), "result");
    }

    void extremesDoNotOverflow()
    {
        const int most = std::numeric_limits<int>::max();
        const int least = std::numeric_limits<int>::min();
        QCOMPARE(vx::dialValueAfterDrag(0, most, 1, {least, most, true, false}), most);
        QCOMPARE(vx::dialValueAfterDrag(0, least, 1, {least, most, true, false}), least);
        QCOMPARE(vx::dialValueAfterDrag(7, 100, 0, {0, 10, false, false}), 7);
    }

    void anyDragStaysWithinTheRange()
    {
        QRandomGenerator random(3);
        for (int i = 0; i < 5000; ++i) {
            const int minimum = random.bounded(-500, 500);
            const int maximum = minimum + random.bounded(1000);
            const int result = vx::dialValueAfterDrag(random.bounded(minimum, maximum + 1),
                random.bounded(-2000, 2000), random.bounded(1, 400), {minimum, maximum, false, false});
            QVERIFY(result >= minimum && result <= maximum);
        }
    }

    void itIsSetUp()
    {
        vx::DialButton dial;
        QCOMPARE(dial.defaultValue(), 8);
        QCOMPARE(dial.value(), 0); // not moved by the constructor
        QCOMPARE(vx::DialButton(3, nullptr).defaultValue(), 3);
        QCOMPARE(dial.focusPolicy(), Qt::NoFocus);
        QVERIFY(dial.isCheckable());
        QVERIFY(!dial.isChecked());
        QVERIFY(!dial.isActive());
        QVERIFY(!dial.isDown());
        QVERIFY(!dial.reboundEnabled());
        QCOMPARE(int(vx::DialButton::BackgroundNormal), 1);
        QCOMPARE(int(vx::DialButton::BackgroundChecked), 5);
        QCOMPARE(dial.palette().color(QPalette::Button), QColor(Qt::darkBlue).darker(400));
        QCOMPARE(dial.palette().color(QPalette::Mid), QColor(Qt::darkBlue).lighter(400));
    }

    void aDragAcrossOneWidthRaisesTheValueByAThirdOfTheRange()
    {
        Panel panel;
        panel.drag({100, 150});
        QCOMPARE(panel.dial->value(), 185);
    }

    void aDragStopsAtTheMaximum()
    {
        Panel panel;
        panel.drag({300, 500});
        QCOMPARE(panel.dial->value(), 255);
        panel.drag({-50, -95});
        QVERIFY(panel.dial->value() < 255);
    }

    void theSignalsOfATurnComeInOrder()
    {
        Panel panel;
        panel.dial->setReboundEnabled(true);
        panel.dial->setDefaultValue(100);
        zelkovtest::SignalRecorder recorder(panel.dial);
        QSignalSpy values(panel.dial, &QDial::valueChanged);
        panel.drag({150});
        QStringList expected = names({"toggled", "pressed", "toggled", "released", "reboundPerformed"});
        QCOMPARE(recorder.names(), expected);
        QCOMPARE(recorder.entries().at(0).arguments, QVariantList{true});
        QCOMPARE(recorder.entries().at(2).arguments, QVariantList{false});
        QCOMPARE(recorder.entries().at(4).arguments, QVariantList{100});
        QCOMPARE(panel.dial->value(), 100);
        QCOMPARE(values.last().first().toInt(), 100);
        QVERIFY(values.count() >= 2);
    }

    void withoutReboundTheValueStays()
    {
        Panel panel;
        zelkovtest::SignalRecorder recorder(panel.dial);
        panel.drag({150});
        QCOMPARE(recorder.names(), names({"toggled", "pressed", "toggled", "released"}));
        QCOMPARE(panel.dial->value(), 185);
    }

    void aReleaseOnTheSpotHasNoRebound()
    {
        Panel panel;
        panel.dial->setReboundEnabled(true);
        panel.dial->setDefaultValue(7);
        zelkovtest::SignalRecorder recorder(panel.dial);
        panel.drag({});
        QCOMPARE(recorder.names(), names({"toggled", "pressed", "toggled", "released"}));
        QCOMPARE(panel.dial->value(), 100);
        QVERIFY(!panel.dial->isChecked());
    }

    void whileItIsHeldItIsDownAndChecked()
    {
        Panel panel;
        {
            zelkovtest::Pointer pointer(&panel.window);
            pointer.move(panel.at(50));
            pointer.press();
            QVERIFY(panel.dial->isDown());
            QVERIFY(panel.dial->isChecked());
            QVERIFY(!panel.dial->isSliderDown());
            QCOMPARE(panel.dial->value(), 100);
        }
        QVERIFY(!panel.dial->isDown());
        QVERIFY(!panel.dial->isChecked());
    }

    void aPressWithAModifierIsTheDials()
    {
        Panel panel;
        zelkovtest::SignalRecorder recorder(panel.dial);
        QMouseEvent press(
            QEvent::MouseButtonPress, QPointF(50, 50), Qt::LeftButton, Qt::LeftButton, Qt::ControlModifier);
        QCoreApplication::sendEvent(panel.dial, &press);
        QVERIFY(!panel.dial->isDown());
        QVERIFY(panel.dial->isSliderDown());
        QVERIFY(recorder.names().isEmpty());
        QCOMPARE(panel.dial->value(), 0); // the spot of the literal 0
    }

    void withoutHorizontalTrackingItIsTurnedAround()
    {
        Panel panel;
        panel.dial->setHorizontalMouseTracking(false);
        QVERIFY(!panel.dial->horizontalMouseTracking());
        panel.drag({99}); // to the right edge: angle 0
        const double ratio = (qDegreesToRadians(0.0) + 4.0 * M_PI / 3.0) / (5.0 * M_PI / 3.0);
        QVERIFY2(qAbs(panel.dial->value() - ratio * 255.0) < 3.0, qPrintable(QString::number(panel.dial->value())));
    }

    void horizontalTrackingTurnsWrappingOffButNotOn()
    {
        vx::DialButton dial;
        dial.setWrapping(true);
        dial.setHorizontalMouseTracking(false);
        QVERIFY(dial.wrapping());
        dial.setHorizontalMouseTracking(true);
        QVERIFY(!dial.wrapping());
        dial.setHorizontalMouseTracking(false);
        QVERIFY(!dial.wrapping());
    }

    void theModeIsLatchedAtThePress()
    {
        Panel panel;
        zelkovtest::Pointer pointer(&panel.window);
        pointer.move(panel.at(50));
        pointer.press();
        panel.dial->setHorizontalMouseTracking(false);
        pointer.move(panel.at(150));
        QCOMPARE(panel.dial->value(), 185);
        pointer.release();
    }

    void toggleFlipsTheRawFlag()
    {
        vx::DialButton dial;
        QSignalSpy toggled(&dial, &vx::DialButton::toggled);
        dial.toggle();
        QVERIFY(dial.isChecked());
        QVERIFY(dial.property("checked").toBool());
        dial.setCheckable(false);
        QVERIFY(!dial.isChecked());
        dial.toggle(); // flips true to false unseen
        dial.toggle();
        QVERIFY(!dial.isChecked());
        dial.setCheckable(true);
        QVERIFY(dial.isChecked());
        dial.setChecked(true); // reported again
        QCOMPARE(toggled.count(), 4);
    }

    void downAndCheckedAreOneFlag()
    {
        vx::DialButton dial;
        QSignalSpy toggled(&dial, &vx::DialButton::toggled);
        dial.setDown();
        QVERIFY(dial.isChecked());
        QVERIFY(!dial.isDown()); // no place of a press
        dial.setDown(false);
        QVERIFY(!dial.isChecked());
        QCOMPARE(toggled.count(), 2);
    }

    void resetGoesToTheDefault()
    {
        vx::DialButton dial(42);
        dial.setRange(0, 255);
        dial.reset();
        QCOMPARE(dial.value(), 42);
        dial.setDefaultValue(43);
        dial.reset();
        QCOMPARE(dial.value(), 43);
    }

    void theTimerIsNeverStarted()
    {
        Panel panel;
        QCOMPARE(panel.dial->mouseClickSensitivity(), 200);
        panel.dial->setMouseClickSensitivity(1);
        zelkovtest::Pointer pointer(&panel.window);
        pointer.move(panel.at(60));
        pointer.press();
        QTest::qWait(50);
        QVERIFY(!panel.dial->isSliderDown()); // the dial took nothing over
        pointer.release();
    }

    void theTimeoutHandsAPressToTheDial()
    {
        class Open : public vx::DialButton
        {
        public:
            using vx::DialButton::DialButton;
            using vx::DialButton::mouseMoveEvent;
            using vx::DialButton::onTimeout;
        };
        Open dial(10);
        dial.resize(100, 100);
        dial.setRange(0, 100);
        dial.onTimeout(); // nothing seen yet
        QVERIFY(!dial.isSliderDown());
        QMouseEvent move(QEvent::MouseMove, QPointF(60, 60), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
        dial.mouseMoveEvent(&move);
        dial.onTimeout();
        QVERIFY(dial.isSliderDown());
    }

    void theStyleSheetFollowsTheStates()
    {
        Panel panel;
        panel.dial->setButton(filled(QSize(1, 1), Qt::transparent));
        panel.window.setStyleSheet(QStringLiteral("vx--DialButton { background: #00ff00; }"
                                                  "vx--DialButton[checked=\"true\"] { background: #ff0000; }"
                                                  "vx--DialButton[active=\"true\"] { background: #0000ff; }"));
        const auto colour = [&] { return panel.dial->grab().toImage().pixelColor(3, 3); };
        QCOMPARE(colour(), QColor(Qt::green));
        panel.dial->setChecked(true);
        QCOMPARE(colour(), QColor(Qt::red));
        panel.dial->setChecked(false);
        panel.dial->setActive(true);
        QCOMPARE(colour(), QColor(Qt::blue));
        panel.dial->setActive(false);
        QCOMPARE(colour(), QColor(Qt::green));
    }

    void theMarginsAreCrossed()
    {
        vx::DialButton dial;
        dial.resize(100, 100);
        dial.setRightMargin(5);
        dial.setLeftMargin(11);
        dial.setTopMargin(3);
        dial.setBottomMargin(7);
        dial.setRightPadding(2);
        dial.setLeftPadding(4);
        dial.setTopPadding(6);
        dial.setBottomPadding(8);
        dial.setImage(filled(QSize(4, 4), Qt::red));
        dial.setButton(filled(QSize(4, 4), Qt::green));
        dial.setHandle(filled(QSize(1, 1), Qt::green));
        const QImage image = dial.grab().toImage();
        QCOMPARE(boxOf(image, Qt::red), QRect(5, 3, 100 - 5 - 11, 100 - 3 - 7));
        QCOMPARE(boxOf(image, Qt::green), QRect(7, 9, 100 - 7 - 15, 100 - 9 - 15));
        vx::DialButton plain;
        QCOMPARE(dial.sizeHint(), plain.sizeHint() + QSize(16, 10)); // paddings do not count
    }

    void theHandleOrbitsAtAQuarterOfTheButton_data()
    {
        QTest::addColumn<int>("value");
        QTest::addColumn<QPoint>("offset");
        QTest::newRow("top") << 50 << QPoint(0, -15);
        QTest::newRow("end") << 100 << QPoint(7, 12); // 60 degrees: 7.5 and 12.99 cut off
    }
    void theHandleOrbitsAtAQuarterOfTheButton()
    {
        QFETCH(int, value);
        QFETCH(QPoint, offset);
        vx::DialButton dial;
        dial.resize(100, 100);
        dial.setRange(0, 100);
        dial.setButton(filled(QSize(60, 80), Qt::green));
        dial.setHandle(filled(QSize(5, 5), Qt::red));
        dial.setValue(value);
        const QRect knob = QStyle::alignedRect(Qt::LeftToRight, Qt::AlignCenter, QSize(60, 80), dial.rect());
        const QImage image = dial.grab().toImage();
        QCOMPARE(boxOf(image, Qt::red).center(), knob.center() + offset);
        QCOMPARE(image.pixelColor(0, 0), QColor(Qt::green)); // the button fills the widget
    }

    void aButtonWithoutHandleTurnsToTheValue()
    {
        vx::DialButton dial;
        dial.resize(100, 100);
        dial.setRange(0, 100);
        QPixmap knob(100, 100);
        knob.fill(Qt::green);
        {
            QPainter painter(&knob);
            painter.fillRect(45, 0, 10, 30, Qt::red); // upright: points up
        }
        dial.setButton(knob);
        dial.setValue(50); // the top
        QImage image = dial.grab().toImage();
        QCOMPARE(image.pixelColor(50, 10), QColor(Qt::red));
        dial.setValue(80); // 90 degrees further
        image = dial.grab().toImage();
        QCOMPARE(image.pixelColor(90, 50), QColor(Qt::red));
        QCOMPARE(image.pixelColor(50, 10), QColor(Qt::green));
    }

    void withoutAButtonThePaletteTellsTheState()
    {
        vx::DialButton dial;
        dial.resize(100, 100);
        QPalette palette = dial.palette();
        palette.setColor(QPalette::Button, Qt::red);
        palette.setColor(QPalette::Mid, Qt::green);
        dial.setPalette(palette);
        dial.setHandle(filled(QSize(5, 5), Qt::blue)); // nothing without a button
        const QImage normal = dial.grab().toImage();
        QVERIFY(boxOf(normal, Qt::blue).isNull());
        dial.setChecked(true);
        const QImage checked = dial.grab().toImage();
        QVERIFY(normal != checked);
        dial.setCheckable(false);
        QCOMPARE(dial.grab().toImage(), normal);
    }

    void theGradientIsRound()
    {
        const QRadialGradient gradient = vx::DialButton::gradient(Qt::red, Qt::blue);
        QCOMPARE(gradient.coordinateMode(), QGradient::ObjectBoundingMode);
        QCOMPARE(gradient.center(), QPointF(0.5, 0.5));
        QCOMPARE(gradient.focalPoint(), QPointF(0.5, 0.5));
        QVERIFY(qFuzzyCompare(gradient.radius(), 0.6));
        QCOMPARE(gradient.stops(), (QGradientStops{{0.0, Qt::red}, {1.0, Qt::blue}}));
    }

    void pointsLieInTheDirectionOfTheValue()
    {
        vx::DialButton dial;
        dial.resize(101, 61);
        dial.setRange(0, 100);
        QCOMPARE(dial.pointFromAngle(0.0, 10.0), QPointF(60, 30));
        const QPointF top = dial.pointFromValue(50);
        QVERIFY(qAbs(top.x() - 50.0) < 1e-6);
        QVERIFY(qAbs(top.y() - (30.0 - 61.0)) < 1e-6); // the whole side away
    }

    void theValueIsTraced()
    {
        zelkovtest::LogCapture log(1);
        vx::DialButton dial;
        dial.setValue(5);
        QVERIFY2(log.lines().join(QLatin1Char('\n')).contains(
                     QLatin1String("[vx::DialButton::updateBalloon] DialButton::updateBalloon() -> 5")),
            qPrintable(log.lines().join(QLatin1Char('\n'))));
    }

    void itMayBeDeletedInAnyOfItsSignals_data()
    {
        QTest::addColumn<QByteArray>("signal");
        for (const char* const signal :
            {"2toggled(bool)", "2pressed()", "2released()", "2reboundPerformed(int)", "2valueChanged(int)"}) {
            QTest::newRow(signal) << QByteArray(signal);
        }
    }
    void itMayBeDeletedInAnyOfItsSignals()
    {
        QFETCH(QByteArray, signal);
        Panel panel;
        panel.dial->setReboundEnabled(true);
        panel.dial->setDefaultValue(3);
        QPointer<vx::DialButton> gone(panel.dial);
        QObject::connect(panel.dial, signal.constData(), panel.dial, "1deleteLater()");
        zelkovtest::Pointer pointer(&panel.window);
        const QPoint place = panel.at(50);
        pointer.move(place);
        pointer.press();
        pointer.move(place + QPoint(60, 0));
        pointer.release();
        QTRY_VERIFY(!gone);
    }
};

ZELKOV_TEST_MAIN(TestDialButton)
#include "tst_dialbutton.moc"
