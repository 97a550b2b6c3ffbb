// SPDX-License-Identifier: MIT
// A row to search with.
#pragma once

#include "foundation/Export.h"
#include "popover/items/EditItem.h"

class QLabel;
class QPushButton;

namespace vx
{
namespace PopoverWidget
{

/// An edit row with a magnifier at the left of its line edit and a button at the right that empties it. The button is
/// there while there is text.
class ZELKOV_WIDGETS_EXPORT SearchItem : public EditItem
{
    Q_OBJECT

public:
    /// \a text is that of the row; the field starts empty with \a placeholder.
    SearchItem(const QString& text, const QString& placeholder, const QString& objectName, int id,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~SearchItem() override;

Q_SIGNALS:
    /// The text changed, by the user or from code. itemPerformed() comes only when the editing is finished.
    void searchChanged(const QString& text);

protected:
    void showEvent(QShowEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void searchEdited(const QString& text);
    void clearClicked();

private:
    void placeMarks();

    QLabel* m_loop;
    QPushButton* m_clearButton;
};

} // namespace PopoverWidget
} // namespace vx
