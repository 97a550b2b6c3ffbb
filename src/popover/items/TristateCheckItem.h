// SPDX-License-Identifier: MIT
// A row with a check box of three states.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QCheckBox>

namespace vx
{
namespace PopoverWidget
{

/// A row with a check box of three states, 0 to 2 as Qt::CheckState. A click on the row takes the next one in the
/// ring 0, 1, 2, whether tristate is set or not; a click on the box does what QCheckBox does. Then stateChanged() is
/// emitted, and itemPerformed() with the new state as value. A user without the right sees the step taken back in the
/// ring, and clients hear nothing. Changes from code perform nothing.
///
/// The elements of the row are checked in state 2 alone. About clicks near the top left corner see CheckItem.
class ZELKOV_WIDGETS_EXPORT TristateCheckItem : public Item
{
    Q_OBJECT

public:
    /// Starts in \a state, 0 to 2, without a signal.
    TristateCheckItem(const QString& text, const QString& objectName, int id, bool tristate, int state,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~TristateCheckItem() override;

    /// Takes int as state, and bool as 2 or 0.
    void setValue(const QVariant& value) override;
    /// The state, as int.
    QVariant value() override;
    /// Whether the state is 2.
    bool isChecked() const override;
    /// State 2 or 0.
    void setChecked(bool checked) override;
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;

    /// Sets box and elements. Emits layoutChanged(). Other numbers than 0, 1 and 2 are ignored.
    void setCheckState(int state);
    int checkState() const;
    /// Without, the box goes from 0 to 2 and back; a state of 1 becomes 0 first.
    void setTristate(bool tristate);
    bool isTristate() const;

    /// The box; null when it has been deleted by someone else.
    QCheckBox* checkBox() const;

Q_SIGNALS:
    /// The user changed the state. @p objectName is that of the row.
    void stateChanged(int state, const QString& objectName);

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void receiveStateChanged(int state);
    void emitItemPerformed();

private:
    ControlHolder<QCheckBox> m_box;
    QFlags<EItemPerformedFlag> m_performedFlags = eipControl; // of the click that turns the box
    bool m_tristate;
};

} // namespace PopoverWidget
} // namespace vx
