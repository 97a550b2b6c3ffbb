// SPDX-License-Identifier: MIT
// The arithmetic of the plain sliders and the overlay bar: numbers and rectangles, no widgets.
#pragma once

#include "foundation/Export.h"

#include <Qt>
#include <QtCore/QRect>
#include <QtCore/QSize>

namespace vx
{
/// Where a press on a groove leads to, and where an overlay bar lies. All functions are pure; lengths are logical
/// pixels.
namespace SliderGeometry
{
/// The value under a press on the groove of a slider, such that the middle of the handle comes under the pointer.
///
/// @p pressed is the distance of the press from the low end of the slider, @p length the slider's length and
/// @p handleLength that of its handle, all along the groove. Fractions of a value are cut off toward @p minimum.
/// Presses nearer to an end than half a handle count as that end; a slider with no room to move gives @p minimum.
///
/// With @p inverted the result is @p maximum minus the value, and not the mirror image of it: on a range that
/// does not start at 0 it is off by @p minimum and may lie under it. Clients rely on that.
ZELKOV_WIDGETS_EXPORT int jumpValue(
    int minimum, int maximum, bool inverted, int pressed, int length, int handleLength);

/// The rectangle of a bar @p thickness wide along an edge of an area of size @p area, in the area's coordinates.
///
/// @p leading means the top edge for a horizontal and the left edge for a vertical bar, in every layout
/// direction; otherwise it is bottom or right. The bar takes the whole edge.
ZELKOV_WIDGETS_EXPORT QRect overlayBarRect(
    Qt::Orientation orientation, bool leading, const QSize& area, int thickness);
}
}
