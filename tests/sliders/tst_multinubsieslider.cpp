// SPDX-License-Identifier: MIT
// The model of a slider with several handles: ids, values, layout in the window, stacking, and what it does as a
// widget.
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "TimeLineScene.h"

#include <QtGui/QContextMenuEvent>
#include <QtWidgets/QApplication>

#include <limits>

using timelinetest::list;
using timelinetest::Scene;
using vx::MultiNubsieSlider;
using vx::Nubsie;

namespace
{
// Where the handle is, by its middle.
QPoint seenAt(const Nubsie* nubsie)
{
    return nubsie->pos() + QPoint(nubsie->width() / 2, nubsie->height() / 2);
}

QVector<double> drawn(const Scene& scene, std::initializer_list<int> ids)
{
    QVector<double> result;
    for (const int id : ids) {
        result << scene.drawn(id);
    }
    return result;
}

bool near(const QVector<double>& a, const QVector<double>& b)
{
    return std::equal(
        a.begin(), a.end(), b.begin(), b.end(), [](double x, double y) { return qAbs(x - y) < 1e-12; });
}

// The handles among the children of the window, the lowest first.
QList<int> stack(const QWidget& window)
{
    QList<int> result;
    for (const QObject* child : window.children()) {
        if (const auto* const nubsie = qobject_cast<const Nubsie*>(child)) {
            result << nubsie->id();
        }
    }
    return result;
}
}

class TestMultiNubsieSlider : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void startsAsDocumented();
    void signalsSlotsAndPropertiesKeepTheirOrder();

    // Handles
    void anIdIsTakenOnce();
    void theDefaultIsTheMiddleWhateverIsGiven();
    void handlesAreChildrenOfTheWindow();
    void aHandleOfOnesOwnIsAdopted();
    void removedHandlesAreGone();
    void anUnknownIdIsIgnored();
    void handlesGoWithTheSliderIfItHasAnotherWindow();
    void handlesStayBehindOtherwise();

    // Values
    void setValueReportsIfAsked();
    void settingTheSameValueDoesNothing();
    void setValuesSetsRangeValueAndDefault();
    void setRangeClampsAndReports();
    void datesAreMappedToValues();
    void aDateDifferenceNeedsADateHandleAndATime();
    void featuresGoToTheHandle();
    void looksGoToTheHandle();
    void blinking();

    // Layout
    void handlesStandOnTheBar();
    void verticalHandlesStandFromTheBottom();
    void closeHandlesArePushedApart();
    void aNewValuePushesItsNeighboursOnly();
    void aHiddenHandleTakesNoPlace();
    void nothingIsLaidOutWhileHidden();
    void handlesOfDifferentSizesShareTheScale();
    void handlesFollowAResizeNowAndLater();
    void handlesFollowAMove();
    void repaintQueuedLaysOutLater();
    void animatedLayoutMovesSlowly();
    void aHandleOnItsWayGoesToTheNewPlace();
    void aSliderThatIsTooShortKeepsItsHandles();
    void manyHandles();

    // Stacking
    void handlesStackAsTold();
    void aRivalLetsTheOneInUseGoOnTop();

    // As a widget
    void handlesShowAndHideWithTheSlider();
    void hiddenHandlesStayHidden();
    void handlesAreDisabledWithTheSlider();
    void opacityIsStoredAndFades();
    void progressIsHeldBetweenZeroAndOne();
    void contextMenusDoNotComeUp();
    void aClientMayEmitTheValueSignal();
};

void TestMultiNubsieSlider::startsAsDocumented()
{
    MultiNubsieSlider slider;
    QCOMPARE(slider.getFeatures(), QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>(QFlag(0x0C)));
    QCOMPARE(slider.orientation(), Qt::Horizontal);
    QCOMPARE(slider.sliderBarExtent(), 5.0);
    QCOMPARE(slider.getOpacity(), 1.0);
    QVERIFY(!slider.getDrawTrack());
    QCOMPARE(slider.getProgressColor(), QColor(Qt::yellow));
    QCOMPARE(slider.getProgress(), 0.0);
    QVERIFY(slider.getNubsies().isEmpty());
    QVERIFY(!slider.hasMouseTracking());
    QCOMPARE(MultiNubsieSlider::s_SliderBarPadding, 0);
    QCOMPARE(MultiNubsieSlider::s_NubsieTextMargin, 4);
    QCOMPARE(MultiNubsieSlider::s_NubsieMargin, 0);
    QCOMPARE(MultiNubsieSlider::s_SlidingAccuracyShearing, 50);
    QCOMPARE(MultiNubsieSlider::s_SlidingAccuracyBorder, 25);
    QCOMPARE(MultiNubsieSlider::s_FlagLongPressThreshold, 1000u);
    QCOMPARE(MultiNubsieSlider::s_OpacityFadeValue, 0.25);
    QCOMPARE(int(MultiNubsieSlider::emfJumpOnTrackClick), 0x20);
    QCOMPARE(int(MultiNubsieSlider::efcGray), 2);
    const QList<QTimer*> timers = slider.findChildren<QTimer*>();
    QCOMPARE(timers.size(), 2);
    for (const QTimer* timer : timers) {
        QVERIFY(timer->isSingleShot() && !timer->isActive());
    }
}

