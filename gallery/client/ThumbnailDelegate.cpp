// SPDX-License-Identifier: MIT
// How a picture of the wall of thumbnails looks.
#include "ThumbnailDelegate.h"

#include <QtGui/QGuiApplication>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtGui/QPalette>

namespace client
{
namespace
{
const QMargins c_margins(10, 10, 1, 1); // of the picture in its cell
constexpr int c_frame = 3;

// The text of a caption is white in every theme, and the highlight of a dark one is too light for it.
QColor chosenColor()
{
    const QColor color = QGuiApplication::palette().color(QPalette::Highlight);
    return color.lightness() > 150 ? color.darker(170) : color;
}
}

void ThumbnailDelegate::paint(
    QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    TableViewDelegate::paint(painter, option, index);
    if (option.state.testFlag(QStyle::State_Selected)) {
        const QRect picture = option.rect.marginsRemoved(c_margins);
        QPainterPath frame;
        frame.addRect(picture);
        frame.addRect(picture.adjusted(c_frame, c_frame, -c_frame, -c_frame));
        painter->fillPath(frame, chosenColor());
    }
}

QRect ThumbnailDelegate::getTitleRect(const QRect& rect) const
{
    return TableViewDelegate::getTitleRect(rect.marginsRemoved({c_margins.left(), 0, 1, 1}));
}

void ThumbnailDelegate::paintCaption(QRect& background, QRect& text, const QModelIndex& index, QPainter* painter,
    const QStyleOptionViewItem& option, const QColor&, Qt::ItemDataRole role) const
{
    const bool isChosen = option.state.testFlag(QStyle::State_Selected);
    TableViewDelegate::paintCaption(
        background, text, index, painter, option, isChosen ? chosenColor() : QColor(20, 24, 30, 190), role);
}
}
