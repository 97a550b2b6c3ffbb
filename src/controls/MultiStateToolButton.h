// SPDX-License-Identifier: MIT
// A tool button with a list of states.
#pragma once

#include "controls/TMultiStateWidget.h"
#include "foundation/Export.h"

namespace vx
{
/// A tool button that walks through a list of states, one with each click; see TMultiStateWidget. Style sheets draw each
/// state with a selector such as `vx--MultiStateToolButton[state="2"]`.
class ZELKOV_WIDGETS_EXPORT MultiStateToolButton : public TMultiStateWidget<QToolButton>
{
    Q_OBJECT
    Q_PROPERTY(int state READ state WRITE setState)

public:
    /// Starts with the first of \a states, or 0. The parent owns the button.
    MultiStateToolButton(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~MultiStateToolButton() override;
};
}
