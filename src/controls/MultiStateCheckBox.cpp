// SPDX-License-Identifier: MIT
// A check box with a list of states.
#include "controls/MultiStateCheckBox.h"

namespace vx
{
MultiStateCheckBox::MultiStateCheckBox(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TMultiStateWidget<QCheckBox>(states, objectName, parent)
{
}

MultiStateCheckBox::~MultiStateCheckBox() = default;
}
