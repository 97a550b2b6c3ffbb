// SPDX-License-Identifier: MIT
// The mix-in alone: the verdict on a hold, its timer, and the questions to the security manager.
#include "ClickTools.h"
#include "input/ClickVerdict.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QWidget>

#include <climits>
#include <type_traits>

using clicktest::c_Never;
using vx::CustomClickAdapter;

namespace
{
class Adapter : public vx::CustomClickAdapter
{
public:
    explicit Adapter(QWidget* owner = nullptr, int span = c_Never)
        : vx::CustomClickAdapter(owner, span)
    {
    }
    using vx::CustomClickAdapter::evaluateClickTimespan;
    using vx::CustomClickAdapter::isProtected;
    using vx::CustomClickAdapter::m_adminOnly;
    using vx::CustomClickAdapter::m_clickType;
    using vx::CustomClickAdapter::m_evaluated;
    using vx::CustomClickAdapter::m_owner;
    using vx::CustomClickAdapter::m_pressTime;
    using vx::CustomClickAdapter::m_protected;
    using vx::CustomClickAdapter::m_securityCheck;
    using vx::CustomClickAdapter::startClickTimer;
    using vx::CustomClickAdapter::stopClickTimer;
};
}

class TestCustomClickAdapter : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theKindsOfClicksHaveTheirNumbers()
    {
        QCOMPARE(int(CustomClickAdapter::ectNone), 0);
        QCOMPARE(int(CustomClickAdapter::ectNormal), 1);
        QCOMPARE(int(CustomClickAdapter::ectLong), 2);
        QCOMPARE(int(CustomClickAdapter::ectContext), 4);
        QCOMPARE(int(CustomClickAdapter::ectArrow), 6);
        QCOMPARE(CustomClickAdapter::s_DefaultLongClickTimeout, 750);
        QCOMPARE(CustomClickAdapter::s_DefaultLongClickSpan, 750);
        QVERIFY(std::has_virtual_destructor<CustomClickAdapter>::value);
    }

    void itStartsWithItsDefaults()
    {
        QWidget owner;
        Adapter adapter(&owner, 123);
        QCOMPARE(adapter.m_owner, &owner);
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNone);
        QVERIFY(adapter.autoClick());
        QVERIFY(!adapter.m_evaluated);
        QVERIFY(!adapter.m_pressTime.isValid());
        QCOMPARE(adapter.getLongClickSpan(), 123);
        QCOMPARE(adapter.longClickTimer().interval(), 123);
        QVERIFY(adapter.longClickTimer().isSingleShot());
        QVERIFY(!adapter.longClickTimer().isActive());
        QVERIFY(adapter.m_securityCheck.isEmpty());
        QVERIFY(!adapter.m_protected);
        QVERIFY(!adapter.m_adminOnly);
        QVERIFY(CustomClickAdapter::securityManager() == nullptr);
    }

    void aHoldIsJudgedByTimerAndTime_data()
    {
        QTest::addColumn<bool>("autoClick");
        QTest::addColumn<bool>("timerRuns");
        QTest::addColumn<qint64>("heldFor");
        QTest::addColumn<int>("span");
        QTest::addColumn<bool>("isLong");
        QTest::newRow("short") << true << true << qint64(749) << 750 << false;
        QTest::newRow("just the span, timer late") << true << true << qint64(750) << 750 << true;
        QTest::newRow("timer expired early") << true << false << qint64(1) << 750 << true;
        QTest::newRow("without automatic click, short") << false << false << qint64(749) << 750 << false;
        QTest::newRow("without automatic click, long") << false << false << qint64(750) << 750 << true;
        QTest::newRow("switched off in mid-hold") << false << true << qint64(10) << 750 << false;
        QTest::newRow("no span") << false << false << qint64(0) << 0 << true;
        QTest::newRow("negative span") << false << false << qint64(0) << -1 << true;
    }

    void aHoldIsJudgedByTimerAndTime()
    {
        QFETCH(bool, autoClick);
        QFETCH(bool, timerRuns);
        QFETCH(qint64, heldFor);
        QFETCH(int, span);
        QTEST(vx::isLongHold(autoClick, timerRuns, heldFor, span), "isLong");
    }

    void aPressIsANormalClickAndStartsTheTimer()
    {
        Adapter adapter;
        adapter.m_evaluated = true;
        adapter.startClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
        QVERIFY(!adapter.m_evaluated);
        QVERIFY(adapter.m_pressTime.isValid());
        QVERIFY(adapter.longClickTimer().isActive());
        adapter.stopClickTimer();
        QVERIFY(!adapter.longClickTimer().isActive());
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
    }

    void withoutAutomaticClicksTheTimerNeverRuns()
    {
        Adapter adapter(nullptr, 20);
        adapter.setAutoClick(false);
        QVERIFY(!adapter.autoClick());
        adapter.startClickTimer();
        QVERIFY(!adapter.longClickTimer().isActive());
        adapter.setLongClickSpan(c_Never);
        adapter.stopClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
        adapter.setLongClickSpan(20);
        adapter.startClickTimer();
        clicktest::letPass(25);
        adapter.stopClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectLong);
    }

    void aTimerThatNoLongerRunsMakesThePressLongAtOnce()
    {
        Adapter adapter;
        adapter.startClickTimer();
        adapter.longClickTimer().stop();
        adapter.stopClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectLong);
    }

    void onePressIsJudgedOnce()
    {
        Adapter adapter;
        adapter.startClickTimer();
        adapter.evaluateClickTimespan();
        QVERIFY(adapter.m_evaluated);
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
        adapter.longClickTimer().stop();
        adapter.stopClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
        adapter.startClickTimer();
        adapter.longClickTimer().stop();
        adapter.evaluateClickTimespan();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectLong);
    }

    void aRefusedUserIsNotJudgedButTheTimerStops()
    {
        Adapter adapter;
        adapter.startClickTimer();
        adapter.m_protected = true;
        adapter.longClickTimer().setInterval(c_Never);
        QVERIFY(adapter.longClickTimer().isActive());
        adapter.stopClickTimer();
        QVERIFY(!adapter.longClickTimer().isActive());
        QVERIFY(!adapter.m_evaluated);
        adapter.evaluateClickTimespan();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectNormal);
    }

    void theSpanIsTheTimersInterval()
    {
        Adapter adapter;
        adapter.setLongClickSpan(321);
        QCOMPARE(adapter.getLongClickSpan(), 321);
        QCOMPARE(adapter.longClickTimer().interval(), 321);
        // A negative interval would be a complaint of Qt's at the next press.
        adapter.setLongClickSpan(INT_MIN);
        QCOMPARE(adapter.getLongClickSpan(), INT_MIN);
        QCOMPARE(adapter.longClickTimer().interval(), 0);
        adapter.startClickTimer();
        adapter.stopClickTimer();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectLong);
    }

    void aNewSpanDuringAHoldIsLeftToQt()
    {
        Adapter adapter;
        adapter.startClickTimer();
        QSignalSpy expired(&adapter.longClickTimer(), &QTimer::timeout);
        adapter.setLongClickSpan(20);
        QVERIFY(adapter.longClickTimer().isActive());
        QVERIFY(expired.wait());
        adapter.evaluateClickTimespan();
        QCOMPARE(adapter.getClickType(), CustomClickAdapter::ectLong);
    }

    void withoutAManagerEverybodyMayClick()
    {
        Adapter adapter;
        adapter.setAdminOnly(true);
        adapter.setSecurityCheck(QStringLiteral("export"));
        adapter.m_protected = true;
        QVERIFY(!adapter.isProtected());
        QVERIFY(!adapter.m_protected);
    }

    void theTwoAnswersOfTheManagerAreTakenInOppositeSenses_data()
    {
        QTest::addColumn<bool>("adminOnly");
        QTest::addColumn<QString>("right");
        QTest::addColumn<bool>("answer");
        QTest::addColumn<bool>("isProtected");
        QTest::addColumn<QStringList>("questions");
        const QString right = QStringLiteral("export");
        const QStringList admin(QStringLiteral("administrator 1 0"));
        const QStringList refused(QStringLiteral("right export 1 0 0"));
        QTest::newRow("administrator") << true << QString() << true << false << admin;
        QTest::newRow("no administrator") << true << QString() << false << true << admin;
        QTest::newRow("right refused") << false << right << true << true << refused;
        QTest::newRow("right not refused") << false << right << false << false << refused;
        QTest::newRow("administrator goes before the right") << true << right << true << false << admin;
        QTest::newRow("the same, refused") << true << right << false << true << admin;
        QTest::newRow("nothing to ask") << false << QString() << true << false << QStringList();
    }

    void theTwoAnswersOfTheManagerAreTakenInOppositeSenses()
    {
        QFETCH(bool, adminOnly);
        QFETCH(QString, right);
        QFETCH(bool, answer);
        QFETCH(bool, isProtected);
        clicktest::OnDuty guard;
        guard->administrator = answer;
        guard->refuses = answer;
        Adapter adapter;
        adapter.setAdminOnly(adminOnly);
        adapter.setSecurityCheck(right);
        adapter.m_protected = !isProtected;
        QCOMPARE(adapter.isProtected(), isProtected);
        QCOMPARE(adapter.m_protected, isProtected);
        QTEST(guard->questions, "questions");
    }

    void allButtonsShareOneManager()
    {
        const auto guard = std::make_shared<clicktest::Guard>();
        CustomClickAdapter::setSecurityManager(guard);
        QVERIFY(CustomClickAdapter::securityManager() == guard);
        CustomClickAdapter::setSecurityManager(nullptr);
        QVERIFY(CustomClickAdapter::securityManager() == nullptr);
        QCOMPARE(guard.use_count(), 1L);
    }

    void theManagerMayGoWhileItIsAsked()
    {
        CustomClickAdapter::setSecurityManager(std::make_shared<clicktest::Guard>());
        auto* guard = static_cast<clicktest::Guard*>(CustomClickAdapter::securityManager().get());
        guard->administrator = false;
        guard->whenAsked = [] { CustomClickAdapter::setSecurityManager(nullptr); };
        Adapter adapter;
        adapter.setAdminOnly(true);
        QVERIFY(adapter.isProtected());
        QVERIFY(!adapter.isProtected());
    }
};

ZELKOV_TEST_MAIN(TestCustomClickAdapter)
#include "tst_customclickadapter.moc"
