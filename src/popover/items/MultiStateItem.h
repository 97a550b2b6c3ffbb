// SPDX-License-Identifier: MIT
// A row with a button of several states.
#pragma once

#include "controls/MultiStateCustomToolButton.h"
#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

namespace vx
{
namespace PopoverWidget
{

/// A row with a button that walks through states. A click on the row performs it, with isChecked() as value, and
/// leaves the state; a click on the button takes the step and does not perform.
class ZELKOV_WIDGETS_EXPORT MultiStateItem : public Item
{
    Q_OBJECT

public:
    /// The button is there in any case, and visible with eifControl.
    MultiStateItem(const QString& text, const QString& objectName, const QList<int>& states, int id,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~MultiStateItem() override;

    /// Takes int only, as state. Emits nothing.
    void setValue(const QVariant& value) override;
    /// The state.
    QVariant value() override;
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;

    /// The button; null when it has been deleted by someone else.
    vx::MultiStateCustomToolButton* multiStateItem() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    ControlHolder<vx::MultiStateCustomToolButton> m_button;
};

} // namespace PopoverWidget
} // namespace vx
