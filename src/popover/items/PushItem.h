// SPDX-License-Identifier: MIT
// A row that is a button.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"

namespace vx
{
namespace PopoverWidget
{

/// A row that works as a button: each click checks or unchecks its elements and performs it, with isChecked() as
/// value. Its popover closes then, unless it was added with flags of its own.
///
/// With eifDoubleClick a single click performs only when no second one follows.
class ZELKOV_WIDGETS_EXPORT PushItem : public Item
{
    Q_OBJECT

public:
    /// Texts, names and flags are those of Item.
    PushItem(const QString& text, const QString& additionalText, const QString& objectName, int id,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~PushItem() override;

    /// ecfDismiss.
    EContainerFlag defaultItemFlags() override;
    /// Toggles icon and text element and emits itemPerformed() with just these flags.
    void performSingleClick(QFlags<EItemPerformedFlag> flags) override;

    /// The text element, or the icon element without one.
    ElidedButton* pushItem() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;
};

} // namespace PopoverWidget
} // namespace vx
