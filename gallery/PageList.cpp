// SPDX-License-Identifier: MIT
// The pages of the gallery. A new page gets its entry here.
#include "PageList.h"

#include <QtCore/QCoreApplication>

#include "pages/BadgesPage.h"
#include "pages/CameraWallPage.h"
#include "pages/ClickVariantsPage.h"
#include "pages/ClientPage.h"
#include "pages/CountingLinesPage.h"
#include "pages/DeviceBrowserPage.h"
#include "pages/EditsPage.h"
#include "pages/FadesPage.h"
#include "pages/FramesPage.h"
#include "pages/LabelsPage.h"
#include "pages/MouseGesturesPage.h"
#include "pages/OverlaysPage.h"
#include "pages/PasswordPage.h"
#include "pages/PhoneListPage.h"
#include "pages/PopoverRowsPage.h"
#include "pages/PopoversPage.h"
#include "pages/PanelsPage.h"
#include "pages/PagesPage.h"
#include "pages/ZoomAreaPage.h"
#include "pages/RubberBandPage.h"
#include "pages/ToolBarPage.h"
#include "pages/PtzPage.h"
#include "pages/ScrollBarsPage.h"
#include "pages/TimeLabelsPage.h"
#include "pages/TimeLinePage.h"

namespace gallery
{
namespace
{
template <class PageClass>
Page* make(SignalLog& log, QWidget* parent)
{
    return new PageClass(log, parent);
}

QString translated(const char* text)
{
    return QCoreApplication::translate("gallery::PageList", text);
}
}

const QVector<PageEntry>& pages()
{
    static const QVector<PageEntry> list = {
        {"client", QT_TRANSLATE_NOOP("gallery::PageList", "Cameras"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Camera client"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "A whole client made of the library. Log in as user with camera1!, or as admin with "
                           "camera2!, who may export, steer and edit."),
         &make<ClientPage>},
        {"camera-wall", QT_TRANSLATE_NOOP("gallery::PageList", "Cameras"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Camera wall"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "Click selects a camera, double click enlarges it, a long press cuts its line, a "
                           "slow drag looks around, a swipe turns to the next wall."),
         &make<CameraWallPage>},
        {"mouse-gestures", QT_TRANSLATE_NOOP("gallery::PageList", "Input"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Mouse gestures"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "MouseAdapter turns raw mouse events into clicks, long presses, pans and swipes. "
                           "Try the pad, and drag or flick the picture below it."),
         &make<MouseGesturesPage>},
        {"click-variants", QT_TRANSLATE_NOOP("gallery::PageList", "Input"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Click variants"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "TCustomClickWidget tells short, long and context clicks apart and asks for rights; "
                           "CustomContextClickToolButton adds an arrow."),
         &make<ClickVariantsPage>},
        {"fades", QT_TRANSLATE_NOOP("gallery::PageList", "Foundation"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Fades and pulses"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "FadableThing fades as a whole, and one fade can take over from the other at any "
                           "moment. TFadingWidget is a button that pulses to catch the eye."),
         &make<FadesPage>},
        {"badges", QT_TRANSLATE_NOOP("gallery::PageList", "Indicators"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Badges and spinners"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "BadgeWidget shows a short text in a pill or a busy mark; BadgeDrawer paints the "
                           "same into any widget."),
         &make<BadgesPage>},
        {"labels", QT_TRANSLATE_NOOP("gallery::PageList", "Indicators"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Labels"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "ElidedLabel and ElidedButton shorten their text to the room they have; Label covers "
                           "itself with a picture that keeps its proportions."),
         &make<LabelsPage>},
        {"overlays", QT_TRANSLATE_NOOP("gallery::PageList", "Indicators"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Overlays"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "BusyOverlayView tells that a connection has gone and for how long; IconOverlayView "
                           "shows a sign for a moment and deletes itself."),
         &make<OverlaysPage>},
        {"time-labels", QT_TRANSLATE_NOOP("gallery::PageList", "Indicators"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Time labels"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "TimeLabel shows the time of a picture and lets it be edited; NameTimeLabel drops "
                           "what has no room."),
         &make<TimeLabelsPage>},
        {"frames", QT_TRANSLATE_NOOP("gallery::PageList", "Indicators"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Frames"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "BorderIcon cuts a small picture into nine parts and fills any rectangle with it."),
         &make<FramesPage>},
        {"scroll-bars", QT_TRANSLATE_NOOP("gallery::PageList", "Sliders"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Scroll bars"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "NicerScrollBar floats over the content of a scroll area and fades; JumpSlider follows "
                           "a click on its groove at once."),
         &make<ScrollBarsPage>},
        {"time-line", QT_TRANSLATE_NOOP("gallery::PageList", "Sliders"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Time line"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "MultiNubsieSlider has any number of handles on one scale, kept apart only as far as "
                           "needed. Drag them, double-click them, click the flags."),
         &make<TimeLinePage>},
        {"popovers", QT_TRANSLATE_NOOP("gallery::PageList", "Popovers"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Popovers"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "A popover points at what it belongs to, keeps inside the window and closes with a click "
                           "beside it. Click a number."),
         &make<PopoversPage>},
        {"popover-rows", QT_TRANSLATE_NOOP("gallery::PageList", "Popovers"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Popover rows"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "Every row that a popover can hold: texts, choices, values and submenus. What is "
                           "performed stands in the log, with its value and flags."),
         &make<PopoverRowsPage>},
        {"panels", QT_TRANSLATE_NOOP("gallery::PageList", "Views"), QT_TRANSLATE_NOOP("gallery::PageList", "Panels"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "FadeView is a strip at the edge of a view that slides open and can take the full "
                           "height; FadeStripeView adds a handle, a time line and rows of contents."),
         &make<PanelsPage>},
        {"pages", QT_TRANSLATE_NOOP("gallery::PageList", "Views"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Pages and slideshow"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "NavigationViewController slides from page to page and tells each of its coming and going; "
                           "WidgetSlideshow moves on by itself."),
         &make<PagesPage>},
        {"zoom-area", QT_TRANSLATE_NOOP("gallery::PageList", "Views"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Zoom area"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "ZoomScrollArea turns the wheel into a steady stream of zoom factors instead of scrolling."),
         &make<ZoomAreaPage>},
        {"rubber-band", QT_TRANSLATE_NOOP("gallery::PageList", "Views"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Rubber band"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "RubberBandWidget marks a region of a picture in the picture's own units: move it, resize "
                           "it, turn it over."),
         &make<RubberBandPage>},
        {"tool-bars", QT_TRANSLATE_NOOP("gallery::PageList", "Views"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Tool bar customising"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "CustomToolBar reports which action was dropped where, and which one is to go."),
         &make<ToolBarPage>},
        {"edits", QT_TRANSLATE_NOOP("gallery::PageList", "Controls"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Edits"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "Fields for search words, folders and times, and a combo box that leaves the wheel to "
                           "the form around it."),
         &make<EditsPage>},
        {"counting-lines", QT_TRANSLATE_NOOP("gallery::PageList", "Controls"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Counting lines"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "VxCountingLinesGroupBox edits a line across the picture; whoever crosses it is "
                           "counted."),
         &make<CountingLinesPage>},
        {"password-form", QT_TRANSLATE_NOOP("gallery::PageList", "Controls"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Password form"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "PasswordCheckWidget checks a new password while it is typed; the theme colours the "
                           "fields by its verdict."),
         &make<PasswordPage>},
        {"dial-and-joystick", QT_TRANSLATE_NOOP("gallery::PageList", "Controls"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Dial and joystick"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "DialButton is dragged sideways and can spring back; JoystickViewWidget shows where a "
                           "stick stands."),
         &make<PtzPage>},
        {"phone-list", QT_TRANSLATE_NOOP("gallery::PageList", "Controls"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Phone-style list"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "iOSListWidget has rows that can be edited, deleted and put in another order."),
         &make<PhoneListPage>},
        {"device-browser", QT_TRANSLATE_NOOP("gallery::PageList", "Models"),
         QT_TRANSLATE_NOOP("gallery::PageList", "Device browser"),
         QT_TRANSLATE_NOOP("gallery::PageList",
                           "MultiFilterModel searches 10,000 devices while you type; FlexibleTableModel and "
                           "TableViewDelegate show them as a wall whose columns follow the width."),
         &make<DeviceBrowserPage>},
    };
    return list;
}

int indexOfPage(const QString& name)
{
    for (int i = 0; i < pages().size(); ++i) {
        if (name == QLatin1String(pages().at(i).name)) {
            return i;
        }
    }
    return -1;
}

QString PageEntry::familyText() const
{
    return translated(family);
}

QString PageEntry::titleText() const
{
    return translated(title);
}

QString PageEntry::descriptionText() const
{
    return translated(description);
}
}
