// SPDX-License-Identifier: MIT
// The whole client, from the log-in to the log-out, by events; and its end in the middle of whatever it does.
#include "client/ClientStage.h"
#include "client/Desk.h"
#include "client/DeviceList.h"
#include "client/DeviceRow.h"
#include "client/Fleet.h"
#include "client/LiveView.h"
#include "client/LiveWall.h"
#include "client/RecordStripes.h"
#include "client/Session.h"
#include "client/TimeTrack.h"
#include "controls/DateTimeEdit.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "popover/items/SliderItem.h"
#include "sliders/MultiNubsieSlider.h"
#include "sliders/Nubsie.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "ZelkovUtils/TimeUtils.h"

#include <QtTest/QtTest>
#include <QtWidgets/QAbstractItemView>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QToolButton>

#include <memory>

using client::Session;
using zelkovtest::ClientStage;
using zelkovtest::Pointer;

namespace
{
const QSize s_size(1000, 680);

/// Two clicks never make a double one.
ulong laterTime()
{
    static ulong time = 10000;
    time += 2000;
    return time;
}

using Where = std::function<QPoint(const QWidget*)>;

template <typename T = QWidget>
bool click(ClientStage& stage, const char* name, const Where& where = ClientStage::middleOf)
{
    QWidget* const widget = stage.settled<T>(name, where);
    if (widget) {
        // In the window: what is clicked may not live until the release.
        const QPoint at = widget->mapTo(&stage.window(), where(widget));
        Pointer(&stage.window(), laterTime()).click(at);
    }
    return widget != nullptr;
}

bool type(ClientStage& stage, const char* name, const QString& text)
{
    if (!click<QLineEdit>(stage, name)) {
        return false;
    }
    auto* const field = stage.seen<QLineEdit>(name);
    if (!field || !field->hasFocus()) {
        return false;
    }
    QTest::keyClick(field, Qt::Key_A, Qt::ControlModifier);
    QTest::keyClick(field, Qt::Key_Delete);
    QTest::keyClicks(field, text);
    return field->text() == text;
}

bool logIn(ClientStage& stage, const QString& user, const QString& password)
{
    return type(stage, "userEdit", user) && type(stage, "passwordEdit", password) && click(stage, "logInButton");
}

bool enter(ClientStage& stage)
{
    return logIn(stage, QStringLiteral("admin"), QStringLiteral("camera2!")) && stage.settled("deviceSearch");
}

/// Ends a popover by a click beside it.
bool closePopover(ClientStage& stage, const char* name)
{
    bool isGone = false;
    for (int i = 0; i < 4 && !isGone; ++i) {
        Pointer(&stage.window(), laterTime()).click(QPoint(4, stage.window().height() - 4));
        isGone = QTest::qWaitFor([&] { return !stage.seen(name); }, 1000);
    }
    return isGone;
}

void drag(ClientStage& stage, const QPoint& from, const QPoint& way, const std::function<void()>& inTheMiddle = {})
{
    Pointer pointer(&stage.window(), laterTime());
    pointer.move(from);
    pointer.press();
    for (int i = 1; i <= 10; ++i) {
        pointer.move(from + way * i / 10);
        if (i == 5 && inTheMiddle) {
            inTheMiddle();
        }
    }
    pointer.release();
}

QString textOf(ClientStage& stage, const char* name)
{
    const auto* const label = stage.seen<QLabel>(name);
    return label ? label->text() : QString();
}

QString left(const QWidget& window)
{
    QStringList result;
    for (const QWidget* const each : window.findChildren<QWidget*>()) {
        result << QStringLiteral("%1 %2").arg(QLatin1String(each->metaObject()->className()), each->objectName());
    }
    return result.join(QLatin1String(", "));
}

/// What is deleted later may leave something to be deleted later itself.
bool isEmpty(const QWidget& window)
{
    return QTest::qWaitFor(
        [&window] {
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
            return window.findChildren<QWidget*>().isEmpty();
        },
        2000);
}

// The arrow beside the button.
QPoint arrowOf(const QWidget* button)
{
    return QPoint(button->width() - 8, button->height() / 2);
}
}

