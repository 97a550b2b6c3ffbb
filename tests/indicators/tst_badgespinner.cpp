// SPDX-License-Identifier: MIT
// The busy mark: its state, its ticks, its shared frames, and its sleep while the host is hidden.
#include "BadgeHost.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QSet>

using namespace badgetest;
using vx::BadgeDrawer;
namespace geometry = vx::BadgeGeometry;

class TestBadgeSpinner : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void busyShowsTheFirstFrame();
    void busyTwiceKeepsTheRunningAngle();
    void busyClearsTheLabel();
    void busyAgainStartsAtTheFirstAngle();
    void endOfBusyTakesTheMarkAway();
    void labelSurvivesTheEndOfBusy();
    void labelDuringBusyStopsTheAnimationButNotTheFlag();
    void unsetDuringBusyStopsTheAnimationButNotTheFlag();
    void labelDuringBusyGivesWayWhenTheHostIsShownAgain();
    void notBusyWhileNotBusyDoesNothing();
    void ticksFollowTheSequenceOfAngles();
    void tickAsksForARepaintAndNoLayout();
    void onlyTicksEmitPixmapChanged();
    void timerRunsEveryFiftyMilliseconds();
    void aTurnFillsTheCacheWithTwelveFrames();
    void manyDrawersShareTheirFrames();
    void coloursOfEqualBrightnessShareTheirFrames();
    void everyPartOfTheLookChangesWithTheNextTick();
    void frameComesFromTheCacheWhenThere();
    void stillFrameLeavesTheStateAlone();
    void framesAreScaledToTheBadgeSize_data();
    void framesAreScaledToTheBadgeSize();
    void hiddenHostWaitsForItsShow();
    void timerSleepsWhileTheHostIsHidden();
    void withoutAHostTheTimerRuns();
    void idleDrawerIgnoresShowAndHide();
    void onlyTheHostsEventsCount();
    void newHostIsWatchedFromTheNextStart();
    void filterNeverEatsAnEvent();
};

void TestBadgeSpinner::init()
{
    TestCase::init();
    QPixmapCache::clear();
}

void TestBadgeSpinner::busyShowsTheFirstFrame()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    QVERIFY(drawer.badgeBusy());
    QVERIFY(drawer.hasBadge());
    QVERIFY(isSpinning(drawer));
    QVERIFY(showsAngle(drawer, 1440));
    QVERIFY(host.wasAskedToUpdate());
    QVERIFY(host.wasAskedForLayout());
    const QPixmap expected = BadgeDrawer::renderBusyBadgePixmap(
        BadgeDrawer::ebbtSpokes, 1440, -4320, QColor(255, 255, 255), QColor(192, 192, 192))
                                 .scaled(20, 20, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
    QCOMPARE(drawer.currentPixmap().toImage(), expected.toImage());
}

void TestBadgeSpinner::busyTwiceKeepsTheRunningAngle()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    tick(drawer);
    tick(drawer);
    host.settle();
    QVERIFY(showsAngle(drawer, 480));
    timerOf(drawer)->stop();
    drawer.setBadgeBusy(true);
    QVERIFY(showsAngle(drawer, 480));
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!host.wasAskedToUpdate());
    QVERIFY(!host.wasAskedForLayout());
}

void TestBadgeSpinner::busyClearsTheLabel()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    drawer.setBadgeBusy(true);
    QCOMPARE(drawer.badgeLabel(), QString());
    QVERIFY(showsAngle(drawer, 1440));
}

void TestBadgeSpinner::busyAgainStartsAtTheFirstAngle()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    tick(drawer);
    drawer.setBadgeBusy(false);
    drawer.setBadgeBusy(true);
    QVERIFY(showsAngle(drawer, 1440));
    tick(drawer);
    QVERIFY(showsAngle(drawer, 960));
}

void TestBadgeSpinner::endOfBusyTakesTheMarkAway()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    host.settle();
    drawer.setBadgeBusy(false);
    QVERIFY(!drawer.badgeBusy());
    QVERIFY(!drawer.hasBadge());
    QVERIFY(!isSpinning(drawer));
    QVERIFY(host.wasAskedToUpdate());
    QVERIFY(host.wasAskedForLayout());
}

