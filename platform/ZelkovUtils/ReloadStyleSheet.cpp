// SPDX-License-Identifier: MIT
// Shows a state of a widget to style sheets through its object name.
#include "ZelkovUtils/ReloadStyleSheet.h"

#include <QtWidgets/QStyle>
#include <QtWidgets/QWidget>

namespace vx
{
void reloadStyleSheet(QWidget* widget, const QString& objectName)
{
    if (widget == nullptr) {
        return;
    }
    widget->style()->unpolish(widget);
    widget->setObjectName(objectName);
    widget->style()->polish(widget);
    widget->update();
}
}
