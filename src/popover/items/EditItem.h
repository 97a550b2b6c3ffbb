// SPDX-License-Identifier: MIT
// A row that takes a text.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"
#include "popover/items/ControlHolder.h"

#include <QtGui/QColor>
#include <QtWidgets/QLineEdit>

namespace vx
{
namespace PopoverWidget
{

/// A row with a line edit at its right end. It is performed when the editing is finished (return, or the focus
/// leaves), with the text as value and the flag eipControl, and not by a click.
///
/// Values from code perform nothing. The two colours are only stored, for style sheets to set and for clients to read.
class ZELKOV_WIDGETS_EXPORT EditItem : public Item
{
    Q_OBJECT
    Q_PROPERTY(QColor placeholderColor READ placeholderColor WRITE setPlaceholderColor)
    Q_PROPERTY(QColor textColor READ textColor WRITE setTextColor)

public:
    /// \a text is the row's, not that of the line edit, which starts empty with \a placeholder. Takes \a lineEdit
    /// over, or makes one if it is null.
    EditItem(const QString& text, const QString& placeholder, const QString& objectName, int id,
        QFlags<EItemFlag> flags, QWidget* parent, QLineEdit* lineEdit = nullptr);
    ~EditItem() override;

    /// Sets the text of the line edit; takes strings only. Emits layoutChanged().
    void setValue(const QVariant& value) override;
    /// The text of the line edit.
    QVariant value() override;
    QWidget* getFocusItem() override;

    /// The edit; null when it has been deleted by someone else.
    QLineEdit* lineEdit() const;

    // Invalid at first, as the other.
    QColor placeholderColor() const;
    void setPlaceholderColor(const QColor& color);
    QColor textColor() const;
    void setTextColor(const QColor& color);

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

    ControlHolder<QLineEdit> m_lineEdit; ///< owned

private Q_SLOTS:
    void onEditingFinished();

private:
    QColor m_placeholderColor;
    QColor m_textColor;
};

} // namespace PopoverWidget
} // namespace vx
