// SPDX-License-Identifier: MIT
// The state of a badge: labels, the busy mark, its timer and its shared frames, and drawing.
#include "indicators/BadgeDrawer.h"
#include "indicators/BadgeGeometry.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtGui/QPainter>
#include <QtGui/QPixmapCache>
#include <QtTest/QtTest>
#include <QtWidgets/QVBoxLayout>

#include <limits>
#include <memory>

using vx::BadgeDrawer;
namespace geometry = vx::BadgeGeometry;

namespace
{
QTimer* timerOf(const BadgeDrawer& drawer)
{
    return drawer.findChild<QTimer*>();
}

bool isSpinning(const BadgeDrawer& drawer)
{
    return timerOf(drawer)->isActive();
}

// Fires the animation's timer at once.
void tick(const BadgeDrawer& drawer)
{
    QTimer* timer = timerOf(drawer);
    QVERIFY(timer->isActive());
    QTimerEvent event(timer->timerId());
    QCoreApplication::sendEvent(timer, &event);
}

QString keyAt(const BadgeDrawer& drawer, int angle)
{
    return geometry::cacheKey(
        drawer.busyBadgeType(), drawer.badgeSize(), angle, -4320, drawer.busyColor1(), drawer.busyColor2());
}

bool isCached(const QString& key)
{
    QPixmap pixmap;
    return QPixmapCache::find(key, &pixmap);
}

// True if the drawer shows the very frame that the cache has for the angle.
bool showsAngle(const BadgeDrawer& drawer, int angle)
{
    QPixmap pixmap;
    return QPixmapCache::find(keyAt(drawer, angle), &pixmap)
        && pixmap.cacheKey() == drawer.currentPixmap().cacheKey();
}

// A widget in a plain window, with counts of what it is asked for.
class Host : public QWidget
{
public:
    explicit Host(const QSize& size = QSize(80, 60))
        : QWidget(new QWidget)
        , m_size(size)
        , m_window(parentWidget())
    {
        // No fixed size: a widget that cannot change its size asks for no layout.
        auto* layout = new QVBoxLayout(m_window.get());
        layout->addWidget(this, 0, Qt::AlignCenter);
        resize(size);
        m_window->installEventFilter(this);
    }
    ~Host() override { setParent(nullptr); }

    void showWindow()
    {
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        settle();
    }

    // Until all that was asked for has been done; then forgets it.
    void settle()
    {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        paints = 0;
        layouts = 0;
    }

    bool wasAskedToUpdate()
    {
        QCoreApplication::processEvents();
        return paints > 0;
    }

    bool wasAskedForLayout()
    {
        QCoreApplication::sendPostedEvents();
        return layouts > 0;
    }

    bool eventFilter(QObject* watched, QEvent* event) override
    {
        layouts += watched == m_window.get() && event->type() == QEvent::LayoutRequest ? 1 : 0;
        return false;
    }

    QSize sizeHint() const override { return m_size; }

    int paints = 0;
    int layouts = 0;

protected:
    void paintEvent(QPaintEvent*) override { ++paints; }

private:
    QSize m_size;
    std::unique_ptr<QWidget> m_window;
};

QImage drawn(BadgeDrawer& drawer, const QSize& size, Qt::Alignment alignment)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    drawer.drawBadge(painter, alignment);
    return image;
}

QRect inked(const QImage& image)
{
    QRect bounds;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) != 0) {
                bounds |= QRect(x, y, 1, 1);
            }
        }
    }
    return bounds;
}
}

class TestBadgeDrawer : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void startsWithoutABadge();
    void settersOnlyStore();
    void typesHaveTheirNumbers();

    void labelIsRenderedScaledAndAnnouncedToTheHost();
    void labelWithTheMembersDefaults();
    void emptyLabelIsAPlainDisc();
    void longLabelIsAsHighAsAskedAndWider();
    void sizeHintFollowsThePixmap();
    void unsetTakesTheLabelAway();
    void labelsAreNotCached();
    void emptySizesGiveNoBadge_data();
    void emptySizesGiveNoBadge();

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
    void lookChangesWithTheNextTick();
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

    void drawsAlignedInTheHost_data();
    void drawsAlignedInTheHost();
    void drawsNothingWithoutAHost();
    void drawsNothingWithAnInactivePainter();
    void drawsNothingWithoutABadge();
    void alignmentIgnoresTheLayoutDirection();

    void hostMayDieFirst();
    void drawerMayDieInItsOwnSignal();
    void drawerMayDieWhileBusy();
    void hostMayDieInTheSignal();
    void unknownTypesShowATransparentMark();
};

