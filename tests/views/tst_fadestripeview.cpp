// SPDX-License-Identifier: MIT
// The panel with handle, slider and rows: clicks, drags, double clicks, drops, styles.
#include "sliders/MultiNubsieSlider.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/FadeStripeView.h"
#include "views/FadeStripeViewController.h"

#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QStackedLayout>

using zelkovtest::SignalRecorder;

Q_DECLARE_METATYPE(FadeView::EPositions)

namespace
{
constexpr auto c_Top = FadeView::ePositionTop;
constexpr auto c_Bottom = FadeView::ePositionBottom;

QString word(const char* text)
{
    return QString::fromLatin1(text);
}

QStringList list(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

class OpenStripe : public FadeStripeView
{
public:
    using FadeStripeView::FadeStripeView;
    using FadeView::m_fadeInSize;
    using FadeView::m_fullscreenTransition;
    using FadeView::m_maximumHeight;
    using FadeView::m_minimumSize;
    using FadeView::m_stripeMinimumHeight;
    using FadeStripeView::isMimeTypeAccepted;
};

/// A stripe over a view of 400 by 600 pixels, with rows of 100: heights 15, 130, 230.
struct Scene
{
    explicit Scene(FadeView::EPositions edge = c_Top, bool open = true)
        : top(edge == c_Top)
    {
        view.resize(400, 600);
        contents = new QWidget;
        stripe = new OpenStripe(edge, contents, &view);
        stripe->setFadeStripeAsPartOfLayout(false);
        stripe->setContentsHeight(100);
        stripe->show();
        view.show();
        if (!QTest::qWaitForWindowExposed(&view)) {
            qFatal("no window");
        }
        stripe->setRows(open ? 1 : 0);
        stripe->resize();
        QCoreApplication::processEvents();
        recorder.add(stripe);
    }

    QWidget* bar(bool header) const
    {
        const auto* const layout = stripe->layout();
        return layout->itemAt(header ? 0 : 2)->widget();
    }
    QWidget* movingBar() const { return bar(!top); }
    QPoint onHandle() const { return movingBar()->geometry().center(); }
    QPoint besideHandle() const { return QPoint(50, movingBar()->geometry().center().y()); }

    void send(QEvent::Type type, const QPoint& at)
    {
        const QPoint inWindow = stripe->mapTo(&view, at);
        const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, at, inWindow, view.mapToGlobal(inWindow),
            type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton, buttons, Qt::NoModifier);
        QApplication::sendEvent(stripe, &event);
    }
    void click(const QPoint& at)
    {
        send(QEvent::MouseButtonPress, at);
        send(QEvent::MouseButtonRelease, at);
    }
    /// Drags the moving bar until the panel has the height, and does not let go.
    void dragTo(int height, int steps = 4)
    {
        const QPoint press = besideHandle();
        const int from = stripe->height();
        const int y = stripe->mapTo(&view, press).y();
        send(QEvent::MouseButtonPress, press);
        for (int i = 1; i <= steps; ++i) {
            // On top a panel stays a pixel behind the pointer: odd on purpose.
            const int by = (height - from) * i / steps + (top ? 1 : 0);
            const QPoint inView(50, y + (top ? by : -by));
            send(QEvent::MouseMove, stripe->mapFrom(&view, inView));
            last = inView;
        }
    }
    void letGo() { send(QEvent::MouseButtonRelease, stripe->mapFrom(&view, last)); }

    QStringList without(const QStringList& ignored) const
    {
        QStringList result;
        for (const QString& name : recorder.names()) {
            if (!ignored.contains(name)) {
                result << name;
            }
        }
        return result;
    }
    void wait(const char* signal) const
    {
        QTRY_VERIFY_WITH_TIMEOUT(recorder.count(word(signal)) > 0, 5000);
        QCoreApplication::processEvents();
    }

    bool top;
    QWidget view;
    QWidget* contents;
    OpenStripe* stripe;
    SignalRecorder recorder;
    QPoint last;
};
}

