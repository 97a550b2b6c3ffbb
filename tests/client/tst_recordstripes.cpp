// SPDX-License-Identifier: MIT
// The sliding panels of the camera client, driven by the mouse.
#include "client/RecordStripes.h"

#include <QtCore/QDateTime>
#include <QtCore/QTranslator>
#include <QtGui/QImage>
#include <QtGui/QPainter>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QDateTimeEdit>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStackedWidget>
#include <QtWidgets/QVBoxLayout>

#include <functional>
#include <memory>

#include "client/EventStripe.h"
#include "client/ExportRun.h"
#include "client/Fleet.h"
#include "client/RecordTimeLine.h"
#include "client/Session.h"
#include "client/TimeTrack.h"
#include "indicators/IconOverlayView.h"
#include "popover/Container.h"
#include "popover/Controller.h"
#include "popover/Item.h"
#include "popover/Manager.h"
#include "sliders/MultiNubsieSlider.h"
#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"
#include "views/FadeStripeView.h"

using client::Fleet;
using client::RecordStripes;
using client::Session;
using client::TimeTrack;
using vx::PopoverWidget::Controller;
using zelkovtest::Pointer;
using zelkovtest::SignalRecorder;

namespace
{
const qint64 s_day = 24 * 60 * 60 * 1000;

// What the handle paints outside of that place of the window.
bool paintsOutside(vx::Nubsie* handle, const QRect& place)
{
    QImage image(handle->size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    handle->render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) != 0 && !place.contains(handle->pos() + QPoint(x, y))) {
                return true;
            }
        }
    }
    return false;
}

// Pages in a window below a bar, as in a client; the area is the first page.
struct Scene
{
    Fleet fleet;
    Session session;
    std::unique_ptr<QWidget> window = std::make_unique<QWidget>();
    QWidget* bar = new QWidget;
    QStackedWidget* pages = new QStackedWidget;
    QPointer<QWidget> area = new QWidget;
    QPointer<RecordStripes> stripes;

    Scene()
    {
        window->resize(900, 600);
        bar->setFixedHeight(40);
        pages->addWidget(area);
        pages->addWidget(new QWidget);
        auto* layout = new QVBoxLayout(window.get());
        layout->setContentsMargins(0, 0, 0, 0);
        layout->setSpacing(0);
        layout->addWidget(bar);
        layout->addWidget(pages, 1);
        session.logIn(QStringLiteral("admin"), QStringLiteral("camera2!"));
        stripes = new RecordStripes(fleet, session, area);
        window->show();
        QVERIFY(QTest::qWaitForWindowExposed(window.get()));
        QCoreApplication::processEvents();
    }

    TimeTrack* track() const { return stripes->timeLine()->track(); }
    QVector<vx::Nubsie*> handles() const
    {
        QVector<vx::Nubsie*> result;
        for (vx::MultiNubsieSlider* slider :
            {track()->positionSlider(), track()->fromSlider(), track()->toSlider()}) {
            for (const QPointer<vx::Nubsie>& handle : slider->getNubsies()) {
                result << handle;
            }
        }
        return result;
    }
    int seenHandles() const
    {
        int result = 0;
        for (vx::Nubsie* handle : handles()) {
            result += handle->isVisible() && paintsOutside(handle, QRect()) ? 1 : 0;
        }
        return result;
    }
    QPoint middleOf(vx::MultiNubsieSlider* slider) const
    {
        return slider->getNubsies().constFirst()->geometry().center();
    }
    QPoint middleOf(const QWidget* widget) const
    {
        return widget->mapTo(window.get(), widget->rect().center());
    }
    template <typename T> T* find(const char* name) const
    {
        return window->findChild<T*>(QLatin1String(name));
    }
    QRect inWindow(const QWidget* widget) const
    {
        return QRect(widget->mapTo(window.get(), QPoint()), widget->size());
    }
    QPoint grabOf(const FadeStripeView* stripe) const { return middleOf(stripe->findChild<QWidget*>(QStringLiteral("grab"))); }
    void clickGrab(const FadeStripeView* stripe) const
    {
        Pointer pointer(window.get());
        pointer.click(grabOf(stripe));
    }
    Controller* popover() const { return find<Controller>("exportPopover"); }
    QWidget* row(const char* name) const { return popover()->findChild<QWidget*>(QLatin1String(name)); }
};

// Runs as soon as the popover is open, in its event loop.
void whenOpen(Scene& scene, const std::function<void()>& action)
{
    auto* timer = new QTimer(&scene.session);
    timer->setInterval(20);
    QObject::connect(timer, &QTimer::timeout, timer, [&scene, timer, action] {
        if (scene.popover() && scene.popover()->isActive() && scene.popover()->isVisible()) {
            timer->stop();
            timer->deleteLater();
            action();
        }
    });
    timer->start();
}

QVector<qint64> timesOf(const QSignalSpy& spy)
{
    QVector<qint64> result;
    for (const QList<QVariant>& arguments : spy) {
        result << qint64(arguments.at(0).toULongLong() / 1000);
    }
    return result;
}

// Puts a mark before every text.
class Marking : public QTranslator
{
public:
    QString translate(const char* context, const char* text, const char*, int) const override
    {
        return QLatin1String(context).startsWith(QLatin1String("client"))
            ? QStringLiteral("#") + QString::fromUtf8(text)
            : QString();
    }
    bool isEmpty() const override { return false; }
};
}

