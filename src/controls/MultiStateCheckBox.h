// SPDX-License-Identifier: MIT
// A check box with a list of states.
#pragma once

#include "controls/TMultiStateWidget.h"
#include "foundation/Export.h"

namespace vx
{
/// A check box that walks through a list of states, one with each click; see TMultiStateWidget. Style sheets draw each
/// state with a selector such as `vx--MultiStateCheckBox[state="2"]`.
class ZELKOV_WIDGETS_EXPORT MultiStateCheckBox : public TMultiStateWidget<QCheckBox>
{
    Q_OBJECT
    Q_PROPERTY(int state READ state WRITE setState)

public:
    /// Starts with the first of \a states, or 0. The parent owns the button.
    MultiStateCheckBox(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~MultiStateCheckBox() override;
};
}
