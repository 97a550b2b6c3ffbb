// SPDX-License-Identifier: MIT
// A row with a number.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QSpinBox>

namespace vx
{
namespace PopoverWidget
{

/// A row with a spin box at its right end. A left click on the row, not a change of the number, checks or unchecks its
/// elements and performs it, with isChecked() as value.
class ZELKOV_WIDGETS_EXPORT SpinItem : public Item
{
    Q_OBJECT

public:
    /// Takes \a spinBox over, or makes one if it is null, and sets it to \a value.
    SpinItem(const QString& text, const QString& objectName, int id, QSpinBox* spinBox, int value,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~SpinItem() override;

    /// The number that the value gives, within the range of the spin box.
    void setValue(const QVariant& value) override;
    /// The number.
    QVariant value() override;

    /// The box; null when it has been deleted by someone else.
    QSpinBox* spinBox() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    ControlHolder<QSpinBox> m_spinBox;
};

} // namespace PopoverWidget
} // namespace vx
