// SPDX-License-Identifier: MIT
// How a picture of the wall of thumbnails looks.
#pragma once

#include "models/TableViewDelegate.h"

namespace client
{
/// The caption is as wide as the picture; the chosen camera has a frame and a caption in the colour of what is chosen.
class ThumbnailDelegate : public vx::TableViewDelegate
{
    Q_OBJECT

public:
    using TableViewDelegate::TableViewDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    QRect getTitleRect(const QRect& rect) const override;

protected:
    void paintCaption(QRect& background, QRect& text, const QModelIndex& index, QPainter* painter,
        const QStyleOptionViewItem& option, const QColor& color, Qt::ItemDataRole role) const override;
};
}