void TestBadgeDrawer::init()
{
    TestCase::init();
    QPixmapCache::clear();
}

void TestBadgeDrawer::startsWithoutABadge()
{
    BadgeDrawer drawer(nullptr, nullptr);
    QVERIFY(!drawer.hasBadge());
    QVERIFY(drawer.currentPixmap().isNull());
    QVERIFY(!drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QCOMPARE(drawer.badgeLabel(), QString());
    QCOMPARE(drawer.badgeSize(), QSize(20, 20));
    QCOMPARE(drawer.sizeHint(), QSize(20, 20));
    QCOMPARE(drawer.badgeStroke(), false);
    QCOMPARE(drawer.badgeColor(), QColor(255, 255, 255, 255));
    QCOMPARE(drawer.busyColor1(), QColor(255, 255, 255, 255));
    QCOMPARE(drawer.busyColor2(), QColor(192, 192, 192, 255));
    QCOMPARE(drawer.badgeBackground(), QColor(246, 67, 70, 220));
    QCOMPARE(drawer.busyBadgeType(), BadgeDrawer::ebbtSpokes);
}

void TestBadgeDrawer::settersOnlyStore()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeLabel(QStringLiteral("7"), false);
    host.showWindow();
    const qint64 before = drawer.currentPixmap().cacheKey();
    zelkovtest::SignalRecorder recorder(&drawer);

    drawer.setBadgeSize(QSize(32, 30));
    drawer.setBadgeStroke(true);
    drawer.setBadgeColor(Qt::green);
    drawer.setBadgeBackground(Qt::blue);
    drawer.setBusyColor1(Qt::cyan);
    drawer.setBusyColor2(Qt::yellow);
    drawer.setBusyBadgeType(BadgeDrawer::ebbtDots);

    QCOMPARE(drawer.badgeSize(), QSize(32, 30));
    QCOMPARE(drawer.badgeStroke(), true);
    QCOMPARE(drawer.badgeColor(), QColor(Qt::green));
    QCOMPARE(drawer.badgeBackground(), QColor(Qt::blue));
    QCOMPARE(drawer.busyColor1(), QColor(Qt::cyan));
    QCOMPARE(drawer.busyColor2(), QColor(Qt::yellow));
    QCOMPARE(drawer.busyBadgeType(), BadgeDrawer::ebbtDots);

    QVERIFY(!host.wasAskedToUpdate());
    QVERIFY(!host.wasAskedForLayout());
    QCOMPARE(drawer.currentPixmap().cacheKey(), before);
    QCOMPARE(recorder.names(), QStringList());

    drawer.setBadgeWidget(nullptr);
    QVERIFY(!host.wasAskedToUpdate());
}

void TestBadgeDrawer::typesHaveTheirNumbers()
{
    QCOMPARE(int(BadgeDrawer::ebbtArc), 0);
    QCOMPARE(int(BadgeDrawer::ebbtRing), 1);
    QCOMPARE(int(BadgeDrawer::ebbtDots), 2);
    QCOMPARE(int(BadgeDrawer::ebbtSpokes), 3);
}

void TestBadgeDrawer::labelIsRenderedScaledAndAnnouncedToTheHost()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeLabel(QStringLiteral("12"), QSize(40, 40), true, true);
    QVERIFY(host.wasAskedToUpdate());
    QVERIFY(host.wasAskedForLayout());
    QVERIFY(drawer.hasBadge());
    QVERIFY(!drawer.badgeBusy());
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("12"));
    const QPixmap expected = BadgeDrawer::renderBadgePixmapFromText(
        QStringLiteral("12"), true, true, drawer.badgeColor(), drawer.badgeBackground())
                                 .scaled(40, 40, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
    QCOMPARE(drawer.currentPixmap().toImage(), expected.toImage());
}

void TestBadgeDrawer::labelWithTheMembersDefaults()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeSize(QSize(30, 30));
    for (const bool stroke : {false, true}) {
        for (const bool crossed : {false, true}) {
            drawer.setBadgeStroke(stroke);
            drawer.setBadgeLabel(QStringLiteral("5"), crossed);
            const QImage shortForm = drawer.currentPixmap().toImage();
            drawer.setBadgeLabel(QStringLiteral("5"), QSize(30, 30), stroke, crossed);
            QCOMPARE(shortForm, drawer.currentPixmap().toImage());
            drawer.setBadgeLabel(QStringLiteral("5"), QSize(30, 30), !stroke, crossed);
            QVERIFY(shortForm != drawer.currentPixmap().toImage());
            drawer.setBadgeLabel(QStringLiteral("5"), QSize(30, 30), stroke, !crossed);
            QVERIFY(shortForm != drawer.currentPixmap().toImage());
        }
    }
}

