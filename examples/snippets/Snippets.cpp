// SPDX-License-Identifier: MIT
// The list of the pages.
#include "Snippets.h"

#include <QtCore/QEventLoop>
#include <QtCore/QTimer>

#define ZELKOV_PAGES(PAGE)                                                                                            \
    PAGE(badges, "badges")                                                                                            \
    PAGE(clicks, "clicks")                                                                                            \
    PAGE(counting_lines, "counting-lines")                                                                            \
    PAGE(dial_and_joystick, "dial-and-joystick")                                                                      \
    PAGE(edits, "edits")                                                                                              \
    PAGE(fades, "fades")                                                                                              \
    PAGE(foundation, "foundation")                                                                                    \
    PAGE(frames, "frames")                                                                                            \
    PAGE(labels, "labels")                                                                                            \
    PAGE(models, "models")                                                                                            \
    PAGE(mouse_gestures, "mouse-gestures")                                                                            \
    PAGE(overlays, "overlays")                                                                                        \
    PAGE(panels, "panels")                                                                                            \
    PAGE(password_form, "password-form")                                                                              \
    PAGE(phone_list, "phone-list")                                                                                    \
    PAGE(platform, "platform")                                                                                        \
    PAGE(popover_rows, "popover-rows")                                                                                \
    PAGE(popovers, "popovers")                                                                                        \
    PAGE(resources, "resources")                                                                                      \
    PAGE(rubber_band, "rubber-band")                                                                                  \
    PAGE(sliders, "sliders")                                                                                          \
    PAGE(switches, "switches")                                                                                        \
    PAGE(time_labels, "time-labels")                                                                                  \
    PAGE(time_line, "time-line")                                                                                      \
    PAGE(tool_bars, "tool-bars")                                                                                      \
    PAGE(zoom_area, "zoom-area")

namespace snippets
{
#define ZELKOV_DECLARE(function, name) void function();
ZELKOV_PAGES(ZELKOV_DECLARE)
#undef ZELKOV_DECLARE

const QVector<Page>& pages()
{
#define ZELKOV_ENTRY(function, name) {name, &function},
    static const QVector<Page> list{ZELKOV_PAGES(ZELKOV_ENTRY)};
#undef ZELKOV_ENTRY
    return list;
}

void pause(int milliseconds)
{
    QEventLoop loop;
    QTimer::singleShot(milliseconds, &loop, &QEventLoop::quit);
    loop.exec();
}
}