void TestBadgeSpinner::labelSurvivesTheEndOfBusy()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    const qint64 label = drawer.currentPixmap().cacheKey();
    host.settle();
    drawer.setBadgeBusy(false);
    QVERIFY(!drawer.badgeBusy());
    QVERIFY(drawer.hasBadge());
    QCOMPARE(drawer.currentPixmap().cacheKey(), label);
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("3"));
    QVERIFY(host.wasAskedToUpdate());
    QVERIFY(host.wasAskedForLayout());
}

void TestBadgeSpinner::labelDuringBusyStopsTheAnimationButNotTheFlag()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    QVERIFY(drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("3"));
}

void TestBadgeSpinner::unsetDuringBusyStopsTheAnimationButNotTheFlag()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    drawer.unsetBadgeLabel();
    QVERIFY(drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!drawer.hasBadge());
}

void TestBadgeSpinner::labelDuringBusyGivesWayWhenTheHostIsShownAgain()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    const qint64 label = drawer.currentPixmap().cacheKey();
    host.hide();
    host.show();
    QVERIFY(isSpinning(drawer));
    QCOMPARE(drawer.currentPixmap().cacheKey(), label);
    tick(drawer);
    QVERIFY(showsAngle(drawer, 960));
    // The end of busy leaves everything alone while there is a label: clients rely on it.
    drawer.setBadgeBusy(false);
    QVERIFY(isSpinning(drawer));
    QVERIFY(drawer.hasBadge());
    drawer.unsetBadgeLabel();
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!drawer.hasBadge());
}

void TestBadgeSpinner::notBusyWhileNotBusyDoesNothing()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(false);
    QVERIFY(!host.wasAskedToUpdate());
    QVERIFY(!host.wasAskedForLayout());
}

void TestBadgeSpinner::ticksFollowTheSequenceOfAngles()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    const QVector<int> angles {
        960, 480, 0, -480, -960, -1440, -1920, -2400, -2880, -3360, -3840, -4320, -4800, -5280, 0, -480, -960};
    for (const int angle : angles) {
        tick(drawer);
        QVERIFY2(showsAngle(drawer, angle), qPrintable(QString::number(angle)));
    }
}

void TestBadgeSpinner::tickAsksForARepaintAndNoLayout()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    host.settle();
    tick(drawer);
    QVERIFY(!host.wasAskedForLayout());
    QVERIFY(host.wasAskedToUpdate());
}

void TestBadgeSpinner::onlyTicksEmitPixmapChanged()
{
    BadgeDrawer drawer(nullptr, nullptr);
    zelkovtest::SignalRecorder recorder(&drawer);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    drawer.unsetBadgeLabel();
    drawer.setBadgeBusy(true);
    drawer.busyPixmap();
    drawer.setBadgeBusy(false);
    drawer.setBadgeBusy(true);
    QCOMPARE(recorder.names(), QStringList());
    tick(drawer);
    QCOMPARE(recorder.names(), QStringList {QStringLiteral("pixmapChanged")});
    tick(drawer);
    QCOMPARE(recorder.names(), (QStringList {QStringLiteral("pixmapChanged"), QStringLiteral("pixmapChanged")}));
}

void TestBadgeSpinner::timerRunsEveryFiftyMilliseconds()
{
    BadgeDrawer drawer(nullptr, nullptr);
    QCOMPARE(timerOf(drawer)->interval(), 50);
    QVERIFY(!timerOf(drawer)->isSingleShot());
    QSignalSpy spy(&drawer, &BadgeDrawer::pixmapChanged);
    QElapsedTimer elapsed;
    elapsed.start();
    drawer.setBadgeBusy(true);
    QTRY_VERIFY_WITH_TIMEOUT(spy.count() >= 4, 10000);
    QVERIFY(elapsed.elapsed() >= 190 * 95 / 100);
}

void TestBadgeSpinner::aTurnFillsTheCacheWithTwelveFrames()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    for (int i = 0; i < 2; ++i) {
        tick(drawer);
    }
    QSet<qint64> frames;
    for (int i = 0; i < 36; ++i) {
        tick(drawer);
        frames << drawer.currentPixmap().cacheKey();
    }
    QCOMPARE(frames.size(), 12);
    for (int angle = 0; angle > -5760; angle -= 480) {
        QVERIFY(isCached(keyAt(drawer, angle)));
    }
    QVERIFY(!isCached(keyAt(drawer, -5760)));
}