void TestMultiNubsieSlider::signalsSlotsAndPropertiesKeepTheirOrder()
{
    const QMetaObject& meta = MultiNubsieSlider::staticMetaObject;
    QStringList names;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        const QString name = QString::fromLatin1(meta.method(i).name());
        // Default arguments and invocables make further entries.
        if (names.isEmpty() || names.constLast() != name) {
            names << name;
        }
    }
    QCOMPARE(names,
        list({"nubsieValueChanged", "nubsieValueChangedByUser", "nubsieDragStarted", "nubsieDragEnded",
            "triggerNubsieRepaintQueued", "firstFlagClicked", "secondFlagClicked", "firstFlagLongClicked",
            "secondFlagLongClicked", "firstFlagRightClicked", "secondFlagRightClicked", "firstFlagDoubleClicked",
            "secondFlagDoubleClicked", "hideNubsieBalloons", "repaintNubsiesQueued", "raiseNubsies",
            "raiseNubsieOnSlider", "stackNubsiesUnder", "stackNubsiesOver", "raiseNubsieOverRivals",
            "repaintNubsiesImmediately", "updateNubsiePositions", "nubsieValueChanged", "dragSizeChanged",
            "setActiveOpacity", "setInActiveOpacity", "handleResize", "longClickEvent", "flagLongClickEvent",
            "startLongClickTimer", "stopLongClickTimer", "startFlagLongClickTimer", "stopFlagLongClickTimer",
            "nubsiePopoverClosing", "singleClickPerformed"}));
    QStringList properties;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        properties << QString::fromLatin1(meta.property(i).name());
    }
    QCOMPARE(properties, list({"opacityFactor", "orientation", "sliderBarExtent", "drawTrack", "progressColor"}));
    QCOMPARE(
        meta.method(meta.methodOffset()).methodSignature(), QByteArray("nubsieValueChanged(vx::NubsieID,int)"));
}

// --- Handles
// -----------------------------------------------------------------------------------------------------

void TestMultiNubsieSlider::anIdIsTakenOnce()
{
    Scene scene;
    QCOMPARE(scene.slider->addNubsie(QStringLiteral("a"), 1, 0, 10, 3), 3);
    QCOMPARE(scene.slider->addNubsie(QStringLiteral("b"), 2, 0, 10, 3), -1);
    QCOMPARE(scene.slider->addNubsie(QStringLiteral("c"), 2, 0, 10, -2), -1);
    QCOMPARE(scene.slider->addNubsie(QStringLiteral("d"), 2, 0, 10, 0), 0);
    QCOMPARE(scene.slider->getNubsies().size(), 2);
    QCOMPARE(scene.slider->value(3), 1);
    QCOMPARE(scene.slider->nubsie(3)->objectName(), QStringLiteral("a"));
    QVERIFY(scene.slider->nubsieExists(0));
    QVERIFY(!scene.slider->nubsieExists(1));
}

void TestMultiNubsieSlider::theDefaultIsTheMiddleWhateverIsGiven()
{
    Scene scene;
    scene.slider->addNubsie(QStringLiteral("a"), 10, 0, 100, 7, 1);
    QCOMPARE(scene.slider->nubsie(1)->defaultValue(), 50);
    scene.slider->addNubsie(QStringLiteral("b"), 10, 0, 5, 2);
    QCOMPARE(scene.slider->nubsie(2)->defaultValue(), 3);
    scene.slider->addNubsie(QStringLiteral("c"), 0, -5, 0, 3);
    QCOMPARE(scene.slider->nubsie(3)->defaultValue(), 0 - 2);
    const int lowest = std::numeric_limits<int>::min();
    scene.slider->addNubsie(QStringLiteral("d"), 0, lowest, std::numeric_limits<int>::max(), 4);
    QCOMPARE(scene.slider->nubsie(4)->defaultValue(), 0);
    scene.slider->setDefaultValues(1, 8);
    QCOMPARE(scene.slider->nubsie(1)->defaultValue(), 8);
}

void TestMultiNubsieSlider::handlesAreChildrenOfTheWindow()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    QCOMPARE(handle->parentWidget(), &scene.host);
    MultiNubsieSlider alone;
    alone.addNubsie(QStringLiteral("a"), 1, 0, 10, 1);
    QCOMPARE(alone.nubsie(1)->parentWidget(), &alone);
}

