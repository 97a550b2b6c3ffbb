// SPDX-License-Identifier: MIT
// The classes of foundation/.
#include "foundation/AlignedWidget.h"
#include "foundation/FadableThing.h"
#include "foundation/OpacityAnimation.h"
#include "foundation/TFadingWidget.h"

#include <QtWidgets/QLabel>

#include "Registry.h"
#include "Suites.h"

namespace zelkovtest
{
namespace
{
Entry alignedWidget()
{
    Entry entry;
    entry.name = "AlignedWidget";
    entry.header = "foundation/AlignedWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        vx::AlignedWidget* const widget = new vx::AlignedWidget(new QLabel(QStringLiteral("child")), host);
        return Subject{widget, widget};
    };
    entry.exercise = {{"ask", {}, {[](const Subject& subject) {
        static_cast<vx::AlignedWidget*>(subject.object.data())->qchild();
    }}}};
    return entry;
}

Entry opacityAnimation()
{
    Entry entry;
    entry.name = "OpacityAnimation";
    entry.header = "foundation/OpacityAnimation.h";
    entry.kind = Kind::Object;
    entry.create = [](QWidget* host) {
        // A plain widget: that of a FadableThing belongs to it alone and nobody else may delete it.
        QWidget* const widget = new QWidget(host);
        widget->resize(150, 100);
        OpacityAnimation* const animation = new OpacityAnimation(widget);
        animation->setOpacity(1.0);
        animation->setFadingTimes(20, 20);
        return Subject{animation, widget};
    };
    entry.exercise = {
        {"fade out and in", {"didFadeOut", "didFadeIn"},
            {call(&OpacityAnimation::fadeOut), waitFor("didFadeOut"), call(&OpacityAnimation::fadeIn),
                waitFor("didFadeIn")}},
        {"fade the children along", {},
            {call(&OpacityAnimation::setFadeChildren, true), call(&OpacityAnimation::fadeOut), waitFor("didFadeOut"),
                call(&OpacityAnimation::setFadeChildren, false)}},
    };
    entry.setters = {
        setter("fadeIn", &OpacityAnimation::fadeIn),
        setter("fadeOut", &OpacityAnimation::fadeOut),
        setter("setFadingTimes", &OpacityAnimation::setFadingTimes),
        setter("setOpacity", &OpacityAnimation::setOpacity),
        setter("setAutoHide", &OpacityAnimation::setAutoHide),
        setter("setFadeChildren", &OpacityAnimation::setFadeChildren),
    };
    return entry;
}

Entry fadableThing()
{
    Entry entry = widgetClass<FadableThing<QWidget>>("FadableThing", "foundation/FadableThing.h");
    entry.exercise = {{"fade", {}, {[](const Subject& subject) {
        static_cast<FadableThing<QWidget>*>(subject.object.data())->fader()->fadeIn();
    }}}};
    return entry;
}

using Button = vx::TFadingWidget<QPushButton>;

// What FadingWidget does for any widget is driven through the button.
Entry fadingButton()
{
    Entry entry;
    entry.name = "TFadingWidget";
    entry.header = "foundation/TFadingWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        Button* const button = new Button(host, 10, 20, QColor(Qt::red), 0, 255, true);
        button->resize(80, 30);
        return Subject{button, button};
    };
    const auto on = [](const Subject& subject) { return static_cast<Button*>(subject.object.data()); };
    entry.exercise = {{"pulse", {},
        {[on](const Subject& subject) {
            on(subject)->startFading();
            paint(subject.widget);
            paint(subject.widget);
            on(subject)->stopFading();
        },
            [on](const Subject& subject) {
                on(subject)->fadeOnce();
                on(subject)->badge().setBadgeBusy(true);
                paint(subject.widget);
            }}}};
    entry.setters = {
        setter("enableShadow", &Button::enableShadow),
        {"setAlpha", {QMetaType::Int},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setAlpha(values.at(0).toInt());
            }},
        {"setOverlay", {QMetaType::QString, QMetaType::Int, QMetaType::QPoint},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setOverlay(values.at(0).toString(),
                    Qt::Alignment(QFlag(values.at(1).toInt())), values.at(2).toPoint());
            }},
        {"startFading", {}, [](QObject* object, const QVariantList&) { static_cast<Button*>(object)->startFading(); }},
        {"fadeOnce", {}, [](QObject* object, const QVariantList&) { static_cast<Button*>(object)->fadeOnce(); }},
        setter("stopFading", &Button::stopFading),
    };
    return entry;
}
}

std::vector<Entry> foundationEntries()
{
    return {
        alignedWidget(),
        fadableThing(),
        valueClass("FadingWidget", "foundation/FadingWidget.h"),
        valueClass("LogStatement", "foundation/LogStatement.h"),
        opacityAnimation(),
        fadingButton(),
        valueClass("ValueRange", "foundation/ValueRange.h"),
    };
}
}
