// SPDX-License-Identifier: MIT
// Qt's buttons with a pulse, an overlay picture and a badge.
#pragma once

#include "foundation/Export.h"
#include "foundation/FadingWidget.h"

#include <QCheckBox>
#include <QPushButton>
#include <QToolButton>

class QContextMenuEvent;
class QPaintEvent;

namespace vx
{
/// A button that can pulse: `startFading()`, `stopFading()`, `fadeOnce()`, and FadingWidget's overlay and badge.
///
/// A press ends the pulse at once; the last frame stays on screen until the next repaint, which a press brings
/// anyway. A right click on a tool button opens its menu. Instantiated for QToolButton, QPushButton and QCheckBox.
template <typename T>
class TFadingWidget : public T, public FadingWidget
{
public:
    /// See FadingWidget for the numbers, enableShadow() for \a shadow.
    TFadingWidget(QWidget* parent, int interval, int step, QColor color, int minAlpha, int maxAlpha, bool shadow);
    ~TFadingWidget() override;

    /// Gives the widget a drop shadow (blur radius 10, offset 2.5 to the right and down), or takes away its graphics
    /// effect, whatever it is.
    void enableShadow(bool on);

    /// As FadingWidget::stopFading(), for the button by its own type.
    void stopFading();

protected:
    void paintEvent(QPaintEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
};

extern template class ZELKOV_WIDGETS_EXPORT TFadingWidget<QToolButton>;
extern template class ZELKOV_WIDGETS_EXPORT TFadingWidget<QPushButton>;
extern template class ZELKOV_WIDGETS_EXPORT TFadingWidget<QCheckBox>;
}
