// SPDX-License-Identifier: MIT
// The wall of live views: what it shows, what the hand does with it, its tools, and who may turn cameras.
#include "client/CountingLine.h"
#include "client/CountingTools.h"
#include "client/Fleet.h"
#include "client/LiveView.h"
#include "client/LiveWall.h"
#include "client/PtzPanel.h"
#include "client/Reconnection.h"
#include "client/Session.h"
#include "client/WallGeometry.h"
#include "controls/DateTimeEdit.h"
#include "controls/DialButton.h"
#include "controls/JoystickViewWidget.h"
#include "controls/VxCountingLinesGroupBox.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/IconOverlayView.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"
#include "popover/Manager.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/RubberBandWidget.h"

#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include <memory>
#include <random>

using client::Fleet;
using client::LiveView;
using client::LiveWall;
using zelkovtest::Pointer;

namespace
{
constexpr quint64 c_Moment = 1700000000000000;

/// A wall in a plain window, shown.
struct WallHost
{
    explicit WallHost(const QSize& size = QSize(800, 600))
        : wall(fleet, &window)
    {
        window.resize(size);
        wall.setGeometry(window.rect());
        wall.reconnection().setDelay(3600 * 1000);
        window.show();
    }

    QString caption(int id) { return wall.view(id)->findChild<vx::NameTimeLabel*>()->text().trimmed(); }
    vx::TimeLabel* time(int id) { return wall.view(id)->findChild<vx::TimeLabel*>(); }
    vx::BusyOverlayView* overlay(int id) { return wall.view(id)->findChild<vx::BusyOverlayView*>(); }
    vx::RubberBandWidget* band() { return wall.findChild<vx::RubberBandWidget*>(QStringLiteral("markedRegion")); }
    QPoint middle(int id) { return wall.view(id)->mapTo(&window, wall.view(id)->rect().center()); }
    QImage picture(int id) { return wall.view(id)->grab().toImage(); }

    QWidget window;
    Fleet fleet;
    LiveWall wall;
};

/// Whether any timer of the object or below it runs.
int runningTimers(const QObject& object)
{
    int result = 0;
    for (const QTimer* const timer : object.findChildren<QTimer*>()) {
        result += timer->isActive() ? 1 : 0;
    }
    return result;
}
}

class TestLiveWall : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theCountOfViewsIsTheNextSquare_data();
    void theCountOfViewsIsTheNextSquare();
    void cellsFillTheWallAndLeaveEqualGaps();
    void theWallShowsTheFirstCamerasInTheOrderOfTheFleet();
    void aMovedOrRemovedCameraChangesTheWall();
    void viewsStayWithTheirCameras();
    void aNewNameIsShown();
    void aCameraBeyondTheWallComesToItsFirstPlace();
    void fewerViewsKeepTheChosenCamera();
    void thereIsAlwaysAChosenCameraWhileThereAreCameras();
    void anUnknownCameraIsNotChosen();
    void aPressChoosesAndTheFrameFollows();
    void aDoubleClickEnlargesAndGoesBack();
    void theEnlargedCameraFollowsTheChoice();
    void theKeyboardChoosesAndEnlarges();
    void aDragLooksAround();
    void aLongPressTakesASnapshot();
    void aSmallViewShowsTheTimeWithoutTheDate();
    void theRecordedTimeGoesToAllViews();
    void livePicturesMoveAndRecordedOnesStandStill();
    void theSameMomentIsTheSamePicture();
    void theFrameRateIsCounted();
    void aHiddenWallRunsNoTimer();
    void namesTimesAndCountsCanBeHidden();
    void aDropShowsTheOverlayAfterItsDelay();
    void theButtonReconnects();
    void aCameraComesBackByItself();
    void severalCamerasComeBackInTurn();
    void aHiddenWallDoesNotReconnect();
    void recordsOfACameraThatIsOfflineAreSeen();
    void aMarkedRegionIsInThePixelsOfTheCamera();
    void theRegionSurvivesAResize();
    void theButtonClosesTheRegionAndAPressDrawsANewOne();
    void aMereClickLeavesNoRegion();
    void theRegionFollowsTheChosenCamera();
    void theCountingLineIsDraggedInThePicture();
    void theCountingLineFollowsTheForm();
    void eachCameraHasItsOwnCountingLine();
    void steeringMovesThePictureOfACameraWithAMotor();
    void steeringEndsWithTheChoice();
    void usersAreRefusedToSteer();
    void theStickSteersAndSpringsBack();
    void dialsSteerAndSpringBack();
    void aWallCanDieAtAnyTime();
};

void TestLiveWall::theCountOfViewsIsTheNextSquare_data()
{
    QTest::addColumn<int>("wanted");
    QTest::addColumn<int>("count");
    const int squares[] = {4, 9, 16, 25, 36, 49, 64};
    int before = -5;
    for (const int square : squares) {
        QTest::addRow("%d", square) << square << square;
        QTest::addRow("beyond %d", before) << before + 1 << square;
        before = square;
    }
    QTest::newRow("too many") << 1000 << 64;
    QTest::newRow("least number") << std::numeric_limits<int>::min() << 4;
}

