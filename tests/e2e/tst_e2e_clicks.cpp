// SPDX-License-Identifier: MIT
// A real pointer on click buttons: a long hold, right clicks, the arrow of a split button.
#include "input/CustomClickQWidget.h"
#include "input/CustomContextClickToolButton.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QProcess>
#include <QtTest/QtTest>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QMenu>
#include <QtWidgets/QStyleOptionToolButton>

namespace
{
using Button = vx::TCustomClickWidget<QToolButton>;

class Split : public vx::CustomContextClickToolButton
{
public:
    using vx::CustomContextClickToolButton::CustomContextClickToolButton;

    QPoint arrow() const
    {
        QStyleOptionToolButton option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_ToolButton, &option, QStyle::SC_ToolButtonMenu, this).center();
    }
};

class Scene : public QWidget
{
public:
    Scene()
        : hold(new Button(this, vx::CustomClickAdapter::s_DefaultLongClickSpan, false))
        , split(new Split(this, vx::CustomClickAdapter::s_DefaultLongClickSpan, false))
    {
        setGeometry(200, 150, 300, 120);
        hold->setGeometry(20, 20, 80, 60);
        split->setGeometry(140, 20, 100, 60);
        split->setPopupMode(QToolButton::MenuButtonPopup);
        menu.addAction(QStringLiteral("One"));
        split->setMenu(&menu);
        follow(hold);
        follow(split);
        connect(&menu, &QMenu::aboutToShow, this, [this] { seen << QStringLiteral("menu"); });
    }

    void follow(Button* button)
    {
        connect(button, &QToolButton::pressed, this, [this] { seen << QStringLiteral("pressed"); });
        connect(button, &QToolButton::released, this, [this] { seen << QStringLiteral("released"); });
        connect(button, &QToolButton::clicked, this,
            [this, button] { seen << QStringLiteral("clicked %1").arg(int(button->getClickType())); });
    }

    Button* hold;
    Split* split;
    QMenu menu;
    QStringList seen;
};

QStringList words(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(','));
}

QStringList to(const QWidget* widget, const QPoint& position)
{
    const QPoint global = widget->mapToGlobal(position);
    return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
        QStringLiteral("sleep"), QStringLiteral("0.05")};
}

QStringList then(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

void pointer(const QStringList& arguments)
{
    QProcess xdotool;
    xdotool.start(QStringLiteral("xdotool"), arguments);
    QVERIFY(QTest::qWaitFor([&] { return xdotool.state() == QProcess::NotRunning; }, 10000));
    QCOMPARE(xdotool.exitCode(), 0);
}
}

class TestE2eClicks : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aShortClickIsNormal()
    {
        Scene scene;
        show(scene);
        pointer(to(scene.hold, QPoint(30, 30)) + then("mousedown 1 sleep 0.1 mouseup 1"));
        QTRY_COMPARE(scene.seen, words("pressed,released,clicked 1"));
    }

    void aLongHoldClicksByItselfAndTheReleaseBringsNothing()
    {
        Scene scene;
        show(scene);
        pointer(to(scene.hold, QPoint(30, 30)) + then("mousedown 1"));
        QTRY_COMPARE(scene.seen, words("pressed,pressed,released,clicked 2"));
        // A shaking hand, out of the button and back, and the end of the hold.
        pointer(to(scene.hold, QPoint(33, 31)) + to(scene.hold, QPoint(33, 90)) + to(scene.hold, QPoint(31, 30))
            + then("mouseup 1 sleep 0.1"));
        QTRY_VERIFY(QApplication::mouseButtons() == Qt::NoButton);
        QCOMPARE(scene.seen, words("pressed,pressed,released,clicked 2"));
    }

    void aHoldGoesOnOutsideSinceQtTellsOfLeavingAfterTheRelease()
    {
        Scene scene;
        show(scene);
        pointer(to(scene.hold, QPoint(30, 30)) + then("mousedown 1 sleep 0.1") + to(&scene, QPoint(120, 100))
            + then("sleep 1 mouseup 1 sleep 0.1"));
        QTRY_COMPARE(scene.seen, words("pressed,released,pressed,released,clicked 2"));
    }

    void aRightClickIsAContextClick()
    {
        Scene scene;
        show(scene);
        pointer(to(scene.split, QPoint(30, 30)) + then("mousedown 3 sleep 0.1 mouseup 3 sleep 0.1"));
        QTRY_COMPARE(scene.seen, words("clicked 4"));
    }

    void aClickOnTheArrowIsItsOwnAndOpensNoMenu()
    {
        Scene scene;
        show(scene);
        pointer(to(scene.split, scene.split->arrow()) + then("mousedown 1 sleep 0.9"));
        QCOMPARE(scene.seen, QStringList());
        QCOMPARE(scene.split->getClickType(), vx::CustomClickAdapter::ectArrow);
        pointer(then("mouseup 1"));
        QTRY_COMPARE(scene.seen, words("clicked 6"));
        pointer(to(scene.split, QPoint(30, 30)) + then("mousedown 1 sleep 0.1 mouseup 1"));
        QTRY_COMPARE(scene.seen, words("clicked 6,pressed,released,clicked 1"));
    }

private:
    static void show(QWidget& window)
    {
        window.show();
        QVERIFY(QTest::qWaitForWindowActive(&window));
        // The window manager moves the window once more after it is shown.
        QPoint last;
        QTRY_VERIFY([&] {
            const QPoint now = window.mapToGlobal(QPoint());
            const bool still = now == last;
            last = now;
            return still;
        }());
    }
};

ZELKOV_TEST_MAIN(TestE2eClicks)
#include "tst_e2e_clicks.moc"