void TestMultiNubsieSlider::aHandleOfOnesOwnIsAdopted()
{
    Scene scene;
    scene.add(1, 20);
    scene.show();
    auto* const mine = new Nubsie(QStringLiteral("mine"), 150, 0, 200, 3, &scene.host, 9);
    mine->setSize(QSize(20, 20));
    scene.slider->addNubsie(mine);
    QCOMPARE(scene.slider->nubsie(9), mine);
    QVERIFY(mine->isVisible());
    // Under those that are there, and laid out one turn of the loop later.
    QCOMPARE(stack(scene.host), (QList<int> {9, 1}));
    QVERIFY(seenAt(mine) != QPoint(260, 249));
    QCoreApplication::processEvents();
    QCOMPARE(seenAt(mine), QPoint(260, 249));
    mine->setValue(100, true, true);
    QCOMPARE(scene.journal.lines, list({"changed 9 100"}));
    scene.slider->addNubsie(static_cast<Nubsie*>(nullptr));
    QCOMPARE(scene.slider->getNubsies().size(), 2);
}

void TestMultiNubsieSlider::removedHandlesAreGone()
{
    Scene scene;
    const QPointer<Nubsie> one = scene.add(1, 20);
    const QPointer<Nubsie> two = scene.add(2, 100);
    const QPointer<Nubsie> three = scene.add(3, 180);
    scene.slider->removeNubsie(2);
    QVERIFY(!two);
    QCOMPARE(scene.slider->getNubsies(), (QList<QPointer<Nubsie>> {one, three}));
    scene.slider->removeAllNubsies();
    QVERIFY(!one && !three);
    QVERIFY(scene.slider->getNubsies().isEmpty());

    // One that somebody else deletes is passed over.
    Nubsie* const last = scene.add(4, 20);
    scene.add(5, 100);
    scene.show();
    delete last;
    scene.slider->updateNubsiePositions(true);
    scene.slider->raiseNubsies();
    scene.slider->hideNubsieBalloons();
    scene.slider->stackNubsiesOver(&scene.host);
    scene.slider->cancelAnimations();
    scene.slider->setNubsiesVisible(true);
    QVERIFY(!scene.slider->nubsieExists(4));
    QCOMPARE(scene.drawn(5), 0.5);
}

void TestMultiNubsieSlider::anUnknownIdIsIgnored()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    MultiNubsieSlider& slider = *scene.slider;
    QVERIFY(slider.nubsie(7) == nullptr);
    QCOMPARE(slider.value(7), 0);
    QCOMPARE(slider.minimum(7), 0);
    QCOMPARE(slider.maximum(7), 0);
    QVERIFY(!slider.nubsieGrabbed(7) && !slider.nubsieMaximized(7) && !slider.nubsieVisible(7));
    QVERIFY(!slider.getDate(7).isValid() && !slider.startDate(7).isValid() && !slider.endDate(7).isValid());
    QCOMPARE(int(slider.getFeatures(7)), 0);
    QVERIFY(!slider.isBlinkingNubsie(7));
    slider.setValue(7, 1, true, true);
    slider.setValues(7, 1, 0, 2, 1);
    slider.setRange(7, 0, 2);
    slider.setDefaultValues(7, 2);
    slider.setDate(7, QDateTime::currentDateTime(), true);
    slider.setStartEndDates(7, QDateTime(), QDateTime());
    slider.setDateDiff(7, 5);
    slider.clearDateDiff(7);
    slider.setFeatures(7, Nubsie::enfDraggable);
    slider.addFeatures(7, Nubsie::enfDraggable);
    slider.setStandardSize(7, QSize(1, 1));
    slider.setDraggedSize(7, QSize(1, 1));
    slider.setIcon(7, QPixmap());
    slider.setIconRed(7, QPixmap());
    slider.setIconMap(7, {});
    slider.setItemMap(7, {});
    slider.setText(7, QString());
    slider.setTextMap(7, {});
    slider.setToolTipText(7, QString());
    slider.setTextColor(7, Qt::red);
    slider.setBackColor(7, Qt::red);
    slider.setBalloonTextMap(7, {});
    slider.setPopoverFeatures(7, vx::PopoverWidget::Balloon::ebfTitle);
    slider.setPopoverID(7, 1, QString());
    slider.startBlinkingNubsie(7, 10);
    slider.stopBlinkingNubsie(7);
    slider.setNubsieVisible(7, false);
    slider.removeNubsie(7);
    scene.journal.listen(&slider, 7);
    QCOMPARE(scene.journal.lines, QStringList());
}

void TestMultiNubsieSlider::handlesGoWithTheSliderIfItHasAnotherWindow()
{
    Scene scene;
    const QPointer<Nubsie> handle = scene.add(1, 100);
    delete scene.slider;
    QVERIFY(handle);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(!handle);
}

void TestMultiNubsieSlider::handlesStayBehindOtherwise()
{
    QWidget host;
    auto* const slider = new MultiNubsieSlider(&host);
    slider->addNubsie(QStringLiteral("a"), 1, 0, 10, 1);
    const QPointer<Nubsie> handle = slider->nubsie(1);
    delete slider;
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(handle);
    QCOMPARE(handle->parentWidget(), &host);
}

