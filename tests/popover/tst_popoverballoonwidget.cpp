// SPDX-License-Identifier: MIT
// Values in a balloon beside a control: texts, rows, and the end after three seconds.
#include "popover/PopoverBalloonWidget.h"

#include "BalloonScene.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QTimer>
#include <QtGui/QFontDatabase>
#include <QtTest/QtTest>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QGraphicsProxyWidget>
#include <QtWidgets/QGraphicsScene>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include <memory>

using vx::PopoverBalloonWidget;
using vx::ValueRange;
using vx::PopoverWidget::Balloon;
using vx::PopoverWidget::Container;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
using zelkovtest::BalloonScene;
using zelkovtest::SignalRecorder;

namespace
{
using ItemMap = QMap<ValueRange, QPointer<Item>>;

class TextItem : public Item
{
public:
    explicit TextItem(int id, QWidget* parent = nullptr)
        : Item(parent, vx::PopoverWidget::eifText, id, QStringLiteral("item"), QStringLiteral("Row"), QString())
    {
    }
    void perform()
    {
        Q_EMIT itemPerformed(id(), QVariant(), QVariant(), vx::PopoverWidget::EItemPerformedFlags());
    }
};

class Values : public PopoverBalloonWidget
{
public:
    using PopoverBalloonWidget::clearUnparentedBalloonItems;
    using PopoverBalloonWidget::getBalloonItemForValue;
    using PopoverBalloonWidget::getBalloonTextForValue;
    using PopoverBalloonWidget::obtainWindow;
    using PopoverBalloonWidget::PopoverBalloonWidget;
    using PopoverBalloonWidget::popoverOpen;
};

// A window with a control, and the values of it.
struct Scene
{
    Scene()
    {
        window.resize(400, 300);
        control = new QPushButton(&window);
        control->setGeometry(150, 100, 80, 24);
        values.reset(new Values(control, QStringLiteral("unused"), 70, QStringLiteral("Speed")));
        window.show();
        window.activateWindow();
        BalloonScene::settle();
    }
    ~Scene()
    {
        values.reset();
        drop();
    }

    static void drop()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        BalloonScene::settle();
    }
    Controller* controller() const { return values->hasController() ? values->getController().data() : nullptr; }
    Container* container() const { return controller()->getContainer(); }
    QTimer* timer() const { return container()->findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly); }
    QList<QLabel*> labels() const { return container()->findChildren<QLabel*>(); }

    QWidget window;
    QPushButton* control = nullptr;
    std::unique_ptr<Values> values;
};
}

class TestPopoverBalloonWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { Manager::init(1000); }
    void cleanupTestCase() { Manager::deleteInstance(); }

    void nothingIsMadeBeforeItIsNeeded();
    void theControllerIsMadeOnce();
    void theControllerFollowsTheControl();
    void featuresCountWhenTheControllerIsMade();
    void aTextOpensATransparentBalloon();
    void oneLabelServesAllTexts();
    void textsAreInTheFixedFontOfThirteenPixels();
    void eachTextStartsTheTimeAnewAndLaysOut();
    void anOpenBalloonIsNotOpenedAgainByAText();
    void threeSecondsAfterTheLastTextItCloses();
    void valuesSelectTheFirstRangeThatHoldsThem_data();
    void valuesSelectTheFirstRangeThatHoldsThem();
    void aValueInNoRangeCloses();
    void aValueInNoRangeMakesNothing();
    void aValueWithATextOpensTwice();
    void rowsAreAddedOnceAndDismiss();
    void theRowOfTheValueIsChecked();
    void rowsOutsideTheLimitsAreHidden();
    void equalLimitsLeaveVisibilityAlone();
    void rowsOpenABalloonThatTakesTheMouse();
    void rowsWinOverTexts();
    void withRowsDisabledTextsDecide();
    void aDeadRowIsSkipped();
    void aNewMapDeletesRowsThatNeverHadAParent();
    void destructionDeletesControllerAndRows();
    void titleAndIdReachTheController();
    void aControlInASceneUsesTheActiveWindow();
    void withoutAnyWindowNoRowsAreShown();
    void aNewPairIsMadeForADeadOne();
    void aDeadLabelIsReplaced();
    void copiesShareTheController();
    void withoutAManagerNothingHappens();
};

