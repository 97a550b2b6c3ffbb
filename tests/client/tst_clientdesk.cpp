// SPDX-License-Identifier: MIT
// The client as a whole: the log-in, the desk, its tool bar and settings, used with the mouse and the keyboard.
#include "client/BarEditor.h"
#include "client/ClientWindow.h"
#include "client/Desk.h"
#include "client/DeskBar.h"
#include "client/Fleet.h"
#include "client/LiveWall.h"
#include "client/Reconnection.h"
#include "client/Session.h"
#include "controls/PasswordCheckWidget.h"
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "input/CustomClickAdapter.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/items/SliderItem.h"
#include "popover/items/Submenu.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"
#include "views/CustomToolBar.h"
#include "views/NavigationViewController.h"

#include <QtCore/QFile>
#include <QtCore/QMimeData>
#include <QtCore/QTranslator>
#include <QtCore/QXmlStreamReader>
#include <QtGui/QDropEvent>
#include <QtCore/QPropertyAnimation>
#include <QtTest/QtTest>
#include <QtWidgets/QAbstractButton>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QListWidget>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QSpinBox>
#include <QtWidgets/QSplitter>
#include <QtWidgets/QToolButton>
#include <QtWidgets/QVBoxLayout>

#include <algorithm>
#include <memory>

namespace
{
using client::ClientWindow;
using client::Session;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;

// The client in a window, as a program has it.
struct Client
{
    QWidget window;
    ClientWindow* client;
    std::unique_ptr<zelkovtest::Pointer> pointer;

    Client()
    {
        window.resize(1000, 680);
        client = new ClientWindow;
        auto* layout = new QVBoxLayout(&window);
        layout->setContentsMargins(0, 0, 0, 0);
        layout->addWidget(client);
        window.show();
        if (!QTest::qWaitForWindowActive(&window)) {
            QTest::qFail("the window does not become active", __FILE__, __LINE__);
        }
        pointer = std::make_unique<zelkovtest::Pointer>(&window);
    }

    /// Popovers that are closed may still be there: what is to be seen goes first.
    template <class T> T* find(const char* name) const
    {
        const QList<T*> all = window.findChildren<T*>(QLatin1String(name));
        for (T* each : all) {
            if (each->isVisible()) {
                return each;
            }
        }
        return all.value(0);
    }
    QWidget* widget(const char* name) const { return find<QWidget>(name); }
    QLineEdit* edit(const char* name) const { return find<QLineEdit>(name); }
    QToolButton* tool(const char* name) const { return find<QToolButton>(name); }
    client::LiveWall& wall() const { return client->desk().wall(); }
    Session& session() const { return client->session(); }
    vx::NavigationViewController* pages() const { return find<vx::NavigationViewController>("clientPages"); }
    QString status() const { return find<QLabel>("statusText")->text(); }
    QString message() const { return find<QLabel>("loginMessage")->text(); }

