// SPDX-License-Identifier: MIT
// The whole client with a real pointer and real keys, from the log-in to the log-out.
#include "client/ClientStage.h"
#include "client/DeviceList.h"
#include "client/DeviceRow.h"
#include "client/Fleet.h"
#include "client/LiveWall.h"
#include "client/RecordStripes.h"
#include "client/Session.h"
#include "client/TimeTrack.h"
#include "popover/Manager.h"
#include "popover/items/CheckItem.h"
#include "sliders/MultiNubsieSlider.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QProcess>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QToolButton>

#include <algorithm>

using client::Session;
using zelkovtest::ClientStage;

namespace
{
using Where = std::function<QPoint(const QWidget*)>;

// Runs xdotool while the program goes on, in whatever event loops that leads to.
bool pointer(const QStringList& arguments)
{
    QProcess tool;
    tool.start(QStringLiteral("xdotool"), arguments);
    return QTest::qWaitFor([&tool] { return tool.state() == QProcess::NotRunning; }, 30000)
        && tool.exitStatus() == QProcess::NormalExit && tool.exitCode() == 0;
}

QStringList words(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

QStringList to(const QPoint& global)
{
    return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
        QStringLiteral("sleep"), QStringLiteral("0.05")};
}

bool clickAt(const QPoint& global)
{
    // The time before it keeps two clicks from being a double one.
    return pointer(to(global) + words("sleep 0.45 mousedown 1 sleep 0.05 mouseup 1 sleep 0.05"));
}

template <typename T = QWidget>
bool click(ClientStage& stage, const char* name, const Where& where = ClientStage::middleOf)
{
    const QWidget* const widget = stage.settled<T>(name, where);
    return widget && clickAt(widget->mapToGlobal(where(widget)));
}

bool drag(const QPoint& from, const QPoint& onto)
{
    QStringList steps = to(from) + words("sleep 0.1 mousedown 1 sleep 0.1");
    for (int i = 1; i <= 12; ++i) {
        steps << to(from + (onto - from) * i / 12);
    }
    return pointer(steps + words("sleep 0.2 mouseup 1 sleep 0.1"));
}

bool type(ClientStage& stage, const char* name, const QString& text)
{
    if (!click<QLineEdit>(stage, name)
        || !QTest::qWaitFor(
            [&] { return stage.seen<QLineEdit>(name) && stage.seen<QLineEdit>(name)->hasFocus(); }, 5000)) {
        return false;
    }
    QStringList keys = words("key ctrl+a key Delete");
    if (!text.isEmpty()) {
        keys << words("type --delay 30") << text;
    }
    return pointer(keys)
        && QTest::qWaitFor([&] { return stage.seen<QLineEdit>(name)->text() == text; }, 5000);
}

bool closePopover(ClientStage& stage, const char* name)
{
    bool isGone = false;
    for (int i = 0; i < 4 && !isGone; ++i) {
        isGone = clickAt(stage.window().mapToGlobal(QPoint(6, stage.window().height() - 6)))
            && QTest::qWaitFor([&] { return !stage.seen(name); }, 1500);
    }
    return isGone;
}

// Beside the control of a row.
QPoint leftOf(const QWidget* row)
{
    return QPoint(24, row->height() / 2);
}
}

class TestE2eClient : public zelkovtest::TestCase
{
    Q_OBJECT

    // The window manager moves the window once more after it is shown.
    static bool waitUntilSettled(const QWidget& window)
    {
        QPoint last;
        QElapsedTimer unchanged;
        unchanged.start();
        return QTest::qWaitFor(
            [&] {
                const QPoint now = window.mapToGlobal(QPoint());
                if (now != last) {
                    last = now;
                    unchanged.restart();
                }
                return unchanged.elapsed() > 300;
            },
            10000);
    }

private Q_SLOTS:
    void initTestCase() { vx::PopoverWidget::Manager::init(1000); }
    void cleanupTestCase() { vx::PopoverWidget::Manager::deleteInstance(); }