void TestBadgeDrawer::emptyLabelIsAPlainDisc()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QString(), QSize(20, 20), false, false);
    QVERIFY(drawer.hasBadge());
    QCOMPARE(drawer.currentPixmap().size(), QSize(20, 20));
    QCOMPARE(drawer.currentPixmap().toImage().pixelColor(10, 10).alpha(), 220);
    QCOMPARE(drawer.currentPixmap().toImage().pixelColor(0, 0).alpha(), 0);
}

void TestBadgeDrawer::longLabelIsAsHighAsAskedAndWider()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("recording now"), false);
    const QSize canvas
        = BadgeDrawer::renderBadgePixmapFromText(QStringLiteral("recording now"), false, false, Qt::white, Qt::red)
              .size();
    QCOMPARE(drawer.currentPixmap().height(), 20);
    QVERIFY(qAbs(drawer.currentPixmap().width() - canvas.width() / 5) <= 1);
}

void TestBadgeDrawer::sizeHintFollowsThePixmap()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeSize(QSize(24, 18));
    QCOMPARE(drawer.sizeHint(), QSize(24, 18));
    drawer.setBadgeLabel(QStringLiteral("a longer text"), QSize(16, 16), false, false);
    QCOMPARE(drawer.sizeHint(), drawer.currentPixmap().size());
    QVERIFY(drawer.sizeHint().width() > 24);
    drawer.unsetBadgeLabel();
    QCOMPARE(drawer.sizeHint(), QSize(24, 18));
    drawer.setBadgeBusy(true);
    QCOMPARE(drawer.sizeHint(), QSize(24, 24));
}

void TestBadgeDrawer::unsetTakesTheLabelAway()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    host.showWindow();
    drawer.unsetBadgeLabel();
    QVERIFY(!drawer.hasBadge());
    QCOMPARE(drawer.badgeLabel(), QString());
    QVERIFY(host.wasAskedToUpdate());
    QVERIFY(host.wasAskedForLayout());
}

void TestBadgeDrawer::labelsAreNotCached()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    const qint64 first = drawer.currentPixmap().cacheKey();
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    QVERIFY(drawer.currentPixmap().cacheKey() != first);
}

void TestBadgeDrawer::emptySizesGiveNoBadge_data()
{
    QTest::addColumn<QSize>("size");
    const int most = std::numeric_limits<int>::max();
    const int least = std::numeric_limits<int>::min();
    QTest::newRow("zero") << QSize(0, 0);
    QTest::newRow("no width") << QSize(0, 20);
    QTest::newRow("no height") << QSize(20, 0);
    QTest::newRow("invalid") << QSize();
    QTest::newRow("negative") << QSize(-20, -20);
    QTest::newRow("no room") << QSize(most, most);
    QTest::newRow("one huge side") << QSize(1, most);
    QTest::newRow("least") << QSize(least, least);
}

void TestBadgeDrawer::emptySizesGiveNoBadge()
{
    QFETCH(QSize, size);
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeSize(size);
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    QVERIFY(!drawer.hasBadge());
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("1"));
    QCOMPARE(drawer.sizeHint(), size);
    drawer.setBadgeBusy(true);
    QVERIFY(!drawer.hasBadge());
    QVERIFY(drawer.badgeBusy());
    tick(drawer);
    QVERIFY(!drawer.hasBadge());
    QVERIFY(drawer.busyPixmap().isNull());
    QVERIFY(!isCached(keyAt(drawer, 1440)));
    QVERIFY(inked(drawn(drawer, host.size(), Qt::AlignCenter)).isNull());
    drawer.setBadgeBusy(false);
}

void TestBadgeDrawer::busyShowsTheFirstFrame()
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

void TestBadgeDrawer::busyTwiceKeepsTheRunningAngle()
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

void TestBadgeDrawer::busyClearsTheLabel()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    drawer.setBadgeBusy(true);
    QCOMPARE(drawer.badgeLabel(), QString());
    QVERIFY(showsAngle(drawer, 1440));
}

void TestBadgeDrawer::busyAgainStartsAtTheFirstAngle()
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

void TestBadgeDrawer::endOfBusyTakesTheMarkAway()
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

void TestBadgeDrawer::labelSurvivesTheEndOfBusy()
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