void TestLiveWall::theCountOfViewsIsTheNextSquare()
{
    QFETCH(int, wanted);
    QFETCH(int, count);
    Fleet fleet;
    LiveWall wall(fleet);
    wall.setViewCount(wanted);
    QCOMPARE(wall.viewCount(), count);
    QCOMPARE(wall.shownCameras().size(), count);
    QCOMPARE(wall.findChildren<LiveView*>().size(), qMax(4, count));
}

void TestLiveWall::cellsFillTheWallAndLeaveEqualGaps()
{
    std::mt19937 random(5);
    for (int round = 0; round < 500; ++round) {
        const int columns = 2 + int(random() % 7);
        const int gap = int(random() % 5);
        const QRect wall(int(random() % 50), int(random() % 50), 60 + int(random() % 900), 60 + int(random() % 900));
        QRect all;
        int least = 10000;
        int most = 0;
        for (int i = 0; i < columns * columns; ++i) {
            const QRect cell = client::wallCell(wall, columns, i, gap);
            all |= cell;
            least = qMin(least, cell.width());
            most = qMax(most, cell.width());
            if (i % columns > 0) {
                QCOMPARE(cell.left() - client::wallCell(wall, columns, i - 1, gap).right() - 1, gap);
            }
            if (i >= columns) {
                QCOMPARE(cell.top() - client::wallCell(wall, columns, i - columns, gap).bottom() - 1, gap);
            }
        }
        QCOMPARE(all, wall);
        QVERIFY(most - least <= 1);
    }
}

void TestLiveWall::theWallShowsTheFirstCamerasInTheOrderOfTheFleet()
{
    WallHost host;
    QCOMPARE(host.wall.viewCount(), 4);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({0, 1, 2, 3}));
    QCOMPARE(host.wall.currentCamera(), 0);
    QVERIFY(host.wall.isLive());
    QCOMPARE(host.caption(1), host.fleet.camera(1)->name);
    QVERIFY(host.wall.view(1)->x() > host.wall.view(0)->x());
    QCOMPARE(host.wall.view(1)->y(), host.wall.view(0)->y());
    QVERIFY(host.wall.view(2)->y() > host.wall.view(0)->y());
    QVERIFY(!host.wall.view(4));
}

void TestLiveWall::aMovedOrRemovedCameraChangesTheWall()
{
    WallHost host;
    host.fleet.move(0, 2);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({1, 2, 0, 3}));
    QVERIFY(host.wall.view(0)->y() > host.wall.view(1)->y());
    host.fleet.remove(2);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({1, 0, 3, 4}));
    QCOMPARE(host.wall.currentCamera(), 0);
    while (host.fleet.cameras().size() > 2) {
        host.fleet.remove(host.fleet.cameras().last().id);
    }
    QCOMPARE(host.wall.shownCameras(), QVector<int>({1, 0}));
}

void TestLiveWall::viewsStayWithTheirCameras()
{
    WallHost host;
    LiveView* const view = host.wall.view(1);
    view->lookBy(QPointF(0.2, 0));
    const QPointF look = view->lookingAt();
    host.fleet.move(1, 3);
    QCOMPARE(host.wall.view(1), view);
    QCOMPARE(view->lookingAt(), look);
    host.wall.setViewCount(9);
    QCOMPARE(host.wall.view(1), view);
}

void TestLiveWall::aNewNameIsShown()
{
    WallHost host;
    host.fleet.rename(3, QStringLiteral("Kiosk"));
    QCOMPARE(host.caption(3), QStringLiteral("Kiosk"));
    host.fleet.rename(40, QStringLiteral("Far away"));
    host.wall.chooseCamera(40);
    QCOMPARE(host.caption(40), QStringLiteral("Far away"));
}

void TestLiveWall::aCameraBeyondTheWallComesToItsFirstPlace()
{
    WallHost host;
    QSignalSpy changed(&host.wall, &LiveWall::currentChanged);
    host.wall.chooseCamera(50);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({50, 0, 1, 2}));
    QCOMPARE(host.wall.currentCamera(), 50);
    QCOMPARE(changed, QList<QVariantList>({{50}}));
    host.wall.chooseCamera(1);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({50, 0, 1, 2}));
    host.fleet.move(host.fleet.indexOf(50), 1);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({0, 50, 1, 2}));
}

void TestLiveWall::fewerViewsKeepTheChosenCamera()
{
    WallHost host;
    host.wall.setViewCount(16);
    host.wall.chooseCamera(12);
    host.wall.setViewCount(4);
    QCOMPARE(host.wall.currentCamera(), 12);
    QCOMPARE(host.wall.shownCameras(), QVector<int>({12, 0, 1, 2}));
    QVERIFY(host.wall.view(12)->isCurrent());
}

