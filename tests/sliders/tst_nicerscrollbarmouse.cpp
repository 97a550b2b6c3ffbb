// SPDX-License-Identifier: MIT
// The overlay bar under the mouse: drags, presses on the groove, wheel.
#include "ScrollScene.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QWheelEvent>
#include <QtTest/qtestspontaneevent.h>
#include <QtTest/QtTest>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOptionSlider>
#include <QtWidgets/QVBoxLayout>

namespace
{
QRect handleOf(const QScrollBar* bar)
{
    // As QScrollBar::initStyleOption, which is protected.
    QStyleOptionSlider option;
    option.initFrom(bar);
    option.subControls = QStyle::SC_All;
    option.orientation = bar->orientation();
    option.minimum = bar->minimum();
    option.maximum = bar->maximum();
    option.sliderPosition = bar->sliderPosition();
    option.sliderValue = bar->value();
    option.singleStep = bar->singleStep();
    option.pageStep = bar->pageStep();
    if (bar->orientation() == Qt::Horizontal) {
        option.state |= QStyle::State_Horizontal;
    }
    return bar->style()->subControlRect(QStyle::CC_ScrollBar, &option, QStyle::SC_ScrollBarSlider, bar);
}

/// As if the window system had sent it, so that it goes on to the parents when it is ignored. Whether the event
/// was accepted in the end.
bool wheel(QWidget* widget, const QPoint& position, const QPoint& angle)
{
    QWheelEvent event(position, widget->mapToGlobal(position), QPoint(), angle, Qt::NoButton, Qt::NoModifier,
        Qt::NoScrollPhase, false);
    QSpontaneKeyEvent::setSpontaneous(&event);
    qApp->notify(widget, &event);
    return event.isAccepted();
}

class WheelCounter : public QWidget
{
public:
    using QWidget::QWidget;
    int count = 0;

protected:
    void wheelEvent(QWheelEvent* event) override
    {
        ++count;
        event->ignore();
    }
};

/// As an area at the end of its range.
class DeafArea : public QAbstractScrollArea
{
public:
    int count = 0;

protected:
    void wheelEvent(QWheelEvent* event) override
    {
        ++count;
        event->ignore();
    }
};
}

class TestNicerScrollBarMouse : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void draggingTheHandleScrollsTheArea_data();
    void draggingTheHandleScrollsTheArea();
    void aDragThatComesInOneGoArrivesWhole();
    void theRealBarIsNotFollowedDuringADrag();
    void aFadedBarStillTakesTheMouse();
    void aMoveOverAFadedBarShowsIt();
    void aPressOnTheGrooveMovesThisBarAlone();
    void pressAndReleaseAreReportedBeforeTheBaseClassReportsThem();
    void theBarMayBeDeletedInTheMiddleOfADrag_data();
    void theBarMayBeDeletedInTheMiddleOfADrag();
    void aWheelOverTheBarScrollsTheArea_data();
    void aWheelOverTheBarScrollsTheArea();
    void aWheelOverABarOnTheViewportScrollsOnce();
    void aWheelThatTheAreaTurnsAwayIsOfferedAroundItOnce();
    void aWheelOverAPlainBarIsIgnored();
    void aSidewaysWheelOverTheVerticalBarScrollsSideways();
};

void TestNicerScrollBarMouse::draggingTheHandleScrollsTheArea_data()
{
    QTest::addColumn<bool>("horizontal");
    QTest::newRow("vertical") << false;
    QTest::newRow("horizontal") << true;
}

void TestNicerScrollBarMouse::draggingTheHandleScrollsTheArea()
{
    QFETCH(bool, horizontal);
    ScrollScene scene(horizontal ? Qt::Horizontal : Qt::Vertical);
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    QSignalSpy dragged(scene.bar, &NicerScrollBar::nicerValueChanged);
    const QPoint start = handleOf(scene.bar).center();
    const QPoint step = horizontal ? QPoint(30, 0) : QPoint(0, 30);
    zelkovtest::Pointer pointer(scene.bar);
    pointer.move(start);
    pointer.press();
    QVERIFY(scene.bar->isSliderDown());
    pointer.move(start + step);
    ScrollScene::settle();
    const int first = scene.real->value();
    QVERIFY(first > 0);
    QCOMPARE(scene.bar->value(), first);
    QCOMPARE(dragged.last().at(0).toInt(), first);
    pointer.move(start + 2 * step);
    ScrollScene::settle();
    QVERIFY(scene.real->value() > first);
    pointer.release();
    ScrollScene::settle();
    QVERIFY(!scene.bar->isSliderDown());
    QCOMPARE(scene.bar->value(), scene.real->value());
    QCOMPARE(dragged.count(), 2);
}

