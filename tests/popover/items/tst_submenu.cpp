// SPDX-License-Identifier: MIT
// Rows that open popovers: submenus and the reset menu; and what containers do with them.
#include "RowTools.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/Manager.h"
#include "popover/items/LabelItem.h"
#include "popover/items/RadioItem.h"
#include "popover/items/Submenu.h"

#include <QtGui/QContextMenuEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>

using namespace vx::PopoverWidget;

namespace
{
Container* column(const char* name)
{
    return new Container(nullptr, QString::fromLatin1(name), Qt::Vertical, Qt::AlignTop);
}
PushItem* push(int id)
{
    return new PushItem(QStringLiteral("push"), QString(), QStringLiteral("push"), id, eifText, nullptr);
}

/// A window with a submenu whose popover holds one push row with the id 21.
class Scene
{
public:
    explicit Scene(EItemFlags flags = eifText | eifControl)
        : nested(column("nested"))
    {
        Manager::init(100);
        window.resize(600, 400);
        window.show();
        nested->addItem(push(21));
        menu = new Submenu(5, QStringLiteral("title"), QStringLiteral("text"), QStringLiteral("more"),
            QStringLiteral("name"), &window, nested, nullptr, 7, flags);
        menu->setUserData(QStringLiteral("data"));
        menu->setParent(&window);
        menu->setGeometry(200, 100, 200, 30);
        menu->show();
        QCoreApplication::processEvents();
    }
    ~Scene()
    {
        delete menu;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        Manager::deleteInstance();
    }
    Scene(const Scene&) = delete;
    Scene& operator=(const Scene&) = delete;

    QWidget* disclosure() const { return menu->findChild<QWidget*>(QStringLiteral("disclosureIcon")); }
    bool isOpen() const { return menu->controller() && menu->controller()->isActive(); }

    QWidget window;
    QPointer<Container> nested;
    QPointer<Submenu> menu;
};
}

