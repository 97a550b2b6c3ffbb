// SPDX-License-Identifier: MIT
// The balloons of a handle: texts, dates, intervals, and the popover in which a value is picked.
#include "NubsieScene.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "sliders/Nubsie.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "ZelkovUtils/TimeUtils.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLabel>

using vx::Nubsie;
using vx::PopoverWidget::Controller;
using vx::PopoverWidget::Item;
using vx::PopoverWidget::Manager;
using zelkovtest::SignalRecorder;

namespace
{
using Features = QFlags<Nubsie::ENubsieFeatures>;
using ItemMap = QMap<vx::ValueRange, QPointer<Item>>;

// A row that is performed by performSingleClick().
struct Row : Item
{
    Row(const QString& text, const QVariant& userData)
        : Item(nullptr, vx::PopoverWidget::eifText, 1, text, text, QString())
    {
        setUserData(userData);
    }
    QVariant userData() override { return m_userData; }
    void pick() { performSingleClick(QFlags<vx::PopoverWidget::EItemPerformedFlag>()); }
};

// The arguments of all valueChangedbyPopover().
QList<QVariantList> picked(const SignalRecorder& recorder)
{
    QList<QVariantList> result;
    for (const SignalRecorder::Entry& entry : recorder.entries()) {
        if (entry.name == QLatin1String("valueChangedbyPopover")) {
            result << entry.arguments;
        }
    }
    return result;
}

struct Scene
{
    Scene()
    {
        window.resize(400, 300);
        handle = new Nubsie(QStringLiteral("handle"), 3, 0, 10, 5, &window, 1);
        handle->setSize(QSize(20, 20));
        handle->setPosition(QPointF(200, 150));
        window.show();
        (void)QTest::qWaitForWindowExposed(&window);
    }

    Controller* controller() const
    {
        const QList<Controller*> all = window.findChildren<Controller*>();
        return all.isEmpty() ? nullptr : all.first();
    }
    bool open() const { return controller() != nullptr && controller()->isActive(); }
    QString text() const
    {
        const QList<QLabel*> labels
            = controller() != nullptr ? controller()->findChildren<QLabel*>() : QList<QLabel*>();
        for (const QLabel* const label : labels) {
            if (label->text() == expected) {
                return expected;
            }
        }
        return labels.isEmpty() ? QString() : labels.first()->text();
    }

    QWidget window;
    Nubsie* handle;
    QString expected;
};
}

class TestNubsieBalloon : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { Manager::init(100); }
    void cleanupTestCase() { Manager::deleteInstance(); }

    void theBalloonShowsTheTextOfTheTrueValue();
    void aRequestedBalloonComesOnlyWhenAskedFor();
    void withoutAFeatureThereIsNoBalloon();
    void aHiddenHandleTakesItsBalloonAway();
    void hidingABalloonThatWasNeverMadeMakesNone();
    void theBalloonOfADateHandleShowsItsDate();
    void withoutBothDatesThereIsNoBalloon();
    void inIntervalModeTheBalloonShowsTheInterval();
    void inIntervalModeWithoutADifferenceNothingHappens();
    void aStepRefreshesTheBalloon();
    void aClickOpensThePopoverOfTheShownValue();
    void whatIsPickedBecomesTheValue();
    void whatAnInvertedHandleIsGivenIsTurnedRound();
    void onlyAWholeNumberCanBePicked();
    void showingTwiceTellsOnce();
    void theClosingIsTold();
    void onlyRowsInTheRangeAreVisible();
    void hidingThePopoverOnlyForbidsItems();
    void newItemsEmptyTheBalloon();
};

void TestNubsieBalloon::theBalloonShowsTheTextOfTheTrueValue()
{
    Scene scene;
    scene.handle->setBalloonTextMap({{{3}, QStringLiteral("three")}, {{7}, QStringLiteral("seven")}});
    scene.handle->setFeatures(Features(Nubsie::enfBalloon) | Nubsie::enfInverted);
    scene.handle->updateNubsie(false);
    QVERIFY(!scene.open());
    scene.handle->updateNubsie(true);
    QVERIFY(scene.open());
    scene.expected = QStringLiteral("three");
    QCOMPARE(scene.text(), scene.expected);
    scene.handle->setValue(4);
    scene.handle->updateNubsie(true);
    QVERIFY(!scene.open());
}

void TestNubsieBalloon::aRequestedBalloonComesOnlyWhenAskedFor()
{
    Scene scene;
    scene.handle->setBalloonTextMap({{{0, 10}, QStringLiteral("any")}});
    scene.handle->setFeatures(Nubsie::enfRequestedBalloon);
    scene.handle->updateNubsie(true);
    QVERIFY(!scene.open());
    scene.handle->updateBalloon();
    QVERIFY(scene.open());
    scene.handle->hideBalloon();
    QVERIFY(!scene.open());
}

