// SPDX-License-Identifier: MIT
// Second platform set: object names for style sheets.
#pragma once

#include <QtCore/QString>

class QWidget;

namespace vx
{
void reloadStyleSheet(QWidget* widget, const QString& objectName);
}