    void click(QWidget* target, Qt::MouseButton button = Qt::LeftButton)
    {
        clickAt(target, target->rect().center(), button);
    }
    void clickAt(QWidget* target, const QPoint& position, Qt::MouseButton button = Qt::LeftButton)
    {
        pointer->wait(1000);
        pointer->click(target->mapTo(&window, position), button);
    }
    void clickNamed(const char* name)
    {
        QWidget* const target = widget(name);
        if (!target || !target->isVisible()) {
            QTest::qFail(qPrintable(QStringLiteral("not to be seen: ") + QLatin1String(name)), __FILE__, __LINE__);
            return;
        }
        click(target);
    }
    /// Beside the control at the end and the place at the beginning that counts as its own.
    void clickRow(const char* name)
    {
        QWidget* const target = widget(name);
        if (!target || !target->isVisible()) {
            QTest::qFail(qPrintable(QStringLiteral("not to be seen: ") + QLatin1String(name)), __FILE__, __LINE__);
            return;
        }
        clickAt(target, QPoint(120, target->height() / 2));
    }
    void type(const char* field, const QString& text)
    {
        QLineEdit* const target = edit(field);
        click(target);
        target->selectAll();
        QTest::keyClicks(target, text);
    }
    void logIn(const char* user = "admin", const char* password = "camera2!")
    {
        type("userEdit", QLatin1String(user));
        type("passwordEdit", QLatin1String(password));
        clickNamed("logInButton");
        QTRY_COMPARE(pages()->currentWidget(), widget("desk"));
    }
    void openSettings()
    {
        clickNamed("settingsButton");
        QTRY_VERIFY(widget("settingsRows") && widget("settingsRows")->isVisible());
    }
    void openSubmenu(const char* row, const char* content)
    {
        clickRow(row);
        QTRY_VERIFY(widget(content) && widget(content)->isVisible());
    }
    QList<Controller*> openPopovers() const
    {
        QList<Controller*> result;
        for (Controller* controller : window.findChildren<Controller*>()) {
            if (controller->isActive() || controller->isVisible()) {
                result << controller;
            }
        }
        return result;
    }
    void drop(QWidget* on, const QString& tool, const QPoint& place)
    {
        const std::unique_ptr<QMimeData> data(client::ToolList::dataOf(tool));
        QDragEnterEvent enter(place, Qt::MoveAction, data.get(), Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(on, &enter);
        QDragMoveEvent move(place, Qt::MoveAction, data.get(), Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(on, &move);
        QDropEvent drop(place, Qt::MoveAction, data.get(), Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(on, &drop);
    }
};

// What is written on the widgets that are to be seen, and what they tell when the pointer rests.
QSet<QString> visibleTexts(const QWidget& window)
{
    QSet<QString> texts;
    for (const QWidget* widget : window.findChildren<QWidget*>()) {
        if (!widget->isVisible()) {
            continue;
        }
        texts << widget->toolTip();
        if (const auto* label = qobject_cast<const QLabel*>(widget)) {
            texts << label->text();
        } else if (const auto* button = qobject_cast<const QAbstractButton*>(widget)) {
            texts << button->text();
        } else if (const auto* edit = qobject_cast<const QLineEdit*>(widget)) {
            texts << edit->placeholderText();
        }
    }
    texts.remove(QString());
    return texts;
}

// English texts that another language writes differently.
QMap<QString, QString> catalogue(const QString& language)
{
    QMap<QString, QString> result;
    QFile file(QStringLiteral(CLIENT_FOLDER "/client_%1.ts").arg(language));
    if (!file.open(QIODevice::ReadOnly)) {
        return result;
    }
    QXmlStreamReader xml(&file);
    QString source;
    while (!xml.atEnd()) {
        xml.readNext();
        if (xml.isStartElement() && xml.name() == QLatin1String("source")) {
            source = xml.readElementText();
        } else if (xml.isStartElement() && xml.name() == QLatin1String("translation")) {
            const QString text = xml.readElementText();
            if (text != source) {
                result.insert(source, text);
            }
        }
    }
    return result;
}

struct Translated
{
    QTranslator translator;

    explicit Translated(const QString& language)
    {
        ClientWindow::initCatalogues();
        if (!translator.load(QStringLiteral(":/client/client_") + language)) {
            QTest::qFail("no catalogue", __FILE__, __LINE__);
        }
        QLocale::setDefault(QLocale(language));
        QCoreApplication::installTranslator(&translator);
    }
    ~Translated()
    {
        QCoreApplication::removeTranslator(&translator);
        QLocale::setDefault(QLocale::c());
    }
};

// Scroll bars that appear while there is a style sheet make Qt grumble about how they write a colour.
void forgetColorWarnings()
{
    const QStringList warnings = zelkovtest::TestCase::unexpectedWarnings();
    if (warnings.filter(QStringLiteral("parseColorValue")).size() == warnings.size()) {
        zelkovtest::TestCase::forgetWarnings();
    }
}
}

class TestClientDesk : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aWrongPasswordStaysAndSelectsTheField();
    void aWrongNameStaysToo();
    void theRightPasswordSlidesTheDeskIn();
    void returnGoesFromTheNameToThePasswordAndIn();
    void logOutGoesBackAndClearsTheFields();
    void aNewPasswordHoldsFromNowOn();
    void aPasswordThatWasUsedIsNotTaken();
    void cancellingANewPasswordKeepsTheOldOne();

    void aUserFindsGuardedButtonsLocked();
    void anAdministratorSteers();
    void theRoleIsSwitchedInTheUserMenu();
    void losingTheRightPutsTheStickAway();

    void aClickTakesTheNextNumberOfViews();
    void theArrowOpensTheChoiceOfViews();
    void picturesAndThumbnailsChangeSides();
    void liveAndRecordedFollowTheButton();
    void markingAndCountingExcludeEachOther();
    void aDroppedCameraComesBackByTheButton();

    void checkRowsChangeTheSettings();
    void theSliderSetsTheNumberOfViews();
    void theDeviceListChangesItsSide();
    void theSearchRowGoesToACamera();
    void theSiteIsSetBack();
    void allShownCamerasAreRenamedByAnAdministratorOnly();
    void themeAndLanguageAreAskedForOnce();
    void theShownNameStandsOnTheButton();
    void anIdleUserIsLoggedOut();
    void everySubmenuOpens_data();
    void everySubmenuOpens();

    void toolsAreMovedTakenOutAndPutBack();
    void toolsDoNotClickWhileTheBarIsCustomised();

    void anotherLanguageKeepsTheLogInAndLeavesNoTextBehind_data();
    void anotherLanguageKeepsTheLogInAndLeavesNoTextBehind();
    void anotherLanguageTranslatesTheLogIn();
    void anotherThemeKeepsTheState();
    void theRightsGoWithTheClient();
};

void TestClientDesk::aWrongPasswordStaysAndSelectsTheField()
{
    Client c;
    c.type("userEdit", QStringLiteral("admin"));
    c.type("passwordEdit", QStringLiteral("wrong"));
    QVERIFY(c.message().isEmpty());
    c.clickNamed("logInButton");
    QVERIFY(!c.message().isEmpty());
    QCOMPARE(c.session().role(), Session::Role::None);
    QCOMPARE(c.pages()->animatedWidget(), c.widget("loginPanel"));
    QVERIFY(c.edit("passwordEdit")->hasFocus());
    QCOMPARE(c.edit("passwordEdit")->selectedText(), QStringLiteral("wrong"));
    // The next edit takes the message away.
    QTest::keyClick(c.edit("passwordEdit"), Qt::Key_A);
    QVERIFY(c.message().isEmpty());
}

void TestClientDesk::aWrongNameStaysToo()
{
    Client c;
    c.type("userEdit", QStringLiteral("nobody"));
    c.type("passwordEdit", QStringLiteral("camera2!"));
    c.clickNamed("logInButton");
    QVERIFY(!c.message().isEmpty());
    const auto shakes = [&c] {
        const QList<QPropertyAnimation*> all = c.window.findChildren<QPropertyAnimation*>();
        return std::any_of(all.begin(), all.end(), [](const QPropertyAnimation* each) {
            return each->propertyName() == "pos" && each->state() == QAbstractAnimation::Running;
        });
    };
    QTRY_VERIFY(!shakes()); // or the button is not where the click goes
    c.type("userEdit", QStringLiteral("user"));
    c.clickNamed("logInButton");
    QVERIFY(!c.message().isEmpty()); // the password of another one
    QCOMPARE(c.session().role(), Session::Role::None);
}

void TestClientDesk::theRightPasswordSlidesTheDeskIn()
{
    Client c;
    QVERIFY(!c.widget("desk")->isVisible());
    c.type("userEdit", QStringLiteral("admin"));
    c.type("passwordEdit", QStringLiteral("camera2!"));
    c.clickNamed("logInButton");
    QCOMPARE(c.session().role(), Session::Role::Administrator);
    QCOMPARE(c.pages()->animatedWidget(), c.widget("desk"));
    QCOMPARE(c.pages()->currentWidget(), c.widget("loginPanel")); // still on its way
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("desk"));
    QCOMPARE(c.find<QPushButton>("userButton")->text(), QStringLiteral("admin"));
}

void TestClientDesk::returnGoesFromTheNameToThePasswordAndIn()
{
    Client c;
    c.type("userEdit", QStringLiteral("user"));
    QTest::keyClick(c.edit("userEdit"), Qt::Key_Return);
    QVERIFY(c.edit("passwordEdit")->hasFocus());
    QVERIFY(c.message().isEmpty());
    QTest::keyClicks(c.edit("passwordEdit"), QStringLiteral("camera1!"));
    QTest::keyClick(c.edit("passwordEdit"), Qt::Key_Return);
    QCOMPARE(c.session().role(), Session::Role::User);
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("desk"));
}