// --- Values
// ------------------------------------------------------------------------------------------------------

void TestMultiNubsieSlider::setValueReportsIfAsked()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.show();
    scene.slider->setValue(1, 20, false, true);
    QCOMPARE(scene.journal.lines, list({"changed 1 20"}));
    QCOMPARE(seenAt(handle), QPoint(130, 249));
    scene.slider->setValue(1, 40, false, false);
    QCOMPARE(scene.journal.lines, list({"changed 1 20"}));
    QCOMPARE(scene.slider->value(1), 40);
    // Held in the range.
    scene.slider->setValue(1, 999, false, true);
    QCOMPARE(scene.journal.lines, list({"changed 1 20", "changed 1 200"}));
}

void TestMultiNubsieSlider::settingTheSameValueDoesNothing()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    handle->setNormalizedValue(0.501);
    scene.show();
    scene.slider->setValue(1, 100, false, true);
    QCOMPARE(scene.journal.lines, QStringList());
    QCOMPARE(handle->normalizedValue(), 0.501);
    // An inverted handle is asked for its true value as well.
    scene.slider->addFeatures(1, Nubsie::enfInverted);
    scene.slider->setValue(1, 150, false, true);
    QCOMPARE(scene.slider->value(1), 150);
}

void TestMultiNubsieSlider::setValuesSetsRangeValueAndDefault()
{
    Scene scene;
    scene.add(1, 100);
    scene.show();
    scene.slider->setValues(1, 30, 10, 50, 12);
    QCOMPARE(scene.slider->value(1), 30);
    QCOMPARE(scene.slider->minimum(1), 10);
    QCOMPARE(scene.slider->maximum(1), 50);
    QCOMPARE(scene.slider->nubsie(1)->defaultValue(), 12);
    QCOMPARE(scene.drawn(1), 0.5);
    QCOMPARE(scene.journal.lines, list({"changed 1 30"}));
    // Reported even for the same value.
    scene.slider->setValues(1, 30, 10, 50, 12);
    QCOMPARE(scene.journal.lines, list({"changed 1 30", "changed 1 30"}));
}

void TestMultiNubsieSlider::setRangeClampsAndReports()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.show();
    scene.slider->setRange(1, 0, 200);
    QCOMPARE(scene.journal.lines, QStringList());
    scene.slider->setRange(1, 0, 400);
    QCOMPARE(scene.journal.lines, list({"changed 1 100"}));
    QCOMPARE(scene.drawn(1), 0.25);
    // Placed like a handle in motion.
    QCOMPARE(handle->getPosition(), QPointF(160, 248));
    scene.slider->setRange(1, 0, 50);
    QCOMPARE(scene.slider->value(1), 50);
    scene.slider->setRange(1, 60, 80);
    QCOMPARE(scene.slider->value(1), 60);
    QCOMPARE(scene.journal.lines, list({"changed 1 100", "changed 1 50", "changed 1 60"}));
}

void TestMultiNubsieSlider::datesAreMappedToValues()
{
    Scene scene;
    scene.add(1, 0, 0, 86400);
    scene.slider->addFeatures(1, Nubsie::enfDateMode);
    scene.show();
    const QDateTime start(QDate(2026, 3, 2), QTime(0, 0), Qt::UTC);
    scene.slider->setStartEndDates(1, start, start.addDays(1));
    QCOMPARE(scene.journal.lines, QStringList());
    QCOMPARE(scene.slider->startDate(1), start);
    QCOMPARE(scene.slider->endDate(1), start.addDays(1));
    scene.slider->setDate(1, start.addSecs(21600), false);
    QCOMPARE(scene.slider->value(1), 21600);
    QCOMPARE(scene.drawn(1), 0.25);
    QCOMPARE(scene.slider->getDate(1), start.addSecs(21600));
    QCOMPARE(scene.journal.lines, list({"changed 1 21600"}));
}

void TestMultiNubsieSlider::aDateDifferenceNeedsADateHandleAndATime()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->setDateDiff(1, 5000);
    QVERIFY(!handle->deltaTimeMode() && !handle->dateDiffer());
    scene.slider->addFeatures(1, Nubsie::enfDateMode);
    scene.slider->setDateDiff(1, 0);
    QVERIFY(!handle->deltaTimeMode() && !handle->dateDiffer());
    scene.slider->setDateDiff(1, -5000);
    QVERIFY(handle->deltaTimeMode() && handle->dateDiffer());
    QCOMPARE(handle->anchorTimeDiff(), qint64(-5000));
    scene.slider->clearDateDiff(1);
    QVERIFY(!handle->deltaTimeMode() && !handle->dateDiffer());
    QCOMPARE(handle->anchorTimeDiff(), qint64(0));

    // On a handle of another kind it still lays out.
    scene.slider->setFeatures(1, Nubsie::enfDraggable);
    scene.show();
    handle->setDisplayValue(0.1);
    scene.slider->clearDateDiff(1);
    QCOMPARE(scene.drawn(1), 0.5);
}