class TestFadeStripeView : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QPointer<QObject>>(); }

    void signalsStandInTheirOrder();
    void theTreeIsAsTold_data();
    void theTreeIsAsTold();
    void theHandleLiesUnderTheSlider();
    void theMaximumIsThatOfTheEdge();
    void rowsAreHeightsWithBothBars();
    void sizesSnapAtTwoThirds();

    void aSizeHintIsClampedAndTold_data();
    void aSizeHintIsClampedAndTold();
    void duringFullHeightTheContentsAreNotTold();
    void distributingTellsTheHeightOfTheContents();
    void openingAndClosingTellsTheHeight_data();
    void openingAndClosingTellsTheHeight();
    void contentsComeAndGoWithThePanel();

    void aClickOnTheHandleToggles_data();
    void aClickOnTheHandleToggles();
    void aClickOnAnInactivePanelIsReported();
    void aPressTellsItsPlace_data();
    void aPressTellsItsPlace();
    void aReleaseTellsItsPlace();
    void aReleaseOnAClosedPanelIsTold();
    void aMoveOfOnePixelSpoilsTheClick();
    void aDragFollowsThePointer_data();
    void aDragFollowsThePointer();
    void aDragTellsAtLeastOneRow();
    void aDragOpensAndClosesOnTheWay();
    void theDragIsClamped();
    void theReleaseSnaps_data();
    void theReleaseSnaps();
    void anInactivePanelIsNotDragged();
    void nothingHappensInATransition();

    void aDoubleClickOnTopTakesTheFullHeightAndBack();
    void aDoubleClickAtTheBottomTakesOneRow();
    void aDoubleClickElsewhereOrClosedDoesNothing();
    void aClickAtFullHeightLeavesIt();
    void atFullHeightTheStripeFollowsItsParent();

    void typesTurnDropsOnAndOff();
    void dropsAreReported();
    void ignoredSourcesAreRefused();
    void stylesNameTheWidgets_data();
    void stylesNameTheWidgets();
    void theControllerFilesStripes();
    void theStripeMayDieOfItsSignals_data();
    void theStripeMayDieOfItsSignals();
};

void TestFadeStripeView::signalsStandInTheirOrder()
{
    const QMetaObject& meta = FadeStripeView::staticMetaObject;
    QStringList names;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        if (meta.method(i).methodType() == QMetaMethod::Signal) {
            names << QString::fromLatin1(meta.method(i).name());
        }
    }
    QCOMPARE(names,
        list("headerPressed footerPressed headerReleased footerReleased headerReleasedFadedOut "
             "footerReleasedFadedOut heightChanged sizeChanged inactiveClicked dragAccepted"));
}

void TestFadeStripeView::theTreeIsAsTold_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::newRow("top") << c_Top;
    QTest::newRow("bottom") << c_Bottom;
}

void TestFadeStripeView::theTreeIsAsTold()
{
    QFETCH(FadeView::EPositions, edge);
    QWidget view;
    view.resize(400, 600);
    auto* const contents = new QWidget;
    OpenStripe stripe(edge, contents, &view);
    QCOMPARE(stripe.height(), 15);
    QCOMPARE(stripe.minimumHeight(), 15);
    QCOMPARE(stripe.maximumHeight(), 15);
    QCOMPARE(stripe.m_stripeMinimumHeight, 15);
    QCOMPARE(stripe.getRows(), 0);
    const auto* const layout = qobject_cast<QVBoxLayout*>(stripe.layout());
    QVERIFY(layout);
    QCOMPARE(layout->spacing(), 0);
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(1)->widget(), contents);
    QCOMPARE(contents->objectName(), word("contentView"));
    QCOMPARE(contents->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored));
    QCOMPARE(stripe.slider()->objectName(), word("fadeStripeNubsieSlider"));
    QWidget* const moving = layout->itemAt(edge == c_Top ? 2 : 0)->widget();
    QWidget* const other = layout->itemAt(edge == c_Top ? 0 : 2)->widget();
    QCOMPARE(moving->minimumHeight(), 15);
    QCOMPARE(moving->maximumHeight(), 15);
    QCOMPARE(other->minimumHeight(), 0);
    QCOMPARE(other->maximumHeight(), 15);
    QCOMPARE(other->sizePolicy(), QSizePolicy(QSizePolicy::Expanding, QSizePolicy::MinimumExpanding));
    QVERIFY(moving->isAncestorOf(stripe.slider()));
    QVERIFY(moving->objectName().isEmpty());
    const QTimer* const timer = stripe.findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(timer && timer->isSingleShot());
    QCOMPARE(timer->interval(), QApplication::doubleClickInterval());
}