class TestRecordStripes : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { vx::PopoverWidget::Manager::init(1000); }
    void cleanup()
    {
        if (!qApp->styleSheet().isEmpty()) {
            zelkov::theme::apply(*qApp, zelkov::theme::Name::None);
        }
        TestCase::cleanup();
    }
    void cleanupTestCase() { vx::PopoverWidget::Manager::deleteInstance(); }

    // The time line
    void theHandlesStandOnTheTimeLine();
    void aDragTellsTimesInOrderWithinTheDay();
    void aDragFarOffTheScaleIsFine();
    void aPressOnTheScaleBringsTheHandle();
    void theLiveButtonGoesToTheEnd();
    void theFlagsKeepTheirOrder();
    void aFlagBesideTheOtherIsHitByItself();
    void aDoubleClickAsksForAMoment();
    void whatIsShownFromOutsideIsNotTold();

    // Panels
    void aClickOnAnEventGoesToItsCameraAndTime();
    void theHandleStripOpensAndShuts();
    void aDragOfTheBarFollowsThePointerBelowABar();
    void handlesGoWithTheStripes();
    void handlesGoWithThePage();
    void noBalloonStaysWithoutItsHandle();
    void handlesStayInThePanelWhileItSlides();
    void panelsFollowTheArea();
    void picturesKeepClearOfWhatRests();
    void handlesFollowWhatIsAroundTheArea();
    void theUpperPanelTakesTheFullHeightAndBack();
    void theUpperPanelEndsAboveTheLowerOne();
    void inALowAreaOnePanelShutsTheOther();
    void aRemovedCameraTakesItsEventsAlong();

    // Export
    void anAcceptedExportRunsToItsEnd();
    void aRunningExportCanBeStopped();
    void aCancelledPopoverExportsNothing();
    void whoHasNoRightGetsNoPopover();
    void logOutEndsAnExport();
    void logOutClosesThePopover();
    void rowsAndFlagsShowTheSameRange();
    void withoutNameOrPasswordNothingIsExported();
    void theAreaMayGoWhileAnExportRuns();
    void theAreaMayGoWhileThePopoverAsks();
    void theStripesMayGoInASlotOfTheirs();
    void theAreaMayGoWhenTheExportIsOver();
    void theAreaMayGoWhileAMomentIsTyped();
    void handlesDoNotLieOverTheCardOfAnExport();

    // Run time
    void theQualityIsDragged();
    void theMomentPopoverGoesWithTheStripes();
    void aNarrowAreaKeepsTheMomentReadable();
    void picturesBelowDoNotRepaintThePanels_data();
    void picturesBelowDoNotRepaintThePanels();
    void aNewThemeComesAtOnce();
    void aNewLanguageComesAtOnce();
};

void TestRecordStripes::theHandlesStandOnTheTimeLine()
{
    Scene scene;
    QCOMPARE(scene.handles().size(), 3);
    QTRY_COMPARE(scene.seenHandles(), 3);
    const QRect line = scene.inWindow(scene.stripes->timeLine());
    QCOMPARE(line.height(), client::RecordTimeLine::s_height);
    for (const vx::Nubsie* handle : scene.handles()) {
        QCOMPARE(handle->parentWidget(), scene.window.get());
        QVERIFY(line.contains(handle->geometry()));
    }
    const int end = scene.track()->mapTo(scene.window.get(), QPoint(qRound(scene.track()->xOf(scene.track()->end())), 0)).x();
    QVERIFY(qAbs(scene.middleOf(scene.track()->positionSlider()).x() - end) <= 1);
    QVERIFY(scene.stripes->timeLine()->isLive());
}

void TestRecordStripes::aDragTellsTimesInOrderWithinTheDay()
{
    Scene scene;
    QSignalSpy times(scene.stripes, &RecordStripes::timeChosen);
    const QPoint start = scene.middleOf(scene.track()->positionSlider());
    {
        Pointer pointer(scene.window.get());
        pointer.move(start);
        pointer.press();
        for (int x = start.x(); x >= -40; x -= 20) {
            pointer.move(QPoint(x, start.y()));
        }
        pointer.release();
    }
    const QVector<qint64> told = timesOf(times);
    QVERIFY(told.size() > 30);
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    for (int i = 0; i < told.size(); ++i) {
        QVERIFY(i == 0 || told.at(i) < told.at(i - 1));
        QVERIFY(told.at(i) <= now);
        QVERIFY(told.at(i) >= now - s_day - 2000);
    }
    QVERIFY(told.constLast() < now - s_day + 60 * 1000);
    QVERIFY(!scene.stripes->timeLine()->isLive());
    QVERIFY(!scene.find<QPushButton>("timeLineLiveButton")->isChecked());
}

void TestRecordStripes::aDragFarOffTheScaleIsFine()
{
    Scene scene;
    QSignalSpy times(scene.stripes, &RecordStripes::timeChosen);
    const QPoint start = scene.middleOf(scene.track()->positionSlider());
    Pointer pointer(scene.window.get());
    pointer.move(start);
    pointer.press();
    pointer.move(start - QPoint(200, 0));
    pointer.move(start - QPoint(200, 500));
    const qint64 before = timesOf(times).constLast();
    for (int i = 1; i <= 10; ++i) {
        pointer.move(start - QPoint(200 + i, 500));
    }
    const qint64 way = before - timesOf(times).constLast();
    QVERIFY(way > 0);
    QVERIFY(way < 10 * 100 * 1000 / 4); // a pixel of the scale is about 100 seconds
}

void TestRecordStripes::aPressOnTheScaleBringsTheHandle()
{
    Scene scene;
    QSignalSpy times(scene.stripes, &RecordStripes::timeChosen);
    const qint64 noon = scene.track()->begin() + s_day / 2;
    const QPoint point = scene.track()->mapTo(scene.window.get(), QPoint(qRound(scene.track()->xOf(noon)), 34));
    Pointer pointer(scene.window.get());
    pointer.move(point);
    pointer.press();
    QCOMPARE(times.size(), 1);
    QVERIFY(qAbs(timesOf(times).constFirst() - noon) < 120 * 1000);
    QVERIFY(qAbs(scene.middleOf(scene.track()->positionSlider()).x() - point.x()) <= 2);
    pointer.move(point + QPoint(50, 0)); // and on with the pointer
    QVERIFY(timesOf(times).constLast() > noon + 60 * 60 * 1000);
    pointer.release();
}

void TestRecordStripes::theLiveButtonGoesToTheEnd()
{
    Scene scene;
    scene.stripes->showTime(quint64(scene.track()->begin() + s_day / 3) * 1000);
    QVERIFY(!scene.stripes->timeLine()->isLive());
    SignalRecorder recorder(scene.stripes);
    Pointer pointer(scene.window.get());
    pointer.click(scene.middleOf(scene.find<QPushButton>("timeLineLiveButton")));
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("liveWanted")));
    QVERIFY(scene.stripes->timeLine()->isLive());
    QVERIFY(scene.find<QPushButton>("timeLineLiveButton")->isChecked());
    QCOMPARE(scene.track()->moment(), scene.track()->end());
    // A second one tells again and does not uncheck the button.
    pointer.click(scene.middleOf(scene.find<QPushButton>("timeLineLiveButton")));
    QCOMPARE(recorder.names().size(), 2);
    QVERIFY(scene.find<QPushButton>("timeLineLiveButton")->isChecked());
}

