// SPDX-License-Identifier: MIT
// What a handle knows: its number, value, range, dates and features.
#include "NubsieScene.h"
#include "sliders/Nubsie.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMetaProperty>
#include <QtTest/QtTest>

#include <climits>
#include <memory>

using nubsietest::picture;
using vx::Nubsie;
using zelkovtest::SignalRecorder;

namespace
{
using Features = QFlags<Nubsie::ENubsieFeatures>;

std::unique_ptr<Nubsie> makeNubsie(int value = 3, int minimum = 0, int maximum = 10, int defaultValue = 5)
{
    return std::make_unique<Nubsie>(QStringLiteral("handle"), value, minimum, maximum, defaultValue, nullptr, 7);
}
}

class TestNubsie : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNumbersAreTheOnesThatClientsCompare();
    void theTypeOfTheNumberIsRegistered();
    void aNewHandleHasItsDefaults();
    void aHandleFromAParentAloneHasNoSensibleValue();
    void numbersAreTakenOrHandedOut();
    void signalsAndSlotsStandInTheirOrder();
    void everyPropertyReadsWhatWasWritten();
    void theMouseGoesThrough();
    void theValueComesFromThePlaceOnTheScale();
    void aRangeOfOneValueHasItsValueAtTheEnd();
    void settingAValueHoldsItInTheRangeAndTellsIt();
    void settingTheSameValueTellsItToo();
    void settingAValueSilentlyTellsNothing();
    void settingAValueWithoutDisplayLeavesItWhereItIsDrawn();
    void settingAValueRemembersThePreviousOne();
    void settingThePlaceRemembersThePreviousValueAndTellsNothing();
    void rangeSettersOnlyStore();
    void steppingUpGoesAroundAtZeroAndIsHeldInTheRange();
    void steppingDownGoesAroundAtTheMaximum();
    void aStepTellsTheValueOnce();
    void resettingGoesToTheDefault();
    void anInvertedHandleShowsTheOtherEnd();
    void featuresByValueComeFromTheFirstRange();
    void featuresByValueTakeFlagsAsWell();
    void draggableAndMoveableAreReadAsSet();
    void stateIsKeptAsBits();
    void datesStandForValues();
    void settingTheEndsMovesNothing();
    void aDateOutsideIsHeld();
    void aDateIsLocalAndFollowsTheTrueValue();
    void aDateWithoutASpanHarmsNobody();
    void aHandleMayDieInItsOwnSignal_data();
    void aHandleMayDieInItsOwnSignal();
};

void TestNubsie::theNumbersAreTheOnesThatClientsCompare()
{
    QCOMPARE(int(Nubsie::enfDraggable), 0x1);
    QCOMPARE(int(Nubsie::enfMoveable), 0x2);
    QCOMPARE(int(Nubsie::enfValueBadge), 0x4);
    QCOMPARE(int(Nubsie::enfLiveDrag), 0x8);
    QCOMPARE(int(Nubsie::enfBalloon), 0x10);
    QCOMPARE(int(Nubsie::enfRequestedBalloon), 0x20);
    QCOMPARE(int(Nubsie::enfDateMode), 0x40);
    QCOMPARE(int(Nubsie::enfResetOnDoubleClick), 0x80);
    QCOMPARE(int(Nubsie::enfResetOnRelease), 0x100);
    QCOMPARE(int(Nubsie::enfLongClick), 0x200);
    QCOMPARE(int(Nubsie::enfHoldAfterLongClick), 0x400);
    QCOMPARE(int(Nubsie::enfStepOnClick), 0x800);
    QCOMPARE(int(Nubsie::enfStepOnFlick), 0x1000);
    QCOMPARE(int(Nubsie::enfDiscreteSteps), 0x2000);
    QCOMPARE(int(Nubsie::enfInverted), 0x4000);
    QCOMPARE(int(Nubsie::enfValuePopover), 0x8000);
    QCOMPARE(Nubsie::s_InvalidNubsieID, -1);
    QCOMPARE(Nubsie::s_DefaultBlinkDuration, 1500u);
    QCOMPARE(Nubsie::s_LongClickMaxMoveThreshold, 30u);
}