void TestClientDesk::logOutGoesBackAndClearsTheFields()
{
    Client c;
    c.logIn();
    c.clickNamed("userButton");
    c.clickRow("userLogOutRow");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    QCOMPARE(c.session().role(), Session::Role::None);
    QVERIFY(c.edit("userEdit")->text().isEmpty());
    QVERIFY(c.edit("passwordEdit")->text().isEmpty());
    QVERIFY(c.openPopovers().isEmpty());
    c.logIn("user", "camera1!");
    QCOMPARE(c.session().role(), Session::Role::User);
}

void TestClientDesk::aNewPasswordHoldsFromNowOn()
{
    Client c;
    c.type("userEdit", QStringLiteral("user"));
    c.type("passwordEdit", QStringLiteral("camera1!"));
    c.clickNamed("newPasswordButton");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("passwordPanel"));
    QVERIFY(!c.widget("savePasswordButton")->isEnabled());
    c.type("firstInput", QStringLiteral("Better_2026"));
    QVERIFY(!c.widget("savePasswordButton")->isEnabled());
    QVERIFY(c.widget("passwordRule0")->property("met").toBool());
    QVERIFY(!c.widget("passwordRule5")->property("met").toBool());
    c.type("secondInput", QStringLiteral("Better_2026"));
    QVERIFY(c.widget("passwordRule5")->property("met").toBool());
    c.clickNamed("savePasswordButton");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("desk"));

    c.client->logOut();
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    c.type("userEdit", QStringLiteral("user"));
    c.type("passwordEdit", QStringLiteral("camera1!"));
    c.clickNamed("logInButton");
    QVERIFY(!c.message().isEmpty());
    c.logIn("user", "Better_2026");
    QCOMPARE(c.session().role(), Session::Role::User);
}

