// SPDX-License-Identifier: MIT
// Where a panel at the edge of a view stands, and the heights that it snaps to. No widgets.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QRect>
#include <QtCore/QVector>

namespace vx
{
/// The thinking of FadeView and FadeStripeView. All lengths are logical pixels; rectangles are in coordinates of
/// the parent. Edges are the numbers of FadeView::EPositions.
namespace PanelGeometry
{
// The edges.
constexpr int c_Top = 0;
constexpr int c_Bottom = 1;

/// Height of the closed strip, and of each of the two bars of a stripe.
constexpr int c_Strip = 15;
/// Height of both bars of a stripe.
constexpr int c_Bars = 2 * c_Strip;

/// What a panel knows of its surroundings.
struct Surroundings
{
    int edge = c_Top; ///< c_Top or c_Bottom
    int parentWidth = 0; ///< in pixels
    int parentHeight = 0; ///< in pixels
    int neighbourOffset = 0; ///< distance to a panel between this one and the edge
    int verticalOffset = 0; ///< further distance to the top edge
};

/// The panel with a height. Null for an edge that is none.
ZELKOV_WIDGETS_EXPORT QRect panelRect(const Surroundings& surroundings, int height);

/// The strip as it is placed without an animation. Not that of panelRect(): on the top edge the neighbour does not
/// count. Odd on purpose: clients rely on it.
ZELKOV_WIDGETS_EXPORT QRect stillStripRect(const Surroundings& surroundings);

/// All of the parent below the vertical offset, on the top edge: a full height reaches beyond the bottom by that
/// offset. Null on any other edge.
ZELKOV_WIDGETS_EXPORT QRect fullRect(const Surroundings& surroundings, int height);

/// A height that a widget can have.
ZELKOV_WIDGETS_EXPORT int widgetHeight(qint64 height);

/// Whether a panel of this height counts as open.
constexpr bool isOpen(int height)
{
    return height > c_Strip;
}

/// How far from its edge a panel has to stay for a neighbour of this size: one in a layout gives way on the top
/// edge only, one outside on the bottom edge only.
constexpr int neighbourOffset(int edge, bool partOfLayout, int neighbourSize)
{
    return (edge == c_Top) == partOfLayout ? neighbourSize : 0;
}

/// The heights of a stripe with 0, 1, 2 ... rows of contents: 15 for none, else the rows and both bars.
ZELKOV_WIDGETS_EXPORT QVector<int> rowHeights(int contentsHeight, int maximumRows);

/// The number of the row height that a height asked for by the program snaps to: 0 below two thirds of a row, 1 up
/// to a whole row with its bars, -1 (as it is) from there on.
ZELKOV_WIDGETS_EXPORT int snapOfRequest(int height, int contentsHeight);

/// The same for the height at which the user let go. Here a panel closes below 0.66 of a row: not the same as two
/// thirds, and not to be merged with it.
ZELKOV_WIDGETS_EXPORT int snapOfRelease(int height, int contentsHeight);
}
}
