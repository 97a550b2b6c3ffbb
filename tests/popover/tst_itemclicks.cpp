// SPDX-License-Identifier: MIT
// Clicks on a row: what was hit, single and double clicks.
#include "ItemTools.h"

#include "indicators/ElidedButton.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

using itemtest::ClickRow;
using itemtest::Row;
using vx::PopoverWidget::EItemPerformedFlags;
using vx::PopoverWidget::Item;
namespace pw = vx::PopoverWidget;
using zelkovtest::Pointer;

namespace
{
QString text(const char* words)
{
    return QString::fromLatin1(words);
}

QList<int> performedFlags(const QSignalSpy& spy)
{
    QList<int> result;
    for (const QVariantList& arguments : spy) {
        result << int(arguments.at(3).value<EItemPerformedFlags>());
    }
    return result;
}

/// A row inside a window, 200 x 24 at (20, 10).
template <class Class> struct Scene
{
    explicit Scene(QFlags<pw::EItemFlag> flags)
    {
        host.resize(300, 100);
        row = new Class(flags, 5, QStringLiteral("text"), QStringLiteral("more"), &host);
        row->setGeometry(20, 10, 200, 24);
        host.show();
        static_cast<void>(QTest::qWaitForWindowExposed(&host));
    }
    QWidget host;
    QPointer<Class> row;
};
}

