// SPDX-License-Identifier: MIT
// The click buttons and the clickable widget of input/.
#include "input/CustomClickQWidget.h"
#include "input/CustomContextClickToolButton.h"
#include "input/TCustomClickWidget.h"

#include <QtGui/QContextMenuEvent>
#include <QtWidgets/QApplication>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
constexpr QPoint c_middle(20, 15);
constexpr QPoint c_arrow(72, 15);

/// Reports its state as a subclass may: the class itself leaves toggled() alone.
class SwitchingWidget : public vx::CustomClickQWidget
{
public:
    using vx::CustomClickQWidget::CustomClickQWidget;

protected:
    void mousePressEvent(QMouseEvent* event) override
    {
        const QPointer<QWidget> guard = this;
        vx::CustomClickQWidget::mousePressEvent(event);
        if (!guard.isNull()) {
            nextCheckState();
        }
    }
    void nextCheckState() override
    {
        m_on = !m_on;
        Q_EMIT toggled(m_on);
    }

private:
    bool m_on = false;
};

Step rightClick(const QPoint& position)
{
    return [=](const Subject& subject) {
        QContextMenuEvent event(QContextMenuEvent::Mouse, position, subject.widget->mapToGlobal(position));
        QApplication::sendEvent(subject.widget, &event);
    };
}

template <class Button> Entry clickButton(const char* name, const char* header)
{
    Entry entry;
    entry.name = name;
    entry.header = header;
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        Button* const button = new Button(host, 20, true);
        button->setPopupMode(QToolButton::MenuButtonPopup);
        button->setCheckable(true);
        button->resize(80, 30);
        return Subject {button, button};
    };
    entry.exercise = {
        {"click and leave", {"pressed", "released", "clicked"},
            {mousePress(c_middle, 0), leave(), mouseMove(c_middle, 5), mouseRelease(c_middle, 10)}},
        {"hold", {"toggled"}, {mousePress(c_middle, 0), waitFor("toggled"), mouseRelease(c_middle, 100)}},
        {"arrow", {}, {mousePress(c_arrow, 0), mouseRelease(c_arrow, 10)}},
        {"arrow, released elsewhere", {}, {mousePress(c_arrow, 0), mouseRelease(c_middle, 10)}},
        {"right click", {}, {rightClick(c_middle)}},
    };
    entry.setters = {
        {"setLongClickSpan", {QMetaType::Int},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setLongClickSpan(values.at(0).toInt());
            }},
        {"setAutoClick", {QMetaType::Bool},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setAutoClick(values.at(0).toBool());
            }},
        {"setAdminOnly", {QMetaType::Bool},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setAdminOnly(values.at(0).toBool());
            }},
        {"setSecurityCheck", {QMetaType::QString},
            [](QObject* object, const QVariantList& values) {
                static_cast<Button*>(object)->setSecurityCheck(values.at(0).toString());
            }},
        {"setListener", {},
            [](QObject* object, const QVariantList&) { static_cast<Button*>(object)->setListener(nullptr); }},
    };
    return entry;
}

Entry clickableWidget()
{
    Entry entry;
    entry.name = "CustomClickQWidget";
    entry.header = "input/CustomClickQWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        auto* const widget = new SwitchingWidget(host);
        widget->resize(80, 30);
        return Subject {widget, widget};
    };
    entry.exercise = {{"click", {"pressed", "clicked", "released", "toggled"},
        {mousePress(c_middle, 0), mouseMove(c_middle, 5), mouseRelease(c_middle, 10)}}};
    return entry;
}
}

std::vector<Entry> clickEntries()
{
    return {
        valueClass("CustomClickAdapter", "input/CustomClickAdapter.h"),
        clickableWidget(),
        clickButton<vx::CustomContextClickToolButton>(
            "CustomContextClickToolButton", "input/CustomContextClickToolButton.h"),
        clickButton<vx::TCustomClickWidget<QToolButton>>("TCustomClickWidget", "input/TCustomClickWidget.h"),
    };
}
}