class TestClient : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { vx::PopoverWidget::Manager::init(1000); }
    void cleanupTestCase() { vx::PopoverWidget::Manager::deleteInstance(); }

    void theWholeStory();
    void aUserMayDoLess();
    void settingsSurviveThePopover();
    void datesFollowTheLanguage();
    void twoLogInsInTurn();
    void theClientIsDeletedInTheMiddle_data();
    void theClientIsDeletedInTheMiddle();
    void theClientMovesToAnotherWindow();
};

void TestClient::theWholeStory()
{
    ClientStage stage(s_size);
    Session& session = stage.client()->session();
    client::Fleet& fleet = stage.client()->fleet();

    // A wrong password
    QVERIFY(logIn(stage, QStringLiteral("admin"), QStringLiteral("camera1!")));
    QTRY_VERIFY(!textOf(stage, "loginMessage").isEmpty());
    QCOMPARE(session.role(), Session::Role::None);
    QVERIFY(!stage.seen("deviceSearch"));
    QVERIFY(enter(stage));
    QCOMPARE(session.role(), Session::Role::Administrator);

    // Devices
    QVERIFY(type(stage, "deviceSearch", QStringLiteral("yard 3")));
    QCOMPARE(stage.shownDevices().first(), 17);
    QVERIFY(stage.shownDevices().size() < 9);
    QVERIFY(click(stage, "deviceName"));
    QTRY_COMPARE(stage.wall().currentCamera(), 17);
    QVERIFY(type(stage, "deviceSearch", QString()));
    QCOMPARE(stage.shownDevices().size(), 64);

    // Three rows of the settings
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(stage.settled("settingsPopover"));
    QVERIFY(stage.seen("timeStripe"));
    QVERIFY(click(stage, "stripesRow", [](const QWidget* row) { return QPoint(20, row->height() / 2); }));
    QTRY_VERIFY(!stage.seen("timeStripe"));
    auto* const side = stage.seen("deviceSideRow")->findChild<QComboBox*>();
    side->setFocus();
    QTest::keyClick(side, Qt::Key_Down);
    QTRY_VERIFY(stage.client()->findChild<QWidget*>(QStringLiteral("devicePanel"))->x()
        > stage.client()->findChild<QWidget*>(QStringLiteral("deskMiddle"))->x());
    auto* const views = stage.seen<vx::PopoverWidget::SliderItem>("viewsRow");
    QVERIFY(views);
    const QPoint handle = stage.handleOf(views->slider());
    QVERIFY(!handle.isNull());
    drag(stage, handle, QPoint(300, 0));
    QTRY_COMPARE(stage.wall().viewCount(), 64);
    QVERIFY(click(stage, "stripesRow", [](const QWidget* row) { return QPoint(20, row->height() / 2); }));
    QTRY_VERIFY(stage.seen("timeStripe"));
    side->setFocus();
    QTest::keyClick(side, Qt::Key_Up);
    QVERIFY(closePopover(stage, "settingsPopover"));
    QTRY_COMPARE(stage.window().findChildren<vx::Nubsie*>().size(), 3); // only those of the time line

    // Sixteen views
    QVERIFY(click(stage, "viewsButton", arrowOf));
    QVERIFY(click(stage, "viewCountRow_16"));
    QTRY_COMPARE(stage.wall().viewCount(), 16);
    QVERIFY(stage.gone("viewsPopover"));
    QCOMPARE(stage.wall().shownCameras().size(), 16);

    // The time line
    QVERIFY(stage.wall().isLive());
    QSignalSpy times(&stage.stripes(), &client::RecordStripes::timeChosen);
    drag(stage, stage.handleOf(stage.track()->positionSlider()), QPoint(-200, 0));
    QVERIFY(times.count() > 3);
    QVERIFY(!stage.wall().isLive());
    QVERIFY(click<QToolButton>(stage, "liveButton"));
    QTRY_VERIFY(stage.wall().isLive());

    // A region
    stage.wall().chooseCamera(5);
    QSignalSpy marks(&stage.wall(), &client::LiveWall::marked);
    QVERIFY(click(stage, "markButton"));
    QWidget* const band = stage.settled("markedRegion");
    QVERIFY(band);
    drag(stage, band->mapTo(&stage.window(), band->rect().center()), QPoint(12, 8));
    QCOMPARE(marks.count(), 1);
    QCOMPARE(marks.first().first().toInt(), 5);
    QVERIFY(!textOf(stage, "statusText").isEmpty());
    QVERIFY(click(stage, "markButton"));
    QTRY_VERIFY(!stage.seen("markedRegion"));

    // An export
    const qint64 from = stage.track()->from();
    drag(stage, stage.handleOf(stage.track()->fromSlider()), QPoint(-40, 0));
    QVERIFY(stage.track()->from() < from);
    QSignalSpy exported(&stage.stripes(), &client::RecordStripes::exportFinished);
    bool isAccepted = false;
    stage.whenSeen("exportPopover", [&] { isAccepted = click(stage, "exportAccept"); });
    QVERIFY(click(stage, "exportButton"));
    QTRY_VERIFY(isAccepted);
    QTRY_VERIFY(stage.seen("exportRun"));
    QTRY_COMPARE_WITH_TIMEOUT(exported.count(), 1, 15000);
    QCOMPARE(exported.first().first().toBool(), true);
    QVERIFY(stage.gone("exportRun"));

    // Another order
    QVERIFY(click(stage, "deviceEditButton"));
    QTRY_VERIFY(stage.devices()->editMode());
    fleet.move(0, 3); // a drag needs a real pointer
    QTRY_COMPARE(stage.shownDevices(), stage.fleetOrder());
    QVector<int> shown = stage.wall().shownCameras();
    shown.removeOne(17); // it came to the first place when it was chosen
    QCOMPARE(shown.mid(0, 4), QVector<int>({1, 2, 3, 0}));
    QVERIFY(click(stage, "deviceNameEdit"));
    QTest::keyClicks(QApplication::focusWidget(), QStringLiteral("New "));
    QVERIFY(click(stage, "deviceEditButton"));
    QTRY_VERIFY(fleet.camera(1)->name.contains(QLatin1String("New")));

    // A camera is lost and comes back
    stage.wall().chooseCamera(2);
    QVERIFY(click(stage, "dropButton"));
    QTRY_VERIFY(!fleet.camera(2)->online);
    QVERIFY(click(stage, "dropButton"));
    QTRY_VERIFY(fleet.camera(2)->online);
    QVERIFY(click(stage, "dropButton"));
    QTRY_VERIFY(!fleet.camera(2)->online);
    QTRY_VERIFY_WITH_TIMEOUT(fleet.camera(2)->online, 20000); // by itself

    // Theme and language
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(click(stage, "themeRow"));
    QVERIFY(click(stage, "themeRow_dark"));
    QTRY_COMPARE(stage.themes, QStringList(QStringLiteral("dark")));
    QVERIFY(stage.gone("settingsPopover"));
    QVERIFY(stage.client()->palette().color(QPalette::Window).lightness() < 100);
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(click(stage, "languageRow"));
    QVERIFY(click(stage, "languageRow_de"));
    QTRY_COMPARE(stage.languages, QStringList(QStringLiteral("de")));
    QTRY_COMPARE(stage.seen<QLineEdit>("deviceSearch")->placeholderText(), QStringLiteral("Geräte suchen"));
    QVERIFY(stage.gone("settingsPopover"));
    QCOMPARE(stage.wall().viewCount(), 16);
    QCOMPARE(session.role(), Session::Role::Administrator);

    // Another role
    QVERIFY(click(stage, "userButton"));
    QVERIFY(click(stage, "roleUserRow"));
    QTRY_COMPARE(session.role(), Session::Role::User);
    QVERIFY(stage.gone("userPopover"));
    QVERIFY(!stage.seen("deviceEditButton"));

    // Out
    QVERIFY(click(stage, "userButton"));
    QVERIFY(click(stage, "userLogOutRow"));
    QTRY_COMPARE(session.role(), Session::Role::None);
    QVERIFY(stage.settled("loginCard"));
    QVERIFY(!stage.seen("deviceSearch"));
    QCOMPARE(stage.seen<QLineEdit>("passwordEdit")->text(), QString());
}