void TestNubsieBalloon::withoutAFeatureThereIsNoBalloon()
{
    Scene scene;
    scene.handle->setBalloonTextMap({{{0, 10}, QStringLiteral("any")}});
    scene.handle->updateBalloon();
    QVERIFY(!scene.handle->hasController());
}

void TestNubsieBalloon::aHiddenHandleTakesItsBalloonAway()
{
    Scene scene;
    scene.handle->setBalloonTextMap({{{0, 10}, QStringLiteral("any")}});
    scene.handle->setFeatures(Nubsie::enfBalloon);
    scene.handle->updateBalloon();
    QVERIFY(scene.open());
    scene.handle->hide();
    QVERIFY(scene.open());
    scene.handle->updateBalloon();
    QVERIFY(!scene.open());
}

void TestNubsieBalloon::hidingABalloonThatWasNeverMadeMakesNone()
{
    Scene scene;
    scene.handle->hideBalloon();
    scene.handle->hide();
    scene.handle->updateBalloon();
    QVERIFY(!scene.handle->hasController());
}

void TestNubsieBalloon::theBalloonOfADateHandleShowsItsDate()
{
    Scene scene;
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    scene.handle->setStartEndDate(start, start.addSecs(1000));
    scene.handle->setFeatures(Nubsie::enfDateMode);
    scene.handle->updateNubsie(true);
    QVERIFY(scene.open());
    scene.expected = TimeUtils::formatDateTimeRelative(start.addSecs(300), true, true, true, false, false);
    QCOMPARE(scene.text(), scene.expected);
}

void TestNubsieBalloon::withoutBothDatesThereIsNoBalloon()
{
    Scene scene;
    scene.handle->setFeatures(Nubsie::enfDateMode);
    scene.handle->updateBalloon();
    QVERIFY(!scene.handle->hasController());
    scene.handle->setStartEndDate(QDateTime::currentDateTime(), QDateTime());
    scene.handle->updateBalloon();
    scene.handle->setStartEndDate(QDateTime(), QDateTime::currentDateTime());
    scene.handle->updateBalloon();
    QVERIFY(!scene.handle->hasController());
}

void TestNubsieBalloon::inIntervalModeTheBalloonShowsTheInterval()
{
    Scene scene;
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    scene.handle->setStartEndDate(start, start.addSecs(1000));
    scene.handle->setFeatures(Nubsie::enfDateMode);
    scene.handle->setAnchorTimeDiff(-61999);
    scene.handle->setDateDiffer(true);
    scene.handle->setDeltaTimeMode(true);
    QVERIFY(scene.open());
    scene.expected = TimeUtils::formatTimeInterval(-61, true);
    QCOMPARE(scene.text(), scene.expected);
    // Leaving the mode by the setter leaves the balloon as it is.
    scene.handle->setDeltaTimeMode(false);
    QCOMPARE(scene.text(), scene.expected);
}

void TestNubsieBalloon::inIntervalModeWithoutADifferenceNothingHappens()
{
    Scene scene;
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    scene.handle->setStartEndDate(start, start.addSecs(1000));
    scene.handle->setFeatures(Nubsie::enfDateMode);
    scene.handle->setDeltaTimeMode(true);
    QVERIFY(!scene.handle->hasController());
}

void TestNubsieBalloon::aStepRefreshesTheBalloon()
{
    Scene scene;
    scene.handle->setBalloonTextMap({{{4}, QStringLiteral("four")}});
    scene.handle->setFeatures(Nubsie::enfBalloon);
    ++*scene.handle;
    QVERIFY(scene.open());
    scene.expected = QStringLiteral("four");
    QCOMPARE(scene.text(), scene.expected);
    --*scene.handle;
    QVERIFY(!scene.open());
}

void TestNubsieBalloon::aClickOpensThePopoverOfTheShownValue()
{
    Scene scene;
    auto* const seven = new Row(QStringLiteral("seven"), 7);
    scene.handle->setItemMap({{{7}, seven}});
    QCOMPARE(scene.handle->itemMap().keys(), QList<vx::ValueRange>({vx::ValueRange(7)}));
    scene.handle->showValuePopover();
    QVERIFY(!scene.open());
    scene.handle->setFeatures(Nubsie::enfInverted);
    scene.handle->showValuePopover();
    QVERIFY(scene.open());
    QVERIFY(seven->isVisible());
}