void TestFadeStripeView::theHandleLiesUnderTheSlider()
{
    Scene scene;
    const auto* const stack = qobject_cast<QStackedLayout*>(scene.movingBar()->layout());
    QVERIFY(stack);
    QCOMPARE(stack->stackingMode(), QStackedLayout::StackAll);
    QCOMPARE(stack->currentWidget(), scene.stripe->slider());
    QCOMPARE(stack->widget(1), scene.stripe->slider());
    const QObjectList children = scene.movingBar()->children();
    QVERIFY(children.indexOf(stack->widget(0)) < children.indexOf(stack->widget(1)));
    const QWidget* const handle = stack->widget(0)->layout()->itemAt(0)->widget();
    QCOMPARE(handle->maximumWidth(), 35);
    QCOMPARE(handle->width(), 35);
    QVERIFY(qAbs(handle->mapTo(scene.stripe, QPoint()).x() + 17 - 200) <= 1);
}

void TestFadeStripeView::theMaximumIsThatOfTheEdge()
{
    QWidget view;
    view.resize(400, 601);
    OpenStripe top(c_Top, new QWidget, &view);
    OpenStripe bottom(c_Bottom, new QWidget, &view);
    QCOMPARE(top.m_maximumHeight, 601);
    QCOMPARE(bottom.m_maximumHeight, 300);
    bottom.setMaximumHeight(77);
    QCOMPARE(bottom.m_maximumHeight, 77);
    // Not that of the widget.
    QCOMPARE(bottom.maximumHeight(), 15);
}

void TestFadeStripeView::rowsAreHeightsWithBothBars()
{
    Scene scene;
    QCOMPARE(scene.stripe->m_minimumSize, 130);
    scene.stripe->setRows(2);
    QCOMPARE(scene.stripe->height(), 230);
    scene.stripe->setRows(1);
    QCOMPARE(scene.stripe->height(), 130);
    scene.stripe->setRows(0);
    QCOMPARE(scene.stripe->height(), 15);
    QVERIFY(!scene.stripe->isFadedIn());
    // No such row.
    scene.stripe->setRows(9);
    QCOMPARE(scene.stripe->height(), 15);
    scene.stripe->setRows(-1);
    QCOMPARE(scene.stripe->height(), 15);
}

void TestFadeStripeView::sizesSnapAtTwoThirds()
{
    Scene scene;
    QCOMPARE(scene.stripe->snapToSize(66), 15);
    QCOMPARE(scene.stripe->snapToSize(67), 130);
    QCOMPARE(scene.stripe->snapToSize(129), 130);
    QCOMPARE(scene.stripe->snapToSize(130), 130);
    QCOMPARE(scene.stripe->snapToSize(177), 177);
}

void TestFadeStripeView::aSizeHintIsClampedAndTold_data()
{
    QTest::addColumn<int>("size");
    QTest::addColumn<int>("height");
    QTest::addColumn<bool>("open");
    QTest::addColumn<QStringList>("told");
    QTest::newRow("in between") << 150 << 150 << true << list("sizeChanged heightChanged geometryChanged");
    QTest::newRow("just open") << 16 << 16 << true << list("sizeChanged heightChanged geometryChanged");
    QTest::newRow("closed") << 15 << 15 << false
                            << list("sizeChanged heightChanged fadingOutFinished geometryChanged");
    QTest::newRow("below") << -3 << 15 << false
                           << list("sizeChanged heightChanged fadingOutFinished geometryChanged");
    QTest::newRow("above") << 2000 << 600 << true << list("sizeChanged heightChanged geometryChanged");
}

void TestFadeStripeView::aSizeHintIsClampedAndTold()
{
    QFETCH(int, size);
    QFETCH(int, height);
    Scene scene;
    scene.recorder.clear();
    scene.stripe->setSizeHint(size, true);
    QTEST(scene.recorder.names(), "told");
    QCOMPARE(scene.recorder.entries().at(0).arguments.first().toInt(), height - 30);
    QCOMPARE(scene.recorder.entries().at(1).arguments.at(0).toInt(), height);
    QCOMPARE(scene.recorder.entries().at(1).arguments.at(1).toInt(), 0);
    QCOMPARE(scene.stripe->height(), height);
    QTEST(scene.stripe->isFadedIn(), "open");
    QCOMPARE(scene.stripe->slider()->isVisible(), scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->getSizeHint(), height);
}

