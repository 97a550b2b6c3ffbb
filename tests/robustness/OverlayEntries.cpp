// SPDX-License-Identifier: MIT
// The overlays, frame-time labels and the nine-part icon of indicators/.
#include "controls/DateTimeEdit.h"
#include "indicators/BorderIcon.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/IconOverlayView.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"

#include <QtCore/QCoreApplication>
#include <QtGui/QKeyEvent>
#include <QtWidgets/QLabel>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
Entry busyOverlay()
{
    Entry entry = widgetClass<vx::BusyOverlayView>("BusyOverlayView", "indicators/BusyOverlayView.h");
    entry.exercise = {{"lose the connection", {"updatedLayout"},
        {call(&vx::BusyOverlayView::showBusyOverlay, true), call(&vx::BusyOverlayView::setBusySeconds, 3),
            call(&vx::BusyOverlayView::showBusyText), call(&vx::BusyOverlayView::hideBusyOverlay)}}};
    entry.setters = {
        setter("setBusySeconds", &vx::BusyOverlayView::setBusySeconds),
        setter("setBusyText", &vx::BusyOverlayView::setBusyText),
    };
    return entry;
}

Entry iconOverlay()
{
    Entry entry;
    entry.name = "IconOverlayView";
    entry.header = "indicators/IconOverlayView.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const label = new QLabel(QStringLiteral("!"), host);
        auto* const view = new vx::IconOverlayView(label, host);
        return Subject{view, view};
    };
    entry.exercise = {{"come and go", {}, {call(&vx::IconOverlayView::showIconFor, 20)}},
        {"go at once", {},
            {call<vx::IconOverlayView>(&vx::IconOverlayView::showIcon), call(&vx::IconOverlayView::hideIconNow)}}};
    entry.setters = {
        // Qt warns of an animation that starts with values of neither kind; tst_iconoverlayview has the unknown type.
        {"setAnimationType", {QMetaType::Int},
            [](QObject* view, const QVariantList& values) {
                static_cast<vx::IconOverlayView*>(view)->setAnimationType(
                    values.first().toInt() % 2 == 0 ? vx::IconOverlayView::eatGeometry : vx::IconOverlayView::eatOpacity);
            }},
        setter("showIconFor", &vx::IconOverlayView::showIconFor),
    };
    return entry;
}

Entry timeLabel()
{
    Entry entry;
    entry.name = "TimeLabel";
    entry.header = "indicators/TimeLabel.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const label = new vx::TimeLabel(true, host);
        label->showFrametime(true, 1700000000000000ULL, 20, 4, false, Qt::AlignHCenter | Qt::AlignBottom, true);
        return Subject{label, label};
    };
    entry.exercise = {
        {"click the symbol", {"labelGrabbed", "symbolClicked"},
            {mousePress(QPoint(3, 3), 0), mouseRelease(QPoint(3, 3), 20)}},
        {"put it back", {"reposTimeLabel"},
            {call(&vx::TimeLabel::resizeContent, true)}},
        {"enter a time", {"frametimeUpdate"},
            {[](const Subject& subject) {
                auto* const edit = static_cast<vx::TimeLabel*>(subject.object.data())->getDateTimeEit();
                edit->m_returnLeavesField = false; // Return finishes the edit
                QKeyEvent key(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier);
                QCoreApplication::sendEvent(edit, &key);
            }}},
    };
    entry.setters = {
        setter("setFrametime", &vx::TimeLabel::setFrametime),
        setter("setAnchortime", &vx::TimeLabel::setAnchortime),
        setter("setErrorText", &vx::TimeLabel::setErrorText),
        setter("showFrametime", &vx::TimeLabel::showFrametime),
    };
    return entry;
}

Entry nameTimeLabel()
{
    Entry entry = widgetClass<vx::NameTimeLabel>("NameTimeLabel", "indicators/NameTimeLabel.h");
    entry.exercise = {{"click", {"clicked"}, {mousePress(QPoint(3, 3), 0), mouseRelease(QPoint(3, 3), 20)}}};
    entry.setters = {
        setter("setDeviceName", &vx::NameTimeLabel::setDeviceName),
        setter("setTime", &vx::NameTimeLabel::setTime),
        setter("setDate", &vx::NameTimeLabel::setDate),
    };
    return entry;
}
}

std::vector<Entry> overlayEntries()
{
    return {
        valueClass("BorderIcon", "indicators/BorderIcon.h"),
        busyOverlay(),
        iconOverlay(),
        nameTimeLabel(),
        timeLabel(),
    };
}
}