void TestClient::aUserMayDoLess()
{
    ClientStage stage(s_size);
    QVERIFY(logIn(stage, QStringLiteral("user"), QStringLiteral("camera1!")));
    QVERIFY(stage.settled("deviceSearch"));
    QCOMPARE(stage.client()->session().role(), Session::Role::User);
    QVERIFY(!stage.seen("deviceEditButton"));
    for (const char* name : {"exportButton", "ptzButton"}) {
        QVERIFY(click(stage, name));
        QTest::qWait(100);
    }
    QVERIFY(!stage.seen("exportPopover"));
    QVERIFY(!stage.stripes().isExporting());
    QVERIFY(!stage.seen("ptzPanel"));
    stage.client()->session().setRole(Session::Role::Administrator);
    QTRY_VERIFY(stage.seen("deviceEditButton"));
    QVERIFY(click(stage, "ptzButton"));
    QTRY_VERIFY(stage.seen("ptzPanel"));
    stage.client()->session().setRole(Session::Role::User);
    QTRY_VERIFY(!stage.seen("ptzPanel"));
}

void TestClient::settingsSurviveThePopover()
{
    ClientStage stage(s_size);
    QVERIFY(enter(stage));
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(click(stage, "labelsRow"));
    auto* const names = stage.settled<vx::PopoverWidget::Item>("namesRow");
    QVERIFY(names);
    QVERIFY(click(stage, "namesRow"));
    QVERIFY(closePopover(stage, "settingsPopover"));
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(click(stage, "labelsRow"));
    QVERIFY(stage.settled("namesRow"));
    QCOMPARE(stage.seen<vx::PopoverWidget::Item>("namesRow")->value().toBool(), false);
    QVERIFY(closePopover(stage, "settingsPopover"));
}

