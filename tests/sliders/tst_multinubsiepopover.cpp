// SPDX-License-Identifier: MIT
// Clicks that open the value popover of a handle, and the balloons of handles in a slider.
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "TimeLineScene.h"

#include <QtWidgets/QApplication>

using timelinetest::list;
using timelinetest::Scene;
using vx::Nubsie;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
using zelkovtest::Pointer;

namespace
{
using ItemMap = QMap<vx::ValueRange, QPointer<Item>>;

const QPoint middle(109, 17); // on a handle drawn at 0.5

// A row that is performed by a call; its user data are the value.
struct Row : Item
{
    explicit Row(int value)
        : Item(
            nullptr, vx::PopoverWidget::eifText, value, QString::number(value), QString::number(value), QString())
    {
        setUserData(value);
    }
    QVariant userData() override { return m_userData; }
    void pick() { performSingleClick(QFlags<vx::PopoverWidget::EItemPerformedFlag>()); }
};

Controller* openPopover(const Scene& scene)
{
    const QList<Controller*> all = scene.host.findChildren<Controller*>();
    for (Controller* controller : all) {
        if (controller->isActive()) {
            return controller;
        }
    }
    return nullptr;
}
}

class TestMultiNubsiePopover : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { Manager::init(100); }
    void cleanupTestCase() { Manager::deleteInstance(); }

    void aClickOpensTheItemForExactlyTheValue();
    void anItemForARangeOpensNothing();
    void anInvertedHandleIsLookedUpByTheValueShown();
    void theFeatureIsReadAtTheValue();
    void aPointerThatHasMovedOpensNothing();
    void aDragThatEndsOnSuchAValueOpensNothing();
    void whatIsPickedIsReported();
    void theClosingSettlesTheGesture();
    void theBalloonOfADateHandleFollowsTheDrag();
    void aLongClickTakesTheBalloonAway();
};

void TestMultiNubsiePopover::aClickOpensTheItemForExactlyTheValue()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{100}, new Row(100)}, {{150}, new Row(150)}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    QVERIFY(openPopover(scene) == nullptr);
    QTRY_VERIFY(openPopover(scene) != nullptr);
    // It stays the one in use, and large.
    QTRY_COMPARE(handle->getCurrentSize(), QSize(30, 30));
    QCOMPARE(scene.journal.lines, list({"started 1"}));
}

void TestMultiNubsiePopover::anItemForARangeOpensNothing()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{90, 110}, new Row(100)}, {{100, 101}, new Row(101)}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QTRY_COMPARE(handle->getCurrentSize(), QSize(30, 30));
    pointer.release();
    // Settled without a popover.
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QVERIFY(openPopover(scene) == nullptr);
}

void TestMultiNubsiePopover::anInvertedHandleIsLookedUpByTheValueShown()
{
    Scene scene;
    scene.add(1, 40);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover | Nubsie::enfInverted);
    scene.slider->setItemMap(1, {{{160}, new Row(160)}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(QPoint(49, 17));
    QTRY_VERIFY(openPopover(scene) != nullptr);
}

void TestMultiNubsiePopover::theFeatureIsReadAtTheValue()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{100}, new Row(100)}});
    handle->setFeatureMap(QMap<vx::ValueRange, Nubsie::ENubsieFeatures> {{{90, 110}, Nubsie::enfDraggable}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    QTRY_COMPARE(handle->getCurrentSize(), QSize(30, 30));
    pointer.release();
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QVERIFY(openPopover(scene) == nullptr);
}

void TestMultiNubsiePopover::aPointerThatHasMovedOpensNothing()
{
    for (const int away : {3, 4}) {
        Scene scene;
        Nubsie* const handle = scene.add(1, 100);
        scene.slider->addFeatures(1, Nubsie::enfValuePopover);
        scene.slider->setItemMap(1, {{{100}, new Row(100)}});
        scene.show();
        Pointer pointer(scene.slider);
        pointer.move(middle);
        pointer.press();
        QTRY_COMPARE(handle->getCurrentSize(), QSize(30, 30));
        pointer.move(QPoint(110, 17 + away - 1));
        pointer.move(QPoint(110, 17));
        pointer.release();
        QCOMPARE(scene.slider->value(1), 100);
        if (away == 3) {
            QTRY_VERIFY(openPopover(scene) != nullptr);
        } else {
            QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
            QVERIFY(openPopover(scene) == nullptr);
        }
    }
}

void TestMultiNubsiePopover::aDragThatEndsOnSuchAValueOpensNothing()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{119}, new Row(119)}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    pointer.release();
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 119", "ended 1"}));
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QVERIFY(openPopover(scene) == nullptr);
}