void TestPopoverBalloonWidget::nothingIsMadeBeforeItIsNeeded()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("low")}});
    scene.values->setBalloonTitle(QStringLiteral("Title"));
    scene.values->setControllerID(71);
    scene.values->setItemMapEnabled(false);
    QVERIFY(!scene.values->hasController());
    QVERIFY(!scene.values->popoverOpen());
    QVERIFY(Manager::instance()->getControllers(71).isEmpty());
}

void TestPopoverBalloonWidget::theControllerIsMadeOnce()
{
    Scene scene;
    const QPointer<Controller> controller = scene.values->getController();
    QVERIFY(controller);
    QVERIFY(scene.values->hasController());
    QVERIFY(!scene.values->popoverOpen());
    QVERIFY(scene.values->getController() == controller);
    QCOMPARE(Manager::instance()->getControllers(70).size(), 1);
    QVERIFY(controller->hasPersistence());
    QVERIFY(!controller->isSubController());
    QCOMPARE(controller->title(), QStringLiteral("Speed"));
    QCOMPARE(controller->objectName(), QString());
    QCOMPARE(controller->parentWidget(), &scene.window);

    Container* const container = controller->getContainer();
    QCOMPARE(container->objectName(), QStringLiteral("balloonWidget"));
    QCOMPARE(QByteArray(container->metaObject()->className()), QByteArray("vx::WidgetContainer"));
    QCOMPARE(container->layoutOrientation(), int(Qt::Vertical));
    QCOMPARE(container->layout()->alignment(), Qt::Alignment(Qt::AlignLeft));
    QCOMPARE(int(controller->balloon()->getFeatures()), 5);
    QCOMPARE(controller->balloon()->forWidget(), static_cast<const QWidget*>(scene.control));
    QTimer* const timer = scene.timer();
    QVERIFY(timer != nullptr);
    QVERIFY(timer->isSingleShot() && !timer->isActive());
    QCOMPARE(timer->interval(), 3000);
}

void TestPopoverBalloonWidget::theControllerFollowsTheControl()
{
    Scene scene;
    QWidget other;
    other.resize(300, 200);
    other.show();
    const QPointer<Controller> controller = scene.values->getController();
    scene.control->setParent(&other);
    QCOMPARE(controller->parentWidget(), &scene.window);
    QVERIFY(scene.values->getController() == controller);
    QCOMPARE(controller->parentWidget(), &other);
    scene.values.reset();
    Scene::drop();
}

void TestPopoverBalloonWidget::featuresCountWhenTheControllerIsMade()
{
    Scene scene;
    scene.values->setBalloonFeatures(Balloon::ebfNoHeader);
    QCOMPARE(int(scene.values->getController()->balloon()->getFeatures()), 8);
    scene.values->setBalloonFeatures(Balloon::ebfClose);
    QCOMPARE(int(scene.values->getController()->balloon()->getFeatures()), 8);
}

void TestPopoverBalloonWidget::aTextOpensATransparentBalloon()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("12 km/h"));
    Controller* const controller = scene.controller();
    QVERIFY(controller != nullptr);
    QVERIFY(controller->isActive());
    QVERIFY(controller->isVisible());
    QVERIFY(controller->balloon()->isVisible());
    QVERIFY(controller->testAttribute(Qt::WA_TransparentForMouseEvents));
    QVERIFY(scene.values->popoverOpen());
    QCOMPARE(scene.labels().size(), 1);
    QCOMPARE(scene.labels().first()->text(), QStringLiteral("12 km/h"));
}

void TestPopoverBalloonWidget::oneLabelServesAllTexts()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    QLabel* const label = scene.labels().first();
    scene.controller()->dismiss(false, true);
    scene.values->setBalloonText(QStringLiteral("two"));
    QCOMPARE(scene.labels(), QList<QLabel*> {label});
    QCOMPARE(label->text(), QStringLiteral("two"));
    QCOMPARE(scene.container()->getItemIDs(), QList<int> {-1});
    QVERIFY(scene.controller()->isActive());
}