void TestLiveWall::thereIsAlwaysAChosenCameraWhileThereAreCameras()
{
    WallHost host;
    host.wall.chooseCamera(2);
    host.wall.setMarking(true);
    host.wall.setCounting(true);
    host.wall.setEnlarged(2);
    host.fleet.remove(2);
    QCOMPARE(host.wall.enlargedCamera(), -1);
    QCOMPARE(host.wall.currentCamera(), 0);
    while (!host.fleet.cameras().isEmpty()) {
        host.fleet.remove(host.fleet.cameras().first().id);
    }
    QCOMPARE(host.wall.currentCamera(), -1);
    QVERIFY(host.wall.shownCameras().isEmpty());
    host.wall.steer(1, 1, 1);
    host.wall.showRecorded(c_Moment);
    host.wall.setViewCount(64);
}

void TestLiveWall::anUnknownCameraIsNotChosen()
{
    WallHost host;
    QSignalSpy changed(&host.wall, &LiveWall::currentChanged);
    for (const int id : {-1, 64, 1000, 0}) {
        host.wall.chooseCamera(id);
    }
    QCOMPARE(host.wall.currentCamera(), 0);
    QVERIFY(changed.isEmpty());
}

void TestLiveWall::aPressChoosesAndTheFrameFollows()
{
    WallHost host;
    host.wall.showRecorded(c_Moment);
    QSignalSpy changed(&host.wall, &LiveWall::currentChanged);
    Pointer pointer(&host.window);
    pointer.click(host.middle(3));
    QCOMPARE(changed, QList<QVariantList>({{3}}));
    QVERIFY(host.wall.view(3)->isCurrent());
    QVERIFY(!host.wall.view(0)->isCurrent());
    const QColor frame = host.wall.palette().color(QPalette::Highlight);
    QCOMPARE(host.picture(3).pixelColor(1, 100), frame);
    QVERIFY(host.picture(0).pixelColor(1, 100) != frame);
    QCOMPARE(host.wall.view(3)->eventCount(), 0);
}

void TestLiveWall::aDoubleClickEnlargesAndGoesBack()
{
    // The second click comes in time on the slowest machine.
    const int interval = QApplication::doubleClickInterval();
    QApplication::setDoubleClickInterval(20000);
    WallHost host;
    QApplication::setDoubleClickInterval(interval);
    const QRect before = host.wall.view(2)->geometry();
    Pointer pointer(&host.window);
    pointer.click(host.middle(2));
    pointer.click(host.middle(2));
    QTRY_COMPARE(host.wall.enlargedCamera(), 2);
    QCOMPARE(host.wall.currentCamera(), 2);
    QCOMPARE(host.wall.view(2)->geometry(), host.wall.rect());
    QVERIFY(host.wall.view(1)->isHidden());
    pointer.wait(2000);
    pointer.click(host.middle(2));
    pointer.click(host.middle(2));
    QTRY_COMPARE(host.wall.enlargedCamera(), -1);
    QCOMPARE(host.wall.view(2)->geometry(), before);
    QVERIFY(host.wall.view(1)->isVisible());
}

void TestLiveWall::theEnlargedCameraFollowsTheChoice()
{
    WallHost host;
    host.wall.setEnlarged(1);
    QCOMPARE(host.wall.currentCamera(), 1);
    host.wall.chooseCamera(20);
    QCOMPARE(host.wall.enlargedCamera(), 20);
    QCOMPARE(host.wall.view(20)->geometry(), host.wall.rect());
    host.wall.setEnlarged(63); // not on the wall
    QCOMPARE(host.wall.enlargedCamera(), 20);
    host.window.resize(900, 500);
    host.wall.setGeometry(host.window.rect());
    QCOMPARE(host.wall.view(20)->size(), QSize(900, 500));
}

void TestLiveWall::theKeyboardChoosesAndEnlarges()
{
    WallHost host;
    QTest::keyClick(&host.wall, Qt::Key_Right);
    QCOMPARE(host.wall.currentCamera(), 1);
    QTest::keyClick(&host.wall, Qt::Key_Down);
    QCOMPARE(host.wall.currentCamera(), 3);
    QTest::keyClick(&host.wall, Qt::Key_Right); // the end
    QCOMPARE(host.wall.currentCamera(), 3);
    QTest::keyClick(&host.wall, Qt::Key_Left);
    QTest::keyClick(&host.wall, Qt::Key_Up);
    QCOMPARE(host.wall.currentCamera(), 0);
    QTest::keyClick(&host.wall, Qt::Key_Return);
    QCOMPARE(host.wall.enlargedCamera(), 0);
    QTest::keyClick(&host.wall, Qt::Key_Escape);
    QCOMPARE(host.wall.enlargedCamera(), -1);
}

void TestLiveWall::aDragLooksAround()
{
    WallHost host;
    LiveView* const view = host.wall.view(1);
    const QPointF before = view->lookingAt();
    Pointer pointer(&host.window);
    const QPoint middle = host.middle(1);
    pointer.move(middle);
    pointer.press();
    pointer.move(middle + QPoint(-20, 0));
    pointer.move(middle + QPoint(-40, 0));
    pointer.release();
    QVERIFY(view->lookingAt().x() > before.x()); // the picture goes to the left with the hand
    QCOMPARE(view->lookingAt().y(), before.y());
    QCOMPARE(host.wall.view(0)->lookingAt(), before);
    // Not farther than the scene goes.
    view->lookBy(QPointF(1000, 1000));
    const QPointF end = view->lookingAt();
    view->lookBy(QPointF(1, 1));
    QCOMPARE(view->lookingAt(), end);
    QVERIFY(end.x() < 1 && end.y() < 1);
}

