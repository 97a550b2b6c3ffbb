// SPDX-License-Identifier: MIT
// The split button: where the arrow is, and what a click on it does and does not do.
#include "ClickTools.h"
#include "input/CustomContextClickToolButton.h"
#include "support/Pointer.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QMenu>
#include <QtWidgets/QProxyStyle>
#include <QtWidgets/QStyleOptionToolButton>

using clicktest::c_Never;
using clicktest::mouse;
using vx::CustomClickAdapter;

namespace
{
class SplitButton : public vx::CustomContextClickToolButton
{
public:
    explicit SplitButton(QWidget* parent = nullptr, int span = c_Never)
        : vx::CustomContextClickToolButton(parent, span, false)
    {
        setPopupMode(QToolButton::MenuButtonPopup);
        setGeometry(10, 10, 60, 40);
    }
    using vx::CustomContextClickToolButton::insideArrow;
    bool holds() const { return m_longClickTimer.isActive(); }

    QRect arrow() const
    {
        QStyleOptionToolButton option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_ToolButton, &option, QStyle::SC_ToolButtonMenu, this);
    }
};

class NoArrow : public QProxyStyle
{
public:
    NoArrow()
        : QProxyStyle(QStringLiteral("fusion"))
    {
    }
    QRect subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl part,
        const QWidget* widget) const override
    {
        // Not valid, and yet a hit for who only asks whether the point is inside.
        return part == SC_ToolButtonMenu ? QRect(QPoint(40, 0), QPoint(38, 40))
                                         : QProxyStyle::subControlRect(control, option, part, widget);
    }
};
}