void TestNicerScrollBarMouse::aDragThatComesInOneGoArrivesWhole()
{
    const ScrollScene scene;
    const QPoint start = handleOf(scene.bar).center();
    QSignalSpy dragged(scene.bar, &NicerScrollBar::nicerValueChanged);
    // Straight to the widget, with no turn of the event loop between.
    const auto send = [&](QEvent::Type type, const QPoint& position, Qt::MouseButtons held) {
        QMouseEvent event(type, position, scene.bar->mapToGlobal(position),
            type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton, held, Qt::NoModifier);
        QCoreApplication::sendEvent(scene.bar, &event);
    };
    send(QEvent::MouseButtonPress, start, Qt::LeftButton);
    send(QEvent::MouseMove, start + QPoint(0, 20), Qt::LeftButton);
    send(QEvent::MouseMove, start + QPoint(0, 50), Qt::LeftButton);
    send(QEvent::MouseButtonRelease, start + QPoint(0, 50), Qt::NoButton);
    ScrollScene::settle();
    QVERIFY(scene.bar->value() > 0);
    QCOMPARE(scene.real->value(), scene.bar->value());
    QCOMPARE(dragged.count(), 2);
}

void TestNicerScrollBarMouse::theRealBarIsNotFollowedDuringADrag()
{
    ScrollScene scene;
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    zelkovtest::Pointer pointer(scene.bar);
    pointer.move(handleOf(scene.bar).center());
    pointer.press();
    scene.real->setValue(900);
    ScrollScene::settle();
    QCOMPARE(scene.bar->value(), 0);
    pointer.release();
    scene.real->setValue(901);
    QTRY_COMPARE(scene.bar->value(), 901);
}

void TestNicerScrollBarMouse::aFadedBarStillTakesTheMouse()
{
    ScrollScene scene;
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    scene.fade();
    const QPoint start = handleOf(scene.bar).center();
    zelkovtest::Pointer pointer(scene.bar);
    pointer.move(start);
    pointer.press();
    pointer.move(start + QPoint(0, 40));
    pointer.release();
    ScrollScene::settle();
    QVERIFY(scene.real->value() > 0);
}

void TestNicerScrollBarMouse::aMoveOverAFadedBarShowsIt()
{
    ScrollScene scene;
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    zelkovtest::Pointer pointer(scene.bar);
    scene.fade();
    QVERIFY(scene.faded());
    pointer.move(QPoint(7, 150));
    pointer.move(QPoint(7, 151));
    QVERIFY(!scene.faded());
}

void TestNicerScrollBarMouse::aPressOnTheGrooveMovesThisBarAlone()
{
    ScrollScene scene;
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    zelkovtest::Pointer pointer(scene.bar);
    pointer.move(QPoint(7, 150));
    pointer.press();
    pointer.release();
    ScrollScene::settle();
    QCOMPARE(scene.bar->value(), scene.bar->pageStep());
    QCOMPARE(scene.real->value(), 0);
}

void TestNicerScrollBarMouse::pressAndReleaseAreReportedBeforeTheBaseClassReportsThem()
{
    ScrollScene scene;
    QVERIFY(QTest::qWaitForWindowExposed(&scene.area));
    QStringList events;
    connect(scene.bar, &QScrollBar::sliderPressed, this,
        [&] { events << QStringLiteral("pressed %1").arg(scene.bar->isSliderDown()); });
    connect(scene.bar, &QScrollBar::sliderReleased, this,
        [&] { events << QStringLiteral("released %1").arg(scene.bar->isSliderDown()); });
    zelkovtest::Pointer pointer(scene.bar);
    pointer.move(handleOf(scene.bar).center());
    pointer.press();
    pointer.release();
    QCOMPARE(events,
        (QStringList {QStringLiteral("pressed 0"), QStringLiteral("pressed 1"), QStringLiteral("released 1"),
            QStringLiteral("released 0")}));
    events.clear();
    pointer.move(QPoint(7, 150));
    pointer.press();
    pointer.release();
    QCOMPARE(events, (QStringList {QStringLiteral("pressed 0"), QStringLiteral("released 0")}));
}

void TestNicerScrollBarMouse::theBarMayBeDeletedInTheMiddleOfADrag_data()
{
    QTest::addColumn<int>("signal");
    QTest::newRow("sliderPressed") << 0;
    QTest::newRow("nicerValueChanged, during the release") << 1;
    QTest::newRow("sliderReleased") << 2;
}