void TestRecordStripes::theFlagsKeepTheirOrder()
{
    Scene scene;
    TimeTrack* const track = scene.track();
    QSignalSpy ranges(track, &TimeTrack::rangeChosen);
    const auto drag = [&](vx::MultiNubsieSlider* slider, int way) {
        const QPoint start = scene.middleOf(slider);
        Pointer pointer(scene.window.get());
        pointer.move(start);
        pointer.press();
        for (int i = 1; i <= 20; ++i) {
            pointer.move(start + QPoint(way * i / 20, 0));
        }
        pointer.release();
        QCoreApplication::processEvents();
    };
    const auto check = [&] {
        QVERIFY(!ranges.isEmpty());
        for (const QList<QVariant>& range : qAsConst(ranges)) {
            QVERIFY(range.at(0).toLongLong() < range.at(1).toLongLong());
            QVERIFY(range.at(0).toLongLong() >= track->begin());
            QVERIFY(range.at(1).toLongLong() <= track->end());
        }
    };
    const qint64 to = track->to();
    drag(track->fromSlider(), 200); // beyond the other flag, which goes along
    check();
    QVERIFY(track->to() > to);
    drag(track->fromSlider(), 900); // to the end
    check();
    QCOMPARE(track->to(), track->end());
    QVERIFY(track->from() < track->end());
    drag(track->toSlider(), -1200);
    check();
    QCOMPARE(track->from(), track->begin());
    QVERIFY(track->to() - track->from() < 60 * 60 * 1000);
    for (vx::Nubsie* handle : scene.handles()) {
        QVERIFY(QRect(QPoint(), scene.window->size()).contains(handle->geometry()));
    }
    QCOMPARE(scene.stripes->timeLine()->isLive(), true);
}

void TestRecordStripes::aFlagBesideTheOtherIsHitByItself()
{
    Scene scene;
    TimeTrack* const track = scene.track();
    const qint64 middle = track->begin() + s_day / 2;
    track->setRange(middle, middle + TimeTrack::s_shortestRange);
    const QPoint from = scene.middleOf(track->fromSlider());
    const QPoint to = scene.middleOf(track->toSlider());
    QVERIFY(to.x() - from.x() >= 12); // not pushed apart, but turned away from each other
    QVERIFY(to.x() - from.x() <= 20);
    Pointer pointer(scene.window.get());
    pointer.move(from - QPoint(5, 0));
    pointer.press();
    QVERIFY(track->fromSlider()->nubsieGrabbed(track->fromSlider()->getNubsies().constFirst()->id()));
    pointer.release();
    pointer.move(to + QPoint(5, 0));
    pointer.press();
    QVERIFY(track->toSlider()->nubsieGrabbed(track->toSlider()->getNubsies().constFirst()->id()));
    pointer.release();
}

void TestRecordStripes::aDoubleClickAsksForAMoment()
{
    Scene scene;
    scene.stripes->showTime(quint64(scene.track()->begin() + s_day / 2) * 1000);
    QSignalSpy times(scene.stripes, &RecordStripes::timeChosen);
    {
        Pointer pointer(scene.window.get());
        const QPoint point = scene.middleOf(scene.track()->positionSlider());
        pointer.click(point);
        pointer.click(point);
    }
    QTRY_VERIFY(scene.find<Controller>("momentPopover") && scene.find<Controller>("momentPopover")->isActive());
    QPointer<Controller> popover = scene.find<Controller>("momentPopover");
    auto* edit = popover->findChild<QDateTimeEdit*>();
    QVERIFY(edit);
    times.clear();
    const QDateTime wanted = edit->dateTime().addSecs(-3600);
    edit->setDateTime(wanted);
    QTRY_VERIFY(!times.isEmpty());
    QCOMPARE(timesOf(times).constLast() / 1000, wanted.toMSecsSinceEpoch() / 1000);
    QCOMPARE(scene.track()->moment() / 1000, wanted.toMSecsSinceEpoch() / 1000);
    popover->dismiss(false, true);
    QTRY_VERIFY(!popover);
}

void TestRecordStripes::whatIsShownFromOutsideIsNotTold()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    scene.stripes->showTime(0); // long before the day
    QCOMPARE(scene.track()->moment(), scene.track()->begin());
    scene.stripes->showLive();
    QCOMPARE(scene.track()->moment(), scene.track()->end());
    QCOMPARE(recorder.names(), QStringList());
}

void TestRecordStripes::aClickOnAnEventGoesToItsCameraAndTime()
{
    Scene scene;
    FadeStripeView* const top = scene.stripes->eventStripe();
    QVERIFY(!top->isFadedIn());
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(top->isFadedIn() && top->height() > 100, 5000);
    auto* const events = top->findChild<client::EventStripe*>();
    QTRY_VERIFY(events->height() >= client::EventStripe::s_rowHeight - 2);
    QVERIFY(events->events().size() > 20);
    const client::RecordedEvent wanted = events->events().at(2);
    SignalRecorder recorder(scene.stripes);
    Pointer pointer(scene.window.get());
    pointer.click(events->mapTo(scene.window.get(), events->rectOf(2).center()));
    QCOMPARE(recorder.names(), QStringList({QStringLiteral("cameraChosen"), QStringLiteral("timeChosen")}));
    QCOMPARE(recorder.entries().at(0).arguments.at(0).toInt(), wanted.camera);
    QCOMPARE(recorder.entries().at(1).arguments.at(0).toULongLong(), quint64(wanted.time) * 1000);
    QCOMPARE(scene.track()->moment(), wanted.time);
    QVERIFY(!scene.stripes->timeLine()->isLive());
    // Pressed on one and released on another: nothing.
    recorder.clear();
    pointer.move(events->mapTo(scene.window.get(), events->rectOf(0).center()));
    pointer.press();
    pointer.move(events->mapTo(scene.window.get(), events->rectOf(1).center()));
    pointer.release();
    QCOMPARE(recorder.names(), QStringList());
}