void TestNubsie::theTypeOfTheNumberIsRegistered()
{
    QCOMPARE(Nubsie::qMetaTypes, QMetaType::type("vx::NubsieID"));
    QCOMPARE(Nubsie::qMetaTypes, int(QMetaType::Int));
}

void TestNubsie::aNewHandleHasItsDefaults()
{
    const auto nubsie = makeNubsie();
    QCOMPARE(nubsie->objectName(), QStringLiteral("handle"));
    QCOMPARE(nubsie->id(), 7);
    QCOMPARE(nubsie->minimum(), 0);
    QCOMPARE(nubsie->maximum(), 10);
    QCOMPARE(nubsie->defaultValue(), 5);
    QCOMPARE(nubsie->value(), 3);
    QCOMPARE(nubsie->normalizedValue(), 0.3);
    QCOMPARE(nubsie->getDisplayValue(), 0.3);
    QCOMPARE(nubsie->previousValue(), 0);
    QCOMPARE(int(nubsie->features()), 0xB);
    QCOMPARE(int(nubsie->getState()), 0);
    QVERIFY(!nubsie->getSize().isValid());
    QVERIFY(!nubsie->getDraggedSize().isValid());
    QVERIFY(!nubsie->getCurrentSize().isValid());
    QCOMPARE(nubsie->getPosition(), QPointF());
    QVERIFY(nubsie->icon().isNull());
    QVERIFY(nubsie->iconRed().isNull());
    QVERIFY(nubsie->text().isEmpty());
    QVERIFY(nubsie->toolTipText().isEmpty());
    QVERIFY(nubsie->itemMap().isEmpty());
    QVERIFY(!nubsie->getStartDate().isValid());
    QVERIFY(!nubsie->getEndDate().isValid());
    QCOMPARE(nubsie->getGlowOpacity(), 0.0);
    QVERIFY(!nubsie->isBlinking());
    QVERIFY(!nubsie->isMaximized());
    QVERIFY(!nubsie->deltaTimeMode());
    QVERIFY(!nubsie->dateDiffer());
    QCOMPARE(nubsie->anchorTimeDiff(), qint64(0));
    QVERIFY(!nubsie->clickOrLongClickOccured());
    QVERIFY(nubsie->externallyVisible());
    QVERIFY(!nubsie->hasController());
}

void TestNubsie::aHandleFromAParentAloneHasNoSensibleValue()
{
    const Nubsie nubsie(static_cast<QWidget*>(nullptr));
    QVERIFY(nubsie.objectName().isEmpty());
    QCOMPARE(nubsie.defaultValue(), -1);
    QCOMPARE(nubsie.maximum(), INT_MAX);
    QCOMPARE(nubsie.minimum(), INT_MIN);
    QCOMPARE(nubsie.normalizedValue(), 2147483648.0);
    QCOMPARE(nubsie.getDisplayValue(), 2147483648.0);
    QCOMPARE(nubsie.value(), INT_MAX);
}

void TestNubsie::numbersAreTakenOrHandedOut()
{
    QCOMPARE(Nubsie(QString(), 0, 0, 1, 0, nullptr, 0).id(), 0);
    QCOMPARE(Nubsie(QString(), 0, 0, 1, 0, nullptr, 12).id(), 12);
    const int first = Nubsie(QString(), 0, 0, 1, 0, nullptr).id();
    QVERIFY(first >= 0);
    QCOMPARE(Nubsie(QString(), 0, 0, 1, 0, nullptr, -9).id(), first + 1);
    QCOMPARE(Nubsie(static_cast<QWidget*>(nullptr)).id(), first + 2);
}