void TestNicerScrollBarMouse::theBarMayBeDeletedInTheMiddleOfADrag()
{
    QFETCH(int, signal);
    const ScrollScene scene;
    const QPointer<NicerScrollBar> alive(scene.bar);
    const auto remove = [bar = scene.bar] { delete bar; };
    if (signal == 0) {
        connect(scene.bar, &QScrollBar::sliderPressed, this, remove);
    } else if (signal == 1) {
        connect(scene.bar, &NicerScrollBar::nicerValueChanged, this, remove);
    } else {
        connect(scene.bar, &QScrollBar::sliderReleased, this, remove);
    }
    const QPoint start = handleOf(scene.bar).center();
    const auto send = [&](QEvent::Type type, const QPoint& position, Qt::MouseButtons held) {
        if (alive) {
            QMouseEvent event(type, position, alive->mapToGlobal(position),
                type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton, held, Qt::NoModifier);
            QCoreApplication::sendEvent(alive, &event);
        }
    };
    send(QEvent::MouseButtonPress, start, Qt::LeftButton);
    send(QEvent::MouseMove, start + QPoint(0, 20), Qt::LeftButton);
    send(QEvent::MouseButtonRelease, start + QPoint(0, 20), Qt::NoButton);
    QVERIFY(alive.isNull());
}

void TestNicerScrollBarMouse::aWheelOverTheBarScrollsTheArea_data()
{
    draggingTheHandleScrollsTheArea_data();
}

void TestNicerScrollBarMouse::aWheelOverTheBarScrollsTheArea()
{
    QFETCH(bool, horizontal);
    const ScrollScene scene(horizontal ? Qt::Horizontal : Qt::Vertical);
    QVERIFY(wheel(scene.bar, QPoint(5, 5), QPoint(0, -120)));
    // As over the content: an upright wheel scrolls up and down, whichever bar it is over.
    const int scrolled = scene.area.verticalScrollBar()->value();
    QVERIFY(scrolled > 0);
    QCOMPARE(scene.area.horizontalScrollBar()->value(), 0);
    ScrollScene::settle();
    QCOMPARE(scene.bar->value(), scene.real->value());
    QVERIFY(wheel(scene.area.viewport(), QPoint(5, 5), QPoint(0, -120)));
    QCOMPARE(scene.area.verticalScrollBar()->value(), 2 * scrolled);
    QVERIFY(wheel(scene.bar, QPoint(5, 5), QPoint(0, 120)));
    QCOMPARE(scene.area.verticalScrollBar()->value(), scrolled);
}

void TestNicerScrollBarMouse::aWheelOverABarOnTheViewportScrollsOnce()
{
    ScrollScene scene;
    QVERIFY(wheel(scene.bar, QPoint(5, 5), QPoint(0, -120)));
    const int scrolled = scene.real->value();
    scene.bar->setParent(scene.area.viewport());
    scene.bar->show();
    QVERIFY(wheel(scene.bar, QPoint(5, 5), QPoint(0, -120)));
    QCOMPARE(scene.real->value(), 2 * scrolled);
}

void TestNicerScrollBarMouse::aWheelThatTheAreaTurnsAwayIsOfferedAroundItOnce()
{
    WheelCounter around;
    auto* layout = new QVBoxLayout(&around);
    auto* area = new DeafArea;
    layout->addWidget(area);
    auto* bar = new NicerScrollBar(area, Qt::Vertical, NicerScrollBar::epAutomatic, area);
    area->verticalScrollBar()->setRange(0, 100);
    around.resize(300, 200);
    around.show();
    ScrollScene::settle();
    QVERIFY(!wheel(area->viewport(), QPoint(5, 5), QPoint(0, -120)));
    QCOMPARE(around.count, 1);
    QVERIFY(!wheel(bar, QPoint(5, 5), QPoint(0, -120)));
    QCOMPARE(around.count, 2);
    QCOMPARE(area->count, 2);
}

void TestNicerScrollBarMouse::aWheelOverAPlainBarIsIgnored()
{
    NicerScrollBar bar;
    bar.setRange(0, 100);
    QVERIFY(!wheel(&bar, QPoint(5, 5), QPoint(0, -120)));
    QCOMPARE(bar.value(), 0);
}

void TestNicerScrollBarMouse::aSidewaysWheelOverTheVerticalBarScrollsSideways()
{
    const ScrollScene scene;
    QVERIFY(wheel(scene.bar, QPoint(5, 5), QPoint(-120, 0)));
    QVERIFY(scene.area.horizontalScrollBar()->value() > 0);
    QCOMPARE(scene.real->value(), 0);
}

ZELKOV_TEST_MAIN(TestNicerScrollBarMouse)
#include "tst_nicerscrollbarmouse.moc"
