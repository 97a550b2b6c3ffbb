// SPDX-License-Identifier: MIT
// The state of a badge: defaults, labels, drawing and lifetimes.
#include "BadgeHost.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

#include <limits>

using namespace badgetest;
using vx::BadgeDrawer;
namespace geometry = vx::BadgeGeometry;

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
