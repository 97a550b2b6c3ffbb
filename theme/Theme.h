// SPDX-License-Identifier: MIT
// The looks that an application supplies: a light and a dark style sheet with their pictures.
#pragma once

#include <QtCore/QString>
#include <QtGui/QPalette>

class QApplication;

namespace zelkov
{
namespace theme
{
/// None is what Qt gives by itself: an empty sheet and the palette of the style.
enum class Name : int
{
    None,
    Light,
    Dark
};

/// The style sheet, ready for QApplication::setStyleSheet(): light.qss or dark.qss, which the build makes of theme.qss
/// by putting the colours of colors.txt in the place of the words in at-signs.
///
/// Beside the classes it knows a property "role" with which a program says what a plain widget is for:
///   panel      a bordered surface that holds other widgets
///   plain      a scroll area without a frame or a ground of its own
///   bar        a tool bar along the edge of a window
///   sidebar    the list on the left of a window
///   title      the heading of a page         heading    the heading of a panel
///   hint       an explanation, less bright   primary    the button that is meant to be pressed
/// and lets the theme set what is otherwise the program's:
///   roomy      balloons, containers and rows of popovers with more air
///   toggle     buttons with states, of which 1 stands out; dials that are buttons, too
///   modal      a popover that dims what is below, if it opens with a fade
///   track      a slider with a bar           playhead   a handle with the theme's picture and size
///   count      a badge in the alarm colour   spinner    a busy mark in the colours of the theme
///   knob       a dial with a knob that turns orbit      a dial with a dot that runs around
///   stick      a joystick display with pictures
/// The property is to be set before the widget is first shown.
QString styleSheet(Name name);

/// The palette that goes with the sheet, for whatever is painted without it.
QPalette palette(Name name);

/// Fusion style, palette and style sheet for the whole program. Can be called again at any time.
void apply(QApplication& application, Name name);
}
}