void TestClient::datesFollowTheLanguage()
{
    ClientStage stage(s_size);
    QVERIFY(enter(stage));
    const auto format = [&] {
        const int id = stage.wall().shownCameras().first();
        return stage.wall().view(id)->findChild<vx::DateTimeEdit*>()->displayFormat();
    };
    const QString before = format();
    QCOMPARE(before, TimeUtils::getDateTimeFormat(true, true));
    QVERIFY(click(stage, "settingsButton"));
    QVERIFY(click(stage, "languageRow"));
    QVERIFY(click(stage, "languageRow_de"));
    QTRY_COMPARE(stage.languages, QStringList(QStringLiteral("de")));
    QVERIFY(TimeUtils::getDateTimeFormat(true, true) != before);
    QTRY_COMPARE(format(), TimeUtils::getDateTimeFormat(true, true));
}

void TestClient::twoLogInsInTurn()
{
    ClientStage stage(s_size);
    for (int i = 0; i < 2; ++i) {
        QVERIFY(enter(stage));
        QVERIFY(click(stage, "markButton"));
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(stage.settled("settingsPopover"));
        stage.client()->logOut();
        QVERIFY(stage.settled("loginCard"));
        QVERIFY(stage.gone("settingsPopover"));
        QVERIFY(!stage.wall().isMarking());
    }
}

void TestClient::theClientIsDeletedInTheMiddle_data()
{
    QTest::addColumn<QString>("point");
    for (const char* point : {"log-in", "wrong password", "slide", "desk", "settings", "submenu", "combo box", "views",
             "user menu", "log-out", "export asks", "export runs", "scrubbing", "flag held", "slider of a row held",
             "marking", "device renamed", "device deleted", "thumbnails", "offline", "language", "theme",
             "button held"}) {
        QTest::newRow(point) << QString::fromLatin1(point);
    }
}