void TestMultiNubsieSlider::featuresGoToTheHandle()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->setFeatures(1, Nubsie::enfDraggable);
    QCOMPARE(int(handle->features()), int(Nubsie::enfDraggable));
    QMap<vx::ValueRange, Nubsie::ENubsieFeatures> map;
    map.insert(vx::ValueRange(90, 110), Nubsie::enfLongClick);
    handle->setFeatureMap(map);
    QCOMPARE(int(scene.slider->getFeatures(1)), int(Nubsie::enfLongClick));
    // What is added goes to those in force, and all of that becomes the handle's own.
    scene.slider->addFeatures(1, Nubsie::enfBalloon);
    QCOMPARE(int(handle->features()), int(Nubsie::enfLongClick | Nubsie::enfBalloon));
}

void TestMultiNubsieSlider::looksGoToTheHandle()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    MultiNubsieSlider& slider = *scene.slider;
    slider.setStandardSize(1, QSize(16, 18));
    slider.setDraggedSize(1, QSize(26, 28));
    QCOMPARE(handle->getSize(), QSize(16, 18));
    QCOMPARE(handle->getDraggedSize(), QSize(26, 28));
    const QPixmap red = timelinetest::disc(Qt::blue);
    slider.setIconRed(1, red);
    QCOMPARE(handle->iconRed().cacheKey(), red.cacheKey());
    const QPixmap green = timelinetest::disc(Qt::green);
    slider.setIcon(1, green);
    QCOMPARE(handle->icon().cacheKey(), green.cacheKey());
    QMap<vx::ValueRange, QPixmap> icons;
    icons.insert(vx::ValueRange(0, 100), red);
    slider.setIconMap(1, icons);
    QCOMPARE(handle->icon().cacheKey(), red.cacheKey());
    slider.setText(1, QStringLiteral("x"));
    QCOMPARE(handle->text(), QStringLiteral("x"));
    slider.setToolTipText(1, QStringLiteral("tip"));
    QCOMPARE(handle->toolTipText(), QStringLiteral("tip"));
    QMap<vx::ValueRange, QString> texts;
    texts.insert(vx::ValueRange(0, 200), QStringLiteral("on"));
    slider.setTextMap(1, texts);
    QVERIFY(handle->icon().cacheKey() != red.cacheKey());
    slider.setTextColor(1, Qt::black);
    slider.setBackColor(1, Qt::white);
    slider.setBalloonTextMap(1, texts);
}

void TestMultiNubsieSlider::blinking()
{
    Scene scene;
    scene.add(1, 100);
    scene.slider->startBlinkingNubsie(1, 400);
    QVERIFY(scene.slider->isBlinkingNubsie(1));
    scene.slider->stopBlinkingNubsie(1);
    QVERIFY(!scene.slider->isBlinkingNubsie(1));
}

// --- Layout
// ------------------------------------------------------------------------------------------------------

void TestMultiNubsieSlider::handlesStandOnTheBar()
{
    Scene scene;
    Nubsie* const left = scene.add(1, 0);
    Nubsie* const right = scene.add(2, 200);
    scene.show();
    QCOMPARE(scene.slider->sliderBarRect(), QRectF(0, 17.5, 220, 2.5));
    QCOMPARE(scene.slider->extent(left), 200.0);
    QCOMPARE(scene.slider->sliderOrigin(), QPoint(100, 230));
    QCOMPARE(scene.slider->nubsiePos(left), QPointF(109, 247.5));
    QCOMPARE(scene.slider->nubsieRect(right), QRectF(299, 237.5, 20, 20));
    QCOMPARE(scene.slider->distanceToNubsieCenter(left, QPointF(100, 0)), -9.0);
    // Seen one pixel to the lower right.
    QCOMPARE(left->geometry(), QRect(100, 239, 20, 20));
    QCOMPARE(right->geometry(), QRect(300, 239, 20, 20));
    scene.slider->hide();
    QCOMPARE(scene.slider->sliderOrigin(), QPoint(0, 0));
    scene.slider->setSliderBarExtent(9);
    QCOMPARE(scene.slider->sliderBarRect(), QRectF(0, 15.5, 220, 4.5));
}

void TestMultiNubsieSlider::verticalHandlesStandFromTheBottom()
{
    Scene scene(Qt::Vertical);
    Nubsie* const low = scene.add(1, 0);
    Nubsie* const high = scene.add(2, 200);
    scene.show();
    QCOMPARE(scene.slider->sliderBarRect(), QRectF(17.5, 0, 2.5, 220));
    QCOMPARE(low->geometry().bottom(), 230 + 220 - 1);
    QCOMPARE(high->geometry().top(), 230);
    QCOMPARE(scene.slider->distanceToNubsieCenter(high, QPointF(0, 240)), 1.0);
    scene.slider->setOrientation(Qt::Horizontal);
    QCOMPARE(low->geometry().left(), 100);
}