void TestBadgeDrawer::labelDuringBusyStopsTheAnimationButNotTheFlag()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    drawer.setBadgeLabel(QStringLiteral("3"), false);
    QVERIFY(drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QCOMPARE(drawer.badgeLabel(), QStringLiteral("3"));
}

void TestBadgeDrawer::unsetDuringBusyStopsTheAnimationButNotTheFlag()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    drawer.unsetBadgeLabel();
    QVERIFY(drawer.badgeBusy());
    QVERIFY(!isSpinning(drawer));
    QVERIFY(!drawer.hasBadge());
}

void TestBadgeDrawer::labelDuringBusyGivesWayWhenTheHostIsShownAgain()
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
    // The timer never outlives the busy state.
    drawer.setBadgeBusy(false);
    QVERIFY(!isSpinning(drawer));
    QVERIFY(drawer.hasBadge());
}

void TestBadgeDrawer::notBusyWhileNotBusyDoesNothing()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    host.showWindow();
    drawer.setBadgeBusy(false);
    QVERIFY(!host.wasAskedToUpdate());
    QVERIFY(!host.wasAskedForLayout());
}

void TestBadgeDrawer::ticksFollowTheSequenceOfAngles()
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

void TestBadgeDrawer::tickAsksForARepaintAndNoLayout()
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

void TestBadgeDrawer::onlyTicksEmitPixmapChanged()
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

void TestBadgeDrawer::timerRunsEveryFiftyMilliseconds()
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

void TestBadgeDrawer::aTurnFillsTheCacheWithTwelveFrames()
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

void TestBadgeDrawer::manyDrawersShareTheirFrames()
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

void TestBadgeDrawer::coloursOfEqualBrightnessShareTheirFrames()
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

void TestBadgeDrawer::lookChangesWithTheNextTick()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    tick(drawer);
    drawer.setBusyBadgeType(BadgeDrawer::ebbtArc);
    drawer.setBadgeSize(QSize(32, 32));
    QCOMPARE(drawer.currentPixmap().size(), QSize(20, 20));
    tick(drawer);
    QCOMPARE(drawer.currentPixmap().size(), QSize(32, 32));
    QVERIFY(showsAngle(drawer, 480));
}

void TestBadgeDrawer::frameComesFromTheCacheWhenThere()
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

void TestBadgeDrawer::stillFrameLeavesTheStateAlone()
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

void TestBadgeDrawer::framesAreScaledToTheBadgeSize_data()
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

void TestBadgeDrawer::framesAreScaledToTheBadgeSize()
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

void TestBadgeDrawer::hiddenHostWaitsForItsShow()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeBusy(true);
    QVERIFY(drawer.hasBadge());
    QVERIFY(!isSpinning(drawer));
    host.showWindow();
    QVERIFY(isSpinning(drawer));
}

void TestBadgeDrawer::timerSleepsWhileTheHostIsHidden()
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

void TestBadgeDrawer::withoutAHostTheTimerRuns()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeBusy(true);
    QVERIFY(isSpinning(drawer));
    drawer.setBadgeBusy(false);
    QVERIFY(!isSpinning(drawer));
}

void TestBadgeDrawer::idleDrawerIgnoresShowAndHide()
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

void TestBadgeDrawer::onlyTheHostsEventsCount()
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

void TestBadgeDrawer::newHostIsWatchedFromTheNextStart()
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

void TestBadgeDrawer::filterNeverEatsAnEvent()
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

void TestBadgeDrawer::drawsAlignedInTheHost_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<QPoint>("topLeft");
    QTest::newRow("left top") << int(Qt::AlignLeft | Qt::AlignTop) << QPoint(0, 0);
    QTest::newRow("right top") << int(Qt::AlignRight | Qt::AlignTop) << QPoint(60, 0);
    QTest::newRow("right bottom") << int(Qt::AlignRight | Qt::AlignBottom) << QPoint(60, 40);
    QTest::newRow("left bottom") << int(Qt::AlignLeft | Qt::AlignBottom) << QPoint(0, 40);
    QTest::newRow("centre") << int(Qt::AlignCenter) << QPoint(30, 20);
}

void TestBadgeDrawer::drawsAlignedInTheHost()
{
    QFETCH(int, alignment);
    QFETCH(QPoint, topLeft);
    Host host(QSize(80, 60));
    host.showWindow();
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeLabel(QString(), false);
    const QImage image = drawn(drawer, QSize(80, 60), Qt::Alignment(alignment));
    QCOMPARE(inked(image), QRect(topLeft, QSize(20, 20)));
    QCOMPARE(image.copy(QRect(topLeft, QSize(20, 20))),
        drawer.currentPixmap().toImage().convertToFormat(image.format()));
}

