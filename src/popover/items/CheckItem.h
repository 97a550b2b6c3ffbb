// SPDX-License-Identifier: MIT
// A row with a check box.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QCheckBox>

namespace vx
{
namespace PopoverWidget
{

/// A row with a check box. A click on the row or on the box turns the box; unless the user lacks the right, the
/// elements of the row follow, toggled() is emitted and then itemPerformed(), with the new state as value. A user
/// without the right sees the box turn back, and clients hear nothing. Changes from code perform nothing.
///
/// A click within the size of the visible box at the row's top left corner is left to the box, which is not there but
/// at the right end: odd on purpose.
class ZELKOV_WIDGETS_EXPORT CheckItem : public Item
{
    Q_OBJECT

public:
    /// Starts in the state \a checked, without a signal.
    CheckItem(const QString& text, const QString& objectName, int id, bool checked, QFlags<EItemFlag> flags,
        QWidget* parent);
    ~CheckItem() override;

    /// Takes bool only.
    void setValue(const QVariant& value) override;
    /// Whether the box is checked.
    QVariant value() override;
    bool isChecked() const override;
    /// Sets box and elements. Emits layoutChanged().
    void setChecked(bool checked) override;
    /// The control is hit within a rectangle of its size at the row's origin, not where it stands.
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;

    /// Which of the two changes takes the right; both at first. With neither, the row reports toggled() and is
    /// never performed.
    void setSecurityCheckStates(bool onChecking, bool onUnchecking);

    /// The box; null when it has been deleted by someone else.
    QCheckBox* checkBox() const;

Q_SIGNALS:
    /// The user changed the state. @p objectName is that of the row.
    void toggled(bool checked, const QString& objectName);

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void receiveToggled(bool checked);
    void emitItemPerformed();

private:
    ControlHolder<QCheckBox> m_box;
    QFlags<EItemPerformedFlag> m_performedFlags = eipControl; // of the click that turns the box
    bool m_refusing = true; // the last change
    bool m_checkOnChecking = true;
    bool m_checkOnUnchecking = true;
};

} // namespace PopoverWidget
} // namespace vx