void TestMultiNubsieSlider::closeHandlesArePushedApart()
{
    Scene scene;
    Nubsie* const one = scene.add(1, 100);
    Nubsie* const two = scene.add(2, 104);
    scene.show();
    QVERIFY(near(drawn(scene, {1, 2}), {0.46, 0.56}));
    QCOMPARE(one->geometry(), QRect(192, 239, 20, 20));
    QCOMPARE(two->geometry(), QRect(212, 239, 20, 20));
    QCOMPARE(scene.slider->value(1), 100);
    QCOMPARE(scene.slider->value(2), 104);

    Scene top;
    top.add(1, 198);
    top.add(2, 198);
    top.add(3, 198);
    top.show();
    QVector<double> places = drawn(top, {1, 2, 3});
    std::sort(places.begin(), places.end());
    QVERIFY(near(places, {0.8, 0.9, 1.0}));

    Scene bottom;
    bottom.add(1, 0);
    bottom.add(2, 2);
    bottom.show();
    QVERIFY(near(drawn(bottom, {1, 2}), {0.0, 0.1}));
}

void TestMultiNubsieSlider::aNewValuePushesItsNeighboursOnly()
{
    Scene scene;
    scene.add(1, 100);
    scene.add(2, 104);
    scene.add(3, 20);
    scene.add(4, 180);
    scene.show();
    scene.slider->setValue(4, 140, false, false);
    QVERIFY(near(drawn(scene, {1, 2, 3, 4}), {0.46, 0.56, 0.1, 0.7}));
    // Now it reaches the block, and the three are centred together.
    scene.slider->setValue(4, 130, false, false);
    const double lowest = 0.45 + 0.02 / 3;
    QVERIFY(near(drawn(scene, {1, 2, 3, 4}), {lowest, lowest + 0.1, 0.1, lowest + 0.2}));
    // Away again, it stands exactly at its value; those it pushed stay until they are laid out themselves.
    scene.slider->setValue(4, 180, false, false);
    QVERIFY(near(drawn(scene, {1, 2}), {lowest, lowest + 0.1}));
    QCOMPARE(scene.drawn(4), 0.9);
}

void TestMultiNubsieSlider::aHiddenHandleTakesNoPlace()
{
    Scene scene;
    scene.add(1, 100);
    scene.add(2, 104);
    scene.show();
    scene.slider->setNubsieVisible(1, false);
    QVERIFY(!scene.slider->nubsieVisible(1));
    QCOMPARE(scene.drawn(2), 0.52);
    QVERIFY(near(drawn(scene, {1}), {0.46}));
    scene.slider->setNubsieVisible(1, true);
    QVERIFY(near(drawn(scene, {1, 2}), {0.46, 0.56}));
    scene.slider->setNubsiesVisible(false);
    QVERIFY(!scene.slider->nubsieVisible(1) && !scene.slider->nubsieVisible(2));
    scene.slider->setNubsiesVisible(true);
    QVERIFY(near(drawn(scene, {1, 2}), {0.46, 0.56}));
}

void TestMultiNubsieSlider::nothingIsLaidOutWhileHidden()
{
    Scene scene;
    scene.add(1, 100);
    scene.add(2, 104);
    scene.slider->updateNubsiePositions(false);
    QCOMPARE(drawn(scene, {1, 2}), (QVector<double> {0.5, 0.52}));
    scene.slider->setValue(2, 102, false, true);
    QCOMPARE(drawn(scene, {1, 2}), (QVector<double> {0.5, 0.51}));
    QCOMPARE(scene.journal.lines, list({"changed 2 102"}));
}

void TestMultiNubsieSlider::handlesOfDifferentSizesShareTheScale()
{
    Scene scene;
    scene.add(1, 100);
    Nubsie* const wide = scene.add(2, 100);
    wide->setSize(QSize(60, 20));
    scene.show();
    // 60 pixels of a way of 160.
    QCOMPARE(scene.slider->extent(wide), 160.0);
    QVERIFY(qAbs(qAbs(scene.drawn(2) - scene.drawn(1)) - 60.0 / 160.0) < 1e-9);
}

void TestMultiNubsieSlider::handlesFollowAResizeNowAndLater()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 200);
    scene.show();
    handle->moveTo(QPointF(0, 0));
    scene.slider->resize(120, 40);
    QCOMPARE(handle->positionAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle->geometry(), QRect(200, 239, 20, 20));
    QCOMPARE(scene.journal.lines, list({"queued"}));
    handle->move(0, 0);
    QCoreApplication::processEvents();
    QCOMPARE(handle->geometry(), QRect(200, 239, 20, 20));
}