void TestFadeStripeView::duringFullHeightTheContentsAreNotTold()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.recorder.clear();
    scene.stripe->setSizeHint(200, false);
    QCOMPARE(scene.recorder.count(word("sizeChanged")), 0);
    QCOMPARE(scene.recorder.count(word("heightChanged")), 1);
    scene.wait("fullscreenAppeared");
    scene.recorder.clear();
    scene.stripe->setSizeHint(200, false);
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.count(word("sizeChanged")), 0);
}

void TestFadeStripeView::distributingTellsTheHeightOfTheContents()
{
    Scene scene;
    scene.recorder.clear();
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.names(), list("sizeChanged"));
    QCOMPARE(scene.recorder.entries().first().arguments.first().toInt(), 100);
    scene.stripe->setRows(0);
    scene.recorder.clear();
    scene.stripe->distributeHeight();
    QCOMPARE(scene.recorder.names(), QStringList());
}

void TestFadeStripeView::openingAndClosingTellsTheHeight_data()
{
    theTreeIsAsTold_data();
}

void TestFadeStripeView::openingAndClosingTellsTheHeight()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge, false);
    scene.recorder.clear();
    scene.stripe->fadein(true, false, 200);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.without(list("geometryChanged")), list("fadingIn heightChanged fadingInFinished"));
    QCOMPARE(scene.stripe->height(), 200);
    QVERIFY(scene.stripe->slider()->isVisible());
    scene.recorder.clear();
    scene.stripe->fadeout(true);
    scene.wait("fadingOutFinished");
    QCOMPARE(scene.without(list("geometryChanged")), list("fadingOut heightChanged fadingOutFinished"));
    for (const auto& entry : scene.recorder.entries()) {
        if (entry.name == word("heightChanged")) {
            QCOMPARE(entry.arguments.at(0).toInt(), 15);
            QCOMPARE(entry.arguments.at(1).toInt(), int(edge));
        }
    }
    QVERIFY(scene.stripe->slider()->isHidden());
}

void TestFadeStripeView::contentsComeAndGoWithThePanel()
{
    Scene scene;
    scene.stripe->fadeout(true);
    QVERIFY(!scene.contents->isHidden());
    scene.wait("fadingOutFinished");
    QVERIFY(scene.contents->isHidden());
    scene.stripe->fadein(true);
    QVERIFY(!scene.contents->isHidden());
    scene.wait("fadingInFinished");
}

void TestFadeStripeView::aClickOnTheHandleToggles_data()
{
    theTreeIsAsTold_data();
}

void TestFadeStripeView::aClickOnTheHandleToggles()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    // Only after the time in which a double click could come.
    QCOMPARE(scene.without(list("headerPressed footerPressed")), QStringList());
    scene.wait("fadingOutFinished");
    QVERIFY(!scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->height(), 15);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.wait("fadingInFinished");
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.count(word("headerReleased")) + scene.recorder.count(word("footerReleased")), 0);
}

void TestFadeStripeView::aClickOnAnInactivePanelIsReported()
{
    Scene scene;
    scene.stripe->setActive(false);
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.wait("inactiveClicked");
    QCOMPARE(scene.recorder.names(), list("footerPressed inactiveClicked"));
    QVERIFY(scene.stripe->isFadedIn());
}

void TestFadeStripeView::aPressTellsItsPlace_data()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<QPoint>("at");
    QTest::addColumn<QStringList>("told");
    QTest::newRow("top, header") << c_Top << QPoint(100, 5) << list("headerPressed");
    QTest::newRow("top, contents") << c_Top << QPoint(100, 60) << QStringList();
    QTest::newRow("top, footer") << c_Top << QPoint(100, 120) << list("footerPressed");
    QTest::newRow("bottom, header") << c_Bottom << QPoint(100, 5) << list("headerPressed");
    QTest::newRow("bottom, footer") << c_Bottom << QPoint(100, 120) << list("footerPressed");
}

void TestFadeStripeView::aPressTellsItsPlace()
{
    QFETCH(FadeView::EPositions, edge);
    QFETCH(QPoint, at);
    Scene scene(edge);
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonPress, at);
    QTEST(scene.recorder.names(), "told");
    if (!scene.recorder.entries().isEmpty()) {
        QCOMPARE(scene.recorder.entries().first().arguments.first().toFloat(), 0.25F);
    }
    const bool onMoving = scene.movingBar()->geometry().contains(at);
    QCOMPARE(scene.stripe->cursor().shape() == Qt::OpenHandCursor, onMoving);
    scene.send(QEvent::MouseButtonRelease, at);
    QCOMPARE(scene.stripe->cursor().shape(), Qt::ArrowCursor);
}

