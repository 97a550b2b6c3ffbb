// SPDX-License-Identifier: MIT
// The window of the gallery: pages that are made anew for another theme or language, and the one that keeps itself.
#include "GalleryWindow.h"
#include "Page.h"
#include "PageList.h"
#include "SignalLog.h"
#include "client/ClientWindow.h"
#include "client/Desk.h"
#include "client/LiveWall.h"
#include "client/Session.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"

#include <QtCore/QLocale>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QTableView>

namespace
{
using client::Session;
using gallery::GalleryWindow;
using gallery::Page;
using zelkov::theme::Name;

// A gallery that shows the client.
struct Shown
{
    gallery::SignalLog log;
    GalleryWindow window;

    Shown()
        : window(log)
    {
        window.showPage(gallery::indexOfPage(QStringLiteral("client")));
        window.setLanguage(QStringLiteral("en"));
        window.show();
        if (!QTest::qWaitForWindowExposed(&window)) {
            QTest::qFail("the window does not show", __FILE__, __LINE__);
        }
    }

    ~Shown()
    {
        window.setLanguage(QStringLiteral("en"));
        QLocale::setDefault(QLocale::c());
    }

    client::ClientWindow* client() const { return window.findChild<client::ClientWindow*>(); }
    void show(const char* page) { window.showPage(gallery::indexOfPage(QLatin1String(page))); }
    QStringList boxes() const
    {
        QStringList result;
        for (const QComboBox* box : window.centralWidget()->findChildren<QComboBox*>()) {
            result << box->currentText();
        }
        return result;
    }
    /// On the visible one of that name, once it is there and nothing that closes lies over it.
    void click(const char* name)
    {
        QTest::qWait(400);
        for (QWidget* each : window.findChildren<QWidget*>(QLatin1String(name))) {
            if (each->isVisible()) {
                const bool isRow = each->width() > 200;
                const QPoint place = isRow ? QPoint(120, each->height() / 2) : each->rect().center();
                zelkovtest::Pointer(&window).click(each->mapTo(&window, place));
                return;
            }
        }
        QTest::qFail(name, __FILE__, __LINE__);
    }
    QTableView* table() const
    {
        for (QTableView* each : window.centralWidget()->findChildren<QTableView*>()) {
            if (each->model() && each->model()->columnCount() == gallery::SignalLog::cCount) {
                return each;
            }
        }
        return nullptr;
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

class TestGalleryWindow : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePageAskedForBeforeTheLanguageIsTheFirstOne();
    void aPageIsMadeAnewWithEachSwitch();
    void theClientKeepsItsStateWithThemeAndLanguage();
    void theClientKeepsItsStateWhileAnotherPageIsShown();
    void theClientHasTheRoomOfTheScrollArea();
    void theTopBarFollowsTheClient();
    void aFieldOfTheClientKeepsTheFocus();
    void theClientGoesWithTheWindow();
};

void TestGalleryWindow::thePageAskedForBeforeTheLanguageIsTheFirstOne()
{
    gallery::SignalLog log;
    GalleryWindow window(log);
    window.showPage(gallery::indexOfPage(QStringLiteral("badges")));
    QVERIFY(!window.currentPage());
    window.setLanguage(QStringLiteral("en"));
    QVERIFY(window.currentPage());
    QVERIFY(!window.findChild<client::ClientWindow*>());
    window.showPage(-1);
    window.showPage(int(gallery::pages().size()));
    QVERIFY(window.currentPage());
    QLocale::setDefault(QLocale::c());
}

void TestGalleryWindow::aPageIsMadeAnewWithEachSwitch()
{
    Shown s;
    s.show("badges");
    const QPointer<Page> first(s.window.currentPage());
    QVERIFY(!first->keepsItself());
    s.window.setTheme(Name::Dark);
    QVERIFY(s.window.currentPage() != first);
    QTRY_VERIFY(!first);
    s.window.setTheme(Name::None);
}

void TestGalleryWindow::theClientKeepsItsStateWithThemeAndLanguage()
{
    Shown s;
    const QPointer<client::ClientWindow> client(s.client());
    const QPointer<Page> page(s.window.currentPage());
    QVERIFY(page->keepsItself());
    QVERIFY(client->session().logIn(QStringLiteral("admin"), QStringLiteral("camera2!")));
    client->desk().setViewCount(25);
    for (const Name theme : {Name::Light, Name::Dark, Name::None}) {
        s.window.setTheme(theme);
        QVERIFY(client);
        QCOMPARE(s.window.currentPage(), page.data());
        QTRY_VERIFY(client->isVisible());
        QVERIFY(s.window.centralWidget()->isAncestorOf(client));
        QCOMPARE(client->desk().wall().viewCount(), 25);
    }
    for (const QString& language : GalleryWindow::languages()) {
        s.window.setLanguage(language);
        QVERIFY(client);
        QTRY_VERIFY(client->isVisible());
        QCOMPARE(client->session().role(), Session::Role::Administrator);
        QTRY_VERIFY(client->findChild<QLabel*>(QStringLiteral("siteText"))->text()
            != (language == QLatin1String("fr") ? QStringLiteral("Hauptgebäude") : QStringLiteral("Bâtiment principal")));
    }
    QTRY_COMPARE(client->findChild<QLabel*>(QStringLiteral("siteText"))->text(), QStringLiteral("Bâtiment principal"));
}

void TestGalleryWindow::theClientKeepsItsStateWhileAnotherPageIsShown()
{
    Shown s;
    const QPointer<client::ClientWindow> client(s.client());
    QVERIFY(client->session().logIn(QStringLiteral("user"), QStringLiteral("camera1!")));
    s.show("badges");
    QVERIFY(client);
    QVERIFY(!client->isVisible());
    s.window.setTheme(Name::Dark);
    s.window.setLanguage(QStringLiteral("de"));
    QVERIFY(client);
    QVERIFY(!client->isVisible());
    s.show("client");
    QCOMPARE(s.client(), client.data());
    QTRY_VERIFY(client->isVisible());
    QCOMPARE(client->session().role(), Session::Role::User);
    s.window.setTheme(Name::None);
}

void TestGalleryWindow::theClientHasTheRoomOfTheScrollArea()
{
    Shown s;
    const int rows = s.table()->minimumHeight();
    QCoreApplication::processEvents();
    const QWidget* const page = s.window.currentPage();
    QVERIFY2(page->width() >= 960 && page->height() >= 600,
        qPrintable(QStringLiteral("%1 x %2").arg(page->width()).arg(page->height())));
    // Nothing scrolls.
    QVERIFY(s.client()->width() + 4 >= page->width());
    auto* frame = page->findChild<QScrollArea*>(QStringLiteral("clientFrame"));
    QVERIFY(s.client()->height() <= frame->viewport()->height());
    QVERIFY(s.client()->width() <= frame->viewport()->width());
    // The other pages leave more room for the signals.
    s.show("badges");
    QVERIFY(s.table()->minimumHeight() > rows);
    s.show("client");
    QCOMPARE(s.table()->minimumHeight(), rows);
}

void TestGalleryWindow::theTopBarFollowsTheClient()
{
    Shown s;
    Page* const page = s.window.currentPage();
    QVERIFY(s.boxes().contains(QStringLiteral("English")));
    auto* const logIn = s.client()->findChild<QWidget*>(QStringLiteral("loginPanel"));
    s.client()->findChild<QLineEdit*>(QStringLiteral("userEdit"))->setText(QStringLiteral("user"));
    s.client()->findChild<QLineEdit*>(QStringLiteral("passwordEdit"))->setText(QStringLiteral("camera1!"));
    s.click("logInButton");
    QTRY_VERIFY(!logIn->isVisible());
    s.click("settingsButton");
    s.click("languageRow");
    s.click("languageRow_de");
    QTRY_VERIFY(s.boxes().contains(QStringLiteral("Deutsch")));
    QCOMPARE(s.window.currentPage(), page);
    s.click("settingsButton");
    s.click("themeRow");
    s.click("themeRow_dark");
    QTRY_VERIFY(s.boxes().contains(QStringLiteral("Dunkel")));
    QCOMPARE(s.window.currentPage(), page);
    s.window.setTheme(Name::None);
    forgetColorWarnings();
}

void TestGalleryWindow::aFieldOfTheClientKeepsTheFocus()
{
    Shown s;
    s.window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&s.window));
    auto* field = s.client()->findChild<QLineEdit*>(QStringLiteral("passwordEdit"));
    field->setFocus();
    QTest::keyClicks(field, QStringLiteral("cam"));
    s.window.setTheme(Name::Dark);
    QVERIFY(field->hasFocus());
    QTest::keyClicks(field, QStringLiteral("era"));
    QCOMPARE(field->text(), QStringLiteral("camera"));
    s.window.setTheme(Name::None);
}

void TestGalleryWindow::theClientGoesWithTheWindow()
{
    QPointer<client::ClientWindow> client;
    {
        Shown s;
        client = s.client();
        s.show("badges");
        QVERIFY(client);
    }
    QVERIFY(!client);
}

ZELKOV_TEST_MAIN(TestGalleryWindow)
#include "tst_gallery_window.moc"