void TestMultiNubsieSlider::handlesFollowAMove()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 0);
    scene.show();
    scene.slider->move(150, 100);
    QCOMPARE(handle->geometry(), QRect(150, 109, 20, 20));
    QCOMPARE(scene.journal.lines, list({"queued"}));
}

void TestMultiNubsieSlider::repaintQueuedLaysOutLater()
{
    Scene scene;
    QWidget panel(&scene.host);
    panel.setGeometry(0, 0, 400, 400);
    scene.slider->setParent(&panel);
    Nubsie* const handle = scene.add(1, 0);
    scene.show();
    // The slider itself hears nothing of it.
    panel.move(20, 30);
    QCOMPARE(handle->geometry(), QRect(100, 239, 20, 20));
    scene.slider->repaintNubsiesQueued();
    QCOMPARE(scene.journal.lines, list({"queued"}));
    QCOMPARE(handle->geometry(), QRect(100, 239, 20, 20));
    QCoreApplication::processEvents();
    QCOMPARE(handle->geometry(), QRect(120, 269, 20, 20));
    panel.move(0, 0);
    scene.slider->repaintNubsiesImmediately();
    QCOMPARE(handle->geometry(), QRect(100, 239, 20, 20));
    scene.slider->setParent(&scene.host);
}

void TestMultiNubsieSlider::animatedLayoutMovesSlowly()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 0);
    scene.show();
    const QPoint start = handle->pos();
    scene.slider->setValue(1, 200, true, false);
    QCOMPARE(handle->pos(), start);
    QCOMPARE(handle->positionAnimator()->state(), QAbstractAnimation::Running);
    handle->positionAnimator()->setCurrentTime(500);
    QCOMPARE(handle->pos(), QPoint(300, 239));

    // At once where a size is missing.
    handle->setDraggedSize(QSize());
    scene.slider->setValue(1, 0, true, false);
    QCOMPARE(handle->pos(), start);
}

void TestMultiNubsieSlider::aHandleOnItsWayGoesToTheNewPlace()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 0);
    scene.show();
    scene.slider->setValue(1, 200, true, false);
    handle->setNormalizedValue(0.5);
    handle->setDisplayValue(0.5);
    scene.slider->updateNubsiePositions(false);
    QTRY_COMPARE(handle->positionAnimator()->state(), QAbstractAnimation::Stopped);
    QCOMPARE(handle->pos(), QPoint(200, 239));
}

void TestMultiNubsieSlider::aSliderThatIsTooShortKeepsItsHandles()
{
    Scene scene;
    scene.add(1, 100);
    scene.add(2, 104);
    scene.show();
    for (const int width : {20, 10, 1, 0, 21}) {
        scene.slider->resize(width, 40);
        for (const int id : {1, 2}) {
            QVERIFY2(qIsFinite(scene.drawn(id)), qPrintable(QString::number(width)));
        }
    }
    scene.slider->resize(220, 40);
    QCoreApplication::processEvents();
    const QVector<double> places = drawn(scene, {1, 2});
    QVERIFY(places.at(1) - places.at(0) > 0.1 - 1e-9);
    QVERIFY(places.at(0) >= 0.0 && places.at(1) <= 1.0);
}

void TestMultiNubsieSlider::manyHandles()
{
    Scene scene;
    for (int i = 0; i < 30; ++i) {
        scene.add(i, 195);
    }
    scene.show();
    QVector<double> places;
    for (int i = 0; i < 30; ++i) {
        places << scene.drawn(i);
    }
    std::sort(places.begin(), places.end());
    // More than fit: flush with the top, hanging over at the bottom.
    QVERIFY(qAbs(places.constLast() - 1.0) < 1e-12);
    QVERIFY(qAbs(places.constFirst() + 1.9) < 1e-9);
}

// --- Stacking
// ----------------------------------------------------------------------------------------------------

void TestMultiNubsieSlider::handlesStackAsTold()
{
    Scene scene;
    Nubsie* const one = scene.add(1, 0);
    scene.add(2, 60);
    scene.add(3, 120);
    scene.add(4, 180);
    // Each new one goes under the first.
    QCOMPARE(stack(scene.host), (QList<int> {2, 3, 4, 1}));
    scene.slider->raiseNubsies();
    QCOMPARE(stack(scene.host), (QList<int> {1, 2, 3, 4}));
    scene.slider->raiseNubsieOnSlider(scene.slider->nubsie(2));
    QCOMPARE(stack(scene.host).constLast(), 2);
    scene.slider->raiseNubsieOnSlider(nullptr);

    QWidget cover(&scene.host);
    scene.slider->stackNubsiesUnder(&cover);
    QCOMPARE(scene.host.children().constLast(), static_cast<QObject*>(&cover));
    scene.slider->raiseNubsies();
    scene.slider->stackNubsiesOver(&cover);
    // The first stays on top, the last lies lowest, the cover right under it.
    QCOMPARE(stack(scene.host), (QList<int> {4, 2, 3, 1}));
    const QObjectList& children = scene.host.children();
    QCOMPARE(children.indexOf(&cover) + 1, children.indexOf(scene.slider->nubsie(4)));
    scene.slider->stackNubsiesOver(nullptr);
    scene.slider->stackNubsiesUnder(nullptr);

    Scene single;
    single.add(1, 0);
    QWidget below(&single.host);
    single.slider->stackNubsiesOver(&below);
    QVERIFY(single.host.children().indexOf(&below) < single.host.children().indexOf(single.slider->nubsie(1)));
    Q_UNUSED(one)
}

