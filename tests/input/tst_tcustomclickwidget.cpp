// SPDX-License-Identifier: MIT
// The click button with a real pointer: short, long, automatic and context clicks, rights, and the listener.
#include "ClickTools.h"
#include "input/TCustomClickWidget.h"
#include "support/LogCapture.h"
#include "support/Pointer.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QAction>
#include <QtWidgets/QGraphicsEffect>

using clicktest::c_Never;
using clicktest::OnDuty;
using vx::CustomClickAdapter;

namespace
{
using Base = vx::TCustomClickWidget<QToolButton>;

class Button : public Base
{
public:
    explicit Button(QWidget* parent = nullptr, int span = c_Never, bool shadow = false)
        : Base(parent, span, shadow)
    {
        setObjectName(QStringLiteral("button"));
        setGeometry(10, 10, 60, 40);
    }
    using Base::m_color;
    using Base::m_interval;
    using Base::m_maxAlpha;
    using Base::m_minAlpha;
    using Base::m_protected;
    using Base::m_step;
    using Base::m_timer;

    bool holds() const { return m_longClickTimer.isActive(); }
};

/// A window with a button, and what the button emitted with the click type at that moment.
class Scene : public QWidget
{
public:
    explicit Scene(int span = c_Never)
        : button(new Button(this, span))
        , pointer(nullptr)
    {
        resize(120, 90);
        connect(button, &QToolButton::pressed, this, [this] { note("pressed"); });
        connect(button, &QToolButton::released, this, [this] { note("released"); });
        connect(button, &QToolButton::clicked, this, [this](bool on) { note(on ? "clicked on" : "clicked"); });
        connect(button, &QToolButton::toggled, this, [this](bool on) { note(on ? "toggled on" : "toggled off"); });
        show();
        static_cast<void>(QTest::qWaitForWindowExposed(this));
        pointer = std::make_unique<zelkovtest::Pointer>(this);
    }

    void pressInside()
    {
        pointer->move(inside);
        pointer->press();
        QCoreApplication::processEvents();
    }
    void release()
    {
        pointer->release();
        QCoreApplication::processEvents();
    }
    void move(const QPoint& to)
    {
        pointer->move(to);
        QCoreApplication::processEvents();
    }
    QStringList take()
    {
        const QStringList result = emitted;
        emitted.clear();
        return result;
    }
    void note(const char* what)
    {
        emitted << QStringLiteral("%1 %2").arg(QLatin1String(what)).arg(int(button->getClickType()));
    }

    const QPoint inside = QPoint(30, 30);
    const QPoint outside = QPoint(100, 80);
    QPointer<Button> button;
    std::unique_ptr<zelkovtest::Pointer> pointer;
    QStringList emitted;
};

QStringList words(std::initializer_list<const char*> list)
{
    QStringList result;
    for (const char* word : list) {
        result << QLatin1String(word);
    }
    return result;
}
}

/// What a client has: T is the type that its slots name.
class Listener : public QObject
{
    Q_OBJECT

public:
    using T = QToolButton;

    QStringList seen;
    Button* expected = nullptr;
    std::function<void()> whenPressed;

public Q_SLOTS:
    void mousePress(QMouseEvent* event, T* button)
    {
        seen << QStringLiteral("press %1,%2 type %3 held %4")
                    .arg(event->x())
                    .arg(event->y())
                    .arg(int(expected->getClickType()))
                    .arg(expected->holds());
        same = same && button == expected;
        if (whenPressed) {
            whenPressed();
        }
    }
    void mouseRelease(QMouseEvent* event, T* button)
    {
        seen << QStringLiteral("release %1,%2 type %3")
                    .arg(event->x())
                    .arg(event->y())
                    .arg(int(expected->getClickType()));
        same = same && button == expected;
    }

public:
    bool same = true;
};

/// Names the true type of the button, which does not fit.
class OtherListener : public QObject
{
    Q_OBJECT

public:
    int calls = 0;

public Q_SLOTS:
    void mousePress(QMouseEvent*, QToolButton*) { ++calls; }
    void mouseRelease(QMouseEvent*, QToolButton*) { ++calls; }
};

class TestTCustomClickWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itIsMadeWithTheNumbersOfItsPulse()
    {
        Button button(nullptr, 123);
        QCOMPARE(button.m_interval, 100);
        QCOMPARE(button.m_step, 16);
        QCOMPARE(button.m_color.rgb(), QColor(191, 191, 191).rgb());
        QCOMPARE(button.m_minAlpha, 0);
        QCOMPARE(button.m_maxAlpha, 128);
        QCOMPARE(button.focusPolicy(), Qt::NoFocus);
        QCOMPARE(button.getLongClickSpan(), 123);
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNone);
        QVERIFY(button.graphicsEffect() == nullptr);
        Button shaded(nullptr, 123, true);
        QVERIFY(shaded.graphicsEffect() != nullptr);
        QWidget* widget = &button;
        QVERIFY(dynamic_cast<CustomClickAdapter*>(widget) != nullptr);
        QVERIFY(dynamic_cast<vx::TFadingWidget<QToolButton>*>(widget) != nullptr);
    }

    void aShortClickIsANormalOne()
    {
        Scene scene;
        scene.pressInside();
        QVERIFY(scene.button->holds());
        QCOMPARE(scene.take(), words({"pressed 1"}));
        scene.release();
        QVERIFY(!scene.button->holds());
        QCOMPARE(scene.take(), words({"released 1", "clicked 1"}));
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectNormal);
    }

    void aHoldClicksByItselfOnceWithTheMouseStillDown()
    {
        Scene scene(30);
        QSignalSpy clicked(scene.button, &QToolButton::clicked);
        scene.pressInside();
        QVERIFY(clicked.wait());
        QCOMPARE(scene.take(), words({"pressed 1", "pressed 1", "released 2", "clicked 2"}));
        // Nothing that the pointer does from now on is a second click.
        scene.move(scene.inside + QPoint(3, 3));
        scene.move(scene.outside);
        scene.move(scene.inside);
        scene.release();
        QCOMPARE(scene.take(), QStringList());
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectLong);
        QVERIFY(!scene.button->isDown());
    }

    void theNextShortClickIsNormalAgain()
    {
        Scene scene(30);
        QSignalSpy clicked(scene.button, &QToolButton::clicked);
        scene.pressInside();
        QVERIFY(clicked.wait());
        scene.release();
        scene.take();
        scene.button->setLongClickSpan(c_Never);
        scene.pressInside();
        scene.release();
        QCOMPARE(scene.take(), words({"pressed 1", "released 1", "clicked 1"}));
    }

    void withoutAutomaticClicksTheReleaseOfALongHoldClicks()
    {
        Scene scene(30);
        scene.button->setAutoClick(false);
        scene.pressInside();
        QVERIFY(!scene.button->holds());
        clicktest::letPass(40);
        QCOMPARE(scene.take(), words({"pressed 1"}));
        scene.release();
        QCOMPARE(scene.take(), words({"released 2", "clicked 2"}));
        scene.button->setLongClickSpan(c_Never);
        scene.pressInside();
        scene.release();
        QCOMPARE(scene.take(), words({"pressed 1", "released 1", "clicked 1"}));
    }

    void movesCountOnlyWhileTheTimerRuns()
    {
        Scene scene;
        scene.pressInside();
        QVERIFY(scene.button->isDown());
        clicktest::mouse(scene.button, QEvent::MouseMove, QPoint(-5, -5));
        QVERIFY(!scene.button->isDown());
        clicktest::mouse(scene.button, QEvent::MouseMove, QPoint(5, 5));
        QVERIFY(scene.button->isDown());
        scene.button->longClickTimer().stop();
        clicktest::mouse(scene.button, QEvent::MouseMove, QPoint(-5, -5));
        QVERIFY(scene.button->isDown());
        scene.release();
    }

    void leavingStopsTheTimerWithoutAVerdict()
    {
        Scene scene;
        scene.pressInside();
        QEvent leave(QEvent::Leave);
        QApplication::sendEvent(scene.button, &leave);
        QVERIFY(!scene.button->holds());
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectNormal);
        // The release is judged by the letter: the timer no longer runs.
        scene.release();
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectLong);
    }

    void aReleaseOutsideIsNoClick()
    {
        Scene scene;
        scene.pressInside();
        scene.move(scene.outside);
        scene.release();
        QCOMPARE(scene.take(), words({"pressed 1", "released 1"}));
    }

    void aLongClickOnACheckableButtonReportsItsStateAndKeepsIt_data()
    {
        QTest::addColumn<bool>("on");
        QTest::newRow("off") << false;
        QTest::newRow("on") << true;
    }

    void aLongClickOnACheckableButtonReportsItsStateAndKeepsIt()
    {
        QFETCH(bool, on);
        Scene scene(30);
        scene.button->setCheckable(true);
        scene.button->setChecked(on);
        scene.take();
        QSignalSpy clicked(scene.button, &QToolButton::clicked);
        scene.pressInside();
        QVERIFY(clicked.wait());
        scene.release();
        QCOMPARE(scene.button->isChecked(), on);
        QCOMPARE(scene.take(),
            on ? words({"pressed 1", "pressed 1", "toggled on 2", "released 2", "clicked on 2"})
               : words({"pressed 1", "pressed 1", "toggled off 2", "released 2", "clicked 2"}));
    }

    void aShortClickOnACheckableButtonFlipsIt()
    {
        Scene scene;
        scene.button->setCheckable(true);
        scene.pressInside();
        scene.release();
        QVERIFY(scene.button->isChecked());
        QCOMPARE(scene.take(), words({"pressed 1", "toggled on 1", "released 1", "clicked on 1"}));
    }

    void aClickByProgramCountsAsLongWithAutomaticClicks()
    {
        Button button;
        button.setCheckable(true);
        QSignalSpy toggled(&button, &QToolButton::toggled);
        button.click();
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectLong);
        QVERIFY(!button.isChecked());
        QCOMPARE(toggled, (QList<QVariantList> {{false}}));
        Button manual;
        manual.setCheckable(true);
        manual.setAutoClick(false);
        manual.click();
        QCOMPARE(manual.getClickType(), CustomClickAdapter::ectNone);
        QVERIFY(manual.isChecked());
    }

    void aRightClickIsAClickOfItsOwnKind()
    {
        Scene scene;
        scene.button->setCheckable(true);
        scene.button->setChecked(true);
        scene.take();
        scene.pointer->move(scene.inside);
        scene.pointer->press(Qt::RightButton);
        QCoreApplication::processEvents();
        // Not the checked state: always off, and exactly one signal.
        QCOMPARE(scene.take(), words({"clicked 4"}));
        QVERIFY(!scene.button->holds());
        QVERIFY(scene.button->isChecked());
        scene.pointer->release(Qt::RightButton);
        QCoreApplication::processEvents();
        QCOMPARE(scene.take(), QStringList());
    }

    void aRightClickEndsAHold()
    {
        Scene scene;
        scene.pressInside();
        QVERIFY(scene.button->holds());
        clicktest::rightClick(scene.button, QPoint(5, 5));
        QVERIFY(!scene.button->holds());
        QCOMPARE(scene.take(), words({"pressed 1", "clicked 4"}));
        scene.release();
    }

    void otherButtonsHoldToo()
    {
        Scene scene(30);
        QSignalSpy clicked(scene.button, &QToolButton::clicked);
        scene.pointer->move(scene.inside);
        scene.pointer->press(Qt::MiddleButton);
        QVERIFY(clicked.wait());
        QCOMPARE(scene.take(), words({"pressed 1", "released 2", "clicked 2"}));
        scene.pointer->release(Qt::MiddleButton);
    }

    void aRefusedUserGetsNoReaction()
    {
        Scene scene(1);
        OnDuty guard;
        guard->refuses = true;
        scene.button->setSecurityCheck(QStringLiteral("export"));
        scene.button->startFading();
        Listener listener;
        listener.expected = scene.button;
        scene.button->setListener(&listener);
        scene.pressInside();
        QVERIFY(!scene.button->isDown());
        QVERIFY(!scene.button->holds());
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectNone);
        // Not even the pulse ends, since nobody told of a press.
        QVERIFY(scene.button->m_timer.isActive());
        scene.release();
        clicktest::rightClick(scene.button, QPoint(5, 5));
        QCOMPARE(scene.take(), QStringList());
        QCOMPARE(listener.seen, QStringList());
        QCOMPARE(guard->questions.size(), 2);
        QCOMPARE(scene.button->getClickType(), CustomClickAdapter::ectNone);
    }

    void theStateOfARefusedUserStays()
    {
        OnDuty guard;
        guard->refuses = true;
        Button button;
        button.setCheckable(true);
        button.setAutoClick(false);
        button.setSecurityCheck(QStringLiteral("export"));
        QSignalSpy toggled(&button, &QToolButton::toggled);
        button.click();
        QVERIFY(!button.isChecked());
        QCOMPARE(toggled.size(), 0);
    }

    void aRightThatIsTakenAwayDuringTheHoldKeepsTheState()
    {
        Scene scene;
        OnDuty guard;
        scene.button->setSecurityCheck(QStringLiteral("export"));
        scene.button->setCheckable(true);
        scene.pressInside();
        guard->refuses = true;
        scene.release();
        QVERIFY(!scene.button->isChecked());
        QVERIFY(scene.button->m_protected);
        QCOMPARE(guard->questions.size(), 2);
    }

    void theListenerHearsThePressBeforeAndTheReleaseAfter()
    {
        Scene scene;
        Listener listener;
        listener.expected = scene.button;
        scene.button->setListener(&listener);
        connect(
            scene.button, &QToolButton::pressed, &listener, [&] { listener.seen << QStringLiteral("pressed"); });
        connect(
            scene.button, &QToolButton::clicked, &listener, [&] { listener.seen << QStringLiteral("clicked"); });
        scene.pressInside();
        scene.release();
        QCOMPARE(
            listener.seen, words({"press 20,20 type 0 held 0", "pressed", "clicked", "release 20,20 type 1"}));
        QVERIFY(listener.same);
        listener.seen.clear();
        scene.button->setListener(nullptr);
        scene.pressInside();
        scene.release();
        QCOMPARE(listener.seen, words({"pressed", "clicked"}));
    }

    void aListenerNamesTheTypeOfTheButtonAsT()
    {
        Scene scene;
        OtherListener listener;
        scene.button->setListener(&listener);
        // The texts to the letter: one has a blank more than the other.
        expectWarning(QRegularExpression(
            QStringLiteral("No such method OtherListener::mousePress\\(QMouseEvent \\*,T \\*\\)")));
        expectWarning(QRegularExpression(
            QStringLiteral("No such method OtherListener::mouseRelease\\(QMouseEvent \\*,T\\*\\)")));
        scene.pressInside();
        scene.release();
        QCOMPARE(listener.calls, 0);
        QCOMPARE(scene.take(), words({"pressed 1", "released 1", "clicked 1"}));
    }

    void withoutAListenerNothingIsLogged()
    {
        Scene scene;
        zelkovtest::LogCapture log(1);
        scene.pressInside();
        scene.release();
        clicktest::rightClick(scene.button, QPoint(5, 5));
        QCOMPARE(log.text(), QString());
    }

    void aListenerMayDie()
    {
        Scene scene;
        {
            Listener listener;
            scene.button->setListener(&listener);
        }
        scene.pressInside();
        scene.release();
        QCOMPARE(scene.take(), words({"pressed 1", "released 1", "clicked 1"}));
    }

    void whoeverIsAskedOrToldMayDeleteTheButton_data()
    {
        // But not the slots that a release calls: QToolButton itself writes to the button after them.
        QTest::addColumn<QString>("who");
        for (const char* who : {"listener", "manager", "pressed", "long toggled", "long clicked", "context"}) {
            QTest::newRow(who) << QString::fromLatin1(who);
        }
    }

    void whoeverIsAskedOrToldMayDeleteTheButton()
    {
        QFETCH(QString, who);
        const bool isLong = who.startsWith(QLatin1String("long"));
        Scene scene(isLong ? 20 : c_Never);
        OnDuty guard;
        scene.button->setSecurityCheck(QStringLiteral("export"));
        scene.button->setCheckable(true);
        disconnect(scene.button, nullptr, &scene, nullptr);
        Listener listener;
        listener.expected = scene.button;
        scene.button->setListener(&listener);
        const auto kill = [&] { delete scene.button.data(); };
        if (who == QLatin1String("listener")) {
            listener.whenPressed = kill;
        } else if (who == QLatin1String("manager")) {
            guard->whenAsked = kill;
        } else if (who == QLatin1String("pressed")) {
            connect(scene.button, &QToolButton::pressed, &listener, kill);
        } else if (who == QLatin1String("long toggled")) {
            connect(scene.button, &QToolButton::toggled, &listener, kill);
        } else {
            connect(scene.button, &QToolButton::clicked, &listener, kill);
        }
        if (who == QLatin1String("context")) {
            clicktest::rightClick(scene.button, QPoint(5, 5));
        } else {
            scene.pressInside();
            if (isLong) {
                QTRY_VERIFY(scene.button == nullptr);
            }
            scene.release();
        }
        QVERIFY(scene.button == nullptr);
    }

    void theOtherEventsReachTheToolButton()
    {
        Scene scene;
        QAction action(QStringLiteral("Action"));
        scene.button->setDefaultAction(&action);
        QSignalSpy hovered(&action, &QAction::hovered);
        QEnterEvent enter(QPointF(20, 20), QPointF(30, 30), scene.button->mapToGlobal(QPoint(20, 20)));
        QApplication::sendEvent(scene.button, &enter);
        QCOMPARE(hovered.size(), 1);
        scene.take();
        scene.pressInside();
        // What the change of the enabled state does is Qt's work.
        scene.button->setEnabled(false);
        QCOMPARE(scene.take(), words({"pressed 1", "released 1"}));
        scene.release();
    }
};

ZELKOV_TEST_MAIN(TestTCustomClickWidget)
#include "tst_tcustomclickwidget.moc"