void TestNubsieBalloon::whatIsPickedBecomesTheValue()
{
    Scene scene;
    auto* const three = new Row(QStringLiteral("three"), 3);
    auto* const eight = new Row(QStringLiteral("eight"), 8);
    scene.handle->setItemMap({{{3}, three}, {{8}, eight}});
    scene.handle->showValuePopover();
    SignalRecorder recorder(scene.handle);
    eight->pick();
    QCOMPARE(picked(recorder), QList<QVariantList>({{8}}));
    QCOMPARE(recorder.count(QStringLiteral("valueChanged")), 0);
    QCOMPARE(scene.handle->value(), 8);
    QCOMPARE(scene.handle->getDisplayValue(), 0.3);
}

void TestNubsieBalloon::whatAnInvertedHandleIsGivenIsTurnedRound()
{
    Scene scene;
    scene.handle->setFeatures(Nubsie::enfInverted);
    auto* const seven = new Row(QStringLiteral("seven"), 7);
    auto* const nine = new Row(QStringLiteral("nine"), 9);
    scene.handle->setItemMap({{{7}, seven}, {{9}, nine}});
    scene.handle->showValuePopover();
    SignalRecorder recorder(scene.handle);
    nine->pick();
    QCOMPARE(scene.handle->value(true), 1);
    QCOMPARE(scene.handle->value(), 9);
    QCOMPARE(picked(recorder), QList<QVariantList>({{1}}));
}

void TestNubsieBalloon::onlyAWholeNumberCanBePicked()
{
    for (const QVariant& data :
        {QVariant(QStringLiteral("8")), QVariant(8.0), QVariant(8u), QVariant(qint64(8)), QVariant()}) {
        Scene scene;
        auto* const row = new Row(QStringLiteral("row"), data);
        scene.handle->setItemMap({{{3}, row}});
        scene.handle->showValuePopover();
        SignalRecorder recorder(scene.handle);
        row->pick();
        QCOMPARE(recorder.count(QStringLiteral("valueChangedbyPopover")), 0);
        QCOMPARE(scene.handle->value(), 3);
    }
}

void TestNubsieBalloon::showingTwiceTellsOnce()
{
    Scene scene;
    auto* const three = new Row(QStringLiteral("three"), 3);
    scene.handle->setItemMap({{{3}, three}});
    scene.handle->showValuePopover();
    scene.handle->showValuePopover();
    SignalRecorder recorder(scene.handle);
    three->pick();
    QCOMPARE(recorder.count(QStringLiteral("valueChangedbyPopover")), 1);
    QCOMPARE(recorder.count(QStringLiteral("valuePopoverClosing")), 1);
}

void TestNubsieBalloon::theClosingIsTold()
{
    Scene scene;
    auto* const three = new Row(QStringLiteral("three"), 3);
    scene.handle->setItemMap({{{3}, three}});
    scene.handle->showValuePopover();
    SignalRecorder recorder(scene.handle);
    scene.handle->hideBalloon();
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("valuePopoverClosing")));
}

void TestNubsieBalloon::onlyRowsInTheRangeAreVisible()
{
    Scene scene;
    auto* const three = new Row(QStringLiteral("three"), 3);
    auto* const ten = new Row(QStringLiteral("ten"), 10);
    auto* const eleven = new Row(QStringLiteral("eleven"), 11);
    scene.handle->setItemMap({{{3}, three}, {{10}, ten}, {{9, 11}, eleven}});
    scene.handle->showValuePopover();
    QVERIFY(three->isVisible());
    QVERIFY(ten->isVisible());
    QVERIFY(!eleven->isVisible());
}

void TestNubsieBalloon::hidingThePopoverOnlyForbidsItems()
{
    Scene scene;
    auto* const three = new Row(QStringLiteral("three"), 3);
    scene.handle->setItemMap({{{3}, three}});
    scene.handle->setFeatures(Nubsie::enfRequestedBalloon);
    scene.handle->showValuePopover();
    scene.handle->hideValuePopover();
    QVERIFY(scene.open());
    scene.handle->hideBalloon();
    scene.handle->updateBalloon();
    QVERIFY(!scene.open());
    scene.handle->showValuePopover();
    QVERIFY(scene.open());
}

void TestNubsieBalloon::newItemsEmptyTheBalloon()
{
    Scene scene;
    const QPointer<Row> three(new Row(QStringLiteral("three"), 3));
    scene.handle->setItemMap({{{3}, three.data()}});
    scene.handle->showValuePopover();
    QVERIFY(!three.isNull());
    auto* const other = new Row(QStringLiteral("other"), 3);
    scene.handle->setItemMap({{{3}, other}});
    QTRY_VERIFY(three.isNull());
    scene.handle->showValuePopover();
    QVERIFY(other->isVisible());
}

ZELKOV_TEST_MAIN(TestNubsieBalloon)
#include "tst_nubsieballoon.moc"