void TestLiveWall::aLongPressTakesASnapshot()
{
    WallHost host;
    QSignalSpy taken(&host.wall, &LiveWall::snapshotTaken);
    Pointer pointer(&host.window);
    pointer.move(host.middle(2));
    pointer.press();
    QTRY_COMPARE(taken, QList<QVariantList>({{2}}));
    QVERIFY(host.wall.view(2)->findChild<vx::IconOverlayView*>());
    pointer.release();
    QTRY_VERIFY(!host.wall.view(2)->findChild<vx::IconOverlayView*>()); // it has gone by itself
}

void TestLiveWall::aSmallViewShowsTheTimeWithoutTheDate()
{
    WallHost host(QSize(800, 700));
    host.wall.setViewCount(64);
    host.wall.showRecorded(c_Moment);
    QVERIFY(host.wall.view(9)->width() < 110);
    QCOMPARE(host.time(9)->getDateTimeEit()->text(), QStringLiteral("22:13:20"));
    QVERIFY(host.time(9)->height() > 0);
    QVERIFY(host.wall.view(9)->rect().contains(host.time(9)->geometry()));
    host.wall.showRecorded(c_Moment + 24 * 3600 * quint64(1000000));
    QCOMPARE(host.time(9)->getDateTimeEit()->dateTime().date(), QDate(2023, 11, 15));
    host.wall.setEnlarged(9);
    QVERIFY(host.time(9)->getDateTimeEit()->text().startsWith(QLatin1String("15 Nov")));
    QVERIFY(host.wall.view(9)->rect().contains(host.time(9)->geometry()));
}

void TestLiveWall::theRecordedTimeGoesToAllViews()
{
    WallHost host;
    host.wall.setViewCount(9);
    const QString format = host.time(0)->getDateTimeEit()->displayFormat();
    for (const quint64 moment : {c_Moment, c_Moment + 3600000000, c_Moment + 40000}) {
        host.wall.showRecorded(moment);
        QVERIFY(!host.wall.isLive());
        const QDateTime time = QDateTime::fromSecsSinceEpoch(qint64(moment / 1000000));
        for (const int id : host.wall.shownCameras()) {
            QCOMPARE(host.wall.view(id)->frameTime(), moment);
            QVERIFY(host.time(id)->isVisible());
            QVERIFY(host.time(id)->height() > 0);
            QCOMPARE(host.time(id)->getDateTimeEit()->text(), QLocale().toString(time, format));
            QVERIFY(host.time(id)->findChild<QLabel*>(QStringLiteral("FrameTimeGrabberFileserver")));
        }
    }
    host.wall.showLive();
    QVERIFY(host.wall.isLive());
    QVERIFY(host.time(5)->findChild<QLabel*>(QStringLiteral("FrameTimeGrabberCamera")));
    const qint64 now = QDateTime::currentSecsSinceEpoch();
    QVERIFY(qAbs(qint64(host.wall.view(5)->frameTime() / 1000000) - now) <= 5);
    QCOMPARE(host.wall.view(5)->frameTime(), host.wall.view(0)->frameTime());
}

void TestLiveWall::livePicturesMoveAndRecordedOnesStandStill()
{
    WallHost host;
    const QImage first = host.picture(0);
    QTRY_VERIFY(host.picture(0) != first);
    host.wall.showRecorded(c_Moment);
    const QImage recorded = host.picture(0);
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.picture(0), recorded);
}

void TestLiveWall::theSameMomentIsTheSamePicture()
{
    WallHost host;
    host.wall.showRecorded(c_Moment);
    QTest::qWait(1); // the sizes settle
    const QImage recorded = host.picture(2);
    host.wall.showRecorded(c_Moment + 2000000);
    QVERIFY(host.picture(2) != recorded);
    host.wall.showRecorded(c_Moment);
    QCOMPARE(host.picture(2), recorded);
}

void TestLiveWall::theFrameRateIsCounted()
{
    WallHost host;
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QVERIFY(second.wait());
    // Whatever the machine does besides: some frames, and never more than the clock gives.
    QVERIFY(host.wall.framesPerSecond() > 0);
    QVERIFY(host.wall.framesPerSecond() <= 4 * 26);
    host.wall.showRecorded(c_Moment);
    QVERIFY(second.wait());
    QVERIFY(second.wait());
    QCOMPARE(host.wall.framesPerSecond(), 0);
}

void TestLiveWall::aHiddenWallRunsNoTimer()
{
    Fleet fleet;
    LiveWall wall(fleet);
    wall.setViewCount(9);
    fleet.setOnline(1, false);
    QVERIFY(!wall.isRunning());
    QVERIFY(!wall.reconnection().isWaiting());
    QCOMPARE(runningTimers(wall), 0);
    wall.show();
    QVERIFY(wall.isRunning());
    QVERIFY(wall.reconnection().isWaiting());
    wall.hide();
    QVERIFY(!wall.isRunning());
    QVERIFY(!wall.reconnection().isWaiting());
    QCOMPARE(runningTimers(wall), 0);
}