class TestItemClicks : public zelkovtest::TestCase
{
    Q_OBJECT

private:
    int m_interval = 0;

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        m_interval = QApplication::doubleClickInterval();
    }

    void cleanup()
    {
        QApplication::setDoubleClickInterval(m_interval);
        TestCase::cleanup();
    }

    void theElementUnderThePointIsReported()
    {
        Scene<Row> scene(pw::eifIcon | pw::eifText | pw::eifAdditionalText);
        Row* const row = scene.row;
        const QPoint icon = row->iconElement()->geometry().center();
        const QPoint words = row->textElement()->geometry().center();
        const QPoint more = row->additionalTextElement()->geometry().center();
        QCOMPARE(int(row->getItemPerformedFlag(icon, Qt::LeftButton)), 17);
        QCOMPARE(int(row->getItemPerformedFlag(words, Qt::RightButton)), 34);
        QCOMPARE(int(row->getItemPerformedFlag(more, Qt::MiddleButton)), 4);
        QCOMPARE(int(row->getItemPerformedFlag(QPoint(-1, -1), Qt::LeftButton)), 16);
        // A hidden element is hit all the same.
        row->textElement()->setGeometry(0, 0, 7, 7);
        row->textElement()->hide();
        row->iconElement()->setGeometry(100, 0, 1, 1);
        QCOMPARE(int(row->getItemPerformedFlag(QPoint(6, 6), Qt::LeftButton)), 18);
    }

    void theBaseRowAddsTheDoubleClickToWhateverItPerforms()
    {
        Row row(pw::eifText, 3, text("Pan & tilt"));
        row.setUserData(77);
        QSignalSpy performed(&row, &Item::itemPerformed);
        row.performSingleClick(pw::eipText | pw::eipLeftButton);
        QCOMPARE(performed.count(), 1);
        QCOMPARE(performed.at(0).at(0).toInt(), 3);
        QCOMPARE(performed.at(0).at(1), QVariant(QVariant(text("Pan && tilt"))));
        QCOMPARE(performed.at(0).at(2), QVariant(77));
        QCOMPARE(performedFlags(performed), QList<int>({2 | 16 | 64}));
    }

    void performDoubleClickGoesThroughTheVirtualOne()
    {
        ClickRow row;
        QSignalSpy performed(&row, &Item::itemPerformed);
        row.performDoubleClick(pw::eipIcon);
        QCOMPARE(performedFlags(performed), QList<int>({1 | 64}));
        QCOMPARE(performed.at(0).at(1), QVariant(true));
    }

    void theBaseRowIsNotPerformedByAClick()
    {
        Scene<Row> scene(pw::eifText);
        QSignalSpy performed(scene.row.data(), &Item::itemPerformed);
        Pointer pointer(scene.row);
        pointer.click(QPoint(100, 12));
        pointer.wait(2000);
        pointer.click(QPoint(100, 12), Qt::RightButton);
        QCOMPARE(performed.count(), 0);
    }

    void aRealClickOnAnElementReachesTheRow()
    {
        Scene<ClickRow> scene(pw::eifText | pw::eifAdditionalText);
        QSignalSpy performed(scene.row.data(), &Item::itemPerformed);
        Pointer pointer(scene.row);
        pointer.click(scene.row->textElement()->geometry().center());
        QCOMPARE(performedFlags(performed), QList<int>({18}));
    }

    void withoutTheFlagADoubleClickDoesNothing()
    {
        Row row;
        QSignalSpy performed(&row, &Item::itemPerformed);
        // Accepted all the same, since the base class is not asked.
        QVERIFY(itemtest::sendMouse(&row, QEvent::MouseButtonDblClick, QPoint(5, 5)));
        QCOMPARE(performed.count(), 0);
    }

    void aDoubleClickOnAnItemOfAnotherClassStopsNothing()
    {
        Row row(pw::eifText | pw::eifDoubleClick);
        row.resize(100, 20);
        QSignalSpy performed(&row, &Item::itemPerformed);
        itemtest::sendMouse(&row, QEvent::MouseButtonDblClick, QPoint(500, 5), Qt::RightButton, Qt::RightButton);
        QCOMPARE(performedFlags(performed), QList<int>({32 | 64}));
        QVERIFY(!row.m_doubleClickTimer);
    }

    void oneClickIsPerformedOnceAfterTheInterval()
    {
        QApplication::setDoubleClickInterval(60);
        Scene<ClickRow> scene(pw::eifText | pw::eifDoubleClick);
        QSignalSpy performed(scene.row.data(), &Item::itemPerformed);
        QElapsedTimer time;
        time.start();
        Pointer pointer(scene.row);
        pointer.click(QPoint(100, 12));
        QCOMPARE(performed.count(), 0);
        QVERIFY(scene.row->m_doubleClickTimer);
        QCOMPARE(scene.row->m_doubleClickTimer->interval(), 110);
        QVERIFY(scene.row->m_doubleClickTimer->isSingleShot());
        QTRY_COMPARE(performed.count(), 1);
        QVERIFY(time.elapsed() >= 100);
        QCOMPARE(performedFlags(performed).at(0) & 64, 0);
        QVERIFY(!scene.row->m_doubleClickTimer->isActive());
    }

    void twoClicksArePerformedOnceAtOnce()
    {
        QApplication::setDoubleClickInterval(400);
        Scene<ClickRow> scene(pw::eifText | pw::eifDoubleClick);
        QSignalSpy performed(scene.row.data(), &Item::itemPerformed);
        Pointer pointer(scene.row);
        pointer.click(QPoint(180, 12));
        pointer.press(Qt::LeftButton, 50);
        QCOMPARE(performedFlags(performed), QList<int>({16 | 64}));
        pointer.release();
        // The release that ends the double click starts nothing.
        QVERIFY(!scene.row->m_doubleClickTimer->isActive());
        QCOMPARE(performed.count(), 1);
    }

    void aClickAfterADoubleClickCountsAgain()
    {
        QApplication::setDoubleClickInterval(30);
        ClickRow row(pw::eifText | pw::eifDoubleClick);
        row.resize(100, 20);
        QSignalSpy performed(&row, &Item::itemPerformed);
        itemtest::doubleClick(&row, QPoint(5, 5));
        QCOMPARE(performed.count(), 1);
        itemtest::click(&row, QPoint(5, 5));
        QVERIFY(row.m_doubleClickTimer->isActive());
        QTRY_COMPARE(performed.count(), 2);
        QCOMPARE(performedFlags(performed).at(1) & 64, 0);
    }

    void aClickAfterADoubleClickReleasedElsewhereCountsAgain()
    {
        QApplication::setDoubleClickInterval(30);
        ClickRow row(pw::eifText | pw::eifDoubleClick);
        row.resize(100, 20);
        QSignalSpy performed(&row, &Item::itemPerformed);
        itemtest::click(&row, QPoint(5, 5));
        itemtest::sendMouse(&row, QEvent::MouseButtonDblClick, QPoint(5, 5));
        itemtest::sendMouse(&row, QEvent::MouseButtonRelease, QPoint(500, 5), Qt::LeftButton, Qt::NoButton);
        QCOMPARE(performed.count(), 1);
        itemtest::click(&row, QPoint(5, 5));
        QTRY_COMPARE(performed.count(), 2);
    }

    void theTimerKeepsTheLastFlagsOnly()
    {
        QApplication::setDoubleClickInterval(20);
        ClickRow row;
        QSignalSpy performed(&row, &Item::itemPerformed);
        row.startDoubleClickTimer(pw::eipIcon);
        row.startDoubleClickTimer(pw::eipText);
        QTRY_COMPARE(performed.count(), 1);
        QCOMPARE(performedFlags(performed), QList<int>({2}));
        row.startDoubleClickTimer(pw::eipIcon);
        row.stopDoubleClickTimer();
        QVERIFY(!row.m_doubleClickTimer->isActive());
        row.startDoubleClickTimer(pw::eipAdditionalText);
        QTRY_COMPARE(performed.count(), 2);
        QCOMPARE(performedFlags(performed), QList<int>({2, 4}));
    }

    void theBaseRowPerformedByTheTimerReportsADoubleClick()
    {
        QApplication::setDoubleClickInterval(20);
        Row row;
        QSignalSpy performed(&row, &Item::itemPerformed);
        row.startDoubleClickTimer(pw::eipIcon);
        QTRY_COMPARE(performed.count(), 1);
        QCOMPARE(performedFlags(performed), QList<int>({1 | 64}));
    }

    void stoppingWithoutATimerIsNothing()
    {
        Row row;
        row.stopDoubleClickTimer();
        QVERIFY(!row.m_doubleClickTimer);
    }

    void theRowMayDieInItsOwnClick_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<bool>("twice");
        QTest::newRow("single click") << int(pw::eifText) << false;
        QTest::newRow("late single click") << int(pw::eifText | pw::eifDoubleClick) << false;
        QTest::newRow("double click") << int(pw::eifText | pw::eifDoubleClick) << true;
    }

    void theRowMayDieInItsOwnClick()
    {
        QFETCH(int, flags);
        QFETCH(bool, twice);
        QApplication::setDoubleClickInterval(100);
        Scene<ClickRow> scene {pw::EItemFlags(QFlag(flags))};
        connect(scene.row.data(), &Item::itemPerformed, this, [&scene] { delete scene.row.data(); });
        Pointer pointer(&scene.host);
        pointer.click(QPoint(120, 22));
        if (twice) {
            pointer.click(QPoint(120, 22));
        }
        QTRY_VERIFY(!scene.row);
    }

    void theTimerDiesWithTheRow()
    {
        QApplication::setDoubleClickInterval(1);
        QPointer<QTimer> timer;
        {
            ClickRow row;
            row.startDoubleClickTimer(pw::eipIcon);
            timer = row.m_doubleClickTimer;
            QVERIFY(timer);
        }
        QVERIFY(!timer);
    }
};

ZELKOV_TEST_MAIN(TestItemClicks)
#include "tst_itemclicks.moc"