void TestClientDesk::aPasswordThatWasUsedIsNotTaken()
{
    Client c;
    c.logIn("user", "camera1!");
    QVERIFY(c.session().wasUsed(QStringLiteral("camera1!")));
    QVERIFY(!c.session().setPassword(QStringLiteral("camera1!")));
    QVERIFY(c.session().setPassword(QStringLiteral("Camera_1")));
    QVERIFY(!c.session().setPassword(QStringLiteral("camera1!")));
    c.client->logOut();
    QVERIFY(!c.session().setPassword(QStringLiteral("Camera_3")));
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));

    c.type("userEdit", QStringLiteral("user"));
    c.type("passwordEdit", QStringLiteral("Camera_1"));
    c.clickNamed("newPasswordButton");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("passwordPanel"));
    c.type("firstInput", QStringLiteral("Camera_1"));
    c.type("secondInput", QStringLiteral("Camera_1"));
    QVERIFY(!c.widget("passwordRule4")->property("met").toBool());
    QTest::keyClick(c.edit("secondInput"), Qt::Key_Return);
    QCOMPARE(c.pages()->currentWidget(), c.widget("passwordPanel"));
    QCOMPARE(c.pages()->animatedWidget(), c.widget("passwordPanel"));
}

void TestClientDesk::cancellingANewPasswordKeepsTheOldOne()
{
    Client c;
    c.logIn();
    c.clickNamed("userButton");
    c.clickRow("userNewPasswordRow");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("passwordPanel"));
    c.type("firstInput", QStringLiteral("Better_2026"));
    c.clickNamed("cancelPasswordButton");
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("desk"));
    c.client->logOut();
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    c.logIn();
}

void TestClientDesk::aUserFindsGuardedButtonsLocked()
{
    Client c;
    c.logIn("user", "camera1!");
    for (const char* name : {"exportButton", "ptzButton"}) {
        QVERIFY(c.tool(name)->property("refused").toBool());
        QVERIFY(c.tool(name)->toolTip().contains(QLatin1Char('(')));
        QSignalSpy clicked(c.tool(name), &QToolButton::clicked);
        QSignalSpy toggled(c.tool(name), &QToolButton::toggled);
        c.clickNamed(name);
        QCOMPARE(clicked.count() + toggled.count(), 0);
    }
    QVERIFY(!c.widget("ptzPanel")->isVisible());
    QVERIFY(!c.tool("markButton")->property("refused").toBool());
}

void TestClientDesk::anAdministratorSteers()
{
    Client c;
    c.logIn();
    QVERIFY(!c.tool("ptzButton")->property("refused").toBool());
    c.clickNamed("ptzButton");
    QVERIFY(c.widget("ptzPanel")->isVisible());
    c.clickNamed("ptzButton");
    QVERIFY(!c.widget("ptzPanel")->isVisible());
}

void TestClientDesk::theRoleIsSwitchedInTheUserMenu()
{
    Client c;
    c.logIn();
    const qint64 free = c.tool("exportButton")->icon().cacheKey();
    c.clickNamed("userButton");
    c.clickRow("roleUserRow");
    QCOMPARE(c.session().role(), Session::Role::User);
    QVERIFY(c.tool("exportButton")->property("refused").toBool());
    QVERIFY(c.tool("exportButton")->icon().cacheKey() != free);
    QTRY_VERIFY(c.openPopovers().isEmpty());
    c.clickNamed("userButton");
    c.clickRow("roleAdministratorRow");
    QCOMPARE(c.session().role(), Session::Role::Administrator);
    QVERIFY(!c.tool("exportButton")->property("refused").toBool());
}

void TestClientDesk::losingTheRightPutsTheStickAway()
{
    Client c;
    c.logIn();
    c.clickNamed("ptzButton");
    QVERIFY(c.widget("ptzPanel")->isVisible());
    c.session().setRole(Session::Role::User);
    QVERIFY(!c.widget("ptzPanel")->isVisible());
    QVERIFY(!c.tool("ptzButton")->isChecked());
}

void TestClientDesk::aClickTakesTheNextNumberOfViews()
{
    Client c;
    c.logIn();
    QCOMPARE(c.wall().viewCount(), 4);
    for (const int count : {9, 16, 25, 36, 49, 64, 4}) {
        c.clickAt(c.tool("viewsButton"), QPoint(12, 12));
        QCOMPARE(c.wall().viewCount(), count);
        QCOMPARE(c.tool("viewsButton")->text(), QString::number(count));
    }
}

void TestClientDesk::theArrowOpensTheChoiceOfViews()
{
    Client c;
    c.logIn();
    QWidget* const button = c.tool("viewsButton");
    c.clickAt(button, QPoint(button->width() - 6, button->height() / 2));
    QCOMPARE(c.wall().viewCount(), 4);
    c.clickRow("viewCountRow_25");
    QCOMPARE(c.wall().viewCount(), 25);
    QCOMPARE(c.tool("viewsButton")->text(), QStringLiteral("25"));
    QTRY_VERIFY(c.openPopovers().isEmpty());
    // A click beside it closes without a choice.
    c.clickAt(button, QPoint(button->width() - 6, button->height() / 2));
    QCOMPARE(c.openPopovers().size(), 1);
    c.clickAt(&c.window, QPoint(c.window.width() - 20, c.window.height() - 40));
    QTRY_VERIFY(c.openPopovers().isEmpty());
    QCOMPARE(c.wall().viewCount(), 25);
}

