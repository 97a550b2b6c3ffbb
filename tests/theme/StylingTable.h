// SPDX-License-Identifier: MIT
// The table behind tst_styling: for every name and property that docs/styling.md tells of, a rule and the widget
// that is to heed it.
#pragma once

#include <QtCore/QString>
#include <QtCore/QVariant>
#include <QtCore/QVector>
#include <QtWidgets/QWidget>

#include <functional>

namespace styling
{
/// Builds the library's widget in the window, which is on show, and returns it. Shows what it builds.
using Build = std::function<QWidget*(QWidget* window)>;

enum class Proof : int
{
    Box, ///< a background in the marker's colour is seen
    NoBox, ///< a background is not seen; that the selector meets the widget shows in its tool tip
    Rule, ///< the row's own rule brings the marker's colour to light
    WindowRule, ///< it does so from the sheet of the window, but not from the application's
    Value, ///< the property has the value of the rule
    Picture, ///< so it has, and the widget looks different
    Later, ///< so it has, and a widget built under the sheet looks different
    Look ///< the widget looks different; the property says nothing
};

struct Row
{
    QString key; ///< as in the page: a selector, or "selector { qproperty-name }"
    Proof proof;
    QString rule;
    Build build;
    QString property; ///< of what build() returns; empty unless the proof is Value or Picture
    QString value; ///< as text() gives it
};

using Table = QVector<Row>;

/// Magenta: the colour by which a rule is recognised. Nothing else in the scenes is like it.
QString marker();
int markedPixels(const QImage& image);
/// A property as the page tells it: "12", "true", "none", "#102030", "20 x 20", "AlignLeft".
QString text(const QObject* object, const QString& property);
/// A picture of one colour, as a file that a style sheet can name.
QString pictureFile();

/// Where a widget stands in its window.
template <typename Widget>
Widget* placed(Widget* widget, const QRect& rect = QRect(40, 40, 160, 60))
{
    widget->setGeometry(rect);
    widget->show();
    return widget;
}

Row box(const char* key, const Build& build);
Row noBox(const char* key, const Build& build);
/// @p rule has the key's selector with it.
Row rule(const char* key, const char* rule, const Build& build);
Row windowRule(const char* key, const char* rule, const Build& build);
Row look(const char* selector, const char* property, const char* given, const Build& build);
Row later(const char* selector, const char* property, const char* given, const Build& build,
    const char* readBack = nullptr);
Row value(const char* selector, const char* property, const char* given, const Build& build,
    const char* readBack = nullptr);
Row picture(const char* selector, const char* property, const char* given, const Build& build,
    const char* readBack = nullptr);

Table popoverTable();
Table rowTable();
Table sliderTable();
Table viewTable();
Table indicatorTable();
Table controlTable();
Table table(); ///< all of them
}
