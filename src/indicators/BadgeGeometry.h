// SPDX-License-Identifier: MIT
// The numbers behind badges: rectangles, lines, angles and cache keys, without any widget or painter.
#pragma once

#include "foundation/Export.h"

#include <QLine>
#include <QLineF>
#include <QRect>
#include <QSize>
#include <QString>

#include <array>

class QColor;

namespace vx
{

//! Where the parts of a badge lie on its design canvas, and how the busy mark turns.
//!
//! A badge is designed on a canvas 100 pixels high and scaled to its final size afterwards. All coordinates
//! here are canvas pixels with the origin at the top left; angles are in 1/16 degree, counter-clockwise from
//! three o'clock, as QPainter::drawArc() takes them. The functions are pure.
namespace BadgeGeometry
{

constexpr int CanvasExtent = 100; //!< height of every canvas, and width of a busy mark's
constexpr int FirstAngle = 90 * 16; //!< start angle of the busy mark when it becomes busy, and of a still
constexpr int ArcSpan = -270 * 16; //!< span of the open arc; negative is clockwise
constexpr int AngleStep = 30 * 16; //!< what one tick takes off the start angle
constexpr int FullTurn = 360 * 16; //!< one turn
constexpr int TickInterval = 50; //!< milliseconds between two ticks: 12 ticks and 600 ms a turn

//! How many start angles there are: three of the first turn and the twelve that recur.
constexpr int AngleCount = (FirstAngle + FullTurn) / AngleStep;

constexpr int DotCount = 8; ///< of the busy mark of dots
constexpr int SpokeCount = 12; ///< of the busy mark of spokes

// Busy mark ------------------------------------------------------------------------------------------------

//! The start angle that follows \a angle. Once past zero it stays in -5760 < angle <= 0.
ZELKOV_WIDGETS_EXPORT int nextAngle(int angle);

//! The place of \a angle among the AngleCount angles that nextAngle() goes through, 0 for the lowest.
constexpr int angleIndex(int angle)
{
    return (angle + FullTurn) / AngleStep - 1;
}

//! The conical gradient's angle in whole degrees for \a startAngle (1/16 degree), truncated toward zero.
ZELKOV_WIDGETS_EXPORT int gradientAngle(int startAngle);

//! As gradientAngle(), for the spokes: half a spoke's distance behind, so that no spoke is cut by the seam.
ZELKOV_WIDGETS_EXPORT int spokesGradientAngle(int startAngle);

//! The rectangle whose ellipse is the middle line of the arc and of the ring.
ZELKOV_WIDGETS_EXPORT QRect ringRect();

//! The rectangle on whose inscribed circle the dots' centres lie.
ZELKOV_WIDGETS_EXPORT QRect dotsRect();

//! The rectangle on whose inscribed circle the spokes end.
ZELKOV_WIDGETS_EXPORT QRect spokesRect();

//! The dots' bounding squares, the topmost first, then counter-clockwise.
ZELKOV_WIDGETS_EXPORT std::array<QRect, DotCount> dotRects();

//! The spokes from the outer to the inner end, the lowest first, then clockwise.
ZELKOV_WIDGETS_EXPORT std::array<QLine, SpokeCount> spokeLines();

//! The name under which the finished frame is shared: "type_WxH_start_span_value1_value2".
//!
//! Of the colours only QColor::value() counts, their HSV brightness: looks that differ in hue alone share
//! their frames. Clients rely on the key, so it stays as it is.
ZELKOV_WIDGETS_EXPORT QString cacheKey(
    int type, const QSize& size, int startAngle, int spanAngle, const QColor& color1, const QColor& color2);

// Pill -----------------------------------------------------------------------------------------------------

//! The height that a text may have at most; its font shrinks until the text fits.
ZELKOV_WIDGETS_EXPORT int textRoomHeight(bool stroke);

//! The pill, which is also the canvas, around a text \a textWidth pixels wide.
//!
//! Never narrower than high, so that short texts get a disc. Never wider than a painter can draw, 32767.
ZELKOV_WIDGETS_EXPORT QRect pillRect(int textWidth, bool stroke);

//! The rectangle of the outline, or of the pill itself without \a stroke; cross and text refer to it.
ZELKOV_WIDGETS_EXPORT QRect outlineRect(const QRect& pill, bool stroke);

//! The slash through a pill, from the lower left to the upper right; \a outline as from outlineRect().
ZELKOV_WIDGETS_EXPORT QLineF crossLine(const QRect& outline);

//! Where the text is centred; \a outline as from outlineRect().
ZELKOV_WIDGETS_EXPORT QRect textRect(const QRect& outline);

// Both -----------------------------------------------------------------------------------------------------

//! The size of a \a canvas scaled to cover \a wanted with its proportions kept.
//!
//! Empty if there is nothing to scale (an empty canvas or an empty wanted size) or if the result would be
//! larger than any badge can sensibly be (a side over 32767 pixels or more than 16 million pixels in all).
ZELKOV_WIDGETS_EXPORT QSize coveringSize(const QSize& canvas, const QSize& wanted);

} // namespace BadgeGeometry
} // namespace vx