void TestRecordStripes::theHandleStripOpensAndShuts()
{
    Scene scene;
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    QVERIFY(bottom->isFadedIn());
    QTRY_COMPARE(scene.seenHandles(), 3);
    for (int i = 0; i < 2; ++i) {
        scene.clickGrab(bottom);
        QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), c_Bordersize, 5000);
        QTRY_COMPARE(scene.seenHandles(), 0);
        QCOMPARE(bottom->geometry().bottom(), scene.area->rect().bottom());
        scene.clickGrab(bottom);
        QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), client::RecordTimeLine::s_height + 2 * c_Bordersize, 5000);
        QTRY_COMPARE(scene.seenHandles(), 3);
        const QRect line = scene.inWindow(scene.stripes->timeLine());
        for (const vx::Nubsie* handle : scene.handles()) {
            QTRY_VERIFY(line.contains(handle->geometry()));
        }
    }
}

void TestRecordStripes::aDragOfTheBarFollowsThePointerBelowABar()
{
    Scene scene;
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    const QPoint start = scene.inWindow(bottom).topLeft() + QPoint(60, 5);
    Pointer pointer(scene.window.get());
    pointer.move(start);
    pointer.press();
    pointer.move(start + QPoint(0, 20));
    // The area begins 40 pixels below the top of the window; the bar stays under the pointer all the same.
    QVERIFY(qAbs(scene.inWindow(bottom).top() + 5 - (start.y() + 20)) <= 1);
    pointer.move(start + QPoint(0, 115));
    pointer.release();
    QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), c_Bordersize, 5000);
    QTRY_COMPARE(scene.seenHandles(), 0);
}

void TestRecordStripes::handlesGoWithTheStripes()
{
    Scene scene;
    QTRY_COMPARE(scene.seenHandles(), 3);
    scene.stripes->setStripesVisible(false);
    QCOMPARE(scene.seenHandles(), 0);
    QVERIFY(!scene.stripes->timeStripe()->isVisible());
    scene.window->resize(800, 500);
    QCoreApplication::processEvents();
    QCOMPARE(scene.seenHandles(), 0);
    scene.stripes->setStripesVisible(true);
    QTRY_COMPARE(scene.seenHandles(), 3);
    QVERIFY(scene.inWindow(scene.stripes->timeLine()).contains(scene.handles().constFirst()->geometry()));
    // In the middle of a movement.
    scene.clickGrab(scene.stripes->timeStripe());
    QTRY_VERIFY_WITH_TIMEOUT(scene.stripes->timeStripe()->height() < 130, 5000);
    scene.stripes->setStripesVisible(false);
    QTest::qWait(400);
    QCOMPARE(scene.seenHandles(), 0);
}

void TestRecordStripes::handlesGoWithThePage()
{
    Scene scene;
    QTRY_COMPARE(scene.seenHandles(), 3);
    scene.pages->setCurrentIndex(1);
    QCOMPARE(scene.seenHandles(), 0);
    scene.window->resize(850, 550);
    QCoreApplication::processEvents();
    QCOMPARE(scene.seenHandles(), 0);
    scene.pages->setCurrentIndex(0);
    QTRY_COMPARE(scene.seenHandles(), 3);
    const QRect line = scene.inWindow(scene.stripes->timeLine());
    for (const vx::Nubsie* handle : scene.handles()) {
        QVERIFY(line.contains(handle->geometry()));
    }
}

void TestRecordStripes::noBalloonStaysWithoutItsHandle()
{
    Scene scene;
    const auto balloons = [&scene] {
        int result = 0;
        for (const vx::PopoverWidget::Balloon* balloon : scene.window->findChildren<vx::PopoverWidget::Balloon*>()) {
            result += balloon->isVisible() ? 1 : 0;
        }
        return result;
    };
    const auto drag = [&scene] {
        Pointer pointer(scene.window.get());
        const QPoint start = scene.middleOf(scene.track()->positionSlider());
        pointer.move(start);
        pointer.press();
        pointer.move(start - QPoint(50, 0));
        pointer.move(start - QPoint(60, 0));
        pointer.release();
    };
    drag();
    QTRY_COMPARE(balloons(), 1);
    scene.stripes->setStripesVisible(false);
    QTRY_COMPARE_WITH_TIMEOUT(balloons(), 0, 500);
    scene.stripes->setStripesVisible(true);
    QTRY_COMPARE(scene.seenHandles(), 3);
    drag();
    QTRY_COMPARE(balloons(), 1);
    scene.stripes->showLive();
    QTRY_COMPARE_WITH_TIMEOUT(balloons(), 0, 500);
}

void TestRecordStripes::handlesStayInThePanelWhileItSlides()
{
    Scene scene;
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    QTRY_COMPARE(scene.seenHandles(), 3);
    int steps = 0;
    bool outside = false;
    QObject::connect(bottom, &FadeView::geometryChanged, bottom, [&] {
        QTimer::singleShot(0, bottom, [&] {
            ++steps;
            for (vx::Nubsie* handle : scene.handles()) {
                outside = outside || (handle->isVisible() && paintsOutside(handle, scene.inWindow(bottom)));
            }
        });
    });
    bottom->fadeout();
    QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), c_Bordersize, 5000);
    bottom->fadein();
    QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), client::RecordTimeLine::s_height + 2 * c_Bordersize, 5000);
    QVERIFY(steps > 4);
    QVERIFY(!outside);
    QVERIFY(paintsOutside(scene.handles().constFirst(), QRect()));
}

void TestRecordStripes::panelsFollowTheArea()
{
    Scene scene;
    for (const QSize size : {QSize(1200, 800), QSize(500, 300), QSize(901, 601)}) {
        scene.window->resize(size);
        QCoreApplication::processEvents();
        const QRect area = scene.area->rect();
        QCOMPARE(scene.stripes->eventStripe()->geometry().topLeft(), QPoint());
        QCOMPARE(scene.stripes->eventStripe()->width(), area.width());
        QCOMPARE(scene.stripes->timeStripe()->geometry().bottomRight(), area.bottomRight());
        QCOMPARE(scene.stripes->timeStripe()->width(), area.width());
        const QRect line = scene.inWindow(scene.stripes->timeLine());
        for (const vx::Nubsie* handle : scene.handles()) {
            QVERIFY(line.contains(handle->geometry()));
        }
    }
}

