// SPDX-License-Identifier: MIT
// A push button with a list of states.
#include "controls/MultiStatePushButton.h"

namespace vx
{
MultiStatePushButton::MultiStatePushButton(const QList<int>& states, const QString& objectName, QWidget* parent)
    : TMultiStateWidget<QPushButton>(states, objectName, parent)
{
}

MultiStatePushButton::~MultiStatePushButton() = default;
}
