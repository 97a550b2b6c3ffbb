// SPDX-License-Identifier: MIT
// How handles share a scale: numbers only, no widgets.
#pragma once

#include "foundation/Export.h"

#include <vector>

namespace vx
{
/// The rule that keeps handles apart only as far as needed. A handle has its true place on the scale and the one
/// where it is drawn, both from 0 to 1; a row is an array of handles that is sorted by the drawn place.
namespace NubsieLayout
{
/// The two places of a handle, from 0 to 1.
struct Place
{
    double display; ///< where it is drawn
    double value; ///< where it belongs
};

/// Indexes into a row, both included; empty if last is under first.
struct Block
{
    int first; ///< index of the lowest handle
    int last; ///< index of the highest handle
};

/// A handle's length in units of the scale, for a handle of @p size on a scale that is @p extent pixels long. A
/// scale that is shorter than the handle gives a negative length: nothing is kept apart there.
ZELKOV_WIDGETS_EXPORT double handleLength(double size, double extent);

/// The indexes of the places in the order in which they are drawn; equal ones in the given order.
ZELKOV_WIDGETS_EXPORT std::vector<int> sortedByDisplay(const std::vector<Place>& places);

/// Puts the handle at @p seed among its neighbours: those that are nearer than @p length to it, or to one that it
/// pushed, are pushed away; the block is shifted into the scale, the top first, and then toward the mean of its
/// true values as far as the scale and the next neighbours let it. A handle alone comes back to its true value.
/// Returns the block; only handles in it have moved.
ZELKOV_WIDGETS_EXPORT Block enqueue(Place* row, int count, int seed, double length);

/// The handles that drifted home when one was taken out.
struct Drift
{
    Block below; ///< handles under the one taken out
    Block above; ///< handles over it
};

/// Takes the handle at @p index out: those that it pushed aside move toward their true values, the side that was
/// displaced further first, the other one with what room that leaves. The handle itself keeps its place.
ZELKOV_WIDGETS_EXPORT Drift dequeue(Place* row, int count, int index, double length);

/// Moves the handles above @p index down toward their true values, each by at most what the one before it moved
/// and the first by at most @p amount, up to the first that is not above its true value. Returns those that were
/// touched.
ZELKOV_WIDGETS_EXPORT Block pullInThoseAbove(Place* row, int count, int index, double amount);
/// The mirror image.
ZELKOV_WIDGETS_EXPORT Block pullInThoseBelow(Place* row, int index, double amount);

/// Enqueues every handle once, in the given order, with the length at the same index. What comes out is what comes
/// out of sorting anew before each of them, to the last bit; the row is sorted once, since a handle hardly ever
/// passes another.
ZELKOV_WIDGETS_EXPORT void enqueueAll(std::vector<Place>& places, const std::vector<double>& lengths);
}
}