void TestPopoverBalloonWidget::textsAreInTheFixedFontOfThirteenPixels()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    const QFont font = scene.labels().first()->font();
    QCOMPARE(font.pixelSize(), 13);
    QCOMPARE(font.family(), QFontDatabase::systemFont(QFontDatabase::FixedFont).family());
}

void TestPopoverBalloonWidget::eachTextStartsTheTimeAnewAndLaysOut()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    QVERIFY(scene.timer()->isActive());
    scene.timer()->stop();
    SignalRecorder recorder(scene.container());
    scene.values->setBalloonText(QStringLiteral("two"));
    QVERIFY(scene.timer()->isActive());
    QVERIFY(scene.timer()->remainingTime() > 2000);
    QCOMPARE(recorder.count(QStringLiteral("layoutChanged")), 1);
    QCOMPARE(recorder.count(QStringLiteral("dismissPopover")), 0);
}

void TestPopoverBalloonWidget::anOpenBalloonIsNotOpenedAgainByAText()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    SignalRecorder recorder(scene.controller());
    scene.values->setBalloonText(QStringLiteral("two"));
    QCOMPARE(recorder.count(QStringLiteral("balloonOpened")), 0);
    // Active but not visible: opened again.
    scene.controller()->hide();
    scene.values->setBalloonText(QStringLiteral("three"));
    QCOMPARE(recorder.count(QStringLiteral("balloonOpened")), 1);
    QVERIFY(scene.values->popoverOpen());
}

void TestPopoverBalloonWidget::threeSecondsAfterTheLastTextItCloses()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    SignalRecorder recorder(scene.container());
    recorder.add(scene.controller());
    QElapsedTimer clock;
    clock.start();
    QTRY_COMPARE_WITH_TIMEOUT(recorder.count(QStringLiteral("dismissPopover")), 1, 10000);
    QVERIFY(clock.elapsed() > 2700); // coarse timers may be 5 % early
    QVERIFY(!scene.controller()->isActive());
    QCOMPARE(recorder.count(QStringLiteral("balloonClosed")), 1);
    // It lives on for the next text.
    QTRY_VERIFY(!scene.values->popoverOpen());
    scene.values->setBalloonText(QStringLiteral("two"));
    QVERIFY(scene.values->popoverOpen());
}

void TestPopoverBalloonWidget::valuesSelectTheFirstRangeThatHoldsThem_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<QString>("text");

    QTest::newRow("below") << -6 << QString();
    QTest::newRow("first") << -5 << QStringLiteral("a");
    QTest::newRow("last of the first") << 5 << QStringLiteral("a");
    QTest::newRow("only in the second") << 6 << QStringLiteral("b");
    QTest::newRow("last of the second") << 10 << QStringLiteral("b");
    QTest::newRow("between") << 11 << QString();
    QTest::newRow("one value") << 20 << QStringLiteral("c");
    QTest::newRow("after it") << 21 << QString();
}

void TestPopoverBalloonWidget::valuesSelectTheFirstRangeThatHoldsThem()
{
    QFETCH(int, value);
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 10), QStringLiteral("b")},
        {ValueRange(-5, 5), QStringLiteral("a")}, {ValueRange(20), QStringLiteral("c")}});
    QTEST(scene.values->getBalloonTextForValue(value), "text");

    TextItem first(1, scene.control);
    TextItem second(2, scene.control);
    scene.values->setBalloonItemMap({{ValueRange(0, 10), &second}, {ValueRange(-5, 5), &first}});
    Item* const expected = value >= -5 && value <= 5 ? &first : value >= 0 && value <= 10 ? &second : nullptr;
    QCOMPARE(scene.values->getBalloonItemForValue(value).data(), expected);
    scene.values->setBalloonItemMap({});
}