void TestLiveWall::namesTimesAndCountsCanBeHidden()
{
    WallHost host;
    host.wall.showRecorded(c_Moment);
    auto* const caption = host.wall.view(2)->findChild<vx::NameTimeLabel*>();
    QVERIFY(caption->isVisible());
    QVERIFY(host.wall.view(2)->eventCount() > 0);
    const QImage with = host.picture(2);
    host.wall.setShowBadges(false);
    QVERIFY(host.picture(2) != with);
    host.wall.setShowBadges(true);
    QCOMPARE(host.picture(2), with);
    host.wall.setShowNames(false);
    host.wall.setShowTimes(false);
    QVERIFY(caption->isHidden());
    QVERIFY(host.time(2)->isHidden());
    host.wall.setViewCount(9); // new views do the same
    QVERIFY(host.time(7)->isHidden());
    host.wall.showRecorded(c_Moment + 5000000);
    host.wall.setShowNames(true);
    host.wall.setShowTimes(true);
    QVERIFY(caption->isVisible());
    QVERIFY(host.time(7)->isVisible());
    QVERIFY(host.time(7)->height() > 0);
}

void TestLiveWall::aDropShowsTheOverlayAfterItsDelay()
{
    WallHost host;
    QElapsedTimer elapsed;
    elapsed.start();
    host.fleet.setOnline(1, false);
    QVERIFY(!host.wall.view(1)->isOnline());
    QVERIFY(host.overlay(1)->isHidden()); // a short loss shows nothing
    const quint64 frame = host.wall.view(1)->frameTime();
    QTRY_VERIFY(host.overlay(1)->isVisible());
    QVERIFY(elapsed.elapsed() >= 950);
    QVERIFY(host.time(1)->findChild<QLabel*>(QStringLiteral("FrameTimeGrabberError")));
    QTRY_VERIFY(host.overlay(1)->findChild<QLabel*>(QStringLiteral("busyText"))->text().contains(QLatin1String("1 s")));
    QCOMPARE(host.wall.view(1)->frameTime(), frame); // the last picture stays
    QVERIFY(host.wall.view(0)->frameTime() > frame);
    QVERIFY(host.overlay(0)->isHidden());
    host.fleet.setOnline(1, true);
    QVERIFY(host.overlay(1)->isHidden());
    QVERIFY(host.wall.view(1)->findChild<QPushButton*>(QStringLiteral("reconnectButton"))->isHidden());
    QVERIFY(host.wall.view(1)->findChild<vx::IconOverlayView*>());
    QTRY_VERIFY(host.wall.view(1)->frameTime() > frame);
    QVERIFY(host.time(1)->findChild<QLabel*>(QStringLiteral("FrameTimeGrabberCamera")));
}

void TestLiveWall::theButtonReconnects()
{
    WallHost host;
    host.fleet.setOnline(2, false);
    auto* const button = host.wall.view(2)->findChild<QPushButton*>(QStringLiteral("reconnectButton"));
    QVERIFY(button->isHidden());
    QTRY_VERIFY(button->isVisible());
    Pointer pointer(&host.window);
    pointer.click(button->mapTo(&host.window, button->rect().center()));
    QVERIFY(host.fleet.camera(2)->online);
    QVERIFY(button->isHidden());
    QVERIFY(host.overlay(2)->isHidden());
}

void TestLiveWall::aCameraComesBackByItself()
{
    WallHost host;
    host.fleet.setOnline(1, false);
    host.wall.reconnection().setDelay(150);
    QVERIFY(!host.fleet.camera(1)->online);
    QTRY_VERIFY(host.fleet.camera(1)->online);
    QVERIFY(!host.wall.reconnection().isWaiting());
}

void TestLiveWall::severalCamerasComeBackInTurn()
{
    WallHost host;
    for (const int id : {3, 40, 7}) {
        host.fleet.setOnline(id, false);
    }
    host.fleet.remove(40);
    host.wall.reconnection().setDelay(50);
    QTRY_VERIFY(host.fleet.camera(3)->online && host.fleet.camera(7)->online);
    QVERIFY(!host.wall.reconnection().isWaiting());
}

void TestLiveWall::aHiddenWallDoesNotReconnect()
{
    WallHost host;
    host.wall.hide();
    host.wall.reconnection().setDelay(10);
    host.fleet.setOnline(1, false);
    QTest::qWait(60);
    QVERIFY(!host.fleet.camera(1)->online);
    host.wall.show();
    QTRY_VERIFY(host.fleet.camera(1)->online);
}

void TestLiveWall::recordsOfACameraThatIsOfflineAreSeen()
{
    WallHost host;
    host.fleet.setOnline(1, false);
    QTRY_VERIFY(host.overlay(1)->isVisible());
    host.wall.showRecorded(c_Moment);
    QCOMPARE(host.wall.view(1)->frameTime(), c_Moment);
    QVERIFY(host.overlay(1)->isHidden());
    host.wall.showLive();
    QTRY_VERIFY(host.overlay(1)->isVisible());
}

