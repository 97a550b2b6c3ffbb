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

/// The style sheet, ready for QApplication::setStyleSheet(). It is one text, theme.qss, with the colours
/// of the theme put in the place of its words in at-signs.
///
/// Beside the classes it knows a property "role" with which a program says what a plain widget is for:
///   panel      a bordered surface that holds other widgets
///   plain      a scroll area without a frame or a ground of its own
///   bar        a tool bar along the edge of a window
///   sidebar    the list on the left of a window
///   title      the heading of a page         heading    the heading of a panel
///   hint       an explanation, less bright   primary    the button that is meant to be pressed
QString styleSheet(Name name);

/// The palette that goes with the sheet, for whatever is painted without it.
QPalette palette(Name name);

/// Fusion style, palette and style sheet for the whole program. Can be called again at any time.
void apply(QApplication& application, Name name);
}
}
