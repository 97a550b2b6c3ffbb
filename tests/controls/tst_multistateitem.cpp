// SPDX-License-Identifier: MIT
// The walk through a list of states.
#include "TestCase.h"
#include "TestMain.h"
#include "controls/MultiStateWidget.h"

#include <QtCore/QRandomGenerator>
#include <QtTest/QtTest>
#include <QtWidgets/QWidget>

namespace
{
class OpenItem : public vx::MultiStateItem
{
public:
    using MultiStateItem::getNextState;
    using MultiStateItem::goToNextState;
    void setState(int state) override
    {
        MultiStateItem::setState(state);
        calls << state;
    }
    QList<int> calls;
};

class OpenWidget : public vx::MultiStateWidget
{
public:
    using MultiStateWidget::m_forceNextState;
    using MultiStateWidget::m_stateChangeEnabled;
    using MultiStateWidget::m_widget;
    using MultiStateWidget::MultiStateWidget;
};
}

class TestMultiStateItem : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNextStateFollowsInTheList_data()
    {
        QTest::addColumn<QList<int>>("states");
        QTest::addColumn<int>("state");
        QTest::addColumn<int>("next");
        QTest::newRow("within") << QList<int>{0, 1, 2} << 1 << 2;
        QTest::newRow("wraps") << QList<int>{0, 1, 2} << 2 << 0;
        QTest::newRow("unknown leads to the first") << QList<int>{5, 7} << 9 << 5;
        QTest::newRow("empty stays") << QList<int>{} << 4 << 4;
        QTest::newRow("one") << QList<int>{3} << 3 << 3;
        QTest::newRow("a duplicate counts at its first place") << QList<int>{1, 2, 1} << 1 << 2;
        QTest::newRow("the third is never reached") << QList<int>{1, 2, 1} << 2 << 1;
        QTest::newRow("negative") << QList<int>{-1, -5} << -1 << -5;
    }
    void theNextStateFollowsInTheList()
    {
        QFETCH(QList<int>, states);
        QFETCH(int, state);
        QFETCH(int, next);
        OpenItem item;
        item.setState(state);
        item.setStateList(states);
        QCOMPARE(item.getNextState(), next);
        QCOMPARE(item.goToNextState(false), next);
        QCOMPARE(item.state(), next);
        QCOMPARE(item.stateList(), states);
    }

    void aNewListStylesThePresentState()
    {
        OpenItem item;
        item.setState(4);
        item.calls.clear();
        item.setStateList({1, 2});
        QCOMPARE(item.calls, QList<int>{4});
        QCOMPARE(item.state(), 4);
    }

    void withoutChangesOnlyForceStepsOn()
    {
        OpenItem item;
        item.setState(1);
        item.setStateList({1, 2});
        item.setStateChangeEnabled(false);
        item.calls.clear();
        QCOMPARE(item.goToNextState(false), 1);
        QVERIFY(item.calls.isEmpty());
        QCOMPARE(item.goToNextState(true), 2);
        QCOMPARE(item.calls, QList<int>{2});
    }

    void theWalkVisitsAListWithoutDuplicatesInOrder()
    {
        QRandomGenerator random(7);
        for (int round = 0; round < 200; ++round) {
            QList<int> states;
            const int size = random.bounded(1, 12);
            for (int i = 0; i < size; ++i) {
                states << i * 3 - random.bounded(3);
            }
            OpenItem item;
            item.setState(states.first());
            item.setStateList(states);
            for (int step = 1; step < 30; ++step) {
                QCOMPARE(item.goToNextState(false), states.at(step % size));
            }
        }
    }

    void copiesHaveStatesOfTheirOwn()
    {
        vx::MultiStateItem item;
        item.setStateList({1, 2});
        item.setState(2);
        vx::MultiStateItem copy(item);
        item.setState(1);
        QCOMPARE(copy.state(), 2);
        QCOMPARE(copy.stateList(), (QList<int>{1, 2}));
        copy = item;
        QCOMPARE(copy.state(), 1);
    }

    void theWidgetIsNamedAndTheFirstStateTaken()
    {
        QWidget widget;
        const OpenWidget states({6, 7}, QStringLiteral("light"), &widget);
        QCOMPARE(widget.objectName(), QStringLiteral("light"));
        QCOMPARE(states.state(), 6);
        QVERIFY(states.m_stateChangeEnabled);
        QVERIFY(!states.m_forceNextState);
        QCOMPARE(states.m_widget, &widget);
        QCOMPARE(OpenWidget({}, QString(), &widget).state(), 0);
        OpenWidget copy(states);
        QCOMPARE(copy.state(), 6);
        QCOMPARE(copy.m_widget, &widget);
    }
};

ZELKOV_TEST_MAIN(TestMultiStateItem)
#include "tst_multistateitem.moc"