void TestFadeStripeView::aReleaseTellsItsPlace()
{
    Scene scene;
    scene.recorder.clear();
    scene.click(QPoint(100, 5));
    scene.click(QPoint(300, 120));
    scene.click(QPoint(300, 60));
    QCOMPARE(scene.recorder.names(), list("headerPressed headerReleased footerPressed footerReleased"));
    QCOMPARE(scene.recorder.entries().at(1).arguments.first().toFloat(), 0.25F);
    QCOMPARE(scene.recorder.entries().at(3).arguments.first().toFloat(), 0.75F);
}

void TestFadeStripeView::aReleaseOnAClosedPanelIsTold()
{
    for (const bool active : {true, false}) {
        Scene scene(c_Top, false);
        scene.stripe->setActive(active);
        QCoreApplication::processEvents();
        scene.recorder.clear();
        scene.click(scene.besideHandle());
        QCOMPARE(scene.recorder.names(),
            active ? list("footerPressed footerReleasedFadedOut") : list("footerPressed inactiveClicked"));
        Scene below(c_Bottom, false);
        below.stripe->setActive(active);
        below.recorder.clear();
        below.click(below.besideHandle());
        QCOMPARE(below.recorder.names(),
            active ? list("headerPressed headerReleasedFadedOut") : list("headerPressed inactiveClicked"));
    }
}

void TestFadeStripeView::aMoveOfOnePixelSpoilsTheClick()
{
    Scene scene;
    scene.recorder.clear();
    const QPoint handle = scene.onHandle();
    scene.send(QEvent::MouseButtonPress, handle);
    scene.send(QEvent::MouseMove, handle + QPoint(1, 0));
    scene.send(QEvent::MouseButtonRelease, handle + QPoint(1, 0));
    // No click, but a snap: the pixel that the drag has cost is made good.
    QCOMPARE(scene.stripe->height(), 129);
    scene.wait("fadingInFinished");
    QCOMPARE(scene.stripe->height(), 130);
    QTest::qWait(QApplication::doubleClickInterval() + 100);
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingOut")), 0);
}

void TestFadeStripeView::aDragFollowsThePointer_data()
{
    theTreeIsAsTold_data();
}

void TestFadeStripeView::aDragFollowsThePointer()
{
    QFETCH(FadeView::EPositions, edge);
    Scene scene(edge);
    for (const int height : {180, 90, 222}) {
        scene.dragTo(height);
        QCOMPARE(scene.stripe->height(), height);
        QCOMPARE(scene.stripe->geometry(), QRect(0, edge == c_Top ? 0 : 600 - height, 400, height));
        QCOMPARE(scene.stripe->cursor().shape(), Qt::ClosedHandCursor);
    }
    scene.letGo();
    QCOMPARE(scene.stripe->cursor().shape(), Qt::ArrowCursor);
    QCOMPARE(scene.stripe->height(), 222);
}

void TestFadeStripeView::aDragTellsAtLeastOneRow()
{
    Scene scene;
    scene.recorder.clear();
    scene.dragTo(60);
    for (const auto& entry : scene.recorder.entries()) {
        if (entry.name == word("sizeChanged")) {
            QCOMPARE(entry.arguments.first().toInt(), 100);
        }
    }
    QVERIFY(scene.recorder.count(word("sizeChanged")) > 0);
    scene.recorder.clear();
    scene.dragTo(190, 1);
    QCOMPARE(scene.without(list("geometryChanged")), list("footerPressed sizeChanged"));
    QCOMPARE(scene.recorder.entries().at(1).arguments.first().toInt(), 160);
    scene.letGo();
}

void TestFadeStripeView::aDragOpensAndClosesOnTheWay()
{
    Scene scene(c_Top, false);
    QCoreApplication::processEvents();
    scene.recorder.clear();
    scene.dragTo(16, 1);
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingIn")), 1);
    scene.dragTo(15, 1);
    QVERIFY(!scene.stripe->isFadedIn());
    QCOMPARE(scene.recorder.count(word("fadingOut")), 1);
    scene.letGo();
    scene.wait("fadingOutFinished");
}

