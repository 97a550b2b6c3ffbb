// SPDX-License-Identifier: MIT
// Qt's buttons with a list of states in place of the two of a check.
#pragma once

#include "controls/MultiStateWidget.h"
#include "foundation/Export.h"
#include "foundation/TFadingWidget.h"

namespace vx
{
/// A button that walks through its states, one with each click. It pulses like every TFadingWidget and has no shadow.
///
/// Instantiated for QToolButton, QPushButton and QCheckBox; use MultiStateToolButton, MultiStatePushButton and
/// MultiStateCheckBox, which have the property for style sheets. While changes are disabled a click changes nothing,
/// and a checkable button keeps its check, too.
template <typename T>
class TMultiStateWidget : public TFadingWidget<T>, public MultiStateWidget
{
public:
    /// Starts with the first of \a states, or 0; changes are enabled.
    TMultiStateWidget(const QList<int>& states, const QString& objectName, QWidget* parent);
    ~TMultiStateWidget() override;

    /// Shows the state to style sheets, as the property `state` of the concrete classes. Nothing if it holds already.
    void setState(int state) override;

    /// Takes a click's step from code, with \a force also while changes are disabled. Returns the state that then
    /// holds.
    int setNextState(bool force);

protected:
    /// What a click does.
    void nextCheckState() override;
};

extern template class ZELKOV_WIDGETS_EXPORT TMultiStateWidget<QToolButton>;
extern template class ZELKOV_WIDGETS_EXPORT TMultiStateWidget<QPushButton>;
extern template class ZELKOV_WIDGETS_EXPORT TMultiStateWidget<QCheckBox>;
}
