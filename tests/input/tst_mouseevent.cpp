// SPDX-License-Identifier: MIT
// vx::MouseEvent: what each constructor copies, whose time counts, and the name that survives its widget.
#include "input/MouseEvent.h"

#include <memory>

#include <QtGui/QWheelEvent>
#include <QtTest/QtTest>

#include "InputTools.h"
#include "TestCase.h"
#include "TestMain.h"

using vx::MouseEvent;

namespace
{
class OpenEvent : public MouseEvent
{
public:
    using MouseEvent::millis;
    using MouseEvent::MouseEvent;
    using MouseEvent::nothing;
};

QWheelEvent wheel()
{
    return QWheelEvent(QPointF(7, 8), QPointF(207, 158), QPoint(), QPoint(0, 120), Qt::RightButton,
        Qt::ShiftModifier, Qt::NoScrollPhase, false);
}

std::unique_ptr<QWidget> shownWidget()
{
    auto widget = std::make_unique<QWidget>();
    widget->setObjectName(QStringLiteral("camera"));
    widget->setGeometry(100, 100, 200, 150);
    widget->show();
    return widget;
}
}

class TestMouseEvent : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aMouseEventIsCopied()
    {
        QWidget widget;
        widget.setObjectName(QStringLiteral("camera"));
        QMouseEvent event(QEvent::MouseButtonPress, QPointF(1.5, 2), QPointF(3, 4), QPointF(5, 6.25),
            Qt::RightButton, Qt::RightButton | Qt::LeftButton, Qt::ControlModifier);
        event.setTimestamp(77);
        MouseEvent copy(&event, &widget, 0);
        QCOMPARE(copy.type(), QEvent::MouseButtonPress);
        QCOMPARE(copy.localPos(), QPointF(1.5, 2));
        QCOMPARE(copy.windowPos(), QPointF(3, 4));
        QCOMPARE(copy.screenPos(), QPointF(5, 6.25));
        QCOMPARE(copy.button(), Qt::RightButton);
        QCOMPARE(copy.buttons(), Qt::RightButton | Qt::LeftButton);
        QCOMPARE(copy.modifiers(), Qt::KeyboardModifiers(Qt::ControlModifier));
        QCOMPARE(copy.sourceWidget().data(), &widget);
        QCOMPARE(copy.sourceWidgetName(), QStringLiteral("camera"));
        QCOMPARE(copy.timeMillis(), qint64(77));
        QVERIFY(copy.isValid());
    }

    void anEnterEventIsCopiedWithoutButtons()
    {
        QEnterEvent event(QPointF(1, 2), QPointF(3, 4), QPointF(5, 6));
        MouseEvent copy(&event, nullptr, 9);
        QCOMPARE(copy.type(), QEvent::Enter);
        QCOMPARE(copy.localPos(), QPointF(1, 2));
        QCOMPARE(copy.windowPos(), QPointF(3, 4));
        QCOMPARE(copy.screenPos(), QPointF(5, 6));
        QCOMPARE(copy.button(), Qt::NoButton);
        QCOMPARE(copy.buttons(), Qt::MouseButtons(Qt::NoButton));
        QCOMPARE(copy.modifiers(), Qt::KeyboardModifiers(Qt::NoModifier));
        QVERIFY(copy.sourceWidget().isNull());
        QVERIFY(copy.sourceWidgetName().isEmpty());
        QCOMPARE(copy.timeMillis(), qint64(9));
    }

    void aWheelEventKeepsItsModifiersAndLosesItsButtons()
    {
        const auto window = shownWidget();
        QWidget child(window.get());
        child.move(30, 20);
        QWheelEvent event = wheel();
        event.setTimestamp(55);
        const MouseEvent copy(&event, &child, 0);
        QCOMPARE(copy.type(), QEvent::Wheel);
        QCOMPARE(copy.localPos(), QPointF(7, 8));
        QCOMPARE(copy.screenPos(), QPointF(207, 158));
        QCOMPARE(copy.windowPos(), QPointF(window->mapFromGlobal(QPoint(207, 158))));
        QVERIFY(copy.windowPos() != copy.localPos());
        QCOMPARE(copy.buttons(), Qt::MouseButtons(Qt::NoButton));
        QCOMPARE(copy.modifiers(), Qt::KeyboardModifiers(Qt::ShiftModifier));
        QCOMPARE(copy.timeMillis(), qint64(55));

        const MouseEvent homeless(&event, nullptr, 0);
        QCOMPARE(homeless.windowPos(), QPointF());
        QCOMPARE(homeless.localPos(), QPointF(7, 8));
    }

    void anEventMadeUpStandsAtTheCursor()
    {
        QCursor::setPos(150, 130);
        const auto window = shownWidget();
        QWidget child(window.get());
        child.move(30, 20);
        const MouseEvent made(QEvent::Leave, &child, 4);
        QCOMPARE(made.type(), QEvent::Leave);
        QCOMPARE(made.screenPos(), QPointF(QCursor::pos()));
        QCOMPARE(made.windowPos(), QPointF(window->mapFromGlobal(QCursor::pos())));
        QCOMPARE(made.localPos(), QPointF(child.mapFromGlobal(QCursor::pos())));
        QVERIFY(made.windowPos() != made.localPos());
        QCOMPARE(made.buttons(), Qt::MouseButtons(Qt::NoButton));
        QCOMPARE(made.timeMillis(), qint64(4));

        const MouseEvent homeless(QEvent::Leave, nullptr, 0);
        QCOMPARE(homeless.screenPos(), QPointF(QCursor::pos()));
        QCOMPARE(homeless.windowPos(), QPointF());
        QCOMPARE(homeless.localPos(), QPointF());
    }

    void theTimeGivenWinsThenTheEventsOwnThenNow()
    {
        QMouseEvent event = inputtest::press(QPoint(), 500);
        QCOMPARE(OpenEvent::millis(3, &event), qint64(3));
        QCOMPARE(OpenEvent::millis(-3, &event), qint64(-3));
        QCOMPARE(OpenEvent::millis(0, &event), qint64(500));
        event.setTimestamp(0);
        const qint64 before = QDateTime::currentMSecsSinceEpoch();
        const qint64 stamped = OpenEvent::millis(0, &event);
        const qint64 without = OpenEvent::millis(0, nullptr);
        const qint64 entered = [] {
            QEnterEvent enter = inputtest::enter(QPoint());
            return MouseEvent(&enter, nullptr, 0).timeMillis();
        }();
        const qint64 made = MouseEvent(QEvent::Leave, nullptr, 0).timeMillis();
        const qint64 after = QDateTime::currentMSecsSinceEpoch();
        for (const qint64 time : {stamped, without, entered, made}) {
            QVERIFY(time >= before && time <= after);
        }
        QCOMPARE(MouseEvent(QEvent::Leave, nullptr, 86400000).time(), QDateTime::fromMSecsSinceEpoch(86400000));
    }

    void onlyAnEventWithATypeIsValid()
    {
        QVERIFY(!MouseEvent().isValid());
        QVERIFY(!MouseEvent(QEvent::None, nullptr, 1).isValid());
        QVERIFY(MouseEvent(QEvent::Leave, nullptr, 1).isValid());
    }

    void theNullObjectWasMadeWithoutAnApplication()
    {
        const MouseEvent& nothing = OpenEvent::nothing;
        QVERIFY(!nothing.isValid());
        QCOMPARE(nothing.screenPos(), QPointF());
        QCOMPARE(nothing.localPos(), QPointF());
        QCOMPARE(nothing.windowPos(), QPointF());
        QCOMPARE(nothing.buttons(), Qt::MouseButtons(Qt::NoButton));
        QVERIFY(nothing.sourceWidget().isNull());
        QVERIFY(MouseEvent(nothing).sourceWidgetName().isEmpty());
        QVERIFY(nothing.timeMillis() > 0);
        QVERIFY(nothing.timeMillis() <= QDateTime::currentMSecsSinceEpoch());
    }

    void aRectangleContainsItsBorder()
    {
        QMouseEvent event = inputtest::press(QPoint(10, 10), 1);
        const MouseEvent copy(&event, nullptr, 0);
        QVERIFY(copy.isInside(QRect(10, 10, 5, 5)));
        QVERIFY(copy.isInside(QRect(6, 6, 5, 5)));
        QVERIFY(!copy.isInside(QRect(5, 5, 5, 5)));
        QVERIFY(!copy.isInside(QRect(11, 10, 5, 5)));
        QVERIFY(!copy.isInside(QRect()));
    }

    void aWidgetContainsItsAreaOnTheScreen()
    {
        const auto window = shownWidget();
        QWidget child(window.get());
        child.setGeometry(30, 20, 40, 40);
        const auto at = [](const QPoint& global) {
            QMouseEvent event = inputtest::press(global, 1);
            return MouseEvent(&event, nullptr, 0);
        };
        QVERIFY(at(child.mapToGlobal(QPoint(0, 0))).isInside(&child));
        QVERIFY(at(child.mapToGlobal(QPoint(39, 39))).isInside(&child));
        QVERIFY(!at(child.mapToGlobal(QPoint(40, 39))).isInside(&child));
        QVERIFY(!at(child.mapToGlobal(QPoint(-1, 0))).isInside(&child));
        QVERIFY(!at(QPoint(0, 0)).isInside(nullptr));
    }

    void theNameIsReadAgainWhileTheWidgetIsInUse()
    {
        auto widget = shownWidget();
        MouseEvent event(QEvent::Leave, widget.get(), 1);
        widget->setObjectName(QStringLiteral("door"));
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("door"));
        widget->setObjectName(QString());
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("door"));
        widget->setObjectName(QStringLiteral("hidden"));
        widget->hide();
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("door"));
        widget->show();
        widget->setEnabled(false);
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("door"));
        widget->setEnabled(true);
        widget->setObjectName(QStringLiteral("gate"));
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("gate"));
        widget->setObjectName(QStringLiteral("never asked for"));
        widget.reset();
        QVERIFY(event.sourceWidget().isNull());
        QCOMPARE(event.sourceWidgetName(), QStringLiteral("gate"));
    }

    void theNameAtConstructionIsTakenFromAHiddenWidget()
    {
        QWidget widget;
        widget.setObjectName(QStringLiteral("asleep"));
        QCOMPARE(MouseEvent(QEvent::Leave, &widget, 1).sourceWidgetName(), QStringLiteral("asleep"));
    }

    void copiesAndMovesKeepEverything()
    {
        QWidget widget;
        widget.setObjectName(QStringLiteral("camera"));
        QMouseEvent event = inputtest::press(QPoint(12, 34), 56, Qt::RightButton);
        const MouseEvent original(&event, &widget, 0);
        MouseEvent copy(original);
        MouseEvent assigned;
        assigned = original;
        MouseEvent moved(std::move(copy));
        MouseEvent moveAssigned;
        moveAssigned = std::move(assigned);
        for (MouseEvent* each : {&moved, &moveAssigned}) {
            QCOMPARE(each->type(), QEvent::MouseButtonPress);
            QCOMPARE(each->globalPos(), QPoint(12, 34));
            QCOMPARE(each->button(), Qt::RightButton);
            QCOMPARE(each->timeMillis(), qint64(56));
            QCOMPARE(each->sourceWidget().data(), &widget);
            QCOMPARE(each->sourceWidgetName(), QStringLiteral("camera"));
        }
    }

    void nullEventsMakeInvalidOnes()
    {
        QVERIFY(!MouseEvent(static_cast<QMouseEvent*>(nullptr), nullptr, 0).isValid());
        QVERIFY(!MouseEvent(static_cast<QEnterEvent*>(nullptr), nullptr, 0).isValid());
        QVERIFY(!MouseEvent(static_cast<QWheelEvent*>(nullptr), nullptr, 0).isValid());
    }

    void aVariantCarriesIt()
    {
        const MouseEvent event(QEvent::Leave, nullptr, 42);
        const QVariant variant = QVariant::fromValue(event);
        QCOMPARE(QByteArray(variant.typeName()), QByteArray("vx::MouseEvent"));
        QCOMPARE(variant.value<MouseEvent>().timeMillis(), qint64(42));
        QCOMPARE(QMetaType::sizeOf(QMetaType::type("vx::MouseEvent")), int(sizeof(MouseEvent)));
    }
};

ZELKOV_TEST_MAIN(TestMouseEvent)
#include "tst_mouseevent.moc"