void TestClientDesk::picturesAndThumbnailsChangeSides()
{
    Client c;
    c.logIn();
    auto* middle = c.find<vx::NavigationViewController>("deskMiddle");
    c.clickNamed("thumbnailsButton");
    QTRY_COMPARE(middle->currentIndex(), 1);
    c.clickNamed("thumbnailsButton");
    QTRY_COMPARE(middle->currentIndex(), 0);
    // Another number of views leads back to them.
    c.clickNamed("thumbnailsButton");
    QTRY_COMPARE(middle->currentIndex(), 1);
    c.clickAt(c.tool("viewsButton"), QPoint(12, 12));
    QTRY_COMPARE(middle->currentIndex(), 0);
    QCOMPARE(c.tool("thumbnailsButton")->property("state").toInt(), 0);
}

void TestClientDesk::liveAndRecordedFollowTheButton()
{
    Client c;
    c.logIn();
    const QString live = c.tool("liveButton")->text();
    c.clickNamed("liveButton");
    QVERIFY(!c.wall().isLive());
    QVERIFY(c.tool("liveButton")->text() != live);
    QVERIFY(!c.status().isEmpty());
    c.clickNamed("liveButton");
    QVERIFY(c.wall().isLive());
    QCOMPARE(c.tool("liveButton")->text(), live);
}

void TestClientDesk::markingAndCountingExcludeEachOther()
{
    Client c;
    c.logIn();
    c.clickNamed("markButton");
    QVERIFY(c.wall().isMarking());
    c.clickNamed("lineButton");
    QVERIFY(!c.wall().isMarking());
    QVERIFY(c.wall().isCounting());
    QVERIFY(!c.tool("markButton")->isChecked());
    c.clickNamed("lineButton");
    QVERIFY(!c.wall().isCounting());
}

void TestClientDesk::aDroppedCameraComesBackByTheButton()
{
    Client c;
    c.logIn();
    const int id = c.wall().currentCamera();
    QVERIFY(id >= 0);
    const QString tip = c.tool("dropButton")->toolTip();
    c.clickNamed("dropButton");
    QVERIFY(!c.client->fleet().camera(id)->online);
    QVERIFY(c.tool("dropButton")->toolTip() != tip);
    c.clickNamed("dropButton");
    QVERIFY(c.client->fleet().camera(id)->online);
    QCOMPARE(c.tool("dropButton")->toolTip(), tip);
}

void TestClientDesk::checkRowsChangeTheSettings()
{
    Client c;
    c.logIn();
    const auto plates = [&c] {
        int visible = 0;
        for (const QWidget* plate : c.wall().findChildren<QWidget*>(QStringLiteral("cameraName"))) {
            visible += plate->isVisible() ? 1 : 0;
        }
        return visible;
    };
    QCOMPARE(plates(), 4);
    c.openSettings();
    c.openSubmenu("labelsRow", "labelsRowRows");
    c.clickRow("namesRow");
    QTRY_COMPARE(plates(), 0);
    c.clickRow("namesRow");
    QTRY_COMPARE(plates(), 4);
    // One click on the row for all of them.
    c.clickRow("allLabelsRow");
    QTRY_COMPARE(plates(), 0);
    QVERIFY(!c.find<Item>("timesRow")->value().toBool());
    c.clickRow("allLabelsRow");
    QTRY_COMPARE(plates(), 4);
    c.clickRow("timesRow");
    QCOMPARE(c.find<Item>("allLabelsRow")->value().toInt(), 1);
}

void TestClientDesk::theSliderSetsTheNumberOfViews()
{
    Client c;
    c.logIn();
    c.openSettings();
    auto* row = c.find<vx::PopoverWidget::SliderItem>("viewsRow");
    vx::MultiNubsieSlider* const slider = row->slider();
    vx::Nubsie* const handle = slider->getNubsies().first();
    QTRY_VERIFY(handle->isVisible());
    const QPoint from = handle->mapTo(&c.window, handle->rect().center());
    c.pointer->move(from);
    c.pointer->press();
    const int to = slider->mapTo(&c.window, QPoint(slider->width() - 2, 0)).x();
    for (int step = 1; step <= 10; ++step) {
        c.pointer->move(QPoint(from.x() + (to - from.x()) * step / 10, from.y()));
    }
    c.pointer->release();
    QTRY_COMPARE(c.wall().viewCount(), 64);
    QCOMPARE(c.tool("viewsButton")->text(), QStringLiteral("64"));
}