void TestPopoverBalloonWidget::aValueInNoRangeCloses()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("low")}});
    scene.values->updateBalloon(9, 0, 100);
    QVERIFY(scene.controller()->isActive());
    scene.values->updateBalloon(10, 0, 100);
    QVERIFY(!scene.controller()->isActive());
    QVERIFY(scene.values->hasController());
}

void TestPopoverBalloonWidget::aValueInNoRangeMakesNothing()
{
    Scene scene;
    scene.values->updateBalloon(10, 0, 100);
    QVERIFY(!scene.values->hasController());
}

void TestPopoverBalloonWidget::aValueWithATextOpensTwice()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("low")}});
    SignalRecorder recorder(scene.values->getController());
    scene.values->updateBalloon(3, 0, 100);
    // The text opens a closed balloon, and the value opens it in any case.
    QCOMPARE(recorder.count(QStringLiteral("balloonOpened")), 2);
    scene.values->updateBalloon(4, 0, 100);
    QCOMPARE(recorder.count(QStringLiteral("balloonOpened")), 3);
    QVERIFY(scene.controller()->testAttribute(Qt::WA_TransparentForMouseEvents));
}

void TestPopoverBalloonWidget::rowsAreAddedOnceAndDismiss()
{
    Scene scene;
    QPointer<TextItem> slow = new TextItem(1);
    QPointer<TextItem> fast = new TextItem(2);
    scene.values->setBalloonItemMap({{ValueRange(10, 19), fast.data()}, {ValueRange(0, 9), slow.data()}});
    scene.values->updateBalloon(3, 0, 100);
    scene.values->updateBalloon(13, 0, 100);
    QCOMPARE(scene.container()->getItemIDs(), QList<int>({1, 2}));
    SignalRecorder recorder(scene.container());
    // The controller hears of the dismissal before the recorder does.
    slow->perform();
    QCOMPARE(recorder.names(),
        QStringList({QStringLiteral("popoverAboutToClose"), QStringLiteral("dismissPopover"),
            QStringLiteral("itemPerformed")}));
}

void TestPopoverBalloonWidget::theRowOfTheValueIsChecked()
{
    Scene scene;
    auto* const slow = new TextItem(1);
    auto* const fast = new TextItem(2);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), slow}, {ValueRange(10, 19), fast}});
    scene.values->updateBalloon(9, 0, 100);
    QVERIFY(slow->isChecked());
    QVERIFY(!fast->isChecked());
    scene.values->updateBalloon(10, 0, 100);
    QVERIFY(fast->isChecked());
    // Nobody unchecks the others: rows that exclude each other do that by themselves.
    QVERIFY(slow->isChecked());
}

void TestPopoverBalloonWidget::rowsOutsideTheLimitsAreHidden()
{
    Scene scene;
    auto* const a = new TextItem(1);
    auto* const b = new TextItem(2);
    auto* const c = new TextItem(3);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), a}, {ValueRange(10, 19), b}, {ValueRange(20, 29), c}});
    scene.values->updateBalloon(10, 0, 28);
    QVERIFY(!a->isHidden() && !b->isHidden() && c->isHidden());
    scene.values->updateBalloon(10, 1, 29);
    QVERIFY(a->isHidden() && !b->isHidden() && !c->isHidden());
    scene.values->updateBalloon(10, 0, 29);
    QVERIFY(!a->isHidden() && !b->isHidden() && !c->isHidden());
}

void TestPopoverBalloonWidget::equalLimitsLeaveVisibilityAlone()
{
    Scene scene;
    auto* const a = new TextItem(1);
    auto* const b = new TextItem(2);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), a}, {ValueRange(10, 19), b}});
    scene.values->updateBalloon(0, 0, 9);
    QVERIFY(!a->isHidden() && b->isHidden());
    a->setChecked(false);
    scene.values->updateBalloon();
    QVERIFY(!a->isHidden() && b->isHidden());
    QVERIFY(a->isChecked());
    scene.values->updateBalloon(0, 5, 5);
    QVERIFY(!a->isHidden() && b->isHidden());
}

