// SPDX-License-Identifier: MIT
// A row with a radio button.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QButtonGroup>
#include <QtWidgets/QRadioButton>

namespace vx
{
namespace PopoverWidget
{

/// A row with a radio button, one of a group. A click anywhere on the row checks it and performs it, unless it is the
/// checked one of an exclusive group already. Changes from code perform nothing.
///
/// The row's user data are its text, until set otherwise.
class ZELKOV_WIDGETS_EXPORT RadioItem : public Item
{
    Q_OBJECT

public:
    /// \a group is not owned and may be null.
    RadioItem(const QString& text, const QString& objectName, int id, bool checked, QButtonGroup* group,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~RadioItem() override;

    /// Takes bool only: sets button and elements.
    void setValue(const QVariant& value) override;
    /// Whether the button is checked; null without a button.
    QVariant value() override;
    QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button) override;
    /// Sets button and elements. Emits layoutChanged().
    void setChecked(bool checked) override;

    // The button, and its group; null when they have been deleted by someone else.
    QRadioButton* radioButton() const;
    QButtonGroup* buttonGroup() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void stateChanged(bool checked);

private:
    ControlHolder<QRadioButton> m_button;
    QPointer<QButtonGroup> m_group;
};

} // namespace PopoverWidget
} // namespace vx
