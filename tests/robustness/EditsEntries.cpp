// SPDX-License-Identifier: MIT
// The edits, the joystick display and the counting-lines form of controls/.
#include "controls/DateTimeDefaultEdit.h"
#include "controls/DateTimeEdit.h"
#include "controls/ExtendedComboBox.h"
#include "controls/FilepathEdit.h"
#include "controls/JoystickViewWidget.h"
#include "controls/SearchEdit.h"
#include "controls/VxCountingLinesGroupBox.h"

#include <QtCore/QTimer>
#include <QtWidgets/QApplication>
#include <QtWidgets/QFileDialog>
#include <QtWidgets/QPushButton>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
Step pressTheButton()
{
    return [](const Subject& subject) {
        if (auto* const button = subject.widget->findChild<QPushButton*>()) {
            button->click();
        }
    };
}

Entry dateTimeEdit()
{
    Entry entry = widgetClass<vx::DateTimeEdit>("DateTimeEdit", "controls/DateTimeEdit.h");
    entry.exercise = {{"press", {"anchorTimeClicked"}, {mousePress(QPoint(3, 3), 0), mouseRelease(QPoint(3, 3), 10)}}};
    return entry;
}

Entry dateTimeDefaultEdit()
{
    Entry entry = widgetClass<vx::DateTimeDefaultEdit>("DateTimeDefaultEdit", "controls/DateTimeDefaultEdit.h");
    entry.exercise = {
        {"press", {"anchorTimeClicked"}, {mousePress(QPoint(3, 3), 0), mouseRelease(QPoint(3, 3), 10)}},
        {"back to the default", {},
            {call(&vx::DateTimeDefaultEdit::setDefaultDateTime, QDateTime(QDate(2024, 1, 2), QTime(3, 4))),
                call(&QDateTimeEdit::setDateTime, QDateTime(QDate(2025, 1, 2), QTime(3, 4))), pressTheButton()}},
        // Only clients emit this one.
        {"a client's own way back", {"resettedToDefault"},
            {call(&vx::DateTimeDefaultEdit::resettedToDefault, QDateTime(QDate(2024, 1, 2), QTime(3, 4)))}}};
    return entry;
}

// Closes the dialog that the next step opens.
Step dismissTheDialog()
{
    return [](const Subject&) {
        auto* const timer = new QTimer(qApp);
        timer->setProperty("tries", 400);
        QObject::connect(timer, &QTimer::timeout, timer, [timer] {
            for (QWidget* const window : QApplication::topLevelWidgets()) {
                auto* const dialog = qobject_cast<QFileDialog*>(window);
                if (dialog && dialog->isVisible()) {
                    timer->deleteLater();
                    dialog->reject();
                    return;
                }
            }
            const int tries = timer->property("tries").toInt() - 1;
            timer->setProperty("tries", tries);
            if (tries <= 0) {
                timer->deleteLater();
            }
        });
        timer->start(5);
    };
}

Entry filepathEdit()
{
    Entry entry = widgetClass<vx::FilepathEdit>("FilepathEdit", "controls/FilepathEdit.h");
    entry.exercise = {
        {"open and close the dialog", {"fileChooserOpened", "fileChooserClosed"}, {dismissTheDialog(), pressTheButton()}}};
    entry.setters = {setter("setUrlMode", &vx::FilepathEdit::setUrlMode)};
    return entry;
}

Entry searchEdit()
{
    Entry entry = widgetClass<vx::SearchEdit>("SearchEdit", "controls/SearchEdit.h");
    entry.exercise = {{"clear", {}, {call(&QLineEdit::setText, QStringLiteral("gate")), pressTheButton()}}};
    entry.setters = {
        setter("setClearIcon", &vx::SearchEdit::setClearIcon), setter("setLoopIcon", &vx::SearchEdit::setLoopIcon)};
    return entry;
}

Entry joystickView()
{
    Entry entry = widgetClass<JoystickViewWidget>("JoystickViewWidget", "controls/JoystickViewWidget.h");
    entry.exercise = {{"steer", {},
        {call(&JoystickViewWidget::setPointPosition, 0.5F, 0.5F), call(&JoystickViewWidget::setRotationAngle, 30)}}};
    entry.setters = {
        setter("setPointPosition", &JoystickViewWidget::setPointPosition),
        setter("setCircleInset", &JoystickViewWidget::setCircleInset),
        setter("setRotationAngle", &JoystickViewWidget::setRotationAngle),
    };
    return entry;
}

Entry countingLines()
{
    Entry entry
        = widgetClass<vx::VxCountingLinesGroupBox>("VxCountingLinesGroupBox", "controls/VxCountingLinesGroupBox.h");
    entry.exercise = {{"fill in", {},
        {call(&vx::VxCountingLinesGroupBox::setId, 3), call(&vx::VxCountingLinesGroupBox::setRange, QRect(0, 0, 9, 9))}}};
    entry.setters = {
        setter("setStartingPoint", &vx::VxCountingLinesGroupBox::setStartingPoint),
        setter("setEndPoint", &vx::VxCountingLinesGroupBox::setEndPoint),
        setter("setId", &vx::VxCountingLinesGroupBox::setId),
        setter("setRange", &vx::VxCountingLinesGroupBox::setRange),
    };
    return entry;
}
}

std::vector<Entry> editsEntries()
{
    Entry combo = widgetClass<vx::ExtendedComboBox>("ExtendedComboBox", "controls/ExtendedComboBox.h");
    combo.exercise = {{"press beside it", {}, {mouseMove(QPoint(3, 3), 0, Qt::NoButton), leave()}}};
    combo.setters = {setter("setIgnoreWheelEvents", &vx::ExtendedComboBox::setIgnoreWheelEvents)};
    return {
        dateTimeDefaultEdit(),
        dateTimeEdit(),
        combo,
        filepathEdit(),
        joystickView(),
        searchEdit(),
        countingLines(),
    };
}
}
