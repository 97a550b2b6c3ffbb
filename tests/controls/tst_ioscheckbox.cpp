// SPDX-License-Identifier: MIT
// The sliding switch.
#include "Pointer.h"
#include "TestCase.h"
#include "TestMain.h"
#include "controls/iOSCheckBox.h"

#include <QtCore/QPropertyAnimation>
#include <QtTest/QtTest>

namespace
{
/// A switch of the usual size in a plain window.
class SwitchHost
{
public:
    explicit SwitchHost(bool checked = false)
        : box(new iOSCheckBox(&window, checked))
    {
        window.resize(200, 100);
        box->setGeometry(20, 20, 72, 18);
        window.show();
    }
    double x() const { return position().x(); }
    QPointF position() const { return box->property("iconPosition").toPointF(); }
    QPropertyAnimation* animation() const { return box->findChild<QPropertyAnimation*>(); }
    bool slides() const { return animation()->state() == QAbstractAnimation::Running; }

    QWidget window;
    iOSCheckBox* box;
};

class OpenSwitch : public iOSCheckBox
{
public:
    using iOSCheckBox::controlIconAnimationDuration;
    using iOSCheckBox::controlIconPosition;
    using iOSCheckBox::controlMacCheckBox;
    using iOSCheckBox::iOSCheckBox;
};
}