void TestBadgeDrawer::drawsNothingWithoutAHost()
{
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    QVERIFY(!drawer.currentPixmap().isNull());
    QVERIFY(inked(drawn(drawer, QSize(80, 60), Qt::AlignCenter)).isNull());
}

void TestBadgeDrawer::drawsNothingWithAnInactivePainter()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    QPainter painter;
    drawer.drawBadge(painter, Qt::AlignCenter);
    QVERIFY(!painter.isActive());
}

void TestBadgeDrawer::drawsNothingWithoutABadge()
{
    Host host;
    BadgeDrawer drawer(nullptr, &host);
    QVERIFY(inked(drawn(drawer, QSize(80, 60), Qt::AlignCenter)).isNull());
}

void TestBadgeDrawer::alignmentIgnoresTheLayoutDirection()
{
    Host host(QSize(80, 60));
    host.showWindow();
    host.setLayoutDirection(Qt::RightToLeft);
    BadgeDrawer drawer(nullptr, &host);
    drawer.setBadgeLabel(QString(), false);
    QCOMPARE(inked(drawn(drawer, QSize(80, 60), Qt::AlignRight | Qt::AlignTop)), QRect(60, 0, 20, 20));
}

void TestBadgeDrawer::hostMayDieFirst()
{
    auto host = std::make_unique<Host>();
    BadgeDrawer drawer(nullptr, host.get());
    drawer.setBadgeBusy(true);
    host->showWindow();
    QVERIFY(isSpinning(drawer));
    host.reset();
    drawer.setBadgeLabel(QStringLiteral("1"), false);
    QVERIFY(drawer.hasBadge());
    QVERIFY(inked(drawn(drawer, QSize(80, 60), Qt::AlignCenter)).isNull());
    drawer.unsetBadgeLabel();
    drawer.setBadgeBusy(false);
    drawer.setBadgeBusy(true);
    tick(drawer);
    QVERIFY(showsAngle(drawer, 960));
    drawer.setBadgeBusy(false);
}

void TestBadgeDrawer::drawerMayDieInItsOwnSignal()
{
    Host host;
    host.showWindow();
    for (QWidget* widget : {static_cast<QWidget*>(nullptr), static_cast<QWidget*>(&host)}) {
        QPointer<BadgeDrawer> drawer = new BadgeDrawer(nullptr, widget);
        connect(drawer.data(), &BadgeDrawer::pixmapChanged, this, [drawer] { delete drawer.data(); });
        drawer->setBadgeBusy(true);
        QTRY_VERIFY(drawer.isNull());
    }
    host.hide();
    host.show();
}

void TestBadgeDrawer::drawerMayDieWhileBusy()
{
    Host host;
    host.showWindow();
    auto drawer = std::make_unique<BadgeDrawer>(nullptr, &host);
    drawer->setBadgeBusy(true);
    drawer.reset();
    host.hide();
    host.show();
    QCoreApplication::processEvents();
}

void TestBadgeDrawer::hostMayDieInTheSignal()
{
    QPointer<Host> host = new Host;
    host->showWindow();
    BadgeDrawer drawer(nullptr, host);
    connect(&drawer, &BadgeDrawer::pixmapChanged, this, [host] { delete host.data(); });
    drawer.setBadgeBusy(true);
    tick(drawer);
    QVERIFY(host.isNull());
    QVERIFY(drawer.badgeBusy());
    QVERIFY(showsAngle(drawer, 960));
    drawer.setBadgeBusy(false);
    QVERIFY(!drawer.hasBadge());
}

void TestBadgeDrawer::unknownTypesShowATransparentMark()
{
    Host host;
    host.showWindow();
    BadgeDrawer drawer(nullptr, &host);
    for (const int type : {-1, 4, 12345}) {
        drawer.setBusyBadgeType(BadgeDrawer::EBusyBadgeType(type));
        QCOMPARE(int(drawer.busyBadgeType()), type);
        drawer.setBadgeBusy(true);
        tick(drawer);
        QVERIFY(drawer.hasBadge());
        QVERIFY(inked(drawer.currentPixmap().toImage()).isNull());
        drawer.setBadgeBusy(false);
    }
}

ZELKOV_TEST_MAIN(TestBadgeDrawer)
#include "tst_badgedrawer.moc"
