// SPDX-License-Identifier: MIT
// Buttons with states: tool button, push button, check box.
#include "Pointer.h"
#include "TestCase.h"
#include "TestMain.h"
#include "controls/MultiStateCheckBox.h"
#include "controls/MultiStatePushButton.h"
#include "controls/MultiStateToolButton.h"

#include <QtTest/QtTest>

namespace
{
int stylings(QWidget* widget, int state)
{
    // Setting a sheet to itself sends a style change; an empty one does not.
    class Counter : public QObject
    {
    public:
        int count = 0;
        bool eventFilter(QObject*, QEvent* event) override
        {
            count += event->type() == QEvent::StyleChange ? 1 : 0;
            return false;
        }
    } counter;
    widget->installEventFilter(&counter);
    widget->setProperty("state", state);
    return counter.count;
}

template<class Button>
class Open : public Button
{
public:
    using Button::Button;
    using Button::m_forceNextState;
};
}

class TestMultiStateButtons : public zelkovtest::TestCase
{
    Q_OBJECT

    template<class Button>
    void walk(const char* className)
    {
        QWidget window;
        window.resize(200, 100);
        auto* const button = new Open<Button>({0, 1, 2}, QStringLiteral("light"), &window);
        button->setGeometry(10, 10, 100, 40);
        window.show();
        QCOMPARE(button->objectName(), QStringLiteral("light"));
        QCOMPARE(QByteArray(Button::staticMetaObject.className()), QByteArray(className));
        QVERIFY(button->graphicsEffect() == nullptr);
        QCOMPARE(button->metaObject()->methodCount(), button->metaObject()->superClass()->methodCount());

        button->setState(2);
        zelkovtest::Pointer pointer(&window);
        pointer.click(QPoint(10, 30));
        QCOMPARE(button->state(), 0);
        pointer.click(QPoint(11, 30));
        QCOMPARE(button->property("state").toInt(), 1);

        button->setStyleSheet(QStringLiteral("QAbstractButton { color: red }"));
        QCOMPARE(stylings(button, 1), 0);
        QCOMPARE(stylings(button, 2), 1);

        // A check goes with the step.
        button->setCheckable(true);
        button->setChecked(false);
        button->setStateList({5, 7});
        button->setState(9);
        pointer.click(QPoint(12, 30));
        QCOMPARE(button->state(), 5);
        QVERIFY(button->isChecked());

        button->setStateChangeEnabled(false);
        pointer.click(QPoint(13, 30));
        QCOMPARE(button->state(), 5);
        QVERIFY(button->isChecked());
        QCOMPARE(button->setNextState(false), 5);
        QCOMPARE(button->setNextState(true), 7);
        QVERIFY(!button->m_forceNextState);
        button->m_forceNextState = true;
        QCOMPARE(button->setNextState(false), 7);
        QVERIFY(button->m_forceNextState);
        QVERIFY(button->isChecked());

        button->m_forceNextState = false;
        button->setStateChangeEnabled(true);
        button->setStateList({});
        pointer.click(QPoint(14, 30));
        QCOMPARE(button->state(), 7);
        QVERIFY(!button->isChecked());
    }

private Q_SLOTS:
    void aToolButtonWalks() { walk<vx::MultiStateToolButton>("vx::MultiStateToolButton"); }
    void aPushButtonWalks() { walk<vx::MultiStatePushButton>("vx::MultiStatePushButton"); }
    void aCheckBoxWalks() { walk<vx::MultiStateCheckBox>("vx::MultiStateCheckBox"); }

    void aSheetDrawsEachState()
    {
        QWidget window;
        window.resize(100, 60);
        window.setStyleSheet(QStringLiteral(
            "QPushButton { border: none; background: red } QPushButton[state=\"2\"] { background: lime }"));
        vx::MultiStatePushButton button({1, 2}, QStringLiteral("b"), &window);
        button.setGeometry(0, 0, 50, 40);
        window.show();
        QCOMPARE(button.grab().toImage().pixelColor(5, 5), QColor(Qt::red));
        button.setState(2);
        QCOMPARE(button.grab().toImage().pixelColor(5, 5), QColor(Qt::green));
        button.setState(1);
        QCOMPARE(button.grab().toImage().pixelColor(5, 5), QColor(Qt::red));
    }
};

ZELKOV_TEST_MAIN(TestMultiStateButtons)
#include "tst_multistatebuttons.moc"
