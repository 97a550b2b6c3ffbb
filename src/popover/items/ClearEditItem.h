// SPDX-License-Identifier: MIT
// A text row that can be set back.
#pragma once

#include "foundation/Export.h"
#include "popover/items/EditItem.h"

class QAction;

namespace vx
{
namespace PopoverWidget
{

/// An edit row with a mark in the line edit that sets it back to a text of its own, for instance "All". The mark is
/// there while the text is another one. Setting back emits nothing.
class ZELKOV_WIDGETS_EXPORT ClearEditItem : public EditItem
{
    Q_OBJECT

public:
    /// The line edit starts cleared if \a text is \a clearedText, otherwise empty.
    ClearEditItem(const QString& text, const QString& placeholder, const QString& objectName,
        const QString& clearedText, int id, QFlags<EItemFlag> flags, QWidget* parent);
    ~ClearEditItem() override;

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
    QString m_clearedText;
    QAction* m_clearAction;
    bool m_cleared = false;
};

} // namespace PopoverWidget
} // namespace vx
