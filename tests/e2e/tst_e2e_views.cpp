// SPDX-License-Identifier: MIT
// A real pointer resizes a rubber band, drags an action into a tool bar and turns the wheel over the zoom area.
#include "sliders/MultiNubsieSlider.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "views/CustomToolBar.h"
#include "views/FadeStripeView.h"
#include "views/RubberBandWidget.h"
#include "views/ZoomScrollArea.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QDataStream>
#include <QtCore/QMimeData>
#include <QtCore/QProcess>
#include <QtGui/QDrag>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QScrollBar>

using zelkovtest::SignalRecorder;

namespace
{
QString word(const char* text)
{
    return QString::fromLatin1(text);
}

/// Runs xdotool while the event loop goes on.
void pointer(const QString& script)
{
    QProcess xdotool;
    xdotool.start(word("xdotool"), script.split(QLatin1Char(' ')));
    QVERIFY(xdotool.waitForStarted());
    QTRY_COMPARE_WITH_TIMEOUT(xdotool.state(), QProcess::NotRunning, 20000);
    QCOMPARE(xdotool.exitCode(), 0);
}

QString at(const QWidget& widget, const QPoint& position)
{
    const QPoint global = widget.mapToGlobal(position);
    return QStringLiteral("mousemove %1 %2 sleep 0.03").arg(global.x()).arg(global.y());
}

/// Waits until the window manager has left the window where it is.
void settle(QWidget& window)
{
    window.move(100, 100);
    window.show();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    QPoint last;
    QTRY_VERIFY_WITH_TIMEOUT(
        [&] {
            const QPoint now = window.mapToGlobal(QPoint());
            const bool still = now == last;
            last = now;
            QTest::qWait(150);
            return still;
        }(),
        10000);
}

struct BandScene
{
    BandScene()
        : system(QRectF(0, 0, 1000, 500), &view)
    {
        view.resize(500, 250);
        band = new vx::RubberBandWidget(&system, &view);
        band->setApplicationGeometry(QRectF(200, 100, 200, 150));
        settle(view);
        recorder.add(band);
    }

    QWidget view;
    vx::LinearCoordinateSystem system;
    vx::RubberBandWidget* band;
    SignalRecorder recorder;
};

/// A view of 500 by 500 pixels with a panel at its top: rows of 100, so heights of 15, 130 and 230.
struct StripeScene
{
    StripeScene()
    {
        view.resize(500, 500);
        stripe = new FadeStripeView(FadeView::ePositionTop, new QWidget, &view);
        stripe->setFadeStripeAsPartOfLayout(false);
        stripe->setContentsHeight(100);
        stripe->setRows(1);
        settle(view);
        stripe->resize();
        recorder.add(stripe);
    }

    QPoint handle() const { return QPoint(250, stripe->height() - 8); }

    /// Drags the bar beside the handle by some pixels.
    void drag(int by)
    {
        const QPoint from(100, stripe->height() - 8);
        pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 %2 %3 mouseup 1")
                    .arg(at(view, from), at(view, from + QPoint(0, by / 2)), at(view, from + QPoint(0, by))));
    }

    QWidget view;
    FadeStripeView* stripe;
    SignalRecorder recorder;
};

class ActionSource : public QWidget
{
public:
    using QWidget::QWidget;

protected:
    void mousePressEvent(QMouseEvent*) override { }
    void mouseMoveEvent(QMouseEvent*) override
    {
        QByteArray id;
        QDataStream stream(&id, QIODevice::WriteOnly);
        stream << word("zoom-in");
        auto* const mimeData = new QMimeData;
        mimeData->setData(word("application/action-id"), id);
        auto* const drag = new QDrag(this);
        drag->setMimeData(mimeData);
        drag->exec(Qt::MoveAction);
    }
};
}

class TestE2eViews : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aCornerResizesTheBand();
    void shiftKeepsTheProportions();
    void theInsideMovesTheBand();
    void theCloseButtonIsReached();
    void anActionIsDraggedIntoTheBar_data();
    void anActionIsDraggedIntoTheBar();
    void aBarIsDraggedOntoItself();
    void theWheelZooms();
    void thePanelIsDraggedRowByRow();
    void aDoubleClickTakesTheFullHeight();
};

void TestE2eViews::aCornerResizesTheBand()
{
    BandScene scene;
    pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 %2 %3 mouseup 1")
                .arg(at(scene.view, QPoint(199, 124)), at(scene.view, QPoint(220, 140)),
                    at(scene.view, QPoint(249, 174))));
    QTRY_COMPARE(scene.recorder.count(word("endDrag")), 1);
    QCOMPARE(scene.recorder.count(word("startDrag")), 1);
    QVERIFY(scene.recorder.count(word("dragging")) >= 1);
    QCOMPARE(scene.band->contentsGeometry(), QRect(100, 50, 150, 125));
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 300, 250));
}

void TestE2eViews::shiftKeepsTheProportions()
{
    BandScene scene;
    pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 keydown shift sleep 0.05 %2 %3 mouseup 1 keyup shift")
                .arg(at(scene.view, QPoint(199, 124)), at(scene.view, QPoint(250, 126)),
                    at(scene.view, QPoint(299, 129))));
    QTRY_COMPARE(scene.recorder.count(word("endDrag")), 1);
    QCOMPARE(scene.band->applicationGeometry(), QRectF(200, 100, 400, 300));
}

void TestE2eViews::theInsideMovesTheBand()
{
    BandScene scene;
    pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 %2 %3 mouseup 1")
                .arg(at(scene.view, QPoint(150, 90)), at(scene.view, QPoint(200, 100)),
                    at(scene.view, QPoint(250, 130))));
    QTRY_COMPARE(scene.recorder.count(word("endDrag")), 1);
    QCOMPARE(scene.band->contentsGeometry(), QRect(200, 90, 100, 75));
}