void TestBadgeSpinner::manyDrawersShareTheirFrames()
{
    QVector<QSharedPointer<BadgeDrawer>> wall;
    for (int i = 0; i < 64; ++i) {
        wall << QSharedPointer<BadgeDrawer>::create(nullptr, nullptr);
        wall.last()->setBadgeBusy(true);
    }
    for (int i = 0; i < 20; ++i) {
        for (const auto& drawer : wall) {
            tick(*drawer);
            QCOMPARE(drawer->currentPixmap().cacheKey(), wall.first()->currentPixmap().cacheKey());
        }
    }
}

void TestBadgeSpinner::coloursOfEqualBrightnessShareTheirFrames()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBusyColor1(QColor(255, 0, 0));
    drawer.setBusyColor2(QColor(100, 0, 0));
    drawer.setBadgeBusy(true);
    const qint64 red = drawer.currentPixmap().cacheKey();
    drawer.setBadgeBusy(false);

    drawer.setBusyColor1(QColor(0, 0, 255));
    drawer.setBusyColor2(QColor(0, 100, 20));
    drawer.setBadgeBusy(true);
    QCOMPARE(drawer.currentPixmap().cacheKey(), red);
    QVERIFY(drawer.currentPixmap().toImage().pixelColor(9, 2).blue() < 30);
    drawer.setBadgeBusy(false);

    drawer.setBusyColor1(QColor(0, 0, 254));
    drawer.setBadgeBusy(true);
    QVERIFY(drawer.currentPixmap().cacheKey() != red);
    QVERIFY(drawer.currentPixmap().toImage().pixelColor(9, 2).blue() > 200);
}

void TestBadgeSpinner::everyPartOfTheLookChangesWithTheNextTick()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    for (int i = 0; i < 14; ++i) {
        tick(drawer);
    }
    // All angles have been shown once; each setter has to reach them all.
    const auto showsTheNewLook = [&drawer](int angle) {
        const qint64 before = drawer.currentPixmap().cacheKey();
        tick(drawer);
        return drawer.currentPixmap().cacheKey() != before && showsAngle(drawer, angle);
    };
    drawer.setBusyBadgeType(BadgeDrawer::ebbtArc);
    QVERIFY(showsTheNewLook(0));
    drawer.setBadgeSize(QSize(32, 32));
    QCOMPARE(drawer.currentPixmap().size(), QSize(20, 20));
    QVERIFY(showsTheNewLook(-480));
    QCOMPARE(drawer.currentPixmap().size(), QSize(32, 32));
    drawer.setBusyColor1(QColor(9, 0, 0));
    QVERIFY(showsTheNewLook(-960));
    drawer.setBusyColor2(QColor(0, 8, 0));
    QVERIFY(showsTheNewLook(-1440));
}

void TestBadgeSpinner::frameComesFromTheCacheWhenThere()
{
    BadgeDrawer drawer(nullptr, nullptr);
    QPixmap planted(5, 5);
    planted.fill(Qt::magenta);
    QPixmapCache::insert(keyAt(drawer, 960), planted);
    drawer.setBadgeBusy(true);
    tick(drawer);
    QCOMPARE(drawer.currentPixmap().cacheKey(), planted.cacheKey());
    QCOMPARE(drawer.sizeHint(), QSize(5, 5));
    QPixmapCache::clear();
    for (int i = 0; i < 12; ++i) {
        tick(drawer);
        QCOMPARE(drawer.currentPixmap().size(), QSize(20, 20));
    }
}

void TestBadgeSpinner::stillFrameLeavesTheStateAlone()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    const QPixmap still = drawer.busyPixmap();
    QVERIFY(!drawer.hasBadge());
    QVERIFY(!drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!host.wasAskedToUpdate());
    QVERIFY(!host.wasAskedForLayout());
    QVERIFY(isCached(keyAt(drawer, 1440)));

    drawer.setBadgeBusy(true);
    QCOMPARE(drawer.currentPixmap().cacheKey(), still.cacheKey());
    tick(drawer);
    QCOMPARE(drawer.busyPixmap().cacheKey(), still.cacheKey());
    QVERIFY(showsAngle(drawer, 960));
    tick(drawer);
    QVERIFY(showsAngle(drawer, 480));
}