void TestLiveWall::aMarkedRegionIsInThePixelsOfTheCamera()
{
    WallHost host(QSize(1922, 1082)); // views of 960 x 540: half the camera
    QSignalSpy marked(&host.wall, &LiveWall::marked);
    host.wall.setMarking(true);
    QVERIFY(host.wall.isMarking());
    vx::RubberBandWidget* const band = host.band();
    QVERIFY(band && band->isVisible());
    QCOMPARE(band->parentWidget(), host.wall.view(0));
    QCOMPARE(band->applicationGeometry(), QRectF(640, 360, 640, 360));
    QCOMPARE(band->contentsGeometry(), QRect(320, 180, 320, 180));
    Pointer pointer(&host.window);
    const QPoint middle = band->mapTo(&host.window, band->rect().center());
    pointer.move(middle);
    pointer.press();
    pointer.move(middle + QPoint(25, 5));
    QVERIFY(marked.isEmpty()); // at the end
    pointer.move(middle + QPoint(50, 10));
    pointer.release();
    QCOMPARE(marked.size(), 1);
    QCOMPARE(marked.first().at(0).toInt(), 0);
    QCOMPARE(marked.first().at(1).toRectF(), QRectF(740, 380, 640, 360));
    host.wall.setMarking(false);
    QVERIFY(!host.band() || host.band()->isHidden());
}

void TestLiveWall::theRegionSurvivesAResize()
{
    WallHost host(QSize(1922, 1082));
    host.wall.setMarking(true);
    const QRectF region = host.band()->applicationGeometry();
    host.wall.resize(962, 542);
    QCOMPARE(host.band()->applicationGeometry(), region);
    QCOMPARE(host.band()->contentsGeometry(), QRect(160, 90, 160, 90));
    host.wall.setEnlarged(0);
    QCOMPARE(host.band()->applicationGeometry(), region);
    QVERIFY(host.band()->contentsGeometry().width() > 300);
}

void TestLiveWall::theButtonClosesTheRegionAndAPressDrawsANewOne()
{
    WallHost host(QSize(1922, 1082));
    QSignalSpy marked(&host.wall, &LiveWall::marked);
    host.wall.setMarking(true);
    auto* const close = host.band()->findChild<QPushButton*>();
    Pointer pointer(&host.window);
    pointer.click(close->mapTo(&host.window, close->rect().center()));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(!host.band());
    QVERIFY(marked.isEmpty());
    pointer.move(QPoint(100, 100));
    pointer.press();
    pointer.move(QPoint(150, 120));
    pointer.move(QPoint(200, 150));
    pointer.release();
    QCOMPARE(marked.size(), 1);
    const QRectF region = marked.first().at(1).toRectF();
    QVERIFY2(qAbs(region.left() - 200) <= 2 && qAbs(region.top() - 200) <= 2, "starts where the press was");
    QVERIFY2(qAbs(region.right() - 400) <= 4 && qAbs(region.bottom() - 300) <= 4, "ends where the release was");
    QVERIFY(host.band()->isVisible());
    QVERIFY(!QWidget::mouseGrabber());
    // Drawn up to the left, beyond the edge: the region stays within the camera.
    pointer.move(QPoint(90, 80));
    pointer.press();
    pointer.move(QPoint(50, 40));
    pointer.move(QPoint(0, 0));
    pointer.release();
    QCOMPARE(marked.size(), 2);
    const QRectF other = marked.last().at(1).toRectF();
    QVERIFY(QRectF(0, 0, 1920, 1080).contains(other));
    QVERIFY(other.width() > 100 && other.height() > 100);
}

void TestLiveWall::aMereClickLeavesNoRegion()
{
    WallHost host;
    QSignalSpy marked(&host.wall, &LiveWall::marked);
    host.wall.setMarking(true);
    Pointer pointer(&host.window);
    pointer.click(QPoint(20, 200));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(marked.isEmpty());
    QVERIFY(!host.band());
    QVERIFY(!QWidget::mouseGrabber());
}

void TestLiveWall::theRegionFollowsTheChosenCamera()
{
    WallHost host;
    host.wall.setMarking(true);
    Pointer pointer(&host.window);
    pointer.click(host.middle(3));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCOMPARE(host.band()->parentWidget(), host.wall.view(3));
    host.wall.setMarking(false);
    pointer.wait(2000);
    const QPointF look = host.wall.view(3)->lookingAt();
    pointer.move(host.middle(3));
    pointer.press();
    pointer.move(host.middle(3) + QPoint(30, 0));
    pointer.move(host.middle(3) + QPoint(60, 0));
    pointer.release();
    QVERIFY(host.wall.view(3)->lookingAt() != look); // gestures are back
}