void TestFadeStripeView::theDragIsClamped()
{
    Scene scene;
    scene.stripe->setMaximumHeight(300);
    scene.dragTo(450);
    QCOMPARE(scene.stripe->height(), 300);
    scene.dragTo(-100);
    QCOMPARE(scene.stripe->height(), 15);
    scene.letGo();
    scene.wait("fadingOutFinished");
}

void TestFadeStripeView::theReleaseSnaps_data()
{
    QTest::addColumn<int>("height");
    QTest::addColumn<int>("result");
    QTest::newRow("below 0.66 of a row") << 65 << 15;
    QTest::newRow("at 0.66") << 66 << 130;
    QTest::newRow("nearly a row") << 129 << 130;
    QTest::newRow("a row") << 131 << 131;
    QTest::newRow("more") << 177 << 177;
}

void TestFadeStripeView::theReleaseSnaps()
{
    QFETCH(int, height);
    QFETCH(int, result);
    for (const auto edge : {c_Top, c_Bottom}) {
        Scene scene(edge);
        scene.dragTo(height);
        scene.recorder.clear();
        scene.letGo();
        if (result == height) {
            QCOMPARE(scene.without(list("geometryChanged")), list("sizeChanged heightChanged fadingInFinished"));
        } else if (result == 15) {
            scene.wait("fadingOutFinished");
        } else {
            scene.wait("fadingInFinished");
        }
        QCOMPARE(scene.stripe->height(), result);
        QCOMPARE(scene.stripe->isFadedIn(), result > 15);
    }
}

void TestFadeStripeView::anInactivePanelIsNotDragged()
{
    Scene scene;
    scene.stripe->setActive(false);
    scene.recorder.clear();
    scene.dragTo(180);
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.names(), list("footerPressed"));
    scene.send(QEvent::MouseButtonRelease, QPoint(50, 120));
}

void TestFadeStripeView::nothingHappensInATransition()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.recorder.clear();
    const int height = scene.stripe->height();
    scene.click(scene.onHandle());
    scene.send(QEvent::MouseButtonPress, scene.besideHandle());
    scene.send(QEvent::MouseMove, QPoint(50, 300));
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    QCOMPARE(scene.recorder.names(), QStringList());
    QCOMPARE(scene.stripe->height(), height);
    scene.wait("fullscreenAppeared");
}

void TestFadeStripeView::aDoubleClickOnTopTakesTheFullHeightAndBack()
{
    Scene scene;
    scene.recorder.clear();
    scene.click(scene.onHandle());
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    scene.send(QEvent::MouseButtonRelease, scene.onHandle());
    scene.wait("fullscreenAppeared");
    QVERIFY(scene.stripe->isFullscreen());
    QCOMPARE(scene.stripe->geometry(), QRect(0, 0, 400, 600));
    // The single click was taken back.
    QTest::qWait(QApplication::doubleClickInterval() + 100);
    QCOMPARE(scene.recorder.count(word("leavingFullscreen")), 0);
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    scene.wait("fullscreenLeft");
    QCOMPARE(scene.stripe->height(), 130);
}

void TestFadeStripeView::aDoubleClickAtTheBottomTakesOneRow()
{
    Scene scene(c_Bottom);
    scene.stripe->setSizeHint(200, true);
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonDblClick, scene.onHandle());
    QCOMPARE(scene.stripe->height(), 130);
    QCOMPARE(scene.recorder.names(), list("sizeChanged heightChanged geometryChanged"));
    QVERIFY(!scene.stripe->isFullscreen());
}

void TestFadeStripeView::aDoubleClickElsewhereOrClosedDoesNothing()
{
    Scene scene;
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonDblClick, scene.besideHandle());
    QCOMPARE(scene.recorder.names(), QStringList());
    Scene closed(c_Top, false);
    closed.recorder.clear();
    closed.send(QEvent::MouseButtonDblClick, closed.onHandle());
    QCOMPARE(closed.recorder.names(), QStringList());
}

void TestFadeStripeView::aClickAtFullHeightLeavesIt()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.click(scene.onHandle());
    scene.wait("fullscreenLeft");
    QVERIFY(scene.stripe->isFadedIn());
    QCOMPARE(scene.stripe->height(), 130);
}