void TestNubsie::signalsAndSlotsStandInTheirOrder()
{
    const QMetaObject& meta = Nubsie::staticMetaObject;
    QStringList found;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        if (!(meta.method(i).attributes() & QMetaMethod::Cloned)) {
            found << QString::fromLatin1(meta.method(i).methodSignature());
        }
    }
    const QStringList expected {QStringLiteral("valueChangedbyPopover(int)"), QStringLiteral("valueChanged(int)"),
        QStringLiteral("dragSizeChanged(Nubsie*,QSize)"), QStringLiteral("valuePopoverClosing()"),
        QStringLiteral("getCurrentSize()"), QStringLiteral("setCurrentSize(QSize)"),
        QStringLiteral("getPosition()"), QStringLiteral("setPosition(QPointF)"), QStringLiteral("updateBalloon()"),
        QStringLiteral("hideBalloon()"), QStringLiteral("startBlinking(int)"), QStringLiteral("stopBlinking()"),
        QStringLiteral("isBlinking()"), QStringLiteral("performLongClick()"), QStringLiteral("performClick()"),
        QStringLiteral("performDrag()"), QStringLiteral("performDragAction()"),
        QStringLiteral("performDoubleClick()"), QStringLiteral("performPress()"),
        QStringLiteral("performRelease(QPoint)"), QStringLiteral("clearClickOrLongClickOccured()"),
        QStringLiteral("setVisible(bool)"),
        QStringLiteral("handlePopoverAction(int,QVariant,QVariant,vx::PopoverWidget::EItemPerformedFlags)")};
    QCOMPARE(found, expected);
}

void TestNubsie::everyPropertyReadsWhatWasWritten()
{
    const auto nubsie = makeNubsie();
    const QPixmap icon = picture(Qt::blue);
    const QPixmap red = picture(Qt::red);
    const QList<QPair<const char*, QVariant>> values {{"currentSize", QSize(12, 14)}, {"defaultValue", 9},
        {"maximum", 20}, {"minimum", 1}, {"value", 8}, {"icon", icon}, {"icon_red", red},
        {"draggedSize", QSize(40, 41)}, {"size", QSize(20, 21)}, {"position", QPointF(3.5, 4.5)},
        {"glowOpacity", 0.5}};
    for (const auto& entry : values) {
        QVERIFY2(nubsie->setProperty(entry.first, entry.second), entry.first);
        if (entry.second.userType() == QMetaType::QPixmap) {
            QCOMPARE(nubsie->property(entry.first).value<QPixmap>().cacheKey(),
                entry.second.value<QPixmap>().cacheKey());
        } else {
            QCOMPARE(nubsie->property(entry.first), entry.second);
        }
    }
    const QMetaObject& meta = Nubsie::staticMetaObject;
    QStringList names;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        names << QString::fromLatin1(meta.property(i).name());
    }
    QCOMPARE(names.join(QLatin1Char(' ')),
        QStringLiteral(
            "currentSize value defaultValue maximum minimum icon icon_red size draggedSize position glowOpacity"));
}

void TestNubsie::theMouseGoesThrough()
{
    QVERIFY(makeNubsie()->testAttribute(Qt::WA_TransparentForMouseEvents));
}

void TestNubsie::theValueComesFromThePlaceOnTheScale()
{
    const auto nubsie = makeNubsie(0, 0, 10);
    nubsie->setDisplayValue(0.9);
    QCOMPARE(nubsie->value(), 0);
    nubsie->setNormalizedValue(0.44);
    QCOMPARE(nubsie->value(), 4);
    nubsie->setNormalizedValue(0.45);
    QCOMPARE(nubsie->value(), 5);
    QCOMPARE(nubsie->getDisplayValue(), 0.9);
}