void TestPopoverBalloonWidget::rowsOpenABalloonThatTakesTheMouse()
{
    Scene scene;
    scene.values->setBalloonItemMap({{ValueRange(0, 9), new TextItem(1)}});
    scene.values->setBalloonText(QStringLiteral("text"));
    QVERIFY(scene.controller()->testAttribute(Qt::WA_TransparentForMouseEvents));
    scene.values->updateBalloon();
    QVERIFY(!scene.controller()->testAttribute(Qt::WA_TransparentForMouseEvents));
    QVERIFY(scene.values->popoverOpen());
}

void TestPopoverBalloonWidget::rowsWinOverTexts()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 19), QStringLiteral("text")}});
    scene.values->setBalloonItemMap({{ValueRange(0, 9), new TextItem(1)}});
    scene.values->updateBalloon(3, 0, 100);
    QVERIFY(!scene.timer()->isActive());
    QCOMPARE(scene.labels().size(), 0);
    // No row for this one.
    scene.values->updateBalloon(13, 0, 100);
    QVERIFY(scene.timer()->isActive());
    QCOMPARE(scene.labels().size(), 1);
}

void TestPopoverBalloonWidget::withRowsDisabledTextsDecide()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 5), QStringLiteral("text")}});
    scene.values->setBalloonItemMap({{ValueRange(0, 9), new TextItem(1)}});
    scene.values->setItemMapEnabled(false);
    scene.values->updateBalloon(3, 0, 100);
    QCOMPARE(scene.labels().size(), 1);
    scene.values->updateBalloon(7, 0, 100);
    QVERIFY(!scene.controller()->isActive());
    scene.values->setItemMapEnabled(true);
    scene.values->updateBalloon(7, 0, 100);
    QVERIFY(scene.controller()->isActive());
}

void TestPopoverBalloonWidget::aDeadRowIsSkipped()
{
    Scene scene;
    auto* const dead = new TextItem(1);
    auto* const alive = new TextItem(2);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), dead}, {ValueRange(10, 19), alive}});
    scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("text")}});
    delete dead;
    scene.values->updateBalloon(12, 0, 100);
    QCOMPARE(scene.container()->getItemIDs(), QList<int> {2});
    // A value whose row is dead falls back on its text.
    scene.values->updateBalloon(3, 0, 100);
    QCOMPARE(scene.labels().size(), 1);
}

void TestPopoverBalloonWidget::aNewMapDeletesRowsThatNeverHadAParent()
{
    Scene scene;
    const QPointer<Item> loose = new TextItem(1);
    const QPointer<Item> held = new TextItem(2, scene.control);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), loose}, {ValueRange(10, 19), held}});
    scene.values->setBalloonItemMap({});
    QVERIFY(loose); // later, not now
    Scene::drop();
    QVERIFY(!loose);
    QVERIFY(held);
    QVERIFY(!scene.values->getBalloonItemForValue(12));

    const QPointer<Item> third = new TextItem(3);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), third}, {ValueRange(10, 19), held}});
    scene.values->clearUnparentedBalloonItems();
    QVERIFY(!scene.values->getBalloonItemForValue(5));
    QVERIFY(scene.values->getBalloonItemForValue(12) == held);
    Scene::drop();
    QVERIFY(!third);
}

void TestPopoverBalloonWidget::destructionDeletesControllerAndRows()
{
    Scene scene;
    const QPointer<Item> row = new TextItem(1);
    scene.values->setBalloonItemMap({{ValueRange(0, 9), row}});
    const QPointer<Controller> controller = scene.values->getController();
    scene.values.reset();
    QVERIFY(controller && row);
    Scene::drop();
    QVERIFY(!controller && !row);
    QVERIFY(Manager::instance()->getControllers(70).isEmpty());
}

void TestPopoverBalloonWidget::titleAndIdReachTheController()
{
    Scene scene;
    const QPointer<Controller> controller = scene.values->getController();
    scene.values->setBalloonTitle(QStringLiteral("Zoom"));
    QCOMPARE(controller->title(), QStringLiteral("Zoom"));
    scene.values->setControllerID(77);
    QCOMPARE(Manager::instance()->getControllerID(controller), 77);
    QVERIFY(Manager::instance()->getControllers(70).isEmpty());
}

