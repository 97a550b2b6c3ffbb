// SPDX-License-Identifier: MIT
// A text row that can stand for several texts.
#pragma once

#include "foundation/Export.h"
#include "popover/items/EditItem.h"

class QAction;

namespace vx
{
namespace PopoverWidget
{

/// An edit row for a property that several objects have, perhaps with different values: it then shows a text such as
/// "Several values" as placeholder until the user types one for all. Setting back, with the mark in the line edit,
/// leads to that text or to the cleared text.
class ZELKOV_WIDGETS_EXPORT MultipleValuesEditItem : public EditItem
{
    Q_OBJECT

public:
    /// The line edit starts cleared if \a text is \a clearedText, otherwise empty.
    MultipleValuesEditItem(const QString& text, const QString& placeholder, const QString& objectName,
        const QString& clearedText, const QString& multipleValuesText, int id, QFlags<EItemFlag> flags,
        QWidget* parent);
    ~MultipleValuesEditItem() override;

    /// On clears the line edit; off only brings the normal placeholder back.
    void setMultipleValues(bool multiple);
    /// As it was set; typing does not change it.
    bool hasMultipleValues() const;

    /// Whether the line edit was set back and not changed since.
    bool isCleared() const;
    /// For the next time; changes nothing now.
    void setClearedText(const QString& text);

public Q_SLOTS:
    /// Sets the line edit back, takes its focus and hides the mark, with the signals of the line edit blocked.
    void clear();

private Q_SLOTS:
    void showClearAction();

private:
    QString m_placeholder;
    QString m_clearedText;
    QString m_multipleValuesText;
    QAction* m_clearAction;
    bool m_cleared = false;
    bool m_multipleValues = false;
};

} // namespace PopoverWidget
} // namespace vx