class TestCustomContextClickToolButton : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theArrowIsWhereTheStyleHasIt()
    {
        SplitButton button;
        const QRect arrow = button.arrow();
        QVERIFY(arrow.isValid());
        QVERIFY(arrow.width() < button.width());
        for (int x = -1; x <= button.width(); ++x) {
            const QPoint point(x, 20);
            QCOMPARE(button.insideArrow(point), arrow.contains(point));
        }
        QVERIFY(button.insideArrow(arrow.topLeft()));
        QVERIFY(!button.insideArrow(arrow.topLeft() - QPoint(1, 0)));
        QVERIFY(button.insideArrow(arrow.bottomRight()));
        QVERIFY(!button.insideArrow(arrow.bottomRight() + QPoint(1, 0)));
    }

    void anArrowWithoutExtentIsNone()
    {
        NoArrow style;
        SplitButton button;
        button.setStyle(&style);
        QVERIFY(!button.arrow().isValid());
        QVERIFY(!button.insideArrow(QPoint(39, 20)));
    }

    void aClickOnTheArrowIsAClickOfItsOwnKind()
    {
        QWidget host;
        host.resize(120, 90);
        auto* button = new SplitButton(&host);
        QMenu menu;
        menu.addAction(QStringLiteral("One"));
        button->setMenu(&menu);
        QSignalSpy opened(&menu, &QMenu::aboutToShow);
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        QStringList emitted;
        connect(button, &QToolButton::pressed, &host, [&] { emitted << QStringLiteral("pressed"); });
        connect(button, &QToolButton::released, &host, [&] { emitted << QStringLiteral("released"); });
        connect(button, &QToolButton::clicked, &host,
            [&](bool on) { emitted << QStringLiteral("clicked %1 %2").arg(int(button->getClickType())).arg(on); });
        zelkovtest::Pointer pointer(&host);
        pointer.move(button->geometry().topLeft() + button->arrow().center());
        pointer.press();
        QCoreApplication::processEvents();
        QCOMPARE(button->getClickType(), CustomClickAdapter::ectArrow);
        QVERIFY(!button->holds());
        QVERIFY(!button->isDown());
        QCOMPARE(emitted, QStringList());
        pointer.release();
        QCoreApplication::processEvents();
        QCOMPARE(emitted, QStringList(QStringLiteral("clicked 6 0")));
        QCOMPARE(opened.size(), 0);
    }

    void theArrowOfACheckedButtonClicksOffAndKeepsTheState()
    {
        SplitButton button;
        button.setCheckable(true);
        button.setChecked(true);
        QSignalSpy clicked(&button, &QToolButton::clicked);
        // The plain widget ignores both events, so they go on to the parent.
        QVERIFY(!mouse(&button, QEvent::MouseButtonPress, button.arrow().center()));
        QVERIFY(!mouse(&button, QEvent::MouseButtonRelease, button.arrow().center()));
        QCOMPARE(clicked, (QList<QVariantList> {{false}}));
        QVERIFY(button.isChecked());
    }

    void pressesElsewhereAndWithOtherButtonsAreOrdinary()
    {
        SplitButton button;
        QSignalSpy pressed(&button, &QToolButton::pressed);
        mouse(&button, QEvent::MouseButtonPress, QPoint(5, 20));
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNormal);
        QVERIFY(button.holds());
        QCOMPARE(pressed.size(), 1);
        mouse(&button, QEvent::MouseButtonRelease, QPoint(5, 20));

        mouse(&button, QEvent::MouseButtonPress, button.arrow().center(), Qt::MiddleButton);
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNormal);
        QVERIFY(button.holds());
        mouse(&button, QEvent::MouseButtonRelease, button.arrow().center(), Qt::MiddleButton);

        button.setPopupMode(QToolButton::DelayedPopup);
        mouse(&button, QEvent::MouseButtonPress, QPoint(55, 20));
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNormal);
        QVERIFY(button.holds());
        mouse(&button, QEvent::MouseButtonRelease, QPoint(55, 20));
    }

    void aPressOnTheArrowReleasedOutsideItIsNoClick()
    {
        SplitButton button;
        QSignalSpy clicked(&button, &QToolButton::clicked);
        mouse(&button, QEvent::MouseButtonPress, button.arrow().center());
        mouse(&button, QEvent::MouseButtonRelease, QPoint(5, 20));
        QCOMPARE(clicked.size(), 0);
        // The ordinary release judges by the timer, which does not run.
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectLong);
        button.setAutoClick(false);
        mouse(&button, QEvent::MouseButtonPress, button.arrow().center());
        mouse(&button, QEvent::MouseButtonRelease, QPoint(5, 20));
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectArrow);
        QCOMPARE(clicked.size(), 0);
    }

    void anOrdinaryPressReleasedOnTheArrowIsOrdinary()
    {
        SplitButton button;
        QSignalSpy clicked(&button, &QToolButton::clicked);
        mouse(&button, QEvent::MouseButtonPress, QPoint(5, 20));
        mouse(&button, QEvent::MouseButtonRelease, button.arrow().center());
        QCOMPARE(clicked.size(), 1);
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNormal);
    }

    void theArrowAsksForNoRightAndTheRestDoes()
    {
        clicktest::OnDuty guard;
        guard->administrator = false;
        SplitButton button;
        button.setAdminOnly(true);
        QSignalSpy clicked(&button, &QToolButton::clicked);
        mouse(&button, QEvent::MouseButtonPress, button.arrow().center());
        mouse(&button, QEvent::MouseButtonRelease, button.arrow().center());
        QCOMPARE(clicked.size(), 1);
        QCOMPARE(guard->questions, QStringList());
        // A refused press still forgets the last click.
        mouse(&button, QEvent::MouseButtonPress, QPoint(5, 20));
        QCOMPARE(button.getClickType(), CustomClickAdapter::ectNormal);
        mouse(&button, QEvent::MouseButtonRelease, QPoint(5, 20));
        QCOMPARE(clicked.size(), 1);
        QCOMPARE(guard->questions.size(), 1);
    }

    void aSlotOfTheArrowMayDeleteTheButton()
    {
        QPointer<SplitButton> button = new SplitButton;
        connect(button, &QToolButton::clicked, this, [&] { delete button.data(); });
        mouse(button, QEvent::MouseButtonPress, button->arrow().center());
        QMouseEvent release(
            QEvent::MouseButtonRelease, button->arrow().center(), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
        QApplication::sendEvent(button, &release);
        QVERIFY(button == nullptr);
    }

    void aDoubleClickOnTheArrowIsTwoClicks()
    {
        SplitButton button;
        QSignalSpy clicked(&button, &QToolButton::clicked);
        const QPoint arrow = button.arrow().center();
        mouse(&button, QEvent::MouseButtonPress, arrow);
        mouse(&button, QEvent::MouseButtonRelease, arrow);
        mouse(&button, QEvent::MouseButtonDblClick, arrow);
        mouse(&button, QEvent::MouseButtonRelease, arrow);
        QCOMPARE(clicked.size(), 2);
    }
};

ZELKOV_TEST_MAIN(TestCustomContextClickToolButton)
#include "tst_customcontextclicktoolbutton.moc"