void TestPopoverBalloonWidget::aControlInASceneUsesTheActiveWindow()
{
    Scene scene;
    QCOMPARE(scene.values->obtainWindow(), &scene.window);
    QGraphicsScene graphics;
    auto* const embedded = new QPushButton;
    graphics.addWidget(embedded);
    Values values(embedded, QString(), 90, QString());
    QApplication::setActiveWindow(&scene.window);
    QCOMPARE(values.obtainWindow(), &scene.window);
    QCOMPARE(values.getController()->parentWidget(), &scene.window);
}

void TestPopoverBalloonWidget::withoutAnyWindowNoRowsAreShown()
{
    QGraphicsScene graphics;
    auto* const embedded = new QPushButton;
    graphics.addWidget(embedded);
    QApplication::setActiveWindow(nullptr);
    {
        Values values(embedded, QString(), 90, QString());
        QVERIFY(values.obtainWindow() == nullptr);
        values.setBalloonItemMap({{ValueRange(0, 9), new TextItem(1)}});
        values.updateBalloon();
        QVERIFY(!values.hasController());
    }
    Scene::drop();
}

void TestPopoverBalloonWidget::aNewPairIsMadeForADeadOne()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    QPointer<Controller> first = scene.controller();
    delete first.data();
    QVERIFY(!scene.values->hasController());
    QVERIFY(!scene.values->popoverOpen());
    scene.values->setBalloonTitle(QStringLiteral("Zoom"));
    scene.values->setBalloonText(QStringLiteral("two"));
    QVERIFY(scene.values->popoverOpen());
    QCOMPARE(scene.labels().first()->text(), QStringLiteral("two"));

    // Only the content is gone: the popover that held it goes, too.
    first = scene.controller();
    delete scene.container();
    scene.values->setBalloonText(QStringLiteral("three"));
    QVERIFY(scene.controller() != first);
    QCOMPARE(scene.labels().first()->text(), QStringLiteral("three"));
    Scene::drop();
    QVERIFY(!first);
    QCOMPARE(Manager::instance()->getControllers(70).size(), 1);
}

void TestPopoverBalloonWidget::aDeadLabelIsReplaced()
{
    Scene scene;
    scene.values->setBalloonText(QStringLiteral("one"));
    scene.container()->resetLayout(true, true);
    QCOMPARE(scene.labels().size(), 0);
    scene.values->setBalloonText(QStringLiteral("two"));
    QCOMPARE(scene.labels().size(), 1);
    QCOMPARE(scene.labels().first()->text(), QStringLiteral("two"));
}

void TestPopoverBalloonWidget::copiesShareTheController()
{
    Scene scene;
    scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("low")}});
    const QPointer<Controller> controller = scene.values->getController();
    {
        Values copy(*scene.values);
        QVERIFY(copy.getController() == controller);
        QCOMPARE(copy.getBalloonTextForValue(3), QStringLiteral("low"));
        Values other(scene.control, QString(), 5, QString());
        other = copy;
        QVERIFY(other.getController() == controller);
    }
    Scene::drop();
    QVERIFY(!controller);
    scene.values->updateBalloon(3, 0, 9);
    QVERIFY(scene.values->popoverOpen());
}

void TestPopoverBalloonWidget::withoutAManagerNothingHappens()
{
    Manager::deleteInstance();
    {
        Scene scene;
        scene.values->setBalloonTextMap({{ValueRange(0, 9), QStringLiteral("low")}});
        scene.values->setBalloonItemMap({{ValueRange(10, 19), new TextItem(1)}});
        QVERIFY(!scene.values->getController());
        scene.values->setBalloonText(QStringLiteral("one"));
        scene.values->updateBalloon(3, 0, 9);
        scene.values->updateBalloon(13, 0, 90);
        scene.values->setControllerID(3);
        QVERIFY(!scene.values->hasController());
    }
    Manager::init(1000);
}

ZELKOV_TEST_MAIN(TestPopoverBalloonWidget)
#include "tst_popoverballoonwidget.moc"