class TestIOSCheckBox : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theConstructorLoadsTheStripAndPutsItAside()
    {
        OpenSwitch box;
        QCOMPARE(box.controlMacCheckBox()->size(), QSize(109, 18));
        QCOMPARE(*box.controlIconAnimationDuration(), 300);
        QCOMPARE(*box.controlIconPosition(), QPointF(-(box.width() / 3), 0));
        QCOMPARE(box.sizeHint(), QSize(72, 18));
        QVERIFY(!box.getAnimationModeOn());
        QVERIFY(!box.isChecked());
        const auto* animation = box.findChild<QPropertyAnimation*>();
        QCOMPARE(animation->duration(), 300);
        QCOMPARE(animation->loopCount(), 1);
        QCOMPARE(animation->easingCurve().type(), QEasingCurve::Linear);
        QCOMPARE(animation->propertyName(), QByteArray("iconPosition"));
        OpenSwitch on(nullptr, true);
        QVERIFY(on.isChecked());
        QCOMPARE(*on.controlIconPosition(), QPointF(9, 0));
    }

    void stateChangesJump()
    {
        SwitchHost host;
        QCOMPARE(host.position(), QPointF(-24, 0));
        QSignalSpy toggled(host.box, &QCheckBox::toggled);
        QSignalSpy changed(host.box, &QCheckBox::stateChanged);
        host.box->setChecked(true);
        QCOMPARE(host.position(), QPointF(9, 0));
        QVERIFY(!host.slides());
        QCOMPARE(toggled.count(), 1);
        QCOMPARE(changed.count(), 1);
        host.box->setChecked(false);
        QCOMPARE(host.position(), QPointF(-24, 0));
    }

    void inAnimationModeStateChangesSlide()
    {
        SwitchHost host;
        host.box->setAnimationMode(true);
        host.box->setChecked(true);
        QVERIFY(host.slides());
        QCOMPARE(host.position(), QPointF(-24, 0));
        QCOMPARE(host.animation()->duration(), 275);
        host.animation()->pause();
        host.animation()->setCurrentTime(137);
        QVERIFY(host.x() > -8.5 && host.x() < -6.5);
        host.animation()->resume();
        QTRY_VERIFY(!host.slides());
        QCOMPARE(host.position(), QPointF(9, 0));
        QVERIFY(host.box->getAnimationModeOn());
        QCOMPARE(host.box->findChildren<QPropertyAnimation*>().size(), 1);
    }

    void animateToTheOtherSideOfTheStateTakesNoTime()
    {
        SwitchHost host;
        host.box->animateTo(false);
        QCOMPARE(host.animation()->duration(), 0);
        QCOMPARE(host.x(), -24.0);
        // The time is that towards the side of the state, which is where the strip stands.
        host.box->animateTo(true);
        QCOMPARE(host.animation()->duration(), 0);
        QCOMPARE(host.x(), 9.0);
        QVERIFY(!host.box->isChecked());
        // The state is off: 33 pixels to the left are left.
        host.box->animateTo(true);
        QCOMPARE(host.animation()->duration(), 275);
    }

    void aClickTogglesAndSlidesAndClearsTheAnimationMode()
    {
        SwitchHost host;
        host.box->setAnimationMode(true);
        QSignalSpy toggled(host.box, &QCheckBox::toggled);
        QSignalSpy pressed(host.box, &QCheckBox::pressed);
        QSignalSpy clicked(host.box, &QCheckBox::clicked);
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(QPoint(50, 28));
        QVERIFY(host.box->isChecked());
        QVERIFY(host.slides());
        QVERIFY(!host.box->getAnimationModeOn());
        QCOMPARE(toggled.count(), 1);
        QCOMPARE(pressed.count() + clicked.count(), 0);
        QVERIFY(!host.box->isDown());
        QTRY_COMPARE(host.x(), 9.0);
        pointer.click(QPoint(51, 28), Qt::RightButton);
        QVERIFY(!host.box->isChecked());
        QTRY_COMPARE(host.x(), -24.0);
    }

    void theStripFollowsTheDragAndStopsAtBothEnds()
    {
        SwitchHost host;
        zelkovtest::Pointer pointer(&host.window);
        pointer.move(QPoint(40, 28));
        pointer.press();
        pointer.move(QPoint(50, 40));
        QCOMPARE(host.position(), QPointF(-14, 0));
        pointer.move(QPoint(120, 28));
        QCOMPARE(host.x(), 9.0);
        // The pointer's way past the end is lost: the strip starts back at once.
        pointer.move(QPoint(119, 28));
        QCOMPARE(host.x(), 8.0);
        pointer.move(QPoint(0, 28));
        QCOMPARE(host.x(), -24.0);
        QVERIFY(!host.box->isChecked());
        pointer.release();
    }

    void aReleasedDragSnapsToTheNearerSide_data()
    {
        QTest::addColumn<int>("way");
        QTest::addColumn<bool>("on");
        QTest::newRow("exactly in the middle") << 12 << false;
        QTest::newRow("one more") << 13 << true;
        QTest::newRow("one less") << 11 << false;
        QTest::newRow("to the end") << 60 << true;
        QTest::newRow("no way at all, but moved") << 0 << false;
    }
    void aReleasedDragSnapsToTheNearerSide()
    {
        QFETCH(int, way);
        QFETCH(bool, on);
        SwitchHost host;
        QSignalSpy toggled(host.box, &QCheckBox::toggled);
        zelkovtest::Pointer pointer(&host.window);
        pointer.move(QPoint(40, 28));
        pointer.press();
        pointer.move(QPoint(39, 28));
        pointer.move(QPoint(39 + way, 28));
        QCOMPARE(host.x(), qMin(-24.0 + way, 9.0));
        pointer.release();
        QCOMPARE(host.box->isChecked(), on);
        QCOMPARE(toggled.count(), on ? 1 : 0);
        QCOMPARE(host.x(), on ? 9.0 : -24.0);
        QVERIFY(!host.slides());
        // The next click is a click again.
        pointer.click(QPoint(50, 29));
        QCOMPARE(host.box->isChecked(), !on);
    }

    void aDragStopsARunningSlide()
    {
        SwitchHost host;
        zelkovtest::Pointer pointer(&host.window);
        pointer.click(QPoint(50, 28));
        QVERIFY(host.slides());
        pointer.press();
        QVERIFY(host.slides());
        pointer.move(QPoint(51, 28));
        QVERIFY(!host.slides());
        pointer.release();
    }

    void movesWithoutAPressDoNothing()
    {
        SwitchHost host;
        host.box->setMouseTracking(true);
        zelkovtest::Pointer pointer(&host.window);
        pointer.move(QPoint(40, 28));
        pointer.move(QPoint(60, 28));
        QCOMPARE(host.x(), -24.0);
    }

    void inAnimationModeTheEndOfADragSlides()
    {
        SwitchHost host;
        host.box->setAnimationMode(true);
        zelkovtest::Pointer pointer(&host.window);
        pointer.move(QPoint(40, 28));
        pointer.press();
        pointer.move(QPoint(60, 28));
        pointer.release();
        QVERIFY(host.slides());
        QCOMPARE(host.animation()->duration(), 108);
        QVERIFY(host.box->getAnimationModeOn());
    }

    void showingCorrectsThePosition()
    {
        SwitchHost host(true);
        host.box->hide();
        host.box->setProperty("iconPosition", QPointF(-3, 5));
        host.box->show();
        QCOMPARE(host.position(), QPointF(9, 0));
        host.box->setAnimationMode(true);
        host.box->setChecked(false);
        host.box->setVisible(true);
        QVERIFY(!host.slides());
        QCOMPARE(host.position(), QPointF(-24, 0));
    }

    void aSwitchThatGetsItsWidthFromALayoutStandsRight()
    {
        SwitchHost host;
        host.box->resize(120, 30);
        QCOMPARE(host.position(), QPointF(-40, 0));
        host.box->setChecked(true);
        host.box->resize(72, 18);
        QCOMPARE(host.position(), QPointF(9, 0));
        host.box->setProperty("iconPosition", QPointF(1, 0));
        host.box->resize(90, 18);
        QCOMPARE(host.position(), QPointF(1, 0));
    }

    void theStripIsSeenRightOfTheTenthPixel()
    {
        SwitchHost host;
        QPixmap strip(100, 10);
        strip.fill(Qt::red);
        QTemporaryDir folder;
        const QString file = folder.filePath(QStringLiteral("strip.png"));
        QVERIFY(strip.save(file));
        iOSCheckBox box(&host.window, true, file);
        box.setGeometry(20, 50, 72, 18);
        box.show();
        QImage picture(72, 18, QImage::Format_RGB32);
        picture.fill(Qt::blue);
        box.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());
        QCOMPARE(picture.pixelColor(9, 9), QColor(Qt::blue));
        QCOMPARE(picture.pixelColor(10, 0), QColor(Qt::red));
        QCOMPARE(picture.pixelColor(71, 17), QColor(Qt::red));
    }

    void onAndOffLookDifferentAndStretchWithTheWidget()
    {
        SwitchHost host;
        host.box->resize(96, 24);
        const QImage off = host.box->grab().toImage();
        host.box->setChecked(true);
        const QImage on = host.box->grab().toImage();
        QVERIFY(on.pixel(20, 12) != off.pixel(20, 12));
        QVERIFY(on.pixel(80, 12) != off.pixel(80, 12));
    }

    void withoutAPictureTheSwitchWorks()
    {
        QWidget window;
        window.resize(100, 60);
        iOSCheckBox box(&window, false, QStringLiteral(":/nowhere.png"));
        window.show();
        box.grab();
        box.setChecked(true);
        QVERIFY(box.isChecked());
    }
};

ZELKOV_TEST_MAIN(TestIOSCheckBox)
#include "tst_ioscheckbox.moc"
