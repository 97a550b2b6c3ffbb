// SPDX-License-Identifier: MIT
// vx::MouseGesture: what is recorded, how it lives, and what it was.
#include "input/MouseGesture.h"

#include <memory>

#include <QtGui/QStandardItemModel>
#include <QtTest/QtTest>
#include <QtWidgets/QTableView>

#include "InputTools.h"
#include "TestCase.h"
#include "TestMain.h"

using namespace inputtest;

namespace
{
const QPoint start(300, 300);
constexpr ulong t0 = 10000;
const Qt::MouseButtons anyButton = Qt::MouseButtonMask;

QPoint by(int dx, int dy = 0)
{
    return start + QPoint(dx, dy);
}

QStringList verdictsOf(const vx::MouseGesture& gesture)
{
    QStringList result;
    if (gesture.wasSwipe(vx::dAny)) {
        result << QStringLiteral("swipe");
    }
    if (gesture.wasPan(vx::dAny)) {
        result << QStringLiteral("pan");
    }
    if (gesture.wasDoubleClick(anyButton)) {
        result << QStringLiteral("double");
    }
    if (gesture.wasLongClick(anyButton)) {
        result << QStringLiteral("long");
    }
    if (gesture.wasSingleClick(anyButton)) {
        result << QStringLiteral("single");
    }
    return result;
}
}

