// SPDX-License-Identifier: MIT
// The classes of views/.
#include "views/CustomToolBar.h"
#include "views/FadeStripeView.h"
#include "views/FadeView.h"
#include "views/NavigationViewController.h"
#include "views/RubberBandWidget.h"
#include "views/WidgetSlideshow.h"
#include "views/ZoomScrollArea.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QDataStream>
#include <QtCore/QMimeData>
#include <QtCore/QTimer>
#include <QtGui/QContextMenuEvent>
#include <QtGui/QDropEvent>
#include <QtGui/QWheelEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QMenu>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollBar>

#include <memory>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
constexpr QPoint c_viewsCentre(60, 40);

Step viewsDrop(const char* format)
{
    return [format](const Subject& subject) {
        QByteArray id;
        QDataStream stream(&id, QIODevice::WriteOnly);
        stream << QStringLiteral("an id");
        QMimeData data;
        data.setData(QLatin1String(format), id);
        const QPoint place(40, 10);
        QDragEnterEvent enterEvent(place, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(subject.widget, &enterEvent);
        QDragMoveEvent moveEvent(place, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(subject.widget, &moveEvent);
        QDropEvent drop(place, Qt::MoveAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(subject.widget, &drop);
    };
}

// --- Rubber band
// -------------------------------------------------------------------------------------------------

Step viewsFocus(QEvent::Type type)
{
    return [type](const Subject& subject) {
        QFocusEvent event(type, Qt::OtherFocusReason);
        QApplication::sendEvent(subject.widget, &event);
    };
}

Entry rubberBandWidget()
{
    using vx::RubberBandWidget;
    Entry entry;
    entry.name = "RubberBandWidget";
    entry.header = "views/RubberBandWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const band = new RubberBandWidget(nullptr, host);
        const std::shared_ptr<vx::LinearCoordinateSystem> system
            = std::make_shared<vx::LinearCoordinateSystem>(QRectF(0, 0, 1, 1), host);
        // The connection holds it for as long as the band lives.
        QObject::connect(band, &QObject::destroyed, band, [system] {});
        band->setCoordinateSystem(system.get());
        band->setApplicationGeometry(QRectF(0.1, 0.1, 0.6, 0.6));
        band->setLabel(QStringLiteral("Door"));
        return Subject {band, band};
    };
    entry.exercise = {
        {"hover", {"mouseEntered", "mouseLeft"}, {enter(c_viewsCentre), leave()}},
        {"move", {"startDrag", "dragging", "endDrag"},
            {mousePress(c_viewsCentre, 0), mouseMove(QPoint(70, 50), 10), mouseRelease(QPoint(70, 50), 20)}},
        {"resize", {},
            {mousePress(QPoint(1, 1), 0), mouseMove(QPoint(-9, -9), 10), mouseRelease(QPoint(-9, -9), 20)}},
        {"focus", {"focused", "focusLost"}, {viewsFocus(QEvent::FocusIn), viewsFocus(QEvent::FocusOut)}},
        {"select", {"selected", "selectionLost"},
            {call(&RubberBandWidget::select, true), call(&RubberBandWidget::select, false)}},
        // By hand and not with click(): the button touches itself again after its signal unless it lives.
        {"close", {"closeClicked"}, {[](const Subject& subject) {
             QMetaObject::invokeMethod(subject.object, "onClose", Qt::DirectConnection);
         }}},
    };
    entry.setters = {
        setter("setApplicationGeometry", &RubberBandWidget::setApplicationGeometry),
        setter("setAspectRatio", &RubberBandWidget::setAspectRatio),
        setter("setContentsGeometry", &RubberBandWidget::setContentsGeometry),
        setter("setLabel", &RubberBandWidget::setLabel),
        setter("setFrameColor", &RubberBandWidget::setFrameColor),
        setter("setFrameWidth", &RubberBandWidget::setFrameWidth),
        setter("setBackgroundColor", &RubberBandWidget::setBackgroundColor),
        setter("setBackgroundTransparency", &RubberBandWidget::setBackgroundTransparency),
        setter("setColors", &RubberBandWidget::setColors),
        setter("select", &RubberBandWidget::select),
        setter("startDragging", &RubberBandWidget::startDragging),
    };
    return entry;
}

// --- Panel
// -------------------------------------------------------------------------------------------------------

Entry fadeView()
{
    Entry entry;
    entry.name = "FadeView";
    entry.header = "views/FadeView.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const view = new FadeView(FadeView::ePositionTop, nullptr, host);
        view->setFadeStripeAsPartOfLayout(false);
        return Subject {view, view};
    };
    entry.exercise = {
        {"open", {"geometryChanged", "fadingIn", "fadingInFinished"},
            {call(&FadeView::fadein, true, false, 60), waitFor("fadingInFinished")}},
        {"close", {"fadingOut", "fadingOutFinished"},
            {call(&FadeView::fadeout, true, false), waitFor("fadingOutFinished")}},
        {"full height", {"appearingFullscreen", "fullscreenAppeared"},
            {call(&FadeView::goFullscreen, true), waitFor("fullscreenAppeared")}},
        {"full height and back", {"leavingFullscreen", "changeViewOrientation", "fullscreenLeft"},
            {call(&FadeView::goFullscreen, true), waitFor("fullscreenAppeared"),
                call(&FadeView::exitFullscreen, true), waitFor("fullscreenLeft")}},
    };
    entry.setters = {
        setter("resize", static_cast<void (FadeView::*)(int, int)>(&FadeView::resize)),
        setter("setSizeHint", &FadeView::setSizeHint),
        setter("setNeighbourSize", &FadeView::setNeighbourSize),
        setter("setVerticalOffset", &FadeView::setVerticalOffset),
        setter("setFadeStripeAsPartOfLayout", &FadeView::setFadeStripeAsPartOfLayout),
        setter("fadein", &FadeView::fadein),
        setter("fadeout", &FadeView::fadeout),
        setter("goFullscreen", &FadeView::goFullscreen),
        setter("exitFullscreen", &FadeView::exitFullscreen),
        setter("setActive", &FadeView::setActive),
    };
    return entry;
}

Entry fadeStripeView()
{
    Entry entry = fadeView();
    entry.name = "FadeStripeView";
    entry.header = "views/FadeStripeView.h";
    entry.create = [](QWidget* host) {
        auto* const stripe = new FadeStripeView(FadeView::ePositionTop, nullptr, host);
        stripe->setFadeStripeAsPartOfLayout(false);
        stripe->setContentsHeight(40);
        stripe->setRows(1);
        return Subject {stripe, stripe};
    };
    constexpr QPoint header(20, 5);
    constexpr QPoint footer(20, 60);
    // The bars of an open panel can be reached for a moment when it has begun to close.
    const Step close = call(&FadeStripeView::fadeout, true, false);
    const std::vector<Script> own = {
        {"header", {"headerPressed", "headerReleased"}, {mousePress(header, 0), mouseRelease(header, 10)}},
        {"footer", {"footerPressed", "footerReleased"}, {mousePress(footer, 0), mouseRelease(footer, 10)}},
        {"header while closing", {"headerReleasedFadedOut"},
            {close, mousePress(header, 0), mouseRelease(header, 10)}},
        {"footer while closing", {"footerReleasedFadedOut"},
            {close, mousePress(footer, 0), mouseRelease(footer, 10)}},
        {"inactive", {"inactiveClicked"},
            {close, call(&FadeStripeView::setActive, false), mousePress(header, 0), mouseRelease(header, 10)}},
        {"drag", {"sizeChanged", "heightChanged"},
            {mousePress(footer, 0), mouseMove(footer + QPoint(0, 30), 10),
                mouseRelease(footer + QPoint(0, 30), 20)}},
        {"double click", {},
            {mousePress(QPoint(100, 60), 0), mouseRelease(QPoint(100, 60), 10),
                mouseDoubleClick(QPoint(100, 60), 20), mouseRelease(QPoint(100, 60), 30)}},
        {"drop", {"dragAccepted"},
            {[](const Subject& subject) {
                 static_cast<FadeStripeView*>(subject.object.data())
                     ->addAcceptedMimeType(QStringLiteral("application/action-id"));
             },
                viewsDrop("application/action-id")}},
    };
    entry.exercise.insert(entry.exercise.end(), own.begin(), own.end());
    const std::vector<Setter> setters = {
        setter("setContentsHeight", &FadeStripeView::setContentsHeight),
        setter("setRows", &FadeStripeView::setRows),
        setter("setMaximumHeight", &FadeStripeView::setMaximumHeight),
        setter("setSizeHint", &FadeStripeView::setSizeHint),
    };
    entry.setters.insert(entry.setters.end(), setters.begin(), setters.end());
    return entry;
}

// --- Pages
// -------------------------------------------------------------------------------------------------------

Entry navigationViewController()
{
    using vx::NavigationViewController;
    Entry entry;
    entry.name = "NavigationViewController";
    entry.header = "views/NavigationViewController.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const pages = new NavigationViewController(30, QEasingCurve::Linear, host);
        for (int i = 0; i < 3; ++i) {
            pages->addWidget(new QPushButton(QString::number(i)));
        }
        return Subject {pages, pages};
    };
    entry.exercise = {
        {"slide", {"viewWillDisappear", "viewWillAppear", "viewDidDisappear", "viewDidAppear"},
            {call(&NavigationViewController::setCurrentIndexWithAnimation, 1), waitFor("viewDidAppear"),
                call(&NavigationViewController::setCurrentIndex, 2)}},
    };
    entry.setters = {
        setter("setCurrentIndex", &NavigationViewController::setCurrentIndex),
        setter("setCurrentIndexWithAnimation", &NavigationViewController::setCurrentIndexWithAnimation),
    };
    return entry;
}