void TestLiveWall::theCountingLineIsDraggedInThePicture()
{
    WallHost host;
    host.wall.setCounting(true);
    QVERIFY(host.wall.isCounting());
    auto* const form = host.wall.findChild<vx::VxCountingLinesGroupBox*>();
    auto* const line = host.wall.findChild<client::CountingLine*>();
    QVERIFY(form->isVisible() && line->isVisible());
    QCOMPARE(line->parentWidget(), host.wall.view(0));
    QCOMPARE(line->size(), host.wall.view(0)->size());
    QVERIFY(host.wall.view(1)->geometry().right() < form->mapTo(&host.wall, QPoint()).x());
    QSignalSpy changed(&host.wall, &LiveWall::countingLineChanged);
    Pointer pointer(&host.window);
    const QPoint end = line->mapTo(&host.window, line->toView(line->end()).toPoint());
    const QPoint before = line->end();
    pointer.move(end);
    pointer.press();
    pointer.move(end + QPoint(0, -10));
    pointer.move(end + QPoint(10, -30));
    pointer.release();
    QCOMPARE(changed.size(), 2);
    QVERIFY(line->end().x() > before.x() && line->end().y() < before.y());
    QCOMPARE(form->endPoint(), line->end());
    QCOMPARE(form->startingPoint(), line->start());
    QCOMPARE(changed.last().at(2).toPoint(), line->end());
    // The whole line by its middle, as far as the picture goes.
    const QPoint along = line->end() - line->start();
    const QPoint middle
        = line->mapTo(&host.window, ((line->toView(line->start()) + line->toView(line->end())) / 2).toPoint());
    pointer.move(middle);
    pointer.press();
    pointer.move(middle + QPoint(0, -40));
    pointer.move(QPoint(1, 1));
    pointer.release();
    QCOMPARE(line->end() - line->start(), along);
    QVERIFY(qMin(line->start().y(), line->end().y()) >= 0);
    QCOMPARE(form->startingPoint(), line->start());
    host.wall.resize(300, 400); // the tools leave something of the views
    QVERIFY(host.wall.view(0)->width() > 90);
    QCOMPARE(line->size(), host.wall.view(0)->size());
    host.wall.setCounting(false);
    QVERIFY(!form->isVisible());
    QVERIFY(!host.wall.findChild<client::CountingLine*>());
}

void TestLiveWall::theCountingLineFollowsTheForm()
{
    WallHost host;
    host.wall.setCounting(true);
    auto* const form = host.wall.findChild<vx::VxCountingLinesGroupBox*>();
    auto* const line = host.wall.findChild<client::CountingLine*>();
    QSignalSpy changed(&host.wall, &LiveWall::countingLineChanged);
    form->setStartingPoint(QPoint(100, 200));
    QCOMPARE(line->start(), QPoint(100, 200));
    QVERIFY(!changed.isEmpty());
    QCOMPARE(changed.last().at(1).toPoint(), QPoint(100, 200));
    form->setEndPoint(QPoint(5000, 5000));
    QCOMPARE(line->end(), QPoint(1919, 1079));
}

void TestLiveWall::eachCameraHasItsOwnCountingLine()
{
    WallHost host;
    host.wall.setCounting(true);
    auto* const form = host.wall.findChild<vx::VxCountingLinesGroupBox*>();
    form->setStartingPoint(QPoint(11, 22));
    form->setLineName(QStringLiteral("Door"));
    host.wall.chooseCamera(2);
    QVERIFY(form->startingPoint() != QPoint(11, 22));
    QVERIFY(form->lineName().isEmpty());
    QCOMPARE(host.wall.findChild<client::CountingLine*>()->parentWidget(), host.wall.view(2));
    host.wall.chooseCamera(0);
    QCOMPARE(form->startingPoint(), QPoint(11, 22));
    QCOMPARE(form->lineName(), QStringLiteral("Door"));
}

void TestLiveWall::steeringMovesThePictureOfACameraWithAMotor()
{
    WallHost host;
    LiveView* const view = host.wall.view(0);
    const QPointF before = view->lookingAt();
    host.wall.steer(1, 0, 0);
    QTRY_VERIFY(view->lookingAt().x() > before.x());
    host.wall.steer(0, 0, 1);
    QTRY_VERIFY(view->zoom() > 1.2);
    const QPointF zoomed = view->lookingAt();
    host.wall.steer(0, 1, 0);
    QTRY_VERIFY(view->lookingAt().y() < zoomed.y()); // up
    host.wall.steer(0, 0, -1);
    QTRY_COMPARE(view->zoom(), 1.0);
    host.wall.steer(0, 0, 0);
    QVERIFY(!host.fleet.camera(1)->steerable);
    host.wall.chooseCamera(1);
    const QPointF still = host.wall.view(1)->lookingAt();
    host.wall.steer(1, 1, 1);
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.wall.view(1)->lookingAt(), still);
    QCOMPARE(host.wall.view(1)->zoom(), 1.0);
}

void TestLiveWall::steeringEndsWithTheChoice()
{
    WallHost host;
    host.wall.setViewCount(9);
    host.wall.steer(1, 0, 0);
    host.wall.chooseCamera(4);
    QVERIFY(host.fleet.camera(4)->steerable);
    const QPointF still = host.wall.view(4)->lookingAt();
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.wall.view(4)->lookingAt(), still);
}

