// SPDX-License-Identifier: MIT
// The arithmetic of a slider's handle: values, dates, sizes and places, no widgets.
#pragma once

#include "foundation/Export.h"
#include "foundation/ValueRange.h"

#include <QtCore/QMap>
#include <QtCore/QPoint>
#include <QtCore/QPointF>
#include <QtCore/QSize>

namespace vx
{
/// Pure functions behind Nubsie. Results that no int can hold end at the limits instead of wrapping around.
namespace NubsieMath
{
/// The entry of the first range in key order that holds the value, or null.
template <typename Thing> const Thing* entryFor(const QMap<ValueRange, Thing>& map, int value)
{
    for (auto it = map.constBegin(); it != map.constEnd(); ++it) {
        if (it.key().contains(value)) {
            return &it.value();
        }
    }
    return nullptr;
}

// Values ---------------------------------------------------------------------------------------------------

/// The place of a value, held in the range, on the scale from 0 to 1. A range of one value gives 1.
ZELKOV_WIDGETS_EXPORT double normalized(int value, int minimum, int maximum);

/// The value nearest to a place on the scale, held in the range. Halves go up, below zero as well.
ZELKOV_WIDGETS_EXPORT int denormalized(double place, int minimum, int maximum);

/// The value at the same distance from the other end of the range.
ZELKOV_WIDGETS_EXPORT int turnedRound(int value, int minimum, int maximum);

/// One up. After the maximum comes 0, whatever the minimum: clients rely on it.
ZELKOV_WIDGETS_EXPORT int steppedUp(int value, int maximum);

/// One down; before the minimum comes the maximum.
ZELKOV_WIDGETS_EXPORT int steppedDown(int value, int minimum, int maximum);

// Dates, in milliseconds -----------------------------------------------------------------------------------

/// The value that stands for a date, fractions cut off toward @p minimum; not held in the range. Where start and
/// end are the same, earlier dates give the lowest int, later ones the highest and that date the minimum.
ZELKOV_WIDGETS_EXPORT int valueOfDate(qint64 date, qint64 start, qint64 end, int minimum, int maximum);

/// The date of a place on the scale from 0 to 1, fractions of a millisecond cut off toward the start.
ZELKOV_WIDGETS_EXPORT qint64 dateOfPlace(qint64 start, qint64 end, double place);

// Sizes and places -----------------------------------------------------------------------------------------

/// Where the top left corner of a widget of that size goes, so that its middle lies one pixel to the lower right
/// of
/// @p middle. No farther out than a widget can be large.
ZELKOV_WIDGETS_EXPORT QPoint topLeft(const QPointF& middle, const QSize& size);

/// Where a picture is drawn to stand in the middle of an area; a larger one starts at the area's edge.
ZELKOV_WIDGETS_EXPORT QPoint iconPoint(const QSize& area, const QSize& icon);

/// The size of a picture scaled into @p target with its proportions kept, at least 1 x 1. Invalid if there is
/// nothing to scale, or if no picture has room for it (over 32767 pixels a side or 16 million in all).
ZELKOV_WIDGETS_EXPORT QSize scaledSize(const QSize& picture, const QSize& target);

/// Whether a handle has to grow wider for its badge: a wide picture on a square handle whose sizes are both set.
ZELKOV_WIDGETS_EXPORT bool needsPill(const QSize& picture, const QSize& size, const QSize& draggedSize);

/// Whether a handle has to become square again: a square picture on a handle that is not.
ZELKOV_WIDGETS_EXPORT bool needsSquare(const QSize& picture, const QSize& size, const QSize& draggedSize);

/// The size with its width multiplied by the picture's ratio of width to height, cut off to whole pixels.
ZELKOV_WIDGETS_EXPORT QSize widened(const QSize& size, const QSize& picture);

/// The square as high as the size.
ZELKOV_WIDGETS_EXPORT QSize squared(const QSize& size);
}
}