void TestNubsie::aRangeOfOneValueHasItsValueAtTheEnd()
{
    const auto nubsie = makeNubsie(0, 0, 0);
    QCOMPARE(nubsie->normalizedValue(), 1.0);
    QCOMPARE(nubsie->value(), 0);
}

void TestNubsie::settingAValueHoldsItInTheRangeAndTellsIt()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->setValue(11);
    nubsie->setValue(-1);
    nubsie->setValue(4);
    QCOMPARE(recorder.names(),
        QStringList(
            {QStringLiteral("valueChanged"), QStringLiteral("valueChanged"), QStringLiteral("valueChanged")}));
    QCOMPARE(recorder.entries().at(0).arguments, QVariantList({10}));
    QCOMPARE(recorder.entries().at(1).arguments, QVariantList({0}));
    QCOMPARE(recorder.entries().at(2).arguments, QVariantList({4}));
    QCOMPARE(nubsie->getDisplayValue(), 0.4);
}

void TestNubsie::settingTheSameValueTellsItToo()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->setValue(3);
    QCOMPARE(recorder.count(QStringLiteral("valueChanged")), 1);
}

void TestNubsie::settingAValueSilentlyTellsNothing()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->setValue(8, false);
    QVERIFY(recorder.entries().isEmpty());
    QCOMPARE(nubsie->value(), 8);
    QCOMPARE(nubsie->getDisplayValue(), 0.8);
}

void TestNubsie::settingAValueWithoutDisplayLeavesItWhereItIsDrawn()
{
    const auto nubsie = makeNubsie();
    nubsie->setValue(8, true, false);
    QCOMPARE(nubsie->getDisplayValue(), 0.3);
    QCOMPARE(nubsie->normalizedValue(), 0.8);
}

void TestNubsie::settingAValueRemembersThePreviousOne()
{
    const auto nubsie = makeNubsie();
    nubsie->setValue(8);
    QCOMPARE(nubsie->previousValue(), 3);
    nubsie->setValue(8);
    QCOMPARE(nubsie->previousValue(), 8);
}

void TestNubsie::settingThePlaceRemembersThePreviousValueAndTellsNothing()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->setNormalizedValue(0.62);
    QCOMPARE(nubsie->previousValue(), 3);
    QCOMPARE(nubsie->value(), 6);
    QCOMPARE(nubsie->normalizedValue(), 0.62);
    QVERIFY(recorder.entries().isEmpty());
}

void TestNubsie::rangeSettersOnlyStore()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->setRange(100, 200);
    QCOMPARE(nubsie->minimum(), 100);
    QCOMPARE(nubsie->maximum(), 200);
    QCOMPARE(nubsie->normalizedValue(), 0.3);
    QCOMPARE(nubsie->value(), 130);
    nubsie->setMaximum(300);
    QCOMPARE(nubsie->value(), 160);
    nubsie->setMinimum(0);
    QCOMPARE(nubsie->value(), 90);
    nubsie->setDefaultValue(4000);
    QCOMPARE(nubsie->defaultValue(), 4000);
    QVERIFY(recorder.entries().isEmpty());
}

void TestNubsie::steppingUpGoesAroundAtZeroAndIsHeldInTheRange()
{
    const auto nubsie = makeNubsie(9, 5, 10);
    QCOMPARE((++*nubsie).value(), 10);
    QCOMPARE((++*nubsie).value(), 5);
    nubsie->setRange(-5, 10);
    nubsie->setValue(10);
    QCOMPARE((++*nubsie).value(), 0);
    nubsie->setRange(-3, -1);
    nubsie->setValue(-2);
    QCOMPARE((++*nubsie).value(), -1);
}

void TestNubsie::steppingDownGoesAroundAtTheMaximum()
{
    const auto nubsie = makeNubsie(6, 5, 10);
    QCOMPARE((--*nubsie).value(), 5);
    QCOMPARE((--*nubsie).value(), 10);
}

