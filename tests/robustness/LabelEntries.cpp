// SPDX-License-Identifier: MIT
// The labels and the eliding button of indicators/.
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "indicators/Label.h"

#include "Registry.h"
#include "Suites.h"

namespace zelkovtest
{
namespace
{
using vx::ElidedLabel;
using vx::Label;

const QString& longText()
{
    static const QString text = QStringLiteral("The camera in the main entrance does not answer any more");
    return text;
}

Entry pictureLabel()
{
    Entry entry;
    entry.name = "Label";
    entry.header = "indicators/Label.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        Label* const label = new Label(host);
        QPixmap picture(60, 20);
        picture.fill(Qt::red);
        label->setPixmap(picture);
        label->setScaledContents(true);
        label->resize(80, 80);
        return Subject {label, label};
    };
    entry.exercise = {{"other picture, other size", {}, {[](const Subject& subject) {
                           auto* const label = static_cast<Label*>(subject.object.data());
                           paint(label);
                           label->setPixmap(QPixmap());
                           paint(label);
                           QPixmap picture(20, 60);
                           picture.fill(Qt::blue);
                           label->setPixmap(picture);
                           label->resize(90, 40);
                           paint(label);
                       }}}};
    entry.setters = {
        setter("setKeepAspectRatio", &Label::setKeepAspectRatio),
        setter("setPixmap", &Label::setPixmap),
    };
    return entry;
}

Entry elidedLabel()
{
    Entry entry;
    entry.name = "ElidedLabel";
    entry.header = "indicators/ElidedLabel.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        ElidedLabel* const label = new ElidedLabel(longText(), host);
        label->resize(100, 60);
        return Subject {label, label};
    };
    entry.exercise = {{"wrap", {}, {[](const Subject& subject) {
                           auto* const label = static_cast<ElidedLabel*>(subject.object.data());
                           paint(label);
                           label->setWordWrap(true);
                           paint(label);
                           label->resize(30, 60);
                           paint(label);
                       }}}};
    entry.setters = {
        setter("setElideMode", &ElidedLabel::setElideMode),
        setter("setText", &QLabel::setText),
        setter("setIndent", &QLabel::setIndent),
        setter("setWordWrap", &QLabel::setWordWrap),
    };
    return entry;
}

Entry elidedButton()
{
    Entry entry;
    entry.name = "ElidedButton";
    entry.header = "indicators/ElidedButton.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        ElidedButton* const button = new ElidedButton(longText(), host);
        button->resize(100, 30);
        return Subject {button, button};
    };
    entry.exercise = {
        {"modes", {}, {[](const Subject& subject) {
             auto* const button = static_cast<ElidedButton*>(subject.object.data());
             for (const Qt::TextElideMode mode : {Qt::ElideLeft, Qt::ElideMiddle, Qt::ElideRight, Qt::ElideNone}) {
                 button->setElideMode(mode);
                 paint(button);
             }
         }}}};
    entry.setters = {
        setter("setElideMode", &ElidedButton::setElideMode),
        setter("setText", &QAbstractButton::setText),
    };
    return entry;
}
}

std::vector<Entry> labelEntries()
{
    return {elidedButton(), elidedLabel(), pictureLabel()};
}
}