Entry widgetSlideshow()
{
    using vx::WidgetSlideshow;
    Entry entry = navigationViewController();
    entry.name = "WidgetSlideshow";
    entry.header = "views/WidgetSlideshow.h";
    entry.create = [](QWidget* host) {
        auto* const pages = new WidgetSlideshow({new QPushButton, new QPushButton, new QPushButton}, host);
        return Subject {pages, pages};
    };
    return entry;
}

// --- Zoom
// --------------------------------------------------------------------------------------------------------

Step viewsWheel(int angle)
{
    return [angle](const Subject& subject) {
        QWidget* const viewport = static_cast<QAbstractScrollArea*>(subject.widget.data())->viewport();
        QWheelEvent event(c_viewsCentre, viewport->mapToGlobal(c_viewsCentre), QPoint(), QPoint(0, angle),
            Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(viewport, &event);
    };
}

Entry zoomScrollArea()
{
    Entry entry = widgetClass<ZoomScrollArea>("ZoomScrollArea", "views/ZoomScrollArea.h");
    entry.create = [](QWidget* host) {
        auto* const area = new ZoomScrollArea(host);
        area->resize(180, 120);
        auto* const content = new QWidget;
        content->resize(900, 700);
        area->setWidget(content);
        return Subject {area, area};
    };
    entry.exercise = {
        {"wheel", {"updateZoomFactor"}, {viewsWheel(120), waitFor("updateZoomFactor"), viewsWheel(-240)}},
        {"scroll", {"scrollAreaChanged"}, {[](const Subject& subject) {
             static_cast<QScrollArea*>(subject.widget.data())->verticalScrollBar()->setValue(50);
         }}},
    };
    entry.setters = {
        setter("enableScrollbars", &ZoomScrollArea::enableScrollbars),
        setter("setTouchActive", &ZoomScrollArea::setTouchActive),
    };
    return entry;
}

// --- Tool bar
// ----------------------------------------------------------------------------------------------------

// Opens the menu of the first action and chooses the entry that removes it.
void viewsRemoveFirstItem(const Subject& subject)
{
    auto* const bar = static_cast<QToolBar*>(subject.widget.data());
    const QPoint place = bar->widgetForAction(bar->actions().first())->geometry().center();
    QTimer::singleShot(0, qApp, [] {
        if (auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
            const QList<QAction*> all = menu->actions();
            for (QAction* const action : all) {
                if (action->text() == QLatin1String("Remove Item")) {
                    menu->setActiveAction(action);
                    QKeyEvent press(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier);
                    QApplication::sendEvent(menu, &press);
                    return;
                }
            }
        }
    });
    QContextMenuEvent event(QContextMenuEvent::Mouse, place, bar->mapToGlobal(place));
    QApplication::sendEvent(bar, &event);
}

Entry customToolBar()
{
    using vx::CustomToolBar;
    Entry entry;
    entry.name = "CustomToolBar";
    entry.header = "views/CustomToolBar.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const bar = new CustomToolBar(QStringLiteral("Tools"), host, true, QStringLiteral("tools"));
        bar->addAction(QStringLiteral("One"));
        bar->addAction(QStringLiteral("Two"));
        bar->resize(180, 40);
        return Subject {bar, bar};
    };
    entry.exercise = {
        {"drop an action", {"actionDropped"}, {viewsDrop("application/action-id")}},
        {"drop a bar", {"toolBarDropped"}, {viewsDrop("application/toolbar-id")}},
        {"remove an action", {"actionRemoved"}, {viewsRemoveFirstItem}},
        {"press and drag", {},
            {mousePress(QPoint(150, 10), 0), mouseMove(QPoint(150, 60), 10), mouseRelease(QPoint(150, 60), 20)}},
    };
    return entry;
}
}

std::vector<Entry> viewsEntries()
{
    return {
        customToolBar(),
        valueClass("DropPosition", "views/DropPosition.h"),
        fadeStripeView(),
        valueClass("FadeStripeViewController", "views/FadeStripeViewController.h"),
        fadeView(),
        navigationViewController(),
        valueClass("PanelGeometry", "views/PanelGeometry.h"),
        valueClass("RubberBandGeometry", "views/RubberBandGeometry.h"),
        rubberBandWidget(),
        widgetSlideshow(),
        valueClass("ZoomLaw", "views/ZoomLaw.h"),
        zoomScrollArea(),
    };
}
}