void TestE2eViews::theCloseButtonIsReached()
{
    BandScene scene;
    const QWidget* const button = scene.band->findChild<QWidget*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(button);
    const QList<QWidget*> children = scene.band->findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly);
    for (const QWidget* const child : children) {
        if (child->isVisible()) {
            pointer(at(*child, child->rect().center()) + word(" click 1"));
        }
    }
    QTRY_COMPARE(scene.recorder.count(word("closeClicked")), 1);
    QCOMPARE(scene.recorder.count(word("startDrag")), 0);
}

void TestE2eViews::anActionIsDraggedIntoTheBar_data()
{
    QTest::addColumn<int>("before");
    QTest::newRow("before the second") << 1;
    QTest::newRow("at the end") << -1;
}

void TestE2eViews::anActionIsDraggedIntoTheBar()
{
    QFETCH(int, before);
    QWidget window;
    window.resize(400, 250);
    vx::CustomToolBar bar(&window, true, word("tools"));
    bar.setGeometry(0, 0, 400, 50);
    QList<QAction*> actions;
    for (const char* name : {"one", "two", "three"}) {
        actions << bar.addAction(word(name));
    }
    ActionSource source(&window);
    source.setGeometry(50, 150, 100, 60);
    settle(window);
    SignalRecorder recorder(&bar);
    const QRect place = bar.widgetForAction(actions.at(before < 0 ? 2 : before))->geometry();
    const QPoint target = before < 0 ? place.center() + QPoint(6, 0) : place.topLeft() + QPoint(2, 8);
    pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 %2 %3 %4 sleep 0.1 mouseup 1")
                .arg(at(source, QPoint(50, 30)), at(source, QPoint(60, 10)), at(window, QPoint(100, 90)),
                    at(bar, target)));
    QTRY_COMPARE(recorder.count(word("actionDropped")), 1);
    const QVariantList arguments = recorder.entries().last().arguments;
    QCOMPARE(arguments.at(1).toString(), word("zoom-in"));
    QCOMPARE(arguments.at(2).value<QAction*>(), before < 0 ? nullptr : actions.at(before));
}

void TestE2eViews::aBarIsDraggedOntoItself()
{
    QWidget window;
    window.resize(400, 250);
    vx::CustomToolBar bar(&window, true, word("tools"));
    bar.setGeometry(0, 0, 400, 50);
    bar.addAction(word("one"));
    settle(window);
    SignalRecorder recorder(&bar);
    pointer(QStringLiteral("%1 mousedown 1 sleep 0.05 %2 %3 %4 sleep 0.1 mouseup 1")
                .arg(at(bar, QPoint(300, 20)), at(bar, QPoint(270, 20)), at(window, QPoint(200, 150)),
                    at(bar, QPoint(250, 25))));
    QTRY_COMPARE(recorder.count(word("toolBarDropped")), 1);
}

void TestE2eViews::theWheelZooms()
{
    ZoomScrollArea area;
    area.resize(400, 300);
    auto* const content = new QWidget;
    content->resize(1000, 900);
    area.setWidget(content);
    settle(area);
    SignalRecorder recorder(&area);
    // 4 and 5 are the wheel: over the content, then back over the overlay bar at the right, where the first notch
    // takes the one that is owed.
    pointer(at(area, QPoint(150, 150)) + word(" click 4"));
    QTRY_VERIFY(recorder.count(word("updateZoomFactor")) > 2);
    QCOMPARE(recorder.entries().last().arguments.first().toDouble(), 1.0);
    pointer(at(*area.verticalNicerScrollBar(), area.verticalNicerScrollBar()->rect().center())
        + word(" click 5 click 5"));
    QTRY_COMPARE(recorder.entries().last().arguments.first().toDouble(), -1.0);
    QTRY_COMPARE_WITH_TIMEOUT(recorder.entries().last().arguments.first().toDouble(), 0.0, 3000);
    QCOMPARE(area.verticalScrollBar()->value(), 0);
}

void TestE2eViews::thePanelIsDraggedRowByRow()
{
    StripeScene scene;
    // To just under the second row: it stays there.
    scene.drag(95);
    QTRY_COMPARE(scene.stripe->height(), 224);
    // Back to a bit of the first: that row.
    scene.drag(-130);
    QTRY_COMPARE(scene.stripe->height(), 130);
    // To next to nothing: closed.
    scene.recorder.clear();
    scene.drag(-90);
    QTRY_COMPARE(scene.stripe->height(), 15);
    QTRY_COMPARE(scene.recorder.count(word("fadingOutFinished")), 1);
    QVERIFY(!scene.stripe->isFadedIn());
    // A click on the handle opens it again.
    pointer(at(scene.view, scene.handle()) + word(" click 1"));
    QTRY_COMPARE(scene.stripe->height(), 130);
}

void TestE2eViews::aDoubleClickTakesTheFullHeight()
{
    StripeScene scene;
    pointer(at(scene.view, scene.handle()) + word(" click --repeat 2 --delay 60 1"));
    QTRY_COMPARE(scene.recorder.count(word("fullscreenAppeared")), 1);
    QCOMPARE(scene.stripe->geometry(), scene.view.rect());
    pointer(at(scene.view, scene.handle()) + word(" click --repeat 2 --delay 60 1"));
    QTRY_COMPARE(scene.recorder.count(word("fullscreenLeft")), 1);
    QCOMPARE(scene.stripe->height(), 130);
}

ZELKOV_TEST_MAIN(TestE2eViews)
#include "tst_e2e_views.moc"