void TestMultiNubsieSlider::aRivalLetsTheOneInUseGoOnTop()
{
    Scene scene;
    scene.add(1, 0);
    scene.add(2, 100);
    auto* const other = new MultiNubsieSlider(&scene.host, &scene.host);
    other->setGeometry(100, 300, 220, 40);
    other->addNubsie(QStringLiteral("rival"), 1, 0, 10, 7);
    scene.slider->addRival(other);
    scene.slider->addRival(other);
    scene.slider->addRival(nullptr);
    scene.show();
    zelkovtest::Pointer pointer(scene.slider);
    pointer.move(QPoint(9, 17));
    pointer.press();
    // The rival's handle stays where it is.
    QCOMPARE(stack(scene.host), (QList<int> {2, 1, 7}));
    pointer.release();
    delete other;
    scene.slider->raiseNubsieOverRivals();
}

// --- As a widget
// -------------------------------------------------------------------------------------------------

void TestMultiNubsieSlider::handlesShowAndHideWithTheSlider()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    QVERIFY(handle->isHidden());
    scene.show();
    QVERIFY(handle->isVisible());
    scene.slider->hide();
    QVERIFY(handle->isHidden());
    Nubsie* const late = scene.add(2, 20);
    QVERIFY(late->isHidden());
    scene.slider->show();
    QVERIFY(handle->isVisible() && late->isVisible());
    QCOMPARE(seenAt(late), QPoint(130, 249));
}

void TestMultiNubsieSlider::hiddenHandlesStayHidden()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->setNubsieVisible(1, false);
    scene.show();
    QVERIFY(!handle->isVisible());
    scene.slider->setNubsieVisible(1, true);
    QVERIFY(handle->isVisible());
    // Unwanted, it is no longer painted, but not hidden.
    scene.slider->setNubsieVisible(1, false);
    QVERIFY(handle->isVisible());
}

void TestMultiNubsieSlider::handlesAreDisabledWithTheSlider()
{
    Scene scene;
    Nubsie* const handle = scene.add(1, 100);
    scene.slider->setEnabled(false);
    QVERIFY(!handle->isEnabled());
    scene.slider->setEnabled(true);
    QVERIFY(handle->isEnabled());
}

void TestMultiNubsieSlider::opacityIsStoredAndFades()
{
    Scene scene;
    scene.show();
    scene.slider->setOpacity(0.5);
    QCOMPARE(scene.slider->property("opacityFactor").toDouble(), 0.5);
    scene.slider->setFeatures(MultiNubsieSlider::emfFadeWhenInactive);
    QCOMPARE(scene.slider->getOpacity(), 1.0);
    QTRY_COMPARE(scene.slider->getOpacity(), 0.25);
}

void TestMultiNubsieSlider::progressIsHeldBetweenZeroAndOne()
{
    MultiNubsieSlider slider;
    slider.setProgress(1.5);
    QCOMPARE(slider.getProgress(), 1.0);
    slider.setProgress(-1);
    QCOMPARE(slider.getProgress(), 0.0);
    slider.setProgress(0.3);
    QCOMPARE(slider.getProgress(), 0.3);
}

void TestMultiNubsieSlider::contextMenusDoNotComeUp()
{
    Scene scene;
    scene.host.setContextMenuPolicy(Qt::CustomContextMenu);
    QContextMenuEvent menu(QContextMenuEvent::Mouse, QPoint(5, 5));
    QVERIFY(scene.slider->handleEvent(&menu));
}

void TestMultiNubsieSlider::aClientMayEmitTheValueSignal()
{
    // Whoever uses nubsieValueChanged() wakes the slider.
    class Client : public MultiNubsieSlider
    {
    public:
        void tell() { Q_EMIT static_cast<MultiNubsieSlider*>(this)->nubsieValueChanged(vx::NubsieID(1), 5); }
    };
    Client client;
    client.setFeatures(MultiNubsieSlider::emfFadeWhenInactive);
    QTRY_COMPARE(client.getOpacity(), 0.25);
    client.tell();
    QTRY_COMPARE(client.getOpacity(), 1.0);
}

ZELKOV_TEST_MAIN(TestMultiNubsieSlider)
#include "tst_multinubsieslider.moc"
