// SPDX-License-Identifier: MIT
// Rows of the table: special input widgets.
#include "StylingTable.h"

#include "controls/AnimatedCheckBox.h"
#include "controls/DateTimeDefaultEdit.h"
#include "controls/DateTimeEdit.h"
#include "controls/DialButton.h"
#include "controls/ExtendedComboBox.h"
#include "controls/FilepathEdit.h"
#include "controls/JoystickViewWidget.h"
#include "controls/MultiStateCheckBox.h"
#include "controls/MultiStateCustomToolButton.h"
#include "controls/MultiStatePushButton.h"
#include "controls/MultiStateToolButton.h"
#include "controls/PasswordCheckWidget.h"
#include "controls/SearchEdit.h"
#include "controls/VxCountingLinesGroupBox.h"
#include "controls/iOSCheckBox.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "controls/iOSListWidgetItem.h"

#include <QtGui/QPixmap>
#include <QtTest/QTest>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>

namespace styling
{
namespace
{
QPixmap filled(Qt::GlobalColor color)
{
    QPixmap result(48, 48);
    result.fill(color);
    return result;
}

QWidget* dial(QWidget* window)
{
    return placed(new vx::DialButton(8, window), QRect(20, 20, 120, 120));
}

QWidget* knobbedDial(QWidget* window)
{
    auto* const result = static_cast<vx::DialButton*>(dial(window));
    result->setImage(filled(Qt::darkGreen));
    result->setButton(filled(Qt::darkBlue));
    return result;
}

QWidget* checkedDial(QWidget* window)
{
    auto* const result = static_cast<vx::DialButton*>(dial(window));
    result->setChecked(true);
    return result;
}

QWidget* activeDial(QWidget* window)
{
    auto* const result = static_cast<vx::DialButton*>(dial(window));
    result->setActive(true);
    return result;
}

QWidget* joystick(QWidget* window)
{
    return placed(new JoystickViewWidget(window), QRect(20, 20, 120, 120));
}

template <typename Widget>
QWidget* plain(QWidget* window)
{
    return placed(new Widget(window), QRect(40, 40, 160, 30));
}

template <typename Button>
QWidget* states(QWidget* window)
{
    auto* const result = new Button({0, 1, 2}, QStringLiteral("yourStates"), window);
    placed(result);
    result->setState(1);
    return result;
}

vx::PasswordCheckWidget* passwords(QWidget* window, const QString& first, const QString& second)
{
    auto* const form = placed(new vx::PasswordCheckWidget(false, 
                                  vx::PasswordCheckWidget::esrMinimumLength
                                      | vx::PasswordCheckWidget::esrPasswordsMatch,
                                  window),
        QRect(10, 10, 360, 120));
    const QList<QLineEdit*> fields = form->findChildren<QLineEdit*>();
    QTest::keyClicks(fields.at(0), first);
    QTest::keyClicks(fields.at(1), second);
    return form;
}

QWidget* emptyPasswords(QWidget* window)
{
    return passwords(window, QString(), QString());
}

QWidget* weakPassword(QWidget* window)
{
    return passwords(window, QStringLiteral("abc"), QStringLiteral("abd"));
}

QWidget* strongPassword(QWidget* window)
{
    return passwords(window, QStringLiteral("abcdefghij"), QStringLiteral("abcdefghij"));
}

QWidget* list(QWidget* window)
{
    auto* const result = placed(new vx::iOSListWidget(window, QStringLiteral("yourList")), QRect(10, 10, 340, 200));
    auto* const row = new vx::iOSListWidgetItem(
        result, new QLabel(QStringLiteral("row")), QStringLiteral("yourListRow"), QSize(200, 40));
    result->setFixedSize(340, 200);
    result->setEditMode(true);
    row->setDeleteMode(true, false);
    return result;
}

QWidget* deleteIcon(QWidget* window)
{
    return placed(new vx::iOSListWidgetDeleteIcon(window));
}

QWidget* countingLines(QWidget* window)
{
    return placed(new vx::VxCountingLinesGroupBox(window), QRect(0, 0, 390, 290));
}

Table countingLineTable()
{
    Table result;
    // Group boxes and the widget around them have no box where their children lie: the rule is a frame.
    for (const char* const name : {"layoutWidget", "coordGroupBox_2", "label_8", "editX1_2", "label_22", "editY1_2",
             "label", "label_3", "label_23", "editX2_2", "label_24", "editY2_2", "paramGroupBox_2", "label_2",
             "lineIdEdit_2", "label_17", "lineNameEdit_2", "label_18", "lineEastEdit_2", "label_25",
             "lineWestEdit_2"}) {
        result << box((QByteArray("#CountingLinesGroupBox #") + name).constData(), countingLines);
    }
    return result;
}
}

Table controlTable()
{
    const char* const knob = "vx--DialButton";
    const char* const stick = "JoystickViewWidget";
    const char* const form = "vx--PasswordCheckWidget";
    static const QByteArray url = "url(" + pictureFile().toLatin1() + ")";
    return Table {
        box(knob, dial),
        picture(knob, "image", url.constData(), dial, "picture"),
        picture(knob, "button", url.constData(), dial, "picture"),
        picture(knob, "handle", url.constData(), knobbedDial, "picture"),
        picture(knob, "leftmargin", "11", knobbedDial),
        picture(knob, "topmargin", "12", knobbedDial),
        picture(knob, "rightmargin", "13", knobbedDial),
        picture(knob, "bottommargin", "14", knobbedDial),
        picture(knob, "leftpadding", "15", knobbedDial),
        picture(knob, "toppadding", "16", knobbedDial),
        picture(knob, "rightpadding", "17", knobbedDial),
        picture(knob, "bottompadding", "18", knobbedDial),
        rule("vx--DialButton[checked=\"true\"]", "vx--DialButton[checked=\"true\"] { background: #ff00ff; }",
            checkedDial),
        rule("vx--DialButton[active=\"true\"]", "vx--DialButton[active=\"true\"] { background: #ff00ff; }", activeDial),

        box(stick, joystick),
        box("#ptzJoystickView", joystick),
        picture(stick, "ptzCrosshairImage", url.constData(), joystick, "picture"),
        picture(stick, "ptzPointImage", url.constData(), joystick, "picture"),

        box("iOSCheckBox", plain<iOSCheckBox>),
        box("AnimatedCheckBox", plain<AnimatedCheckBox>),

        box("vx--MultiStateCheckBox", states<vx::MultiStateCheckBox>),
        rule("vx--MultiStateCheckBox[state=\"1\"]", "vx--MultiStateCheckBox[state=\"1\"] { background: #ff00ff; }",
            states<vx::MultiStateCheckBox>),
        box("vx--MultiStatePushButton", states<vx::MultiStatePushButton>),
        rule("vx--MultiStatePushButton[state=\"1\"]", "vx--MultiStatePushButton[state=\"1\"] { background: #ff00ff; }",
            states<vx::MultiStatePushButton>),
        box("vx--MultiStateToolButton", states<vx::MultiStateToolButton>),
        rule("vx--MultiStateToolButton[state=\"1\"]", "vx--MultiStateToolButton[state=\"1\"] { background: #ff00ff; }",
            states<vx::MultiStateToolButton>),
        box("vx--MultiStateCustomToolButton", states<vx::MultiStateCustomToolButton>),
        rule("vx--MultiStateCustomToolButton[state=\"1\"]",
            "vx--MultiStateCustomToolButton[state=\"1\"] { background: #ff00ff; }",
            states<vx::MultiStateCustomToolButton>),
        box("#yourStates", states<vx::MultiStatePushButton>),

        box(form, emptyPasswords),
        box("#firstInput", emptyPasswords),
        box("#secondInput", emptyPasswords),
        rule("vx--PasswordCheckWidget[secureStateDisplay=\"0\"] #firstInput",
            "vx--PasswordCheckWidget[secureStateDisplay=\"0\"] #firstInput { background: #ff00ff; }", emptyPasswords),
        rule("vx--PasswordCheckWidget[secureStateDisplay=\"1\"] #firstInput",
            "vx--PasswordCheckWidget[secureStateDisplay=\"1\"] #firstInput { background: #ff00ff; }", weakPassword),
        rule("vx--PasswordCheckWidget[secureStateDisplay=\"2\"] #firstInput",
            "vx--PasswordCheckWidget[secureStateDisplay=\"2\"] #firstInput { background: #ff00ff; }", strongPassword),
        rule("vx--PasswordCheckWidget[passwordsMatchDisplay=\"0\"] #secondInput",
            "vx--PasswordCheckWidget[passwordsMatchDisplay=\"0\"] #secondInput { background: #ff00ff; }",
            emptyPasswords),
        rule("vx--PasswordCheckWidget[passwordsMatchDisplay=\"1\"] #secondInput",
            "vx--PasswordCheckWidget[passwordsMatchDisplay=\"1\"] #secondInput { background: #ff00ff; }",
            weakPassword),
        rule("vx--PasswordCheckWidget[passwordsMatchDisplay=\"2\"] #secondInput",
            "vx--PasswordCheckWidget[passwordsMatchDisplay=\"2\"] #secondInput { background: #ff00ff; }",
            strongPassword),

        box("vx--SearchEdit", plain<vx::SearchEdit>),
        box("vx--FilepathEdit", plain<vx::FilepathEdit>),
        box("#filepathedit", plain<vx::FilepathEdit>),
        box("vx--DateTimeEdit", plain<vx::DateTimeEdit>),
        box("vx--DateTimeDefaultEdit", plain<vx::DateTimeDefaultEdit>),
        box("vx--ExtendedComboBox", plain<vx::ExtendedComboBox>),

        box("vx--iOSListWidget", list),
        box("#yourList", list),
        box("#yourListRow", list),
        box("#deleteButton", list),
        noBox("vx--iOSListWidgetDeleteIcon", deleteIcon),
        value("vx--iOSListWidgetDeleteIcon", "deleteIconRotation", "45", deleteIcon),

        box("vx--VxCountingLinesGroupBox", countingLines),
        box("#CountingLinesGroupBox", countingLines),
    } + countingLineTable();
}
}
