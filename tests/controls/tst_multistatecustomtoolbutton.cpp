// SPDX-License-Identifier: MIT
// The custom click button with states.
#include "Pointer.h"
#include "TestCase.h"
#include "TestMain.h"
#include "controls/MultiStateCustomToolButton.h"

#include <QtTest/QtTest>

namespace
{
class OpenCustom : public vx::MultiStateCustomToolButton
{
public:
    using MultiStateCustomToolButton::m_forceNextState;
    using MultiStateCustomToolButton::MultiStateCustomToolButton;
    int styleChanges = 0;

protected:
    void changeEvent(QEvent* event) override
    {
        styleChanges += event->type() == QEvent::StyleChange ? 1 : 0;
        MultiStateCustomToolButton::changeEvent(event);
    }
};
}

class TestMultiStateCustomToolButton : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itIsACustomClickButtonOfItsOwnTime()
    {
        OpenCustom button({4, 5}, QStringLiteral("light"), nullptr);
        QCOMPARE(button.getLongClickSpan(), 750);
        QVERIFY(button.graphicsEffect() == nullptr);
        QCOMPARE(button.objectName(), QStringLiteral("light"));
        QCOMPARE(button.state(), 4);
        QCOMPARE(button.styleChanges, 0);
    }

    void clicksWalk()
    {
        QWidget window;
        window.resize(100, 60);
        OpenCustom button({0, 1, 2}, QStringLiteral("light"), &window);
        button.setGeometry(10, 10, 60, 40);
        window.show();
        button.setState(2);
        zelkovtest::Pointer pointer(&window);
        pointer.click(QPoint(20, 20));
        QCOMPARE(button.state(), 0);
        QVERIFY(!button.isChecked());
    }

    void everySettingStylesAnew()
    {
        OpenCustom button({0, 1}, QStringLiteral("light"), nullptr);
        button.setStyleSheet(QStringLiteral("QToolButton { color: red }"));
        button.ensurePolished();
        button.styleChanges = 0;
        button.setState(0);
        const int once = button.styleChanges;
        QVERIFY(once > 0);
        button.setState(0);
        QCOMPARE(button.styleChanges, 2 * once);
        button.setStateList({1, 2});
        QCOMPARE(button.styleChanges, 3 * once);
    }

    void withoutChangesTheCheckTogglesAllTheSame()
    {
        QWidget window;
        window.resize(100, 60);
        OpenCustom button({0, 1, 2}, QStringLiteral("light"), &window);
        button.setGeometry(10, 10, 60, 40);
        button.setCheckable(true);
        button.setStateChangeEnabled(false);
        window.show();
        zelkovtest::Pointer pointer(&window);
        pointer.click(QPoint(20, 20));
        QCOMPARE(button.state(), 0);
        QVERIFY(button.isChecked());
        QCOMPARE(button.setNextState(false), 0);
        QVERIFY(!button.isChecked());
        QCOMPARE(button.setNextState(true), 1);
        QVERIFY(!button.m_forceNextState);
    }
};

ZELKOV_TEST_MAIN(TestMultiStateCustomToolButton)
#include "tst_multistatecustomtoolbutton.moc"