void TestClientDesk::theDeviceListChangesItsSide()
{
    Client c;
    c.logIn();
    auto* splitter = c.find<QSplitter>("deskSplitter");
    QWidget* const devices = c.widget("devicePanel");
    QCOMPARE(splitter->indexOf(devices), 0);
    c.openSettings();
    auto* box = c.widget("deviceSideRow")->findChild<QComboBox*>();
    c.click(box);
    QTest::keyClick(box->view(), Qt::Key_Down);
    QTest::keyClick(box->view(), Qt::Key_Return);
    QTRY_COMPARE(splitter->indexOf(devices), 2);
    c.click(box);
    QTest::keyClick(box->view(), Qt::Key_Down);
    QTest::keyClick(box->view(), Qt::Key_Return);
    QTRY_VERIFY(!devices->isVisible());
    c.click(box);
    QTest::keyClick(box->view(), Qt::Key_Home);
    QTest::keyClick(box->view(), Qt::Key_Return);
    QTRY_VERIFY(devices->isVisible());
    QCOMPARE(splitter->indexOf(devices), 0);
}

void TestClientDesk::theSearchRowGoesToACamera()
{
    Client c;
    c.logIn();
    c.openSettings();
    auto* search = c.widget("cameraSearchRow")->findChild<QLineEdit*>();
    c.click(search);
    QTest::keyClicks(search, QStringLiteral("roof 8"));
    QCOMPARE(c.client->fleet().camera(c.wall().currentCamera())->name, QStringLiteral("Roof 8"));
    QVERIFY(c.status().startsWith(QStringLiteral("Roof 8")));
    // The keyboard goes back to the pictures.
    QVERIFY(search->hasFocus());
    c.clickAt(&c.window, QPoint(8, c.window.height() - 8));
    QTRY_VERIFY(c.openPopovers().isEmpty());
    QVERIFY(c.wall().hasFocus());
}

void TestClientDesk::theSiteIsSetBack()
{
    Client c;
    c.logIn();
    const QString main = c.find<QLabel>("siteText")->text();
    c.openSettings();
    c.openSubmenu("camerasRow", "camerasRowRows");
    auto* field = c.widget("siteRow")->findChild<QLineEdit*>();
    QCOMPARE(field->text(), main);
    c.click(field);
    field->selectAll();
    QTest::keyClicks(field, QStringLiteral("Harbour"));
    QCOMPARE(c.find<QLabel>("siteText")->text(), QStringLiteral("Harbour"));
    // The delay of the outage goes to the wall at once.
    auto* seconds = c.widget("outageRow")->findChild<QSpinBox*>();
    QTest::keyClick(seconds, Qt::Key_Up);
    QCOMPARE(seconds->value(), 9);
}

void TestClientDesk::allShownCamerasAreRenamedByAnAdministratorOnly()
{
    Client c;
    c.logIn("user", "camera1!");
    c.openSettings();
    c.openSubmenu("camerasRow", "camerasRowRows");
    QVERIFY(!c.widget("renameRow")->findChild<QLineEdit*>()->isEnabled());
    c.client->logOut();
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    QTRY_VERIFY(!c.widget("renameRow"));

    c.logIn();
    c.openSettings();
    c.openSubmenu("camerasRow", "camerasRowRows");
    auto* field = c.widget("renameRow")->findChild<QLineEdit*>();
    c.click(field);
    QTest::keyClicks(field, QStringLiteral("Dock"));
    QTest::keyClick(field, Qt::Key_Return);
    QCOMPARE(c.client->fleet().cameras().at(0).name, QStringLiteral("Dock 1"));
    QCOMPARE(c.client->fleet().cameras().at(3).name, QStringLiteral("Dock 4"));
    QCOMPARE(c.client->fleet().cameras().at(4).name, QStringLiteral("Garage 1"));
}

void TestClientDesk::themeAndLanguageAreAskedForOnce()
{
    Client c;
    c.logIn();
    QSignalSpy theme(c.client, &ClientWindow::themeWanted);
    QSignalSpy language(c.client, &ClientWindow::languageWanted);
    c.openSettings();
    c.openSubmenu("themeRow", "themeRowRows");
    c.clickRow("themeRow_dark");
    QTRY_COMPARE(theme.count(), 1);
    QCOMPARE(theme.first().first().toString(), QStringLiteral("dark"));
    QTRY_VERIFY(c.openPopovers().isEmpty());
    c.openSettings();
    c.openSubmenu("languageRow", "languageRowRows");
    c.clickRow("languageRow_fr");
    QTRY_COMPARE(language.count(), 1);
    QCOMPARE(language.first().first().toString(), QStringLiteral("fr"));
    QTRY_VERIFY(c.openPopovers().isEmpty());
    QCOMPARE(theme.count(), 1);
}

