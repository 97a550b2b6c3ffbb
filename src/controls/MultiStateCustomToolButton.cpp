// SPDX-License-Identifier: MIT
// A tool button with custom clicks with a list of states.
#include "controls/MultiStateCustomToolButton.h"

namespace vx
{
MultiStateCustomToolButton::MultiStateCustomToolButton(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TMultiStateCustomWidget<QToolButton>(states, objectName, parent)
{
}

MultiStateCustomToolButton::~MultiStateCustomToolButton() = default;
}