void TestBadgeSpinner::framesAreScaledToTheBadgeSize_data()
{
    QTest::addColumn<QSize>("wanted");
    QTest::addColumn<QSize>("size");
    QTest::newRow("20") << QSize(20, 20) << QSize(20, 20);
    QTest::newRow("32") << QSize(32, 32) << QSize(32, 32);
    QTest::newRow("64") << QSize(64, 64) << QSize(64, 64);
    QTest::newRow("canvas") << QSize(100, 100) << QSize(100, 100);
    QTest::newRow("enlarged") << QSize(150, 150) << QSize(150, 150);
    QTest::newRow("wide") << QSize(40, 20) << QSize(40, 40);
    QTest::newRow("tall") << QSize(20, 40) << QSize(40, 40);
    QTest::newRow("one") << QSize(1, 1) << QSize(1, 1);
}

void TestBadgeSpinner::framesAreScaledToTheBadgeSize()
{
    QFETCH(QSize, wanted);
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeSize(wanted);
    drawer.setBadgeBusy(true);
    QTEST(drawer.currentPixmap().size(), "size");
    QPixmap cached;
    QVERIFY(QPixmapCache::find(keyAt(drawer, 1440), &cached));
    QTEST(cached.size(), "size");
}

void TestBadgeSpinner::hiddenHostWaitsForItsShow()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeBusy(true);
    QVERIFY(drawer.hasBadge());
    QVERIFY(!isSpinning(drawer));
    host.showWindow();
    QVERIFY(isSpinning(drawer));
}

void TestBadgeSpinner::timerSleepsWhileTheHostIsHidden()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(true);
    timerOf(drawer)->setInterval(3600000);
    tick(drawer);
    tick(drawer);
    host.hide();
    QVERIFY(!isSpinning(drawer));
    QVERIFY(drawer.badgeBusy());
    host.show();
    QVERIFY(isSpinning(drawer));
    QVERIFY(showsAngle(drawer, 480));
    tick(drawer);
    QVERIFY(showsAngle(drawer, 0));
    // Hiding the window hides the host as well.
    host.window()->hide();
    QVERIFY(!isSpinning(drawer));
    drawer.setBadgeBusy(false);
    host.window()->show();
    QVERIFY(!isSpinning(drawer));
}

void TestBadgeSpinner::withoutAHostTheTimerRuns()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    QVERIFY(isSpinning(drawer));
    drawer.setBadgeBusy(false);
    QVERIFY(!isSpinning(drawer));
}

void TestBadgeSpinner::idleDrawerIgnoresShowAndHide()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    // Ending with a label leaves the filter in place.
    drawer.setBadgeBusy(true);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    drawer.setBadgeBusy(false);
    host.showWindow();
    QVERIFY(!isSpinning(drawer));
    host.hide();
    host.show();
    QVERIFY(!isSpinning(drawer));
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("3"));
}

void TestBadgeSpinner::onlyTheHostsEventsCount()
{
    Host host;
    QWidget other;
    BadgeDrawer drawer(nullptr, &host);
    other.installEventFilter(&drawer);
    drawer.setBadgeBusy(true);
    other.show();
    QVERIFY(!isSpinning(drawer));
    host.showWindow();
    QVERIFY(isSpinning(drawer));
    other.hide();
    QVERIFY(isSpinning(drawer));
}

void TestBadgeSpinner::newHostIsWatchedFromTheNextStart()
{
    Host first;
    Host second;
    BadgeDrawer drawer(nullptr, &first);
    first.showWindow();
    drawer.setBadgeBusy(true);
    drawer.setBadgeWidget(&second);
    QVERIFY(isSpinning(drawer));
    first.hide();
    QVERIFY(isSpinning(drawer));
    second.showWindow();
    tick(drawer);
    QVERIFY(second.wasAskedToUpdate());
    drawer.setBadgeBusy(false);
    drawer.setBadgeBusy(true);
    second.hide();
    QVERIFY(!isSpinning(drawer));
}

void TestBadgeSpinner::filterNeverEatsAnEvent()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    QEvent show(QEvent::Show);
    QEvent hide(QEvent::Hide);
    QVERIFY(!drawer.eventFilter(&host, &show));
    drawer.setBadgeBusy(true);
    QVERIFY(!drawer.eventFilter(&host, &show));
    QVERIFY(isSpinning(drawer));
    QVERIFY(!drawer.eventFilter(&host, &hide));
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!drawer.eventFilter(nullptr, &hide));
}

ZELKOV_TEST_MAIN(TestBadgeSpinner)
#include "tst_badgespinner.moc"