void TestClientDesk::theShownNameStandsOnTheButton()
{
    Client c;
    c.logIn();
    c.openSettings();
    c.openSubmenu("accountRow", "accountRowRows");
    auto* field = c.widget("shownNameRow")->findChild<QLineEdit*>();
    c.click(field);
    QTest::keyClicks(field, QStringLiteral("Night shift"));
    QTest::keyClick(field, Qt::Key_Return);
    QCOMPARE(c.find<QPushButton>("userButton")->text(), QStringLiteral("Night shift"));
    // It is not that of the next one.
    c.client->logOut();
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    c.logIn("user", "camera1!");
    QCOMPARE(c.find<QPushButton>("userButton")->text(), QStringLiteral("user"));
}

void TestClientDesk::anIdleUserIsLoggedOut()
{
    Client c;
    c.logIn();
    c.openSettings();
    c.openSubmenu("accountRow", "accountRowRows");
    auto* number = c.widget("idleRow")->findChild<QSpinBox*>();
    auto* unit = c.widget("idleRow")->findChild<QComboBox*>();
    QVERIFY(!c.find<Item>("idleSwitchRow")->value().toBool());
    unit->setCurrentIndex(0);
    number->setValue(2);
    QVERIFY(!c.find<Item>("idleRow")->textElement()->isChecked());
    c.clickRow("idleSwitchRow");
    QTRY_VERIFY(c.find<Item>("idleRow")->textElement()->isChecked());
    QTRY_COMPARE_WITH_TIMEOUT(c.session().role(), Session::Role::None, 6000);
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    QVERIFY(c.openPopovers().isEmpty());
}

void TestClientDesk::everySubmenuOpens_data()
{
    QTest::addColumn<QString>("row");
    for (const char* row : {"labelsRow", "recordingsRow", "camerasRow", "accountRow", "languageRow", "themeRow"}) {
        QTest::newRow(row) << QString::fromLatin1(row);
    }
}

void TestClientDesk::everySubmenuOpens()
{
    QFETCH(QString, row);
    Client c;
    c.logIn();
    c.openSettings();
    c.openSubmenu(qPrintable(row), qPrintable(row + QStringLiteral("Rows")));
    QCOMPARE(c.openPopovers().size(), 2);
    for (const Controller* controller : c.openPopovers()) {
        QVERIFY(c.window.rect().contains(QRect(controller->balloon()->mapTo(&c.window, QPoint()), controller->balloon()->size())));
    }
    // A click beside it closes the inner one, another one the outer.
    c.clickAt(&c.window, QPoint(8, c.window.height() - 8));
    QTRY_COMPARE(c.openPopovers().size(), 1);
    c.clickAt(&c.window, QPoint(8, c.window.height() - 8));
    QTRY_COMPARE(c.openPopovers().size(), 0);
}

void TestClientDesk::toolsAreMovedTakenOutAndPutBack()
{
    Client c;
    c.logIn();
    auto* bar = c.find<client::DeskBar>("deskBar");
    auto* strip = c.find<vx::CustomToolBar>("toolBar");
    const QStringList usual = bar->tools();
    QCOMPARE(usual.first(), QStringLiteral("views"));
    c.openSettings();
    c.clickRow("customizeRow");
    QTRY_VERIFY(c.widget("barEditor")->isVisible());
    QTRY_VERIFY(c.openPopovers().isEmpty());
    auto* list = c.find<QListWidget>("toolList");
    QCOMPARE(list->count(), 0);

    c.drop(list->viewport(), QStringLiteral("mark"), QPoint(20, 10));
    QCOMPARE(list->count(), 1);
    QVERIFY(!bar->tools().contains(QStringLiteral("mark")));
    QVERIFY(!c.window.findChild<QWidget*>(QStringLiteral("markButton")));

    c.drop(strip, QStringLiteral("mark"), QPoint(1, 10));
    QCOMPARE(list->count(), 0);
    QCOMPARE(bar->tools().first(), QStringLiteral("mark"));
    QVERIFY(c.widget("markButton")->isVisible());

    c.drop(strip, QStringLiteral("views"), QPoint(strip->width() - 2, 10));
    QCOMPARE(bar->tools().last(), QStringLiteral("views"));
    c.drop(strip, QStringLiteral("nothing"), QPoint(1, 10));
    QCOMPARE(bar->tools().size(), usual.size());

    c.clickNamed("resetToolsButton");
    QCOMPARE(bar->tools(), usual);
    c.clickNamed("toolsDoneButton");
    QVERIFY(!c.widget("barEditor")->isVisible());
}

void TestClientDesk::toolsDoNotClickWhileTheBarIsCustomised()
{
    Client c;
    c.logIn();
    c.find<client::DeskBar>("deskBar")->customizeToolBar();
    c.clickNamed("thumbnailsButton");
    c.clickNamed("markButton");
    QCOMPARE(c.tool("thumbnailsButton")->property("state").toInt(), 0);
    QVERIFY(!c.tool("markButton")->isChecked());
    c.clickNamed("toolsDoneButton");
    QVERIFY(!c.widget("barEditor")->isVisible());
    QCoreApplication::processEvents(); // the strip gives its room back
    c.clickNamed("thumbnailsButton");
    QCOMPARE(c.tool("thumbnailsButton")->property("state").toInt(), 1);
    c.clickNamed("markButton");
    QVERIFY(c.tool("markButton")->isChecked());
}

