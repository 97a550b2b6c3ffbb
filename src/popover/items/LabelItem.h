// SPDX-License-Identifier: MIT
// A row that shows text.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"

class QLabel;

namespace vx
{
namespace PopoverWidget
{

/// A row that shows a text over as many lines as it takes, also rich text with links that open in the browser. A
/// click performs it with the text as value.
///
/// The text stands in a QLabel at the left; there is no text element.
class ZELKOV_WIDGETS_EXPORT LabelItem : public Item
{
    Q_OBJECT

public:
    /// The text goes to a label, \a additionalText to the element at the right end, if there is one.
    LabelItem(const QString& text, const QString& additionalText, const QString& objectName, int id,
        QFlags<EItemFlag> flags, QWidget* parent);
    ~LabelItem() override;

    /// Of the label, as it is. Emits layoutChanged().
    void setText(const QString& text) override;
    QString text() override;
    /// The text that the value gives.
    void setValue(const QVariant& value) override;

    /// Makes the text bold, whatever the argument: odd on purpose, clients rely on it.
    void setBold(bool bold);
    /// The label that shows the text.
    QLabel* label() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    QPointer<QLabel> m_label;
};

} // namespace PopoverWidget
} // namespace vx
