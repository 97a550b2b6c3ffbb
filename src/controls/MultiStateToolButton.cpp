// SPDX-License-Identifier: MIT
// A tool button with a list of states.
#include "controls/MultiStateToolButton.h"

namespace vx
{
MultiStateToolButton::MultiStateToolButton(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TMultiStateWidget<QToolButton>(states, objectName, parent)
{
}

MultiStateToolButton::~MultiStateToolButton() = default;
}