void TestClientDesk::anotherLanguageKeepsTheLogInAndLeavesNoTextBehind_data()
{
    QTest::addColumn<QString>("language");
    QTest::newRow("de") << QStringLiteral("de");
    QTest::newRow("fr") << QStringLiteral("fr");
}

void TestClientDesk::anotherLanguageKeepsTheLogInAndLeavesNoTextBehind()
{
    QFETCH(QString, language);
    const QMap<QString, QString> other = catalogue(language);
    QVERIFY(other.size() > 100);
    Client c;
    c.logIn();
    c.clickNamed("ptzButton");
    c.clickAt(c.tool("viewsButton"), QPoint(12, 12));
    c.openSettings();
    const QSet<QString> english = visibleTexts(c.window);
    QVERIFY(english.contains(QStringLiteral("Settings")));
    {
        const Translated translated(language);
        QTRY_VERIFY(c.openPopovers().isEmpty());
        QCOMPARE(c.session().role(), Session::Role::Administrator);
        QCOMPARE(c.wall().viewCount(), 9);
        QVERIFY(c.widget("ptzPanel")->isVisible());
        c.openSettings();
        QSet<QString> seen = visibleTexts(c.window);
        for (const char* row : {"labelsRow", "recordingsRow", "camerasRow", "accountRow"}) {
            c.openSubmenu(row, QByteArray(row).append("Rows").constData());
            seen += visibleTexts(c.window);
            c.clickAt(&c.window, QPoint(8, c.window.height() - 8));
            QTRY_COMPARE(c.openPopovers().size(), 1);
        }
        QSet<QString> translations;
        for (const QString& text : other) {
            translations << text;
        }
        for (const QString& text : qAsConst(seen)) {
            QVERIFY2(!other.contains(text) || translations.contains(text), qPrintable(QStringLiteral("still English: ") + text));
        }
        QVERIFY(seen.contains(other.value(QStringLiteral("Settings"))));
    }
    QTRY_VERIFY(c.openPopovers().isEmpty());
    QVERIFY(c.tool("settingsButton")->toolTip() == QStringLiteral("Settings"));
}

void TestClientDesk::anotherLanguageTranslatesTheLogIn()
{
    Client c;
    c.type("userEdit", QStringLiteral("nobody"));
    c.clickNamed("logInButton");
    const QString english = c.message();
    QVERIFY(!english.isEmpty());
    const Translated translated(QStringLiteral("de"));
    QTRY_COMPARE(c.find<QPushButton>("logInButton")->text(), QStringLiteral("Anmelden"));
    QVERIFY(!c.message().isEmpty());
    QVERIFY(c.message() != english);
    QCOMPARE(c.edit("userEdit")->text(), QStringLiteral("nobody"));
}

void TestClientDesk::anotherThemeKeepsTheState()
{
    Client c;
    c.logIn();
    c.clickNamed("ptzButton");
    c.clickAt(c.tool("viewsButton"), QPoint(12, 12));
    const QImage before = c.tool("settingsButton")->icon().pixmap(22).toImage();
    for (const auto name : {zelkov::theme::Name::Light, zelkov::theme::Name::Dark}) {
        zelkov::theme::apply(*qApp, name);
        QCoreApplication::processEvents();
        QCOMPARE(c.session().role(), Session::Role::Administrator);
        QCOMPARE(c.wall().viewCount(), 9);
        QVERIFY(c.widget("ptzPanel")->isVisible());
    }
    QVERIFY(c.tool("settingsButton")->icon().pixmap(22).toImage() != before);
    c.clickNamed("settingsButton");
    QTRY_VERIFY(c.widget("settingsRows"));
    // The form is one of the present sheet, whenever it is asked for.
    c.client->logOut();
    zelkov::theme::apply(*qApp, zelkov::theme::Name::None);
    QTRY_COMPARE(c.pages()->currentWidget(), c.widget("loginPanel"));
    forgetColorWarnings();
}

void TestClientDesk::theRightsGoWithTheClient()
{
    {
        Client c;
        QVERIFY(vx::CustomClickAdapter::securityManager());
        // Another part of the program asks for its own, and the client takes over when it is back.
        vx::CustomClickAdapter::setSecurityManager(nullptr);
        c.client->hide();
        c.client->show();
        QVERIFY(vx::CustomClickAdapter::securityManager());
        QVERIFY(Item::securityManager());
    }
    QVERIFY(!vx::CustomClickAdapter::securityManager());
    QVERIFY(!Item::securityManager());
}

ZELKOV_TEST_MAIN(TestClientDesk)
#include "tst_clientdesk.moc"
