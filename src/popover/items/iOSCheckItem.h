// SPDX-License-Identifier: MIT
// A row with a sliding switch.
#pragma once

#include "controls/iOSCheckBox.h"
#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

namespace vx
{
namespace PopoverWidget
{

/// A row with a sliding switch. A click on the row slides it over; then the elements of the row follow, toggled() is
/// emitted and itemPerformed() with the new state as value. A user without the right sees the switch slide back, and
/// clients hear nothing. Changes from code perform nothing.
///
/// The flags of the last click on the row stay for changes that the switch itself reports later: odd on purpose. About
/// clicks near the top left corner see CheckItem.
class ZELKOV_WIDGETS_EXPORT iOSCheckItem : public Item
{
    Q_OBJECT

public:
    /// Starts in the state \a checked, without a signal.
    iOSCheckItem(const QString& text, const QString& objectName, int id, bool checked, QFlags<EItemFlag> flags,
        QWidget* parent);
    ~iOSCheckItem() override;

    /// Takes bool only. The switch jumps; later changes from code slide.
    void setValue(const QVariant& value) override;
    /// Whether the switch is on.
    QVariant value() override;
    bool isChecked() const override;
    /// Sets switch and elements. Emits layoutChanged().
    void setChecked(bool checked) override;
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;

    /// The switch; null when it has been deleted by someone else.
    iOSCheckBox* checkBox() const;

Q_SIGNALS:
    /// The user changed the state. @p objectName is that of the row.
    void toggled(bool checked, const QString& objectName);

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void receiveToggled(bool checked);
    void emitItemPerformed();

private:
    ControlHolder<iOSCheckBox> m_box;
    QFlags<EItemPerformedFlag> m_performedFlags = eipControl; // of the last click on the row
};

} // namespace PopoverWidget
} // namespace vx
