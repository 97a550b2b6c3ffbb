// SPDX-License-Identifier: MIT
// A tool button with custom clicks with a list of states.
#pragma once

#include "controls/TMultiStateCustomWidget.h"
#include "foundation/Export.h"

namespace vx
{
/// A tool button with custom clicks that walks through a list of states, one with each click; see TMultiStateCustomWidget. Style sheets draw each
/// state with a selector such as `vx--MultiStateCustomToolButton[state="2"]`.
class ZELKOV_WIDGETS_EXPORT MultiStateCustomToolButton : public TMultiStateCustomWidget<QToolButton>
{
    Q_OBJECT
    Q_PROPERTY(int state READ state WRITE setState)

public:
    /// Starts with the first of \a states, or 0. The parent owns the button.
    MultiStateCustomToolButton(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~MultiStateCustomToolButton() override;
};
}
