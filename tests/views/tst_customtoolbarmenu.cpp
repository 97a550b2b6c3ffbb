// SPDX-License-Identifier: MIT
// The context menu of the tool bar that takes part in customising.
#include "support/TestMain.h"
#include "ToolBarScene.h"

using toolbarscene::c_Action;
using toolbarscene::c_ToolBar;
using toolbarscene::Dragged;
using toolbarscene::Host;
using toolbarscene::packed;
using toolbarscene::Scene;
using toolbarscene::word;

using vx::CustomToolBar;

static void choose(QMenu* menu, const char* text)
{
    const QList<QAction*> all = menu->actions();
    for (QAction* const action : all) {
        if (action->text() == word(text)) {
            menu->setActiveAction(action);
            QTest::keyClick(menu, Qt::Key_Return);
            return;
        }
    }
    QFAIL("no such entry");
}

class TestCustomToolBarMenu : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theMenuIsAFixedPicture();
    void removeItemReportsTheAction();
    void otherEntriesReportNothing();
    void customizeGoesToTheParent();
    void withoutThatSlotNothingBreaks();
    void anEmptyPartHasNoMenuOfThisClass();
    void theBarMayDieWhileItsMenuIsOpen();

private:
    // Opens the menu on the action and calls what to do with it from its loop.
    static void openMenu(Scene& scene, int index, const std::function<void(QMenu*)>& use);
};

void TestCustomToolBarMenu::openMenu(Scene& scene, int index, const std::function<void(QMenu*)>& use)
{
    const QPoint at = index < 0 ? QPoint(200, 20) : scene.place(index).center();
    bool opened = false;
    QTimer::singleShot(10, &scene.host, [&] {
        auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
        opened = menu != nullptr;
        if (menu) {
            use(menu);
        }
        if (auto* const still = QApplication::activePopupWidget()) {
            still->close();
        }
    });
    QContextMenuEvent event(QContextMenuEvent::Mouse, at, scene.bar->mapToGlobal(at));
    QApplication::sendEvent(scene.bar, &event);
    QTest::qWait(30);
    QCOMPARE(opened, index >= 0);
}

void TestCustomToolBarMenu::theMenuIsAFixedPicture()
{
    Scene scene;
    scene.bar->setToolButtonStyle(Qt::ToolButtonTextOnly);
    QStringList entries;
    QPoint position;
    openMenu(scene, 1, [&](QMenu* menu) {
        position = menu->pos();
        const QList<QAction*> all = menu->actions();
        for (const QAction* const action : all) {
            entries << (action->isSeparator() ? word("-") : action->text());
            QCOMPARE(action->isCheckable(), action->text() == word("Icons Only"));
            QCOMPARE(action->isChecked(), action->text() == word("Icons Only"));
        }
    });
    QCOMPARE(entries,
        (QStringList {word("Icons Only"), word("Icons & Text"), word("Text Only"), word("-"), word("Small Icons"),
            word("-"), word("Remove Item"), word("-"), word("Customize Toolbar...")}));
    QCOMPARE(position.y(), scene.bar->mapToGlobal(scene.place(1).center()).y());
    QVERIFY(!scene.bar->findChild<QMenu*>(QString(), Qt::FindDirectChildrenOnly));
}

void TestCustomToolBarMenu::removeItemReportsTheAction()
{
    Scene scene;
    openMenu(scene, 1, [](QMenu* menu) { choose(menu, "Remove Item"); });
    QCOMPARE(scene.recorder.names(), QStringList {word("actionRemoved")});
    QCOMPARE(scene.recorder.entries().first().arguments.at(0).value<QToolBar*>(), scene.bar);
    QCOMPARE(scene.recorder.entries().first().arguments.at(1).value<QAction*>(), scene.actions.at(1));
    QCOMPARE(scene.bar->actions(), scene.actions);
}

void TestCustomToolBarMenu::otherEntriesReportNothing()
{
    Scene scene;
    for (const char* text : {"Icons Only", "Icons & Text", "Text Only", "Small Icons"}) {
        openMenu(scene, 0, [text](QMenu* menu) { choose(menu, text); });
    }
    openMenu(scene, 0, [](QMenu*) {});
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.host.customized, 0);
    QCOMPARE(scene.bar->toolButtonStyle(), Qt::ToolButtonIconOnly);
}

void TestCustomToolBarMenu::customizeGoesToTheParent()
{
    Scene scene;
    openMenu(scene, 2, [](QMenu* menu) { choose(menu, "Customize Toolbar..."); });
    QCOMPARE(scene.host.customized, 1);
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestCustomToolBarMenu::withoutThatSlotNothingBreaks()
{
    Scene scene;
    QWidget plain;
    plain.resize(200, 60);
    scene.bar->setParent(&plain);
    plain.show();
    scene.bar->show();
    QVERIFY(QTest::qWaitForWindowExposed(&plain));
    openMenu(scene, 0, [](QMenu* menu) { choose(menu, "Customize Toolbar..."); });
    QCOMPARE(scene.host.customized, 0);
    scene.bar->setParent(&scene.host);
}

void TestCustomToolBarMenu::anEmptyPartHasNoMenuOfThisClass()
{
    Scene scene;
    openMenu(scene, -1, [](QMenu*) {});
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestCustomToolBarMenu::theBarMayDieWhileItsMenuIsOpen()
{
    Scene scene;
    const QPointer<CustomToolBar> bar(scene.bar);
    openMenu(scene, 0, [&](QMenu*) { delete bar; });
    QVERIFY(!bar);
}

ZELKOV_TEST_MAIN(TestCustomToolBarMenu)
#include "tst_customtoolbarmenu.moc"