void TestRecordStripes::picturesKeepClearOfWhatRests()
{
    Scene scene;
    auto* const pictures = new QWidget;
    auto* const layout = new QVBoxLayout(scene.area);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(pictures);
    pictures->lower();
    FadeStripeView* const top = scene.stripes->eventStripe();
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    const auto between = [&] {
        return QRect(0, c_Bordersize, scene.area->width(), scene.area->height() - c_Bordersize - bottom->height());
    };
    QTRY_COMPARE(pictures->geometry(), between());
    QCOMPARE(bottom->height(), client::RecordTimeLine::s_height + 2 * c_Bordersize);
    scene.clickGrab(bottom);
    QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), c_Bordersize, 5000);
    QTRY_COMPARE(pictures->geometry(), between());
    scene.clickGrab(bottom);
    QTRY_VERIFY_WITH_TIMEOUT(bottom->height() > 100, 5000);
    QTRY_COMPARE(pictures->geometry(), between());
    // The events lie over them.
    top->fadein();
    QTRY_VERIFY_WITH_TIMEOUT(top->height() > 100, 5000);
    QCOMPARE(pictures->geometry(), between());
    // Neither do both of them fit into a low area.
    scene.window->resize(900, 400);
    QTRY_COMPARE(pictures->geometry().bottom(), scene.area->height() - c_Bordersize - 1);
    scene.stripes->setStripesVisible(false);
    QTRY_COMPARE(pictures->geometry(), scene.area->rect());
}

void TestRecordStripes::handlesFollowWhatIsAroundTheArea()
{
    Scene scene;
    const QPoint before = scene.middleOf(scene.track()->toSlider());
    scene.pages->move(scene.pages->pos() + QPoint(0, -20)); // as in a sliding page
    QCoreApplication::processEvents();
    QCOMPARE(scene.middleOf(scene.track()->toSlider()), before + QPoint(0, -20));
}

void TestRecordStripes::theUpperPanelTakesTheFullHeightAndBack()
{
    Scene scene;
    FadeStripeView* const top = scene.stripes->eventStripe();
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(top->height() > 100, 5000);
    QTest::qWait(350);
    {
        Pointer pointer(scene.window.get());
        pointer.click(scene.grabOf(top));
        pointer.click(scene.grabOf(top));
    }
    QTRY_COMPARE_WITH_TIMEOUT(top->height(), scene.area->height(), 5000);
    QTRY_VERIFY(top->isFullscreen());
    // Over the lower panel, or its own bar could not be reached, and over the handles.
    QCOMPARE(scene.seenHandles(), 0);
    QVERIFY(top->isAncestorOf(scene.window->childAt(scene.grabOf(top))));
    scene.window->resize(950, 650);
    QTRY_COMPARE(top->height(), scene.area->height());
    QCOMPARE(scene.seenHandles(), 0);
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(!top->isFullscreen() && top->height() < 200, 5000);
    QTRY_COMPARE(scene.seenHandles(), 3);
    QVERIFY(scene.stripes->timeStripe()->isAncestorOf(scene.window->childAt(scene.grabOf(scene.stripes->timeStripe()))));

    // A click on an event leaves the full height, too.
    top->goFullscreen();
    QTRY_VERIFY_WITH_TIMEOUT(top->isFullscreen(), 5000);
    auto* const events = top->findChild<client::EventStripe*>();
    Pointer pointer(scene.window.get());
    pointer.click(events->mapTo(scene.window.get(), events->rectOf(1).center()));
    QTRY_VERIFY_WITH_TIMEOUT(!top->isFullscreen() && top->height() < 200, 5000);
    QTRY_COMPARE(scene.seenHandles(), 3);
}

void TestRecordStripes::theUpperPanelEndsAboveTheLowerOne()
{
    Scene scene;
    FadeStripeView* const top = scene.stripes->eventStripe();
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    const auto gap = [&] { return bottom->geometry().top() - top->geometry().bottom() - 1; };
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(top->height() > 130, 5000);
    QTest::qWait(350);
    const auto dragToTheEnd = [&] {
        Pointer pointer(scene.window.get());
        pointer.move(scene.inWindow(top).bottomLeft() + QPoint(40, -7));
        pointer.press();
        pointer.move(QPoint(40, 400));
        pointer.move(QPoint(40, 590));
        pointer.release();
    };
    dragToTheEnd();
    QCOMPARE(gap(), 0);
    // With the lower one shut there is more room, and less again when it opens.
    scene.clickGrab(bottom);
    QTRY_COMPARE_WITH_TIMEOUT(bottom->height(), c_Bordersize, 5000);
    QTest::qWait(50);
    dragToTheEnd();
    QCOMPARE(gap(), 0);
    scene.clickGrab(bottom);
    QTRY_VERIFY_WITH_TIMEOUT(bottom->height() > 130, 5000);
    QTRY_COMPARE(gap(), 0);
}

void TestRecordStripes::inALowAreaOnePanelShutsTheOther()
{
    Scene scene;
    FadeStripeView* const top = scene.stripes->eventStripe();
    FadeStripeView* const bottom = scene.stripes->timeStripe();
    scene.window->resize(900, 300);
    QCoreApplication::processEvents();
    QVERIFY(bottom->isFadedIn());
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(top->height() > 130 && bottom->height() == c_Bordersize, 5000);
    QTRY_COMPARE(scene.seenHandles(), 0);
    scene.clickGrab(bottom);
    QTRY_VERIFY_WITH_TIMEOUT(bottom->height() > 130 && top->height() == c_Bordersize, 5000);
    QTRY_COMPARE(scene.seenHandles(), 3);
    scene.window->resize(900, 600);
    scene.clickGrab(top);
    QTRY_VERIFY_WITH_TIMEOUT(top->height() > 130, 5000);
    QTest::qWait(350);
    QVERIFY(bottom->isFadedIn());
    scene.window->resize(900, 300); // the time line stays
    QTRY_COMPARE_WITH_TIMEOUT(top->height(), c_Bordersize, 5000);
    QVERIFY(bottom->height() > 130);
}

