// SPDX-License-Identifier: MIT
// A custom click button with a list of states in place of the two of a check.
#pragma once

#include "controls/MultiStateWidget.h"
#include "foundation/Export.h"
#include "input/TCustomClickWidget.h"

namespace vx
{
/// A button that walks through its states, one with each click, and knows short, long and context clicks.
///
/// Instantiated for QToolButton; use MultiStateCustomToolButton, which has the property for style sheets. While
/// changes are disabled the state stays, but a checkable button still toggles: odd on purpose, clients rely on it.
template <typename T>
class TMultiStateCustomWidget : public TCustomClickWidget<T>, public MultiStateWidget
{
public:
    /// Starts with the first of \a states, or 0; changes are enabled.
    TMultiStateCustomWidget(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~TMultiStateCustomWidget() override;

    /// Shows the state to style sheets, as the property `state` of the concrete classes. Also styles anew if it holds already.
    void setState(int state) override;

    /// Takes a click's step from code, with \a force also while changes are disabled. Returns the state that then
    /// holds.
    int setNextState(bool force);

protected:
    /// What a click does.
    void nextCheckState() override;
};

extern template class ZELKOV_WIDGETS_EXPORT TMultiStateCustomWidget<QToolButton>;
}