void TestClient::theClientIsDeletedInTheMiddle()
{
    QFETCH(QString, point);
    ClientStage stage(s_size);
    const auto is = [&](const char* name) { return point == QLatin1String(name); };
    const auto end = [&] { stage.deleteClient(); };

    if (is("wrong password")) {
        QVERIFY(logIn(stage, QStringLiteral("admin"), QStringLiteral("x")));
    } else if (is("slide")) {
        QVERIFY(logIn(stage, QStringLiteral("admin"), QStringLiteral("camera2!")));
    } else if (!is("log-in")) {
        QVERIFY(enter(stage));
    }
    if (is("settings") || is("submenu") || is("combo box") || is("slider of a row held")) {
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(stage.settled("settingsPopover"));
    }
    if (is("submenu")) {
        QVERIFY(click(stage, "labelsRow"));
        QVERIFY(stage.settled("namesRow"));
    } else if (is("combo box")) {
        auto* const side = stage.seen("deviceSideRow")->findChild<QComboBox*>();
        side->showPopup();
        QTRY_VERIFY(side->view()->isVisible());
    } else if (is("slider of a row held")) {
        vx::MultiNubsieSlider* const slider = stage.seen<vx::PopoverWidget::SliderItem>("viewsRow")->slider();
        drag(stage, stage.handleOf(slider), QPoint(60, 0), end);
    } else if (is("views")) {
        QVERIFY(click(stage, "viewsButton", arrowOf));
        QVERIFY(stage.settled("viewCountRow_16"));
    } else if (is("user menu")) {
        QVERIFY(click(stage, "userButton"));
        QVERIFY(stage.settled("userLogOutRow"));
    } else if (is("log-out")) {
        QVERIFY(click(stage, "userButton"));
        QVERIFY(click(stage, "userLogOutRow"));
    } else if (is("export asks")) {
        stage.whenSeen("exportPopover", end);
        QVERIFY(click(stage, "exportButton"));
    } else if (is("export runs")) {
        bool isAccepted = false;
        stage.whenSeen("exportPopover", [&] { isAccepted = click(stage, "exportAccept"); });
        QVERIFY(click(stage, "exportButton"));
        QTRY_VERIFY(isAccepted);
        QTRY_VERIFY(stage.seen("exportRun"));
    } else if (is("scrubbing")) {
        drag(stage, stage.handleOf(stage.track()->positionSlider()), QPoint(-200, 0), end);
    } else if (is("flag held")) {
        drag(stage, stage.handleOf(stage.track()->fromSlider()), QPoint(-60, 0), end);
    } else if (is("marking")) {
        QVERIFY(click(stage, "markButton"));
        QWidget* const band = stage.settled("markedRegion");
        QVERIFY(band);
        drag(stage, band->mapTo(&stage.window(), band->rect().center()), QPoint(12, 8), end);
    } else if (is("device renamed")) {
        QVERIFY(click(stage, "deviceEditButton"));
        QVERIFY(click(stage, "deviceNameEdit"));
        QTest::keyClicks(QApplication::focusWidget(), QStringLiteral("New "));
    } else if (is("device deleted")) {
        QVERIFY(click(stage, "deviceEditButton"));
        QVERIFY(stage.settled("deviceNameEdit"));
        stage.client()->fleet().remove(0);
    } else if (is("thumbnails")) {
        QVERIFY(click(stage, "thumbnailsButton"));
    } else if (is("offline")) {
        QVERIFY(click(stage, "dropButton"));
    } else if (is("language")) {
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(click(stage, "languageRow"));
        QVERIFY(click(stage, "languageRow_fr"));
    } else if (is("theme")) {
        QVERIFY(click(stage, "settingsButton"));
        QVERIFY(click(stage, "themeRow"));
        QVERIFY(click(stage, "themeRow_dark"));
    } else if (is("button held")) {
        QWidget* const button = stage.settled("dropButton");
        QVERIFY(button);
        Pointer pointer(&stage.window(), laterTime());
        pointer.move(button->mapTo(&stage.window(), button->rect().center()));
        pointer.press();
        end();
        pointer.release();
    }
    if (is("export asks")) {
        QTRY_VERIFY(!stage.client());
    }
    end();
    QVERIFY(!stage.client());
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    // Handles and popovers were children of the window.
    QVERIFY2(isEmpty(stage.window()), qPrintable(left(stage.window())));
    drag(stage, QPoint(100, 100), QPoint(400, 300));
    QTest::qWait(50);
}

void TestClient::theClientMovesToAnotherWindow()
{
    ClientStage stage(s_size);
    QVERIFY(enter(stage));
    QWidget other;
    other.resize(900, 640);
    other.show();
    stage.client()->setParent(&other);
    stage.client()->setGeometry(other.rect());
    stage.client()->show();
    QTRY_VERIFY(stage.track()->isVisible());
    QTRY_COMPARE(stage.track()->positionSlider()->getNubsies().constFirst()->window(), &other);
    stage.deleteClient();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY2(isEmpty(other), qPrintable(left(other)));
    QVERIFY2(isEmpty(stage.window()), qPrintable(left(stage.window())));
}

ZELKOV_TEST_MAIN(TestClient)
#include "tst_client.moc"