    void theWholeStory()
    {
        ClientStage stage(QSize(1040, 700));
        QVERIFY(waitUntilSettled(stage.window()));
        Session& session = stage.client()->session();
        client::Fleet& fleet = stage.client()->fleet();

        // In
        QVERIFY(type(stage, "userEdit", QStringLiteral("admin")));
        QVERIFY(type(stage, "passwordEdit", QStringLiteral("camera1!")));
        QVERIFY(pointer(words("key Return")));
        QTRY_VERIFY(!stage.seen<QLabel>("loginMessage")->text().isEmpty());
        QVERIFY(type(stage, "passwordEdit", QStringLiteral("camera2!")));
        QVERIFY(pointer(words("key Return")));
        QTRY_COMPARE(session.role(), Session::Role::Administrator);

        // Devices
        QVERIFY(type(stage, "deviceSearch", QStringLiteral("roof 4")));
        QTRY_COMPARE(stage.shownDevices().first(), 31);
        QVERIFY(stage.shownDevices().size() < 9);
        QVERIFY(click(stage, "deviceName"));
        QTRY_COMPARE(stage.wall().currentCamera(), 31);
        QVERIFY(type(stage, "deviceSearch", QString()));
        QTRY_COMPARE(stage.shownDevices().size(), 64);
        auto* const area = stage.settled<QScrollArea>("deviceArea");
        QVERIFY(area);
        QVERIFY(pointer(to(area->mapToGlobal(area->rect().center())) + words("click 5 click 5")));
        QTRY_VERIFY(area->verticalScrollBar()->value() > 0);
        QVERIFY(pointer(words("click 4 click 4")));
        QTRY_COMPARE(area->verticalScrollBar()->value(), 0);

        // Three rows of the settings
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(stage.settled("settingsPopover"));
        QVERIFY(stage.seen("timeStripe"));
        QVERIFY(click(stage, "stripesRow", leftOf));
        QTRY_VERIFY(!stage.seen("timeStripe"));
        QVERIFY(click(stage, "stripesRow", leftOf));
        QTRY_VERIFY(stage.seen("timeStripe"));
        const auto* const side = stage.seen("deviceSideRow")->findChild<QComboBox*>();
        QVERIFY(clickAt(side->mapToGlobal(side->rect().center())));
        QTRY_VERIFY(QApplication::activePopupWidget());
        QVERIFY(pointer(words("key Down key Return")));
        QTRY_VERIFY(!QApplication::activePopupWidget());
        QTRY_VERIFY(stage.seen("devicePanel")->x() > stage.seen("deskMiddle")->x());
        QVERIFY(click(stage, "labelsRow"));
        QVERIFY(stage.settled("namesRow"));
        QVERIFY(click(stage, "namesRow", leftOf));
        QTRY_VERIFY(!stage.seen<vx::PopoverWidget::Item>("namesRow")->value().toBool());
        QVERIFY(closePopover(stage, "settingsPopover"));

        // The time line
        QVERIFY(stage.wall().isLive());
        const QPoint moment = stage.handleOf(stage.track()->positionSlider());
        QVERIFY(!moment.isNull());
        const QPoint there = stage.window().mapToGlobal(moment);
        QVERIFY(drag(there, there - QPoint(180, 0)));
        QTRY_VERIFY(!stage.wall().isLive());
        QVERIFY(stage.track()->moment() < stage.track()->end() - 3600 * 1000);

        // A region
        stage.wall().chooseCamera(1);
        QSignalSpy marks(&stage.wall(), &client::LiveWall::marked);
        QVERIFY(click(stage, "markButton"));
        const QWidget* const band = stage.settled("markedRegion");
        QVERIFY(band);
        const QPoint region = band->mapToGlobal(band->rect().center());
        QVERIFY(drag(region, region + QPoint(20, 12)));
        QTRY_COMPARE(marks.count(), 1);
        QCOMPARE(marks.first().first().toInt(), 1);
        QVERIFY(click(stage, "markButton"));
        QTRY_VERIFY(!stage.seen("markedRegion"));

        // An export
        const qint64 from = stage.track()->from();
        const QPoint flag = stage.handleOf(stage.track()->fromSlider());
        QVERIFY(!flag.isNull());
        QVERIFY(drag(stage.window().mapToGlobal(flag), stage.window().mapToGlobal(flag - QPoint(50, 0))));
        QTRY_VERIFY(stage.track()->from() < from);
        QSignalSpy exported(&stage.stripes(), &client::RecordStripes::exportFinished);
        bool isAccepted = false;
        stage.whenSeen("exportPopover", [&] { isAccepted = click(stage, "exportAccept"); });
        QVERIFY(click(stage, "exportButton"));
        QTRY_VERIFY_WITH_TIMEOUT(isAccepted, 20000);
        QTRY_COMPARE_WITH_TIMEOUT(exported.count(), 1, 20000);
        QCOMPARE(exported.first().first().toBool(), true);
        QVERIFY(stage.gone("exportRun"));

        // Another order
        QVERIFY(click(stage, "deviceEditButton"));
        QVERIFY(stage.settled("deviceNameEdit"));
        const auto inList = [&](int row, double part) {
            const QRect rect = stage.devices()->visualItemRect(stage.devices()->item(row));
            const QPoint grip(rect.right() - 16, rect.top() + int(part * (rect.height() - 1)));
            return stage.devices()->viewport()->mapToGlobal(grip);
        };
        QVERIFY(drag(inList(0, 0.5), inList(2, 0.95)));
        QTRY_COMPARE(stage.fleetOrder().mid(0, 4), QVector<int>({1, 2, 0, 3}));
        QTRY_COMPARE(stage.shownDevices(), stage.fleetOrder());
        QVERIFY(type(stage, "deviceNameEdit", QStringLiteral("Harbour")));
        QVERIFY(pointer(words("key Return")));
        const auto isRenamed = [&fleet] {
            return std::any_of(fleet.cameras().begin(), fleet.cameras().end(),
                [](const client::Camera& camera) { return camera.name == QLatin1String("Harbour"); });
        };
        QTRY_VERIFY(isRenamed());
        QVERIFY(click(stage, "deviceEditButton"));
        QTRY_VERIFY(!stage.devices()->editMode());

        // Theme and language
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(click(stage, "themeRow"));
        QVERIFY(click(stage, "themeRow_dark", leftOf));
        QTRY_COMPARE(stage.themes, QStringList(QStringLiteral("dark")));
        QVERIFY(stage.gone("settingsPopover"));
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(click(stage, "languageRow"));
        QVERIFY(click(stage, "languageRow_fr", leftOf));
        QTRY_COMPARE(stage.languages, QStringList(QStringLiteral("fr")));
        QVERIFY(stage.gone("settingsPopover"));
        QTRY_COMPARE(stage.seen<QLineEdit>("deviceSearch")->placeholderText(), QStringLiteral("Rechercher un appareil"));

        // Out
        QVERIFY(click(stage, "userButton"));
        QVERIFY(click(stage, "userLogOutRow"));
        QTRY_COMPARE(session.role(), Session::Role::None);
        QVERIFY(stage.settled("loginCard"));
        QVERIFY(!stage.seen("deviceSearch"));
    }
};

ZELKOV_TEST_MAIN(TestE2eClient)
#include "tst_e2e_client.moc"
