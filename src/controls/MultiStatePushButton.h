// SPDX-License-Identifier: MIT
// A push button with a list of states.
#pragma once

#include "controls/TMultiStateWidget.h"
#include "foundation/Export.h"

namespace vx
{
/// A push button that walks through a list of states, one with each click; see TMultiStateWidget. Style sheets draw each
/// state with a selector such as `vx--MultiStatePushButton[state="2"]`.
class ZELKOV_WIDGETS_EXPORT MultiStatePushButton : public TMultiStateWidget<QPushButton>
{
    Q_OBJECT
    Q_PROPERTY(int state READ state WRITE setState)

public:
    /// Starts with the first of \a states, or 0. The parent owns the button.
    MultiStatePushButton(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~MultiStatePushButton() override;
};
}