void TestNubsie::aStepTellsTheValueOnce()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    ++*nubsie;
    --*nubsie;
    QCOMPARE(recorder.entries().size(), 2);
    QCOMPARE(recorder.entries().at(0).arguments, QVariantList({4}));
    QCOMPARE(recorder.entries().at(1).arguments, QVariantList({3}));
}

void TestNubsie::resettingGoesToTheDefault()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    nubsie->reset();
    QCOMPARE(nubsie->value(), 5);
    QCOMPARE(nubsie->getDisplayValue(), 0.5);
    QCOMPARE(recorder.count(QStringLiteral("valueChanged")), 1);
}

void TestNubsie::anInvertedHandleShowsTheOtherEnd()
{
    const auto nubsie = makeNubsie();
    nubsie->setFeatures(nubsie->features() | Nubsie::enfInverted);
    QCOMPARE(nubsie->value(), 7);
    QCOMPARE(nubsie->value(false), 7);
    QCOMPARE(nubsie->value(true), 3);
    SignalRecorder recorder(nubsie.get());
    nubsie->setValue(2);
    QCOMPARE(recorder.entries().at(0).arguments, QVariantList({2}));
    QCOMPARE(nubsie->value(), 8);
    // Features by value have no say in it.
    nubsie->setFeatureMap({{{0, 10}, Nubsie::enfDraggable}});
    QCOMPARE(nubsie->value(), 8);
}

void TestNubsie::featuresByValueComeFromTheFirstRange()
{
    const auto nubsie = makeNubsie();
    nubsie->setFeatures(Features(Nubsie::enfDraggable));
    nubsie->setFeatureMap({{{4, 6}, Nubsie::enfLongClick}, {{2, 5}, Nubsie::enfDateMode}});
    QCOMPARE(nubsie->getCurrentFeature(), Features(Nubsie::enfDateMode));
    QCOMPARE(nubsie->getFeatureFromValue(5), Features(Nubsie::enfDateMode));
    QCOMPARE(nubsie->getFeatureFromValue(6), Features(Nubsie::enfLongClick));
    QCOMPARE(nubsie->getFeatureFromValue(7), Features(Nubsie::enfDraggable));
    QCOMPARE(nubsie->getFeatureFromValue(1), Features(Nubsie::enfDraggable));
    QCOMPARE(nubsie->features(), Features(Nubsie::enfDraggable));
}

void TestNubsie::featuresByValueTakeFlagsAsWell()
{
    const auto nubsie = makeNubsie();
    QMap<vx::ValueRange, Features> map;
    map.insert({3}, Nubsie::enfLongClick | Nubsie::enfStepOnClick);
    nubsie->setFeatureMap(map);
    QCOMPARE(nubsie->getCurrentFeature(), Nubsie::enfLongClick | Nubsie::enfStepOnClick);
}

void TestNubsie::draggableAndMoveableAreReadAsSet()
{
    const auto nubsie = makeNubsie();
    QVERIFY(nubsie->isDraggable());
    QVERIFY(nubsie->isMoveable());
    nubsie->setFeatureMap({{{0, 10}, Nubsie::enfLongClick}});
    QVERIFY(nubsie->isDraggable());
    QVERIFY(nubsie->isMoveable());
    nubsie->setFeatures(Features(Nubsie::enfLiveDrag));
    nubsie->setFeatureMap({{{0, 10}, Nubsie::enfDraggable}});
    QVERIFY(!nubsie->isDraggable());
    QVERIFY(!nubsie->isMoveable());
}

void TestNubsie::stateIsKeptAsBits()
{
    const auto nubsie = makeNubsie();
    using States = QFlags<Nubsie::ENubsieState>;
    nubsie->setState(States(QFlag(6)));
    nubsie->addState(States(QFlag(8)));
    QCOMPARE(int(nubsie->getState()), 14);
    nubsie->unsetState(States(QFlag(5)));
    QCOMPARE(int(nubsie->getState()), 10);
    nubsie->setState(Nubsie::ensNone);
    QCOMPARE(int(nubsie->getState()), 0);
}