class TestMouseGesture : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void oneReleaseGetsOneVerdict_data()
    {
        QTest::addColumn<QPoint>("end");
        QTest::addColumn<int>("after");
        QTest::addColumn<QString>("verdict");
        QTest::newRow("in place") << by(0) << 10 << "single";
        QTest::newRow("8 pixels") << by(8) << 10 << "single";
        QTest::newRow("8 pixels diagonally") << by(-4, 4) << 10 << "single";
        QTest::newRow("9 pixels") << by(9) << 10 << "swipe";
        QTest::newRow("9 pixels diagonally") << by(-5, 4) << 10 << "swipe";
        QTest::newRow("999 ms") << by(0) << 999 << "single";
        QTest::newRow("1000 ms") << by(0) << 1000 << "long";
        QTest::newRow("8 pixels, 1000 ms") << by(0, 8) << 1000 << "long";
        QTest::newRow("9 pixels, 1000 ms") << by(0, 9) << 1000 << "swipe";
        QTest::newRow("9 pixels, 1001 ms") << by(0, 9) << 1001 << "pan";
    }
    void oneReleaseGetsOneVerdict()
    {
        QFETCH(QPoint, end);
        QFETCH(int, after);
        QFETCH(QString, verdict);
        OpenGesture gesture;
        gesture.feed(press(start, t0), release(end, t0 + ulong(after)));
        QCOMPARE(verdictsOf(gesture), QStringList());
        QVERIFY(gesture.finish());
        QCOMPARE(verdictsOf(gesture), QStringList(verdict));
    }

    void twoReleasesAreADoubleClickOrNothing_data()
    {
        QTest::addColumn<QPoint>("end");
        QTest::addColumn<int>("after");
        QTest::addColumn<QStringList>("verdicts");
        QTest::newRow("400 ms") << by(0) << 400 << QStringList(QStringLiteral("double"));
        QTest::newRow("401 ms") << by(0) << 401 << QStringList();
        QTest::newRow("12 pixels") << by(12) << 300 << QStringList(QStringLiteral("double"));
        QTest::newRow("13 pixels") << by(13) << 300 << QStringList();
    }
    void twoReleasesAreADoubleClickOrNothing()
    {
        QFETCH(QPoint, end);
        QFETCH(int, after);
        OpenGesture gesture(400, 1000, 1000, 8, 12);
        gesture.feed(press(start, t0), release(start, t0 + 50), doublePress(end, t0 + 200),
            release(end, t0 + ulong(after)));
        QCOMPARE(gesture.clickCount(), 2);
        QCOMPARE(gesture.count(QEvent::MouseButtonDblClick), 0);
        QVERIFY(gesture.finish());
        QTEST(verdictsOf(gesture), "verdicts");
    }

    void aLongClickIntervalOfNullLeavesTheSingleClickUnbounded()
    {
        OpenGesture gesture(400, 0);
        gesture.feed(press(start, t0), release(start, t0 + 3600000));
        gesture.finish();
        QCOMPARE(verdictsOf(gesture), QStringList(QStringLiteral("single")));
    }

    void aDoubleClickIntervalOfNullKnowsNoDoubleClick()
    {
        OpenGesture gesture(0);
        gesture.feed(press(start, t0), release(start, t0), release(start, t0));
        gesture.finish();
        QCOMPARE(verdictsOf(gesture), QStringList());
    }

    void theMaskIsComparedWithTheButtonsOfTheFirstEvent()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0, Qt::RightButton), release(start, t0 + 10, Qt::RightButton));
        gesture.finish();
        QCOMPARE(gesture.buttons(), Qt::MouseButtons(Qt::RightButton));
        QVERIFY(gesture.wasSingleClick(Qt::RightButton | Qt::LeftButton));
        QVERIFY(!gesture.wasSingleClick(Qt::LeftButton));
        QVERIFY(!gesture.wasSingleClick(Qt::NoButton));
    }

    void aSwipeIsMeasuredToTheReleaseAndAPanToTheLastEvent()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0), release(by(50), t0 + 100), move(by(0, 80), t0 + 2000));
        gesture.finish();
        QVERIFY(gesture.wasSwipe(vx::dRight));
        QVERIFY(!gesture.wasSwipe(vx::dDown));
        QVERIFY(gesture.wasPan(vx::dDown));
        QVERIFY(!gesture.wasPan(vx::dRight));
        QCOMPARE(gesture.swipeDirection(), vx::dDown);
        QCOMPARE(gesture.swipeOffset(), QPoint(0, 80));
    }

    void orientationsStandForTheirTwoDirections_data()
    {
        QTest::addColumn<QPoint>("end");
        QTest::addColumn<bool>("horizontal");
        QTest::newRow("left") << by(-50) << true;
        QTest::newRow("right") << by(50) << true;
        QTest::newRow("up") << by(0, -50) << false;
        QTest::newRow("down") << by(0, 50) << false;
    }
    void orientationsStandForTheirTwoDirections()
    {
        QFETCH(QPoint, end);
        QFETCH(bool, horizontal);
        OpenGesture swipe;
        swipe.feed(press(start, t0), move(end, t0 + 10));
        QCOMPARE(swipe.isPan(Qt::Horizontal), horizontal);
        QCOMPARE(swipe.isPan(Qt::Vertical), !horizontal);
        swipe.feed(release(end, t0 + 20));
        swipe.finish();
        QCOMPARE(swipe.wasSwipe(Qt::Horizontal), horizontal);
        QCOMPARE(swipe.wasSwipe(Qt::Vertical), !horizontal);
        OpenGesture pan;
        pan.feed(press(start, t0), release(end, t0 + 2000));
        pan.finish();
        QCOMPARE(pan.wasPan(Qt::Horizontal), horizontal);
        QCOMPARE(pan.wasPan(Qt::Vertical), !horizontal);
    }

    void thePanIsLiveOutsideTheRadiusUntilTheRelease()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0));
        QVERIFY(!gesture.isPan(vx::dAny));
        gesture.feed(move(by(8), t0 + 10));
        QVERIFY(!gesture.isPan(vx::dAny));
        gesture.feed(move(by(9), t0 + 20));
        QVERIFY(gesture.isPan(vx::dAny));
        QVERIFY(gesture.isPan(vx::dRight));
        QVERIFY(!gesture.isPan(vx::dLeft));
        gesture.feed(move(by(3), t0 + 30));
        QVERIFY(!gesture.isPan(vx::dAny));
        gesture.feed(move(by(30), t0 + 40));
        OpenGesture canceled(gesture);
        QVERIFY(canceled.cancel());
        QVERIFY(canceled.isPan(vx::dAny));
        gesture.feed(release(by(30), t0 + 50));
        QVERIFY(!gesture.isPan(vx::dAny));
    }

    void theLargerRadiusCountsForInsideClickRadius()
    {
        OpenGesture wideDouble(400, 1000, 1000, 8, 12);
        wideDouble.feed(press(start, t0), move(by(12), t0 + 1));
        QVERIFY(wideDouble.insideClickRadius(1));
        wideDouble.feed(move(by(13), t0 + 2));
        QVERIFY(!wideDouble.insideClickRadius(1));
        OpenGesture wideClick(400, 1000, 1000, 12, 8);
        wideClick.feed(press(start, t0), move(by(12), t0 + 1));
        QVERIFY(wideClick.insideClickRadius(1));
        // Of the second press, which is far away; the third does not exist and lies at the null object.
        wideClick.feed(press(by(100), t0 + 3));
        QVERIFY(!wideClick.insideClickRadius(1));
        QVERIFY(wideClick.insideClickRadius(2));
        QVERIFY(!wideClick.insideClickRadius(3));
    }

    void onlyItsKindsOfEventsAreRecorded()
    {
        OpenGesture gesture;
        QMouseEvent twice = doublePress(start, t0);
        QKeyEvent key(QEvent::KeyPress, Qt::Key_A, Qt::NoModifier);
        QVERIFY(!gesture.add(&twice, nullptr));
        QVERIFY(!gesture.add(&key, nullptr));
        QVERIFY(!gesture.add(nullptr, nullptr));
        QVERIFY(!gesture.isStarted());

        QMouseEvent down = press(start, t0);
        QMouseEvent held = move(start, t0);
        QMouseEvent up = release(start, t0);
        QEnterEvent in = enter(start);
        QEvent out(QEvent::Leave);
        for (QEvent* event : std::initializer_list<QEvent*> {&down, &held, &up, &in, &out}) {
            QVERIFY(gesture.add(event, nullptr));
            QCOMPARE(gesture.last().type(), event->type());
        }
        QCOMPARE(gesture.first().type(), QEvent::MouseButtonPress);
        QCOMPARE(gesture.indexOf(QEvent::Leave, 0), 4);
        QCOMPARE(gesture.count(QEvent::Enter), 1);
        QVERIFY(gesture.finish());
        QVERIFY(!gesture.add(&down, nullptr));
        QCOMPARE(gesture.count(QEvent::MouseButtonPress), 1);
    }

    void aMoveWithoutButtonsChangesTheStateOnly()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0));
        QVERIFY(gesture.isJustStarted());
        QMouseEvent hover = move(by(5), t0 + 1, Qt::NoButton);
        QVERIFY(gesture.add(&hover, nullptr));
        QVERIFY(!gesture.isJustStarted());
        QVERIFY(gesture.isStarted());
        QCOMPARE(gesture.count(QEvent::MouseMove), 0);
        QCOMPARE(gesture.last().type(), QEvent::MouseButtonPress);
    }

    void theStatesFollowEachOther()
    {
        OpenGesture gesture;
        QVERIFY(!gesture.isStarted());
        QVERIFY(!gesture.finish());
        QVERIFY(!gesture.cancel());
        QVERIFY(gesture.startOrUpdate());
        QVERIFY(gesture.isJustStarted() && gesture.isStarted());
        QVERIFY(gesture.startOrUpdate());
        QVERIFY(!gesture.isJustStarted() && gesture.isStarted());
        QVERIFY(gesture.startOrUpdate());
        QVERIFY(!gesture.isJustStarted() && gesture.isStarted());

        OpenGesture canceled(gesture);
        QVERIFY(canceled.cancel());
        QVERIFY(canceled.isCanceled() && !canceled.isStarted() && !canceled.isFinished());
        QVERIFY(!canceled.cancel());
        QVERIFY(!canceled.finish());
        QVERIFY(!canceled.startOrUpdate());

        QVERIFY(gesture.finish());
        QVERIFY(gesture.isFinished() && !gesture.isStarted() && !gesture.isCanceled());
        QVERIFY(!gesture.finish());
        QVERIFY(!gesture.cancel());
        QVERIFY(!gesture.startOrUpdate());
        OpenGesture early;
        early.startOrUpdate();
        QVERIFY(early.finish());
        QCOMPARE(int(vx::MouseGesture::gsIdle), 0);
        QCOMPARE(int(vx::MouseGesture::gsJustStarted), 1);
        QCOMPARE(int(vx::MouseGesture::gsStarted), 2);
        QCOMPARE(int(vx::MouseGesture::gsFinished), 3);
        QCOMPARE(int(vx::MouseGesture::gsCanceled), 4);
    }

    void pressesAndReleasesAreCountedFromOne()
    {
        OpenGesture gesture;
        gesture.feed(press(by(1), t0), release(by(2), t0), move(by(9), t0), press(by(3), t0), release(by(4), t0));
        QCOMPARE(gesture.pressed(1).globalPos(), by(1));
        QCOMPARE(gesture.pressed(2).globalPos(), by(3));
        QCOMPARE(gesture.released(1).globalPos(), by(2));
        QCOMPARE(gesture.released(2).globalPos(), by(4));
        for (const int n : {-1, 0, 3}) {
            QVERIFY(!gesture.pressed(n).isValid());
            QVERIFY(!gesture.released(n).isValid());
        }
        QCOMPARE(gesture.indexOf(QEvent::MouseButtonRelease, 1), 4);
        QCOMPARE(gesture.indexOf(QEvent::MouseButtonRelease, 2), -1);
        QCOMPARE(gesture.indexOf(QEvent::MouseButtonRelease, -1), -1);
        QCOMPARE(gesture.clickCount(), 2);
    }

    void lastPanOffsetGivesIncrements()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0), move(by(20, 5), t0 + 1));
        QCOMPARE(gesture.lastPanDirection(), vx::dRight);
        QCOMPARE(gesture.lastPanOffset(), QPoint(20, 5));
        QCOMPARE(gesture.lastPanOffset(), QPoint());
        gesture.feed(move(by(20, -30), t0 + 2));
        QCOMPARE(gesture.lastPanDirection(), vx::dUp);
        QCOMPARE(gesture.lastPanDirection(), vx::dUp);
        QCOMPARE(gesture.lastPanOffset(), QPoint(0, -35));
        QCOMPARE(gesture.panOffset(), QPoint(20, -30));
        QCOMPARE(gesture.panOffset(), QPoint(20, -30));
        QCOMPARE(gesture.panDirection(), vx::dUp);
        // The latest press is where pans begin, the first one is where swipes begin.
        gesture.feed(press(by(100), t0 + 3), move(by(107), t0 + 4));
        QCOMPARE(gesture.panOffset(), QPoint(7, 0));
        QCOMPARE(gesture.lastPanOffset(), QPoint(7, 0));
        QCOMPARE(gesture.swipeOffset(), QPoint(107, 0));
        QCOMPARE(gesture.swipeDirection(), vx::dRight);
        gesture.feed(release(by(110), t0 + 5));
        QCOMPARE(gesture.panOffset(), QPoint(10, 0));
        QCOMPARE(gesture.lastPanOffset(), QPoint(3, 0));
    }

    void theClickedWidgetIsThatOfTheFirstRelease()
    {
        auto pressedOne = std::make_unique<QWidget>();
        auto releasedOne = std::make_unique<QWidget>();
        pressedOne->setObjectName(QStringLiteral("pressed"));
        releasedOne->setObjectName(QStringLiteral("released"));
        OpenGesture gesture;
        QCOMPARE(gesture.clickedWidget(), static_cast<QWidget*>(nullptr));
        QVERIFY(gesture.clickedWidgetName().isEmpty());
        QMouseEvent down = press(start, t0);
        gesture.add(&down, pressedOne.get());
        QCOMPARE(gesture.clickedWidget(), pressedOne.get());
        QCOMPARE(gesture.clickedWidgetName(), QStringLiteral("pressed"));
        QMouseEvent up = release(start, t0);
        gesture.add(&up, releasedOne.get());
        QCOMPARE(gesture.clickedWidget(), releasedOne.get());
        releasedOne->show();
        releasedOne->setObjectName(QStringLiteral("renamed"));
        QCOMPARE(gesture.clickedWidgetName(), QStringLiteral("renamed"));
        releasedOne.reset();
        QCOMPARE(gesture.clickedWidget(), static_cast<QWidget*>(nullptr));
        QCOMPARE(gesture.clickedWidgetName(), QStringLiteral("renamed"));
    }

    void theIndexIsTheOneUnderTheFirstPress()
    {
        QStandardItemModel model(10, 3);
        QTableView view;
        view.setModel(&model);
        view.setGeometry(60, 70, 300, 300);
        view.show();
        OpenGesture gesture;
        gesture.feed(press(view.mapToGlobal(QPoint(10, 100)), t0), release(view.mapToGlobal(QPoint(10, 10)), t0));
        QVERIFY(gesture.indexAt(&view).isValid());
        QCOMPARE(gesture.indexAt(&view), view.indexAt(QPoint(10, 100)));
        QVERIFY(!gesture.indexAt(nullptr).isValid());
    }

    void anEmptyGestureAnswersEverything()
    {
        OpenGesture gesture;
        QVERIFY(!gesture.first().isValid());
        QVERIFY(!gesture.last().isValid());
        QCOMPARE(gesture.buttons(), Qt::MouseButtons(Qt::NoButton));
        QCOMPARE(gesture.clickCount(), 0);
        QVERIFY(gesture.insideClickRadius(1));
        QVERIFY(!gesture.isPan(vx::dAny));
        QVERIFY(!gesture.isLongPress(anyButton));
        QCOMPARE(gesture.panOffset(), QPoint());
        QCOMPARE(gesture.lastPanOffset(), QPoint());
        QCOMPARE(gesture.swipeOffset(), QPoint());
        QCOMPARE(gesture.swipeDirection(), vx::dLeft);
        gesture.startOrUpdate();
        gesture.finish();
        QCOMPARE(verdictsOf(gesture), QStringList());
    }

    void aReleaseAloneIsMeasuredFromTheNullObject()
    {
        // That one lies at the null point and is much later than any time stamp: far away the release is a swipe.
        OpenGesture far;
        far.feed(release(start, t0));
        far.finish();
        QCOMPARE(verdictsOf(far), QStringList(QStringLiteral("swipe")));
        OpenGesture near;
        near.feed(release(QPoint(4, 4), t0));
        near.finish();
        QCOMPARE(verdictsOf(near), QStringList());
    }

    void copiesAreIndependentAndMovedFromGesturesAreSafe()
    {
        OpenGesture gesture;
        gesture.feed(press(start, t0));
        OpenGesture copy(gesture);
        copy.feed(release(by(50), t0 + 10));
        QCOMPARE(gesture.clickCount(), 0);
        QVERIFY(copy.finish());
        QVERIFY(copy.wasSwipe(vx::dRight));
        QVERIFY(gesture.isStarted());

        vx::MouseGesture moved(std::move(copy));
        QVERIFY(moved.wasSwipe(vx::dRight));
        vx::MouseGesture assigned(gesture);
        assigned = std::move(moved);
        QVERIFY(assigned.wasSwipe(vx::dRight));
        QVERIFY(!moved.pressed(1).isValid());
        moved.wasSwipe(vx::dRight);
        moved.clickedWidgetName();
    }

    void aVariantCarriesThePointer()
    {
        const vx::MouseGesture::Ptr gesture(new OpenGesture);
        const QVariant variant = QVariant::fromValue(gesture);
        QCOMPARE(QByteArray(variant.typeName()), QByteArray("vx::MouseGesture::Ptr"));
        QCOMPARE(variant.value<vx::MouseGesture::Ptr>(), gesture);
    }
};

ZELKOV_TEST_MAIN(TestMouseGesture)
#include "tst_mousegesture.moc"
