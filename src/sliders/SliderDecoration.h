// SPDX-License-Identifier: MIT
// Where a slider with several handles paints its progress and its numbers, and how large its flags are: no
// widgets.
#pragma once

#include "foundation/Export.h"

#include <Qt>
#include <QtCore/QPointF>
#include <QtCore/QRectF>
#include <QtCore/QSize>
#include <QtCore/QSizeF>

namespace vx
{
/// Pure functions behind the painting and the flags of MultiNubsieSlider. Points for texts are the left ends of
/// their base lines.
namespace SliderDecoration
{
/// The part of the bar that is done, in whole pixels. It runs along the width, on a vertical slider as well:
/// clients rely on it.
ZELKOV_WIDGETS_EXPORT QRectF progressRect(const QRectF& bar, double progress);

/// The number of the present value: below a handle, or to the right of one on a vertical slider. @p position and
/// @p handle are the handle's middle and size at rest, and @p margin the distance of numbers from the bar.
ZELKOV_WIDGETS_EXPORT QPointF valuePosition(
    Qt::Orientation orientation, const QPointF& position, const QSizeF& handle, const QSizeF& text, int margin);

/// The number of the minimum, at the low end of the bar.
ZELKOV_WIDGETS_EXPORT QPointF minimumPosition(
    Qt::Orientation orientation, const QRectF& bar, const QSizeF& text, int margin);

/// The number of the maximum, at the high end of the bar.
ZELKOV_WIDGETS_EXPORT QPointF maximumPosition(
    Qt::Orientation orientation, const QRectF& bar, const QSizeF& text, int margin);

/// The size of a flag's picture, its proportions kept, on a slider of that thickness: half of it, cut off to whole
/// pixels, and at least one pixel. A null picture stays null, and one that would be over 32767 pixels large stays
/// as it is.
ZELKOV_WIDGETS_EXPORT QSize flagSize(const QSize& picture, int thickness);

/// The size that a flag's picture has until its flag is given a colour: three pixels on its shorter side.
ZELKOV_WIDGETS_EXPORT QSize shrunkFlagSize(const QSize& picture);
}
}
