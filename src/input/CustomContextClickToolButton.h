// SPDX-License-Identifier: MIT
// A split tool button whose arrow is a click of its own.
#pragma once

#include "foundation/Export.h"
#include "input/TCustomClickWidget.h"

class QPoint;

namespace vx
{
/// The click button with the arrow of a split tool button (QToolButton::MenuButtonPopup). A click on the arrow is
/// clicked() with the click type ectArrow: the button opens nothing itself, the slot opens what it wants.
///
/// The arrow emits on the release within it, has no hold timer, does not push the button down and asks for no
/// right: what it opens is guarded by what is in there.
class ZELKOV_WIDGETS_EXPORT CustomContextClickToolButton : public TCustomClickWidget<QToolButton>
{
    Q_OBJECT

public:
    /// See TCustomClickWidget.
    CustomContextClickToolButton(QWidget* parent, int longClickSpan, bool shadow);
    ~CustomContextClickToolButton() override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

    /// Whether the point, in the button's coordinates, lies in what the style shows as the arrow.
    bool insideArrow(const QPoint& point) const;
};
}
