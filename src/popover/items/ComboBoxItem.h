// SPDX-License-Identifier: MIT
// A row to choose from a list.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtWidgets/QComboBox>

namespace vx
{
namespace PopoverWidget
{

/// A row with a combo box. The user's choice performs it, with the index as value, or the text if the box is
/// editable, and the flag eipControl; a click on the row does nothing. Values from code perform nothing.
///
/// Give entries user data with comboBox()->setItemData(); those of the current entry are the row's.
class ZELKOV_WIDGETS_EXPORT ComboBoxItem : public Item
{
    Q_OBJECT

public:
    /// Starts with the first of \a entries, without a signal.
    ComboBoxItem(const QString& text, const QString& objectName, int id, const QStringList& entries,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~ComboBoxItem() override;

    /// An index or a text; anything else is ignored. Emits layoutChanged().
    void setValue(const QVariant& value) override;
    /// The current index.
    QVariant value() override;
    /// Chooses the entry with that text. Emits nothing.
    void setCurrentText(const QString& text) override;
    QString currentText() override;
    /// Of the current entry; setUserData() of the row does not show here.
    QVariant userData() override;

    /// Chooses the first entry with these user data as setValue() does; unknown data change nothing.
    void setValueByUserData(const QVariant& userData);
    /// Of the entry with that index or text, or a null variant.
    QVariant getUserDataForValue(const QVariant& value);
    /// The index of the first entry with these user data, or -1.
    QVariant getValueForUserData(const QVariant& userData);

    /// Whether an entry can be chosen by the user. An index out of range does nothing.
    void enableItem(int index, bool enabled);
    /// The same for the first entry with these user data.
    void enableItemByUserData(const QVariant& userData, bool enabled);

    /// The box; null when it has been deleted by someone else.
    QComboBox* comboBox() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void currentIndexChanged(int index);
    void currentTextChanged(const QString& text);

private:
    ControlHolder<QComboBox> m_box;
};

} // namespace PopoverWidget
} // namespace vx