void TestMultiNubsiePopover::whatIsPickedIsReported()
{
    Scene scene;
    scene.add(1, 100);
    auto* const row = new Row(150);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{100}, new Row(100)}, {{150}, row}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    QTRY_VERIFY(openPopover(scene) != nullptr);
    row->pick();
    QCOMPARE(scene.slider->value(1), 150);
    QCOMPARE(scene.journal.lines, list({"started 1", "changed 1 150"}));
    // It stays where it is drawn until it is laid out.
    QCOMPARE(scene.drawn(1), 0.5);
}

void TestMultiNubsiePopover::theClosingSettlesTheGesture()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    auto* const row = new Row(150);
    scene.slider->addFeatures(1, Nubsie::enfValuePopover);
    scene.slider->setItemMap(1, {{{100}, new Row(100)}, {{150}, row}});
    scene.show();
    Pointer pointer(scene.slider);
    pointer.click(middle);
    QTRY_VERIFY(openPopover(scene) != nullptr);
    row->pick();
    handle->hideBalloon();
    QTRY_COMPARE(handle->getCurrentSize(), QSize(20, 20));
    QTRY_COMPARE(scene.drawn(1), 0.75);
    QTRY_COMPARE(handle->getPosition(), scene.slider->nubsiePos(handle));
    // Nothing is in use any more.
    QMouseEvent move(QEvent::MouseMove, QPointF(20, 17), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QVERIFY(!scene.slider->handleEvent(&move));
    QCOMPARE(scene.slider->value(1), 150);
}

void TestMultiNubsiePopover::theBalloonOfADateHandleFollowsTheDrag()
{
    Scene scene;
    scene.add(1, 43200, 0, 86400);
    scene.slider->addFeatures(1, Nubsie::enfDateMode);
    const QDateTime start(QDate(2026, 3, 2), QTime(0, 0), Qt::UTC);
    scene.slider->setStartEndDates(1, start, start.addDays(1));
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    pointer.move(QPoint(129, 17));
    QVERIFY(openPopover(scene) != nullptr);
    pointer.release();
    scene.slider->hideNubsieBalloons();
    QTRY_VERIFY(openPopover(scene) == nullptr);

    // With a difference from an anchor it shows as well, until that is cleared.
    scene.slider->setDateDiff(1, 5000);
    QVERIFY(openPopover(scene) != nullptr);
    scene.slider->clearDateDiff(1);
    QTRY_VERIFY(openPopover(scene) == nullptr);
}

void TestMultiNubsiePopover::aLongClickTakesTheBalloonAway()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->addFeatures(1, Nubsie::enfLongClick | Nubsie::enfBalloon);
    scene.slider->setBalloonTextMap(1, {{{0, 200}, QStringLiteral("hello")}});
    scene.slider->setLongPressSlot(1, scene.journal.slot("longClick"));
    scene.show();
    Pointer pointer(scene.slider);
    pointer.move(middle);
    pointer.press();
    handle->updateBalloon();
    QVERIFY(openPopover(scene) != nullptr);
    Scene::fire(scene.longClickTimer());
    QTRY_VERIFY(openPopover(scene) == nullptr);
    pointer.release();
}

ZELKOV_TEST_MAIN(TestMultiNubsiePopover)
#include "tst_multinubsiepopover.moc"
