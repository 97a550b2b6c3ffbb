// SPDX-License-Identifier: MIT
// Shows a state of a widget to style sheets through its object name.
#pragma once

#include "ZelkovUtils/Export.h"

#include <QtCore/QString>

class QWidget;

namespace vx
{
/// Names the widget and lets its style polish it anew, so that the style-sheet rules for that name take hold.
/// Children are not polished. Ignored for null.
ZELKOV_UTILS_EXPORT void reloadStyleSheet(QWidget* widget, const QString& objectName);
}
