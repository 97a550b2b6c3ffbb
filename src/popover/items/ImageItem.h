// SPDX-License-Identifier: MIT
// A row that shows a picture.
#pragma once

#include "foundation/Export.h"
#include "popover/Item.h"

#include <QtGui/QPixmap>

namespace vx
{
class Label;
}

namespace vx
{
namespace PopoverWidget
{

/// A row that is one picture, scaled to the row with its proportions kept. It has no elements. A left click performs
/// it with a null value.
class ZELKOV_WIDGETS_EXPORT ImageItem : public Item
{
    Q_OBJECT

public:
    /// Shows \a pixmap.
    ImageItem(const QString& objectName, int id, const QPixmap& pixmap, QWidget* parent);
    ~ImageItem() override;

    /// Takes pixmaps only. Emits layoutChanged().
    void setValue(const QVariant& value) override;
    /// The picture, or a null variant without one.
    QVariant value() override;

    /// The label that shows the picture.
    vx::Label* label() const;

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    QPointer<vx::Label> m_label;
    QPixmap m_pixmap;
};

} // namespace PopoverWidget
} // namespace vx