class TestSubmenu : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aClickPerformsWithTheUserDataTwiceAndOpens()
    {
        Scene scene;
        QCOMPARE(int(scene.menu->defaultItemFlags()), 0);
        QCOMPARE(scene.menu->container(), scene.nested.data());
        QVERIFY(scene.menu->controller()->hasPersistence());
        QCOMPARE(Manager::instance()->getControllerID(scene.menu->controller()), 5);
        zelkovtest::SignalRecorder recorder(scene.menu);
        QVERIFY(itemtest::sendMouse(
            scene.menu, QEvent::MouseButtonRelease, QPoint(100, 29), Qt::LeftButton, Qt::NoButton));
        QCOMPARE(rowtest::events(recorder), QStringList{QStringLiteral("itemPerformed 7 data 16")});
        QCOMPARE(rowtest::userDataOf(recorder).toString(), QStringLiteral("data"));
        QVERIFY(scene.isOpen());
        QVERIFY(scene.menu->isChecked());
        // Beside the row, since the arrow points left or right.
        const QRect row(scene.menu->mapToGlobal(QPoint()), scene.menu->size());
        const QWidget* const balloon = scene.menu->controller()->balloon();
        const QRect place(balloon->mapToGlobal(QPoint()), balloon->size());
        QVERIFY(place.left() >= row.center().x() || place.right() <= row.center().x());
    }

    void closingUnchecksTheRow()
    {
        Scene scene;
        scene.menu->open();
        QVERIFY(scene.menu->isChecked());
        zelkovtest::SignalRecorder recorder(scene.menu);
        scene.menu->controller()->dismiss(false, true);
        QVERIFY(!scene.menu->isChecked());
        QCOMPARE(rowtest::told(recorder),
            (QStringList{QStringLiteral("layoutChanged"), QStringLiteral("layoutChanged")}));
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(scene.menu->controller() != nullptr);
        scene.menu->open();
        QVERIFY(scene.isOpen());
    }

    void otherButtonsAreOnlyAccepted_data()
    {
        QTest::addColumn<int>("flags");
        QTest::addColumn<int>("button");
        QTest::addColumn<bool>("performed");
        QTest::addColumn<bool>("opened");
        const int usual = eifText | eifControl;
        QTest::newRow("left") << usual << int(Qt::LeftButton) << true << true;
        QTest::newRow("right") << usual << int(Qt::RightButton) << false << false;
        QTest::newRow("right, allowed") << (usual | eifRightClick) << int(Qt::RightButton) << true << true;
        QTest::newRow("middle") << (usual | eifRightClick) << int(Qt::MiddleButton) << false << false;
        QTest::newRow("disclosure only, left") << (usual | eifDisclosureOnly) << int(Qt::LeftButton) << true << false;
        QTest::newRow("disclosure only, right") << (usual | eifDisclosureOnly) << int(Qt::RightButton) << true
                                                << false;
    }
    void otherButtonsAreOnlyAccepted()
    {
        QFETCH(int, flags);
        QFETCH(int, button);
        QFETCH(bool, performed);
        QFETCH(bool, opened);
        Scene scene{EItemFlags(QFlag(flags))};
        QSignalSpy spy(scene.menu.data(), &Item::itemPerformed);
        QVERIFY(itemtest::sendMouse(scene.menu, QEvent::MouseButtonRelease,
            scene.menu->textElement()->geometry().center(), Qt::MouseButton(button), Qt::NoButton));
        QCOMPARE(spy.count(), performed ? 1 : 0);
        QCOMPARE(scene.isOpen(), opened);
        itemtest::click(scene.menu, QPoint(200, 10));
        QCOMPARE(spy.count(), performed ? 1 : 0);
    }

    void theDisclosureIconHasAFlagOfItsOwn()
    {
        Scene scene(eifText | eifControl | eifDisclosureOnly | eifRightClick);
        const QPoint icon = scene.disclosure()->geometry().center();
        QVERIFY(scene.disclosure()->testAttribute(Qt::WA_TransparentForMouseEvents));
        QCOMPARE(int(scene.menu->getItemPerformedFlag(icon, Qt::LeftButton)), 144);
        QCOMPARE(int(scene.menu->getItemPerformedFlag(icon, Qt::RightButton)), 160);
        QCOMPARE(int(scene.menu->getItemPerformedFlag(icon, Qt::MiddleButton)), 128);
        itemtest::click(scene.menu, icon, Qt::MiddleButton);
        QVERIFY(!scene.isOpen());
        zelkovtest::SignalRecorder recorder(scene.menu);
        itemtest::click(scene.menu, icon);
        QVERIFY(scene.isOpen());
        QCOMPARE(rowtest::events(recorder), QStringList{QStringLiteral("itemPerformed 7 data 144")});
    }

    void aRefusedUserOpensNothing()
    {
        const rowtest::SharedRights rights;
        Scene scene;
        scene.menu->setSecurityCheck(QStringLiteral("no"));
        QSignalSpy spy(scene.menu.data(), &Item::itemPerformed);
        itemtest::click(scene.menu, QPoint(100, 29));
        QVERIFY(!scene.isOpen());
        QCOMPARE(spy.count(), 0);
    }

    void nestedRowsArePerformedThroughTheSubmenu()
    {
        Scene scene;
        scene.menu->open();
        zelkovtest::SignalRecorder recorder(scene.menu);
        Item* const row = scene.nested->getItem(21);
        itemtest::click(row, row->rect().center());
        QVERIFY(rowtest::events(recorder).contains(QStringLiteral("itemPerformed 21 true 18"))
            || rowtest::events(recorder).contains(QStringLiteral("itemPerformed 21 true 16")));
        // A push row dismisses the nested popover, which unchecks the submenu.
        QVERIFY(!scene.isOpen());
        QVERIFY(!scene.menu->isChecked());
    }

    void theNestedControllerDiesWithTheRow()
    {
        Scene scene;
        QPointer<Controller> controller = scene.menu->controller();
        delete scene.menu;
        QVERIFY(!controller.isNull());
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(controller.isNull());
    }

    void aRowWithoutItsControllerDoesNotOpen()
    {
        Scene scene;
        delete scene.menu->controller();
        QVERIFY(scene.menu->controller() == nullptr);
        scene.menu->open();
        QVERIFY(!scene.menu->isChecked());
    }

    void aGivenControllerIsKept()
    {
        Scene scene;
        const QPointer<Controller> given = Manager::instance()->createController(9, false, true, &scene.window,
            &scene.window, QString(), QString(), QFlags<Balloon::EArrowDirection>(QFlag(12)), QSizeF(),
            QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        auto* const row = new Submenu(5, QString(), QStringLiteral("t"), QString(), QString(), &scene.window,
            column("other"), nullptr, 8, eifText, given);
        QCOMPARE(row->controller(), given.data());
        QVERIFY(given->hasPersistence());
        delete row;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!given.isNull());
    }

    void theParentFollowsWhatTheNestedContentDismisses()
    {
        Scene scene;
        const QPointer<Controller> parent = Manager::instance()->createController(9, false, false, &scene.window,
            &scene.window, QString(), QString(), QFlags<Balloon::EArrowDirection>(QFlag(15)), QSizeF(),
            QFlags<Balloon::ESizeConstraint>(QFlag(3)));
        Container* const nested = column("nested2");
        Item* const all = nested->addItem(push(31), QFlags<EContainerFlag>(ecfDismissAll));
        auto* const row = new Submenu(6, QString(), QStringLiteral("t"), QString(), QString(), &scene.window, nested,
            parent, 8, eifText);
        Container* const content = column("content");
        content->addItem(row);
        parent->setContainer(content, QFlags<Balloon::EBalloonFeature>(QFlag(8)));
        parent->setPersistence(true);
        parent->setActive();
        row->open();
        QVERIFY(parent->isActive());
        itemtest::click(all, all->rect().center());
        QVERIFY(!parent->isActive());
    }

    void theAdditionalTextTakesTheOthersAlong()
    {
        Scene scene(eifText | eifIcon | eifAdditionalText | eifControl);
        scene.menu->additionalTextElement()->setChecked(true);
        QVERIFY(scene.menu->textElement()->isChecked() && scene.menu->iconElement()->isChecked());
        scene.menu->additionalTextElement()->setChecked(false);
        QVERIFY(!scene.menu->isChecked());
    }

    void searchesByIdDoNotEnterASubmenuThatDoesNotForward()
    {
        for (bool forwards : {true, false}) {
            Scene scene(forwards ? EItemFlags(eifText) : eifText | eifNoForward);
            std::unique_ptr<Container> content(column("content"));
            content->addItem(scene.menu);
            QCOMPARE(content->getItems(21).size(), forwards ? 1 : 0);
            QCOMPARE(content->getItems().size(), 2);
            QCOMPARE(content->getItemIDs(), (QList<int>{7, 21}));
            QCOMPARE(content->getItemsByValue(scene.nested->getItem(21)->value()).size(), 2);
            scene.menu->setParent(&scene.window);
        }
    }

    void aSubmenuBecomesARadioList()
    {
        Scene scene;
        std::unique_ptr<Container> content(column("content"));
        content->addItem(scene.menu);
        content->addItem(push(3));
        const QStringList texts{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")};
        content->setSubmenuRadioList(-1, 40, texts, 1, QStringLiteral("radio"));
        content->setSubmenuRadioList(3, 40, texts, 1, QStringLiteral("radio"));
        content->setSubmenuRadioList(99, 40, texts, 1, QStringLiteral("radio"));
        QVERIFY(scene.nested->itemExists(21));
        QSignalSpy layout(content.get(), &Container::layoutChanged);
        content->setSubmenuRadioList(7, 40, texts, 1, QStringLiteral("radio"));
        QCOMPARE(layout.count(), 0);
        QVERIFY(!scene.nested->itemExists(21));
        const QList<Item*> items = scene.nested->getItems(40);
        QCOMPARE(items.size(), 3);
        QCOMPARE(content->getSelectedItem(40), items.at(1));
        const auto* const first = qobject_cast<RadioItem*>(items.first());
        QVERIFY(first != nullptr);
        QCOMPARE(first->objectName(), QStringLiteral("radio"));
        QCOMPARE(int(first->itemFlags()), 5);
        QCOMPARE(first->buttonGroup()->parent(), content.get());
        QCOMPARE(first->buttonGroup()->buttons().size(), 3);
        content->setSubmenuRadioList(7, 41, {QStringLiteral("x")}, -1, QString());
        QCOMPARE(scene.nested->getItems().size(), 1);
        QVERIFY(content->getSelectedItem(41) == nullptr);
        scene.menu->setParent(&scene.window);
    }

    void theResetMenuHasOneEntry()
    {
        Manager::init(100);
        {
            rowtest::Host<PushItem> host(push(7));
            host.row->setResetPopover(QStringLiteral("Reset"));
            QCOMPARE(host.row->contextMenuPolicy(), Qt::CustomContextMenu);
            zelkovtest::SignalRecorder recorder(host.row);
            QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(5, 6));
            QApplication::sendEvent(host.row, &event);
            QCOMPARE(rowtest::told(recorder).size(), 1);
            QCOMPARE(recorder.names(), QStringList{QStringLiteral("contextMenuRequested")});
            QCOMPARE(recorder.entries().first().arguments.first().toPoint(), QPoint(5, 6));
            const QPointer<Controller> controller = Manager::instance()->getController(0);
            QVERIFY(controller && controller->isActive());
            QCOMPARE(controller->objectName(), QStringLiteral("contextMenuPopover"));
            auto* const entry = qobject_cast<LabelItem*>(controller->getContainer()->getItem(-1));
            QVERIFY(entry != nullptr);
            QCOMPARE(entry->label()->text(), QStringLiteral("Reset"));
            QCOMPARE(controller->getContainer()->getItems().size(), 1);
            itemtest::click(entry, entry->rect().center());
            QCOMPARE(recorder.names(),
                (QStringList{QStringLiteral("contextMenuRequested"), QStringLiteral("resetContextMenuPerformed")}));
            QVERIFY(!controller || !controller->isActive());
            // Set again it opens once, taken away it does not open.
            recorder.clear();
            host.row->setResetPopover(QStringLiteral("Again"));
            host.row->setResetPopover(QStringLiteral("Again"));
            QApplication::sendEvent(host.row, &event);
            QCOMPARE(recorder.names(), QStringList{QStringLiteral("contextMenuRequested")});
            host.row->setResetPopover(QString());
            QApplication::sendEvent(host.row, &event);
            QCOMPARE(recorder.names(), QStringList{QStringLiteral("contextMenuRequested")});
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        Manager::deleteInstance();
    }

    void withoutTheManagerNothingOpens()
    {
        rowtest::Host<PushItem> host(push(7));
        host.row->setResetPopover(QStringLiteral("Reset"));
        QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(5, 6));
        QApplication::sendEvent(host.row, &event);
        std::unique_ptr<Container> nested(column("nested"));
        Submenu menu(5, QString(), QStringLiteral("t"), QString(), QString(), &host.window, nested.get(), nullptr, 7,
            eifText);
        QVERIFY(menu.controller() == nullptr);
        menu.open();
        QVERIFY(!menu.isChecked());
    }
};

ZELKOV_TEST_MAIN(TestSubmenu)
#include "tst_submenu.moc"