void TestLiveWall::usersAreRefusedToSteer()
{
    WallHost host;
    client::Session session;
    client::PtzPanel panel(host.wall, session);
    panel.resize(260, 340);
    panel.show();
    auto* const controls = panel.findChild<QWidget*>(QStringLiteral("ptzControls"));
    auto* const hint = panel.findChild<QLabel*>(QStringLiteral("ptzHint"));
    auto* const pan = panel.findChild<vx::DialButton*>(QStringLiteral("panDial"));
    QVERIFY(!controls->isEnabled()); // nobody is logged in
    QVERIFY(session.logIn(QStringLiteral("user"), QStringLiteral("camera1!")));
    QVERIFY(!controls->isEnabled());
    const QString refused = hint->text();
    QVERIFY(!refused.isEmpty());
    const QPointF before = host.wall.view(0)->lookingAt();
    pan->setValue(80); // by a program
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.wall.view(0)->lookingAt(), before);
    session.setRole(client::Session::Role::Administrator);
    QVERIFY(controls->isEnabled());
    QCOMPARE(pan->value(), 0);
    QVERIFY(hint->text() != refused);
    host.wall.chooseCamera(1); // no motor
    QVERIFY(!controls->isEnabled());
    host.wall.chooseCamera(0);
    QVERIFY(controls->isEnabled());
    host.fleet.setOnline(0, false);
    QVERIFY(!controls->isEnabled());
    host.fleet.setOnline(0, true);
    QVERIFY(controls->isEnabled());
    session.logOut();
    QVERIFY(!controls->isEnabled());
    QCOMPARE(hint->text(), refused);
}

void TestLiveWall::theStickSteersAndSpringsBack()
{
    WallHost host;
    client::Session session;
    session.logIn(QStringLiteral("admin"), QStringLiteral("camera2!"));
    QWidget window;
    auto* const panel = new client::PtzPanel(host.wall, session, &window);
    window.resize(260, 360);
    panel->setGeometry(window.rect());
    window.show();
    auto* const stick = panel->findChild<JoystickViewWidget*>();
    const QImage rest = stick->grab().toImage();
    const QPointF before = host.wall.view(0)->lookingAt();
    {
        Pointer pointer(&window);
        const QPoint middle = stick->mapTo(&window, stick->rect().center());
        pointer.move(middle);
        pointer.press();
        pointer.move(middle + QPoint(20, 0));
        pointer.move(middle + QPoint(300, 0)); // far out
        QVERIFY(stick->grab().toImage() != rest);
        QTRY_VERIFY(host.wall.view(0)->lookingAt().x() > before.x());
        pointer.release();
    }
    QCOMPARE(stick->grab().toImage(), rest);
    const QPointF after = host.wall.view(0)->lookingAt();
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.wall.view(0)->lookingAt(), after);
}

void TestLiveWall::dialsSteerAndSpringBack()
{
    WallHost host;
    client::Session session;
    session.logIn(QStringLiteral("admin"), QStringLiteral("camera2!"));
    QWidget window;
    auto* const panel = new client::PtzPanel(host.wall, session, &window);
    window.resize(260, 360);
    panel->setGeometry(window.rect());
    window.show();
    auto* const zoom = panel->findChild<vx::DialButton*>(QStringLiteral("zoomDial"));
    {
        Pointer pointer(&window);
        const QPoint middle = zoom->mapTo(&window, zoom->rect().center());
        pointer.move(middle);
        pointer.press();
        pointer.move(middle + QPoint(40, 0));
        pointer.move(middle + QPoint(90, 0));
        QVERIFY(zoom->value() > 0);
        QTRY_VERIFY(host.wall.view(0)->zoom() > 1);
        pointer.release();
    }
    QCOMPARE(zoom->value(), 0);
    const double after = host.wall.view(0)->zoom();
    QSignalSpy second(&host.wall, &LiveWall::frameRateChanged);
    QVERIFY(second.wait());
    QCOMPARE(host.wall.view(0)->zoom(), after);
    vx::PopoverWidget::Manager::deleteInstance();
}

void TestLiveWall::aWallCanDieAtAnyTime()
{
    auto host = std::make_unique<WallHost>();
    host->wall.setMarking(true);
    host->wall.setCounting(true);
    host->fleet.setOnline(0, false);
    host->wall.view(1)->showSign(QStringLiteral("snapshotSign"));
    host->wall.setViewCount(16);
    host->wall.setEnlarged(0);
    host.reset();
    // While a region is drawn.
    host = std::make_unique<WallHost>();
    host->wall.setMarking(true);
    Pointer pointer(&host->window);
    pointer.move(QPoint(20, 200));
    pointer.press();
    pointer.move(QPoint(60, 240));
    QVERIFY(QWidget::mouseGrabber());
    host->wall.setMarking(false);
    QVERIFY(!QWidget::mouseGrabber());
    pointer.release();
    // The fleet shrinks in a slot of its own signal.
    bool removed = false;
    QObject::connect(&host->fleet, &Fleet::onlineChanged, &host->wall, [&host, &removed](int id) {
        if (!removed) {
            removed = true;
            host->fleet.remove(id);
        }
    });
    host->fleet.setOnline(2, false);
    QVERIFY(!host->wall.view(2));
}

ZELKOV_TEST_MAIN(TestLiveWall)
#include "tst_livewall.moc"
