// SPDX-License-Identifier: MIT
// Rows of the table: badges, overlays, labels, frame times and buttons that pulse.
#include "StylingTable.h"

#include "ZelkovUtils/ReloadStyleSheet.h"
#include "controls/DateTimeEdit.h"
#include "indicators/BadgeWidget.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "indicators/IconOverlayView.h"
#include "indicators/Label.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"
#include "input/CustomClickQWidget.h"
#include "input/CustomContextClickToolButton.h"

#include <QtCore/QEvent>

namespace styling
{
namespace
{
constexpr quint64 c_frame = 1577934245000000ULL;

QWidget* badge(QWidget* window)
{
    auto* const result = placed(new vx::BadgeWidget(window));
    result->setBadgeLabel(QStringLiteral("33"));
    return result;
}

QWidget* busyBadge(QWidget* window)
{
    auto* const result = placed(new vx::BadgeWidget(window));
    result->setBadgeSize(QSize(48, 48));
    result->setBadgeBusy(true);
    return result;
}

QWidget* busyOverlay(QWidget* window)
{
    auto* const result = placed(new vx::BusyOverlayView(window), QRect(10, 10, 300, 200));
    result->showBusyOverlay(true);
    return result;
}

QWidget* sign(QWidget* window)
{
    return vx::IconOverlayView::showIcon(window, QStringLiteral("yourSign"), true);
}

QWidget* signWithText(QWidget* window)
{
    return vx::IconOverlayView::showTextAndIcon(window, QStringLiteral("Text"), QStringLiteral("yourSign"), true);
}

// It fades by the opacity of a window, which its content is not.
QWidget* bareSign(QWidget* window)
{
    auto* const view = new vx::IconOverlayView(new QWidget(window), window);
    return placed(view);
}

QWidget* label(QWidget* window)
{
    return placed(new vx::Label(QStringLiteral("label"), window));
}

QWidget* elidedLabel(QWidget* window)
{
    auto* const result = new vx::ElidedLabel(window);
    result->setText(QStringLiteral("label"));
    return placed(result);
}

QWidget* elidedButton(QWidget* window)
{
    return placed(new ElidedButton(QStringLiteral("button"), window));
}

QWidget* nameTimeLabel(QWidget* window)
{
    auto* const result = new vx::NameTimeLabel(window);
    result->setText(QStringLiteral("name"), QString(), QString());
    return placed(result);
}

QWidget* shownTime(QWidget* window, bool recording, bool error)
{
    auto* const result = new vx::TimeLabel(recording, window);
    result->showFrametime(true, c_frame, 40, 6, false, Qt::AlignLeft | Qt::AlignTop, false);
    result->showErrorSymbol(error);
    result->resizeContent(false);
    result->setGeometry(20, 20, 300, 40);
    result->show();
    return result;
}

QWidget* timeOfCamera(QWidget* window)
{
    return shownTime(window, true, false);
}

QWidget* polishedTime(QWidget* window)
{
    auto* const result = static_cast<vx::TimeLabel*>(timeOfCamera(window));
    vx::reloadStyleSheet(result->getDateTimeEit(), result->getDateTimeEit()->objectName());
    return result;
}

QWidget* timeOfServer(QWidget* window)
{
    return shownTime(window, false, false);
}

QWidget* timeOfNowhere(QWidget* window)
{
    return shownTime(window, true, true);
}

QWidget* timeWithError(QWidget* window)
{
    auto* const result = static_cast<vx::TimeLabel*>(shownTime(window, true, false));
    result->setFrametime(~quint64(0));
    result->setErrorText(QStringLiteral("no picture at all"));
    result->resizeContent(false);
    return result;
}

QWidget* clickWidget(QWidget* window)
{
    return placed(new vx::CustomClickQWidget(window));
}

QWidget* clickButton(QWidget* window)
{
    return placed(new vx::CustomContextClickToolButton(window, 500, false));
}

// The picture of the sheet is tinted while the button pulses, here in the marker's colour. It is looked for once, at
// the first paint of a pulse.
QWidget* pulsing(QWidget* window)
{
    struct Button : vx::TFadingWidget<QToolButton>
    {
        explicit Button(QWidget* parent)
            : TFadingWidget<QToolButton>(parent, 20, 10, QColor(marker()), 250, 255, false)
        {
        }
        void changeEvent(QEvent* event) override
        {
            TFadingWidget<QToolButton>::changeEvent(event);
            if (event->type() == QEvent::StyleChange) {
                startFading();
            }
        }
    };
    auto* const result = new Button(window);
    result->setObjectName(QStringLiteral("yourButton"));
    result->setAutoRaise(true);
    return placed(result);
}
}

Table indicatorTable()
{
    const char* const mark = "vx--BadgeWidget";
    return {
        box(mark, badge),
        picture(mark, "alignment", "\"AlignHCenter | AlignBottom\"", badge, "AlignHCenter, AlignBottom"),
        later(mark, "badgeSize", "40px 40px", badge, "40 x 40"),
        later(mark, "badgeStroke", "true", badge),
        later(mark, "badgeColor", "#000001", badge),
        later(mark, "badgeBackground", "#ff00ff", badge),
        picture(mark, "busyBadgeType", "0", busyBadge),
        rule("vx--BadgeWidget { qproperty-busyColor1 }",
            "vx--BadgeWidget { qproperty-busyColor1: #ff00ff; qproperty-busyBadgeType: 0; }", busyBadge),
        rule("vx--BadgeWidget { qproperty-busyColor2 }", "vx--BadgeWidget { qproperty-busyColor2: #ff00ff; }",
            busyBadge),

        box("vx--BusyOverlayView", busyOverlay),
        box("#BusyOverlayWidget", busyOverlay),
        box("#busyIcon", busyOverlay),
        box("#busyText", busyOverlay),
        box("vx--IconOverlayView", bareSign),
        box("#yourSign", sign),
        box("#container", signWithText),
        box("#container #icon", signWithText),
        box("#container #text", signWithText),

        box("vx--Label", label),
        box("vx--ElidedLabel", elidedLabel),
        box("ElidedButton", elidedButton),
        box("vx--NameTimeLabel", nameTimeLabel),

        noBox("vx--TimeLabel", timeOfCamera),
        noBox("#FrameTimeWidget", timeOfCamera),
        box("#FrameTimeGrabberCamera", timeOfCamera),
        box("#FrameTimeGrabberFileserver", timeOfServer),
        box("#FrameTimeGrabberError", timeOfNowhere),
        box("#DateEdit", timeOfCamera),
        box("#FrameTimeLabel", timeWithError),
        rule("vx--TimeLabel[overlaypos=\"33\"]",
            "vx--TimeLabel[overlaypos=\"33\"] #DateEdit { background: #ff00ff; }", polishedTime),
        rule("vx--TimeLabel[overlaymargin=\"6\"]",
            "vx--TimeLabel[overlaymargin=\"6\"] #DateEdit { background: #ff00ff; }", polishedTime),

        noBox("vx--CustomClickQWidget", clickWidget),
        box("vx--CustomContextClickToolButton", clickButton),
        windowRule("#yourButton { image }", "QToolButton#yourButton { image: url(:/glow.png); }", pulsing),
    };
}
}