void TestNubsie::datesStandForValues()
{
    const auto nubsie = makeNubsie(0, 0, 4);
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    nubsie->setStartEndDate(start, start.addMSecs(1000));
    SignalRecorder recorder(nubsie.get());
    nubsie->setDate(start.addMSecs(749));
    QCOMPARE(nubsie->value(), 2);
    QCOMPARE(nubsie->getDisplayValue(), 0.5);
    nubsie->setDate(start.addMSecs(750));
    QCOMPARE(nubsie->value(), 3);
    QCOMPARE(recorder.names(), QStringList({QStringLiteral("valueChanged"), QStringLiteral("valueChanged")}));
}

void TestNubsie::settingTheEndsMovesNothing()
{
    const auto nubsie = makeNubsie();
    SignalRecorder recorder(nubsie.get());
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    nubsie->setStartEndDate(start, start.addDays(1));
    QCOMPARE(nubsie->getStartDate(), start);
    QCOMPARE(nubsie->getEndDate(), start.addDays(1));
    QCOMPARE(nubsie->normalizedValue(), 0.3);
    QVERIFY(recorder.entries().isEmpty());
}

void TestNubsie::aDateOutsideIsHeld()
{
    const auto nubsie = makeNubsie();
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    nubsie->setStartEndDate(start, start.addDays(1));
    nubsie->setDate(start.addYears(1000));
    QCOMPARE(nubsie->value(), 10);
    nubsie->setDate(start.addDays(-1));
    QCOMPARE(nubsie->value(), 0);
}

void TestNubsie::aDateIsLocalAndFollowsTheTrueValue()
{
    const auto nubsie = makeNubsie();
    const QDateTime start(QDate(2020, 5, 1), QTime(0, 0), Qt::UTC);
    nubsie->setStartEndDate(start, start.addMSecs(1001));
    nubsie->setNormalizedValue(0.5);
    nubsie->setDisplayValue(0.9);
    QCOMPARE(nubsie->getDate().toMSecsSinceEpoch(), start.addMSecs(500).toMSecsSinceEpoch());
    QCOMPARE(nubsie->getDate().timeSpec(), Qt::LocalTime);
}

void TestNubsie::aDateWithoutASpanHarmsNobody()
{
    const auto nubsie = makeNubsie();
    nubsie->setDate(QDateTime::currentDateTime());
    QVERIFY(nubsie->value() >= 0 && nubsie->value() <= 10);
    nubsie->setDate(QDateTime());
    const QDateTime now = QDateTime::currentDateTime();
    nubsie->setStartEndDate(now, now);
    nubsie->setDate(now);
    QCOMPARE(nubsie->value(), 0);
    QCOMPARE(nubsie->getDate(), now);
}

void TestNubsie::aHandleMayDieInItsOwnSignal_data()
{
    QTest::addColumn<int>("what");
    QTest::newRow("step up") << 0;
    QTest::newRow("step down") << 1;
    QTest::newRow("drag") << 2;
    QTest::newRow("date") << 3;
}

void TestNubsie::aHandleMayDieInItsOwnSignal()
{
    QFETCH(int, what);
    QPointer<Nubsie> nubsie = makeNubsie().release();
    connect(nubsie, &Nubsie::valueChanged, this, [nubsie] { delete nubsie.data(); });
    switch (what) {
    case 0:
        ++*nubsie;
        break;
    case 1:
        --*nubsie;
        break;
    case 2:
        nubsie->setNormalizedValue(0.9);
        QVERIFY(nubsie->performDragAction());
        break;
    default:
        nubsie->setDate(QDateTime::currentDateTime());
    }
    QVERIFY(nubsie.isNull());
}

ZELKOV_TEST_MAIN(TestNubsie)
#include "tst_nubsie.moc"