void TestRecordStripes::aRemovedCameraTakesItsEventsAlong()
{
    Scene scene;
    auto* const events = scene.stripes->eventStripe()->findChild<client::EventStripe*>();
    const int gone = events->events().constFirst().camera;
    const int count = events->events().size();
    scene.fleet.remove(gone);
    QVERIFY(events->events().size() < count);
    for (const client::RecordedEvent& event : events->events()) {
        QVERIFY(event.camera != gone);
    }
    while (!scene.fleet.cameras().isEmpty()) {
        scene.fleet.remove(scene.fleet.cameras().constFirst().id);
    }
    QVERIFY(events->events().isEmpty());
    scene.stripes->runExport(nullptr); // there is nothing to export
    QVERIFY(!scene.stripes->isExporting());
}

void TestRecordStripes::anAcceptedExportRunsToItsEnd()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    bool asked = false;
    whenOpen(scene, [&] {
        asked = true;
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportAccept")));
    });
    {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.find<QPushButton>("timeLineExportButton")));
    }
    QVERIFY(asked);
    QVERIFY(scene.stripes->isExporting());
    QCOMPARE(recorder.names(), QStringList());
    auto* const run = scene.find<QWidget>("exportRun");
    QVERIFY(run && run->isVisible());
    QVERIFY(scene.area->rect().contains(run->geometry()));
    scene.stripes->runExport(nullptr); // one at a time
    QTRY_COMPARE_WITH_TIMEOUT(recorder.names(), QStringList(QStringLiteral("exportFinished")), 10000);
    QCOMPARE(recorder.entries().at(0).arguments.at(0).toBool(), true);
    QVERIFY(!scene.stripes->isExporting());
    QVERIFY(scene.area->findChild<vx::IconOverlayView*>());
    QTRY_VERIFY_WITH_TIMEOUT(!scene.area->findChild<vx::IconOverlayView*>(), 6000);
}

void TestRecordStripes::aRunningExportCanBeStopped()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportAccept")));
    });
    scene.stripes->runExport(scene.bar);
    QTest::qWait(200);
    Pointer pointer(scene.window.get());
    pointer.click(scene.middleOf(scene.find<QPushButton>("exportRunCancel")));
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("exportFinished")));
    QCOMPARE(recorder.entries().at(0).arguments.at(0).toBool(), false);
    QVERIFY(!scene.area->findChild<vx::IconOverlayView*>());
    QTest::qWait(100);
    QVERIFY(!scene.find<QWidget>("exportRun"));
}

void TestRecordStripes::aCancelledPopoverExportsNothing()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportCancel")));
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("exportFinished")));
    QCOMPARE(recorder.entries().at(0).arguments.at(0).toBool(), false);
    QVERIFY(!scene.stripes->isExporting());
    // A click beside it.
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(QPoint(5, 595));
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(recorder.count(QStringLiteral("exportFinished")), 2);
    QVERIFY(!scene.find<QWidget>("exportRun"));
    QTRY_VERIFY(!scene.popover());
}

void TestRecordStripes::whoHasNoRightGetsNoPopover()
{
    Scene scene;
    scene.session.setRole(Session::Role::User);
    SignalRecorder recorder(scene.stripes);
    scene.stripes->runExport(scene.bar);
    QVERIFY(!scene.popover());
    QVERIFY(!scene.stripes->isExporting());
    QCOMPARE(recorder.names(), QStringList());
    QVERIFY(!scene.find<QPushButton>("timeLineExportButton")->isEnabled());
    scene.session.setRole(Session::Role::Administrator);
    QVERIFY(scene.find<QPushButton>("timeLineExportButton")->isEnabled());
}

void TestRecordStripes::logOutEndsAnExport()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportAccept")));
    });
    scene.stripes->runExport(scene.bar);
    QVERIFY(scene.stripes->isExporting());
    scene.session.logOut();
    scene.stripes->setStripesVisible(false);
    QVERIFY(!scene.stripes->isExporting());
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("exportFinished")));
    QCOMPARE(recorder.entries().at(0).arguments.at(0).toBool(), false);
}

void TestRecordStripes::logOutClosesThePopover()
{
    Scene scene;
    SignalRecorder recorder(scene.stripes);
    whenOpen(scene, [&] { scene.session.logOut(); });
    scene.stripes->runExport(scene.bar);
    QVERIFY(!scene.stripes->isExporting());
    QTRY_VERIFY(!scene.popover());
    QCOMPARE(recorder.names(), QStringList(QStringLiteral("exportFinished")));
}