void TestFadeStripeView::atFullHeightTheStripeFollowsItsParent()
{
    Scene scene;
    scene.stripe->goFullscreen(true);
    scene.wait("fullscreenAppeared");
    scene.view.resize(420, 500);
    scene.stripe->resize();
    QCOMPARE(scene.stripe->height(), 500);
    // At full height the bar is not dragged.
    scene.recorder.clear();
    scene.dragTo(300);
    QCOMPARE(scene.stripe->height(), 500);
    QCOMPARE(scene.recorder.names(), list("footerPressed"));
    scene.recorder.clear();
    scene.send(QEvent::MouseButtonRelease, scene.besideHandle());
}

void TestFadeStripeView::typesTurnDropsOnAndOff()
{
    Scene scene;
    QVERIFY(!scene.stripe->acceptDrops());
    scene.stripe->addAcceptedMimeType(word("text/plain"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->addAcceptedMimeType(word("text/html"));
    QCOMPARE(scene.stripe->acceptedMimeTypes(), list("text/plain text/html"));
    scene.stripe->removeAcceptedMimeType(word("text/plain"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->removeAcceptedMimeType(word("text/html"));
    QVERIFY(!scene.stripe->acceptDrops());
    scene.stripe->setAcceptedMimeTypes(list("a/b"));
    QVERIFY(scene.stripe->acceptDrops());
    scene.stripe->setAcceptedMimeTypes({});
    QVERIFY(!scene.stripe->acceptDrops());
}

void TestFadeStripeView::dropsAreReported()
{
    Scene scene;
    scene.stripe->setAcceptedMimeTypes(list("text/plain"));
    QString text;
    int pos = 0;
    connect(scene.stripe, &FadeStripeView::dragAccepted, this,
        [&](const QPointer<QObject>& source, const QMimeData& data, int at) {
            QVERIFY(!source);
            text = data.text();
            pos = at;
        });
    QMimeData data;
    data.setText(word("camera 7"));
    QMimeData other;
    other.setData(word("a/b"), "x");
    for (QMimeData* const dragged : {&data, &other}) {
        const bool wanted = dragged == &data;
        QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &enter);
        QCOMPARE(enter.isAccepted(), wanted);
        QDragMoveEvent move(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &move);
        QCOMPARE(move.isAccepted() && wanted, wanted);
        text.clear();
        QDropEvent drop(QPoint(5, 5), Qt::CopyAction, dragged, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(scene.stripe, &drop);
        QCOMPARE(text, wanted ? word("camera 7") : QString());
    }
    QCOMPARE(pos, -1);
}

void TestFadeStripeView::ignoredSourcesAreRefused()
{
    Scene scene;
    QObject one;
    QObject two;
    scene.stripe->setIgnoredSources({&one, &one, nullptr, &two});
    QCOMPARE(scene.stripe->ignoredSources(), (QList<QObject*>{&one, &two}));
    scene.stripe->removeIgnoredSource(&one);
    QCOMPARE(scene.stripe->ignoredSources(), QList<QObject*>{&two});
    scene.stripe->addIgnoredSource(&two);
    scene.stripe->addIgnoredSource(&one);
    QCOMPARE(scene.stripe->ignoredSources(), (QList<QObject*>{&two, &one}));
    // A drag from another program has no source: never ignored.
    scene.stripe->setAcceptedMimeTypes(list("text/plain"));
    QMimeData data;
    data.setText(word("x"));
    QDropEvent drop(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QVERIFY(scene.stripe->isMimeTypeAccepted(&drop));
}

void TestFadeStripeView::stylesNameTheWidgets_data()
{
    QTest::addColumn<int>("style");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("default") << 0 << list("header footer grab");
    QTest::newRow("red") << 1 << list("header-red footer-red grab-red");
    QTest::newRow("green") << 2 << list("header-green footer-green grab-green");
    QTest::newRow("grey") << 3 << list("header-solid-grey footer-solid-grey grab");
    QTest::newRow("blue") << 4 << list("header-solid-blue footer-solid-blue grab");
}

void TestFadeStripeView::stylesNameTheWidgets()
{
    QFETCH(int, style);
    Scene scene;
    using Setter = void (FadeStripeView::*)();
    const Setter setters[] = {&FadeStripeView::setStyleDefault, &FadeStripeView::setStyleRed,
        &FadeStripeView::setStyleGreen, &FadeStripeView::setStyleSolidGrey, &FadeStripeView::setStyleSolidBlue};
    (scene.stripe->*setters[style])();
    QWidget* const handle = scene.movingBar()->layout()->itemAt(0)->widget()->layout()->itemAt(0)->widget();
    const auto names
        = [&] { return QStringList{scene.bar(true)->objectName(), scene.bar(false)->objectName(), handle->objectName()}; };
    QTEST(names(), "names");
    // Nothing if the header has its name, whatever became of the others.
    handle->setObjectName(word("other"));
    (scene.stripe->*setters[style])();
    QCOMPARE(handle->objectName(), word("other"));
    FadeStripeView::updateStyle(nullptr, word("x"));
}

void TestFadeStripeView::theControllerFilesStripes()
{
    Scene scene;
    FadeStripeViewController* const files = FadeStripeViewController::getInstance();
    QCOMPARE(files, FadeStripeViewController::getInstance());
    QCOMPARE(int(FadeStripeViewController::efspTop), 0);
    QCOMPARE(int(FadeStripeViewController::efspBottom), 2);
    QCOMPARE(int(FadeStripeViewController::efspWestern), 3);
    QVERIFY(!files->getTopFadeStripe(&scene.view));
    files->setTopFadeStripe(scene.stripe, &scene.view);
    QCOMPARE(files->getFadeStripe(&scene.view, FadeStripeViewController::efspTop), scene.stripe);
    QVERIFY(!files->getBottomFadeStripe(&scene.view));
    QVERIFY(!files->getWesternFadeStripe(&scene.view));
    files->setFadeStripe(scene.stripe, &scene.view, FadeStripeViewController::efspWestern);
    QCOMPARE(files->getWesternFadeStripe(&scene.view), scene.stripe);
    files->setBottomFadeStripe(scene.stripe, &scene.view);
    QCOMPARE(files->getBottomFadeStripe(&scene.view), scene.stripe);
    files->setTopFadeStripe(nullptr, &scene.view);
    files->setBottomFadeStripe(nullptr, &scene.view);
    files->setWesternFadeStripe(nullptr, &scene.view);
    QVERIFY(!files->getTopFadeStripe(&scene.view));
}

void TestFadeStripeView::theStripeMayDieOfItsSignals_data()
{
    QTest::addColumn<int>("nth");
    QTest::addColumn<int>("use");
    for (int use = 0; use < 4; ++use) {
        for (int nth = 1; nth <= 5; ++nth) {
            QTest::addRow("%d %d", use, nth) << nth << use;
        }
    }
}

void TestFadeStripeView::theStripeMayDieOfItsSignals()
{
    QFETCH(int, nth);
    QFETCH(int, use);
    Scene scene(c_Top, use != 1);
    const QPointer<OpenStripe> stripe(scene.stripe);
    int left = nth;
    const auto die = [&] {
        if (--left == 0) {
            delete stripe;
        }
    };
    connect(stripe, &FadeView::geometryChanged, this, die);
    connect(stripe, &FadeView::fadingIn, this, die);
    connect(stripe, &FadeView::fadingOut, this, die);
    connect(stripe, &FadeView::fadingInFinished, this, die);
    connect(stripe, &FadeView::fadingOutFinished, this, die);
    connect(stripe, &FadeStripeView::headerPressed, this, die);
    connect(stripe, &FadeStripeView::footerPressed, this, die);
    connect(stripe, &FadeStripeView::sizeChanged, this, die);
    connect(stripe, &FadeStripeView::heightChanged, this, die);
    const QPoint press = scene.besideHandle();
    const auto send = [&](QEvent::Type type, const QPoint& at) {
        if (stripe) {
            scene.send(type, at);
        }
    };
    switch (use) {
    case 0:
        stripe->setSizeHint(15, true);
        break;
    case 1:
        send(QEvent::MouseButtonPress, press);
        send(QEvent::MouseMove, press + QPoint(0, 100));
        send(QEvent::MouseButtonRelease, press + QPoint(0, 100));
        break;
    case 2:
        send(QEvent::MouseButtonPress, press);
        send(QEvent::MouseMove, press + QPoint(0, 70));
        send(QEvent::MouseButtonRelease, press + QPoint(0, 70));
        break;
    default:
        stripe->fadeout(true);
        break;
    }
    QTest::qWait(20);
}

ZELKOV_TEST_MAIN(TestFadeStripeView)
#include "tst_fadestripeview.moc"
