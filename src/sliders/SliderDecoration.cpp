// SPDX-License-Identifier: MIT
// Where a slider with several handles paints its progress and its numbers, and how large its flags are: no
// widgets.
#include "sliders/SliderDecoration.h"

namespace vx
{
namespace SliderDecoration
{
namespace
{
constexpr int c_LongestFlagSide = 32767;
constexpr int c_ShrunkFlag = 3;
// Beyond the margin, the number of the present value keeps clear of the handle's glow.
constexpr int c_ValueDistance = 10;
constexpr double c_LongestBar = 16777215.0;

int wholePixels(double length)
{
    return length > 0.0 ? static_cast<int>(qMin(length, c_LongestBar)) : 0;
}

QSize flagSizeIn(const QSize& picture, const QSize& target, Qt::AspectRatioMode mode)
{
    if (picture.isEmpty()) {
        return picture;
    }
    const QSize size = picture.scaled(target, mode).expandedTo(QSize(1, 1));
    return size.width() > c_LongestFlagSide || size.height() > c_LongestFlagSide ? picture : size;
}
}

QRectF progressRect(const QRectF& bar, double progress)
{
    return QRectF(bar.topLeft(), QSizeF(wholePixels(bar.width() * progress), wholePixels(bar.height())));
}

QPointF valuePosition(
    Qt::Orientation orientation, const QPointF& position, const QSizeF& handle, const QSizeF& text, int margin)
{
    if (orientation == Qt::Horizontal) {
        return position + QPointF(0.0, text.height() + handle.height() + margin + c_ValueDistance);
    }
    return position + QPointF(handle.width() + margin + c_ValueDistance, text.height());
}

QPointF minimumPosition(Qt::Orientation orientation, const QRectF& bar, const QSizeF& text, int margin)
{
    if (orientation == Qt::Horizontal) {
        return bar.bottomLeft() + QPointF(0.0, text.height() + margin);
    }
    return bar.bottomRight() + QPointF(margin, 0.0);
}

QPointF maximumPosition(Qt::Orientation orientation, const QRectF& bar, const QSizeF& text, int margin)
{
    if (orientation == Qt::Horizontal) {
        return bar.bottomRight() + QPointF(-text.width() - margin, text.height() + margin);
    }
    return bar.topRight() + QPointF(margin, text.height());
}

QSize flagSize(const QSize& picture, int thickness)
{
    return flagSizeIn(picture, QSize(thickness / 2, thickness / 2), Qt::KeepAspectRatio);
}

QSize shrunkFlagSize(const QSize& picture)
{
    return flagSizeIn(picture, QSize(c_ShrunkFlag, c_ShrunkFlag), Qt::KeepAspectRatioByExpanding);
}
}
}