void TestRecordStripes::rowsAndFlagsShowTheSameRange()
{
    Scene scene;
    TimeTrack* const track = scene.track();
    qint64 from = 0;
    qint64 flag = 0;
    QDateTime shown;
    QDateTime expected;
    whenOpen(scene, [&] {
        auto* const fromEdit = scene.row("exportFrom")->findChild<QDateTimeEdit*>();
        auto* const toEdit = scene.row("exportTo")->findChild<QDateTimeEdit*>();
        expected = QDateTime::fromMSecsSinceEpoch(track->to());
        shown = toEdit->dateTime();
        fromEdit->setDateTime(fromEdit->dateTime().addSecs(-3600));
        from = fromEdit->dateTime().toMSecsSinceEpoch();
        QCoreApplication::processEvents();
        flag = track->from();
        scene.popover()->dismiss(false, true);
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(shown, expected);
    QCOMPARE(flag / 1000, from / 1000);
}

void TestRecordStripes::withoutNameOrPasswordNothingIsExported()
{
    Scene scene;
    QVector<bool> enabled;
    whenOpen(scene, [&] {
        auto* const file = scene.row("exportFile")->findChild<QLineEdit*>();
        auto* const password = scene.row("exportPassword")->findChild<QLineEdit*>();
        QWidget* const accept = scene.row("exportAccept");
        enabled << accept->isEnabled();
        const QString name = file->text();
        file->clear();
        enabled << accept->isEnabled();
        file->setText(name);
        enabled << accept->isEnabled() << password->isEnabled();
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportProtect")));
        QCoreApplication::processEvents();
        enabled << accept->isEnabled() << password->isEnabled();
        password->setText(QStringLiteral("secret"));
        enabled << accept->isEnabled();
        scene.popover()->dismiss(false, true);
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(enabled, QVector<bool>({true, false, true, false, false, true, true}));
}

void TestRecordStripes::theAreaMayGoWhileAnExportRuns()
{
    Scene scene;
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportAccept")));
    });
    scene.stripes->runExport(scene.bar);
    QVERIFY(scene.stripes->isExporting());
    QTest::qWait(150);
    delete scene.area.data();
    QVERIFY(!scene.stripes);
    QTest::qWait(100);
    QTRY_VERIFY(scene.window->findChildren<vx::Nubsie*>().isEmpty());
}

void TestRecordStripes::theAreaMayGoWhileThePopoverAsks()
{
    Scene scene;
    whenOpen(scene, [&] { delete scene.area.data(); });
    scene.stripes->runExport(scene.bar);
    QVERIFY(!scene.stripes);
    QTRY_VERIFY(!scene.popover());
    QTRY_VERIFY(scene.window->findChildren<vx::Nubsie*>().isEmpty());

    Scene second;
    whenOpen(second, [&] { second.window.reset(); });
    second.stripes->runExport(second.area);
    QVERIFY(!second.stripes);
}

void TestRecordStripes::theStripesMayGoInASlotOfTheirs()
{
    for (int i = 0; i < 4; ++i) {
        Scene scene;
        const auto end = [&scene] { delete scene.area.data(); };
        QPoint point;
        switch (i) {
        case 0:
            QObject::connect(scene.stripes, &RecordStripes::timeChosen, &scene.session, end);
            point = scene.track()->mapTo(scene.window.get(), QPoint(200, 34));
            break;
        case 1:
            QObject::connect(scene.stripes, &RecordStripes::liveWanted, &scene.session, end);
            point = scene.middleOf(scene.find<QPushButton>("timeLineLiveButton"));
            break;
        case 2:
            QObject::connect(scene.track(), &TimeTrack::rangeChosen, &scene.session, end);
            point = scene.middleOf(scene.track()->fromSlider());
            break;
        default: {
            QObject::connect(scene.stripes, &RecordStripes::cameraChosen, &scene.session, end);
            scene.stripes->eventStripe()->fadein();
            auto* const events = scene.stripes->eventStripe()->findChild<client::EventStripe*>();
            QTRY_VERIFY_WITH_TIMEOUT(events->height() > 90, 5000);
            point = events->mapTo(scene.window.get(), events->rectOf(0).center());
            break;
        }
        }
        Pointer pointer(scene.window.get());
        pointer.move(point);
        pointer.press();
        if (i == 2) {
            pointer.move(point - QPoint(30, 0));
        }
        pointer.release();
        QVERIFY(!scene.stripes);
    }
}

void TestRecordStripes::theAreaMayGoWhenTheExportIsOver()
{
    Scene scene;
    QObject::connect(scene.stripes, &RecordStripes::exportFinished, &scene.session, [&] { delete scene.area.data(); });
    whenOpen(scene, [&] {
        Pointer pointer(scene.window.get());
        pointer.click(scene.middleOf(scene.row("exportAccept")));
    });
    scene.stripes->runExport(scene.bar);
    QTRY_VERIFY_WITH_TIMEOUT(!scene.stripes, 10000);

    Scene second;
    QObject::connect(
        second.stripes, &RecordStripes::exportFinished, &second.session, [&] { delete second.area.data(); });
    whenOpen(second, [&] {
        Pointer pointer(second.window.get());
        pointer.click(second.middleOf(second.row("exportCancel")));
    });
    second.stripes->runExport(second.bar);
    QVERIFY(!second.stripes);
}

void TestRecordStripes::theAreaMayGoWhileAMomentIsTyped()
{
    for (const bool wholeWindow : {false, true}) {
        Scene scene;
        QTRY_COMPARE(scene.seenHandles(), 3);
        scene.stripes->timeLine()->askForMoment();
        QPointer<Controller> popover = scene.find<Controller>("momentPopover");
        QVERIFY(popover);
        if (wholeWindow) {
            scene.window.reset();
        } else {
            QObject::connect(
                scene.stripes, &RecordStripes::timeChosen, &scene.session, [&] { delete scene.area.data(); });
            auto* const edit = popover->findChild<QDateTimeEdit*>();
            edit->setDateTime(edit->dateTime().addSecs(-60));
        }
        QTRY_VERIFY(!scene.stripes);
        QTRY_VERIFY(!popover);
    }
}

void TestRecordStripes::handlesDoNotLieOverTheCardOfAnExport()
{
    Scene scene;
    scene.window->resize(700, 300); // too low for card and time line
    QTRY_COMPARE(scene.seenHandles(), 3);
    whenOpen(scene, [&] {
        scene.popover()->setAccepted();
        scene.popover()->dismiss(false, true);
    });
    scene.stripes->runExport(scene.bar);
    QVERIFY(scene.stripes->isExporting());
    QTest::qWait(50);
    QCOMPARE(scene.seenHandles(), 0);
    scene.window->resize(700, 700);
    QTRY_COMPARE(scene.seenHandles(), 3);
    scene.session.logOut();
}

void TestRecordStripes::theQualityIsDragged()
{
    Scene scene;
    QString before;
    QString after;
    whenOpen(scene, [&] {
        auto* const row = static_cast<vx::PopoverWidget::Item*>(scene.row("exportQuality"));
        before = row->additionalText();
        auto* const slider = row->findChild<vx::MultiNubsieSlider*>();
        const QPoint start = scene.middleOf(slider);
        Pointer pointer(scene.window.get());
        pointer.move(start);
        pointer.press();
        pointer.move(start - QPoint(30, 0));
        pointer.move(start - QPoint(40, 0));
        pointer.release();
        after = row->additionalText();
        scene.popover()->dismiss(false, true);
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(before, QStringLiteral("80 %"));
    QVERIFY(after != before && after.endsWith(QStringLiteral(" %")));
    // Its handle does not stay behind in the window.
    QTRY_COMPARE(scene.window->findChildren<vx::Nubsie*>().size(), 3);
}

void TestRecordStripes::theMomentPopoverGoesWithTheStripes()
{
    Scene scene;
    QTRY_COMPARE(scene.seenHandles(), 3);
    scene.stripes->timeLine()->askForMoment();
    QPointer<Controller> popover = scene.find<Controller>("momentPopover");
    QVERIFY(popover && popover->isVisible());
    scene.stripes->timeLine()->askForMoment(); // one is enough
    QCOMPARE(scene.window->findChildren<Controller*>(QStringLiteral("momentPopover")).size(), 1);
    scene.stripes->setStripesVisible(false);
    QTRY_VERIFY(!popover || !popover->isVisible());
    scene.stripes->setStripesVisible(true);
    QTRY_VERIFY(!popover);
    scene.stripes->timeLine()->askForMoment();
    popover = scene.find<Controller>("momentPopover");
    QVERIFY(popover);
    delete scene.area.data();
    QTRY_VERIFY(!popover);
}

void TestRecordStripes::aNarrowAreaKeepsTheMomentReadable()
{
    Scene scene;
    auto* const moment = scene.find<QLabel>("momentLabel");
    auto* const range = scene.find<QLabel>("rangeLabel");
    scene.stripes->showTime(quint64(scene.track()->begin() + s_day / 2) * 1000);
    QStringList ranges;
    for (int width = 1000; width >= 340; width -= 60) {
        scene.window->resize(width, 500);
        QCoreApplication::processEvents();
        QVERIFY2(moment->width() >= moment->fontMetrics().horizontalAdvance(moment->text())
                || range->text().isEmpty(),
            qPrintable(QString::number(width)));
        QVERIFY(range->text().isEmpty() || range->width() >= range->fontMetrics().horizontalAdvance(range->text()));
        QVERIFY(scene.stripes->timeLine()->rect().contains(scene.find<QPushButton>("timeLineLiveButton")->geometry()));
        ranges << range->text();
    }
    for (int i = 1; i < ranges.size(); ++i) {
        QVERIFY(ranges.at(i).size() <= ranges.at(i - 1).size());
    }
    ranges.removeDuplicates();
    QVERIFY(ranges.size() >= 3);
}

void TestRecordStripes::picturesBelowDoNotRepaintThePanels_data()
{
    QTest::addColumn<bool>("themed");
    QTest::newRow("plain") << false;
    QTest::newRow("themed") << true;
}

// The pictures run at 25 frames a second: what lies over them must not be painted as often.
void TestRecordStripes::picturesBelowDoNotRepaintThePanels()
{
    QFETCH(bool, themed);
    if (themed) {
        zelkov::theme::apply(*qApp, zelkov::theme::Name::Light);
    }
    {
        Scene scene;
        auto* const wall = new QWidget(scene.area);
        wall->lower();
        wall->setGeometry(scene.area->rect());
        wall->show();
        scene.stripes->eventStripe()->fadein();
        QTRY_VERIFY_WITH_TIMEOUT(scene.stripes->eventStripe()->height() > 130, 5000);
        QTest::qWait(300);
        struct Counter : QObject
        {
            bool eventFilter(QObject*, QEvent* event) override
            {
                count += event->type() == QEvent::Paint ? 1 : 0;
                return false;
            }
            int count = 0;
        } panels, walls;
        scene.track()->installEventFilter(&panels);
        scene.stripes->eventStripe()->findChild<client::EventStripe*>()->installEventFilter(&panels);
        wall->installEventFilter(&walls);
        for (int i = 0; i < 20; ++i) {
            wall->update();
            QTest::qWait(10);
        }
        QVERIFY(walls.count >= 15);
        QVERIFY2(panels.count <= 4, qPrintable(QString::number(panels.count)));
    }
}

void TestRecordStripes::aNewThemeComesAtOnce()
{
    {
        Scene scene;
        QTRY_COMPARE(scene.seenHandles(), 3);
        vx::Nubsie* const handle = scene.track()->positionSlider()->getNubsies().constFirst();
        const auto knob = [handle] {
            const QImage icon = handle->icon().toImage();
            return icon.pixelColor(icon.rect().center());
        };
        QPalette green = scene.window->palette();
        green.setColor(QPalette::Highlight, Qt::darkGreen);
        scene.window->setPalette(green);
        QCOMPARE(knob(), QColor(Qt::darkGreen));
        scene.window->setPalette(QPalette());

        QVector<QColor> knobs;
        QVector<QColor> grounds;
        for (const zelkov::theme::Name name : {zelkov::theme::Name::Light, zelkov::theme::Name::Dark}) {
            zelkov::theme::apply(*qApp, name);
            QCoreApplication::processEvents();
            knobs << knob();
            const QImage line = scene.stripes->timeLine()->grab().toImage();
            grounds << line.pixelColor(3, line.height() - 3);
            QCOMPARE(scene.seenHandles(), 3);
        }
        QVERIFY(knobs.at(0) != knobs.at(1));
        QVERIFY(grounds.at(0).lightness() > 200);
        QVERIFY(grounds.at(1).lightness() < 80);
    }
}

void TestRecordStripes::aNewLanguageComesAtOnce()
{
    Scene scene;
    QCOMPARE(scene.find<QPushButton>("timeLineLiveButton")->text(), QStringLiteral("Live"));
    QStringList texts;
    Marking marking;
    whenOpen(scene, [&] {
        QCoreApplication::installTranslator(&marking);
        QCoreApplication::processEvents();
        texts << scene.popover()->title();
        scene.popover()->setAccepted();
        scene.popover()->dismiss(false, true);
    });
    scene.stripes->runExport(scene.bar);
    QCOMPARE(texts, QStringList(QStringLiteral("#Export")));
    QCOMPARE(scene.find<QPushButton>("timeLineLiveButton")->text(), QStringLiteral("#Live"));
    QCOMPARE(scene.find<QPushButton>("exportRunCancel")->text(), QStringLiteral("#Cancel"));
    QCoreApplication::removeTranslator(&marking);
    QCoreApplication::processEvents();
    QCOMPARE(scene.find<QPushButton>("timeLineLiveButton")->text(), QStringLiteral("Live"));
    QCOMPARE(scene.find<QPushButton>("exportRunCancel")->text(), QStringLiteral("Cancel"));
    scene.session.logOut();
}

ZELKOV_TEST_MAIN(TestRecordStripes)
#include "tst_recordstripes.moc"
