// SPDX-License-Identifier: MIT
// How handles share a scale: numbers only, no widgets.
#include "sliders/NubsieLayout.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <numeric>

namespace vx
{
namespace NubsieLayout
{
namespace
{
// Both return the last index that they pushed, or @p from.
int pushUp(Place* row, int count, int from, double& limit, double length)
{
    int k = from + 1;
    for (; k < count && row[k].display < limit; ++k) {
        row[k].display = limit;
        limit += length;
    }
    return k - 1;
}

int pushDown(Place* row, int from, double& limit, double length)
{
    int k = from - 1;
    for (; k >= 0 && row[k].display > limit; --k) {
        row[k].display = limit;
        limit -= length;
    }
    return k + 1;
}

void shiftBy(Place* row, const Block& block, double delta)
{
    for (int k = block.first; k <= block.last; ++k) {
        row[k].display += delta;
    }
}

struct Ends
{
    double least;
    double greatest;
};

Ends endsOf(const Place* row, const Block& block, double length)
{
    if (length >= 0.0) {
        return {row[block.first].display, row[block.last].display};
    }
    // On a scale shorter than a handle a block may run backward.
    const auto byDisplay = [](const Place& a, const Place& b) { return a.display < b.display; };
    const auto ends = std::minmax_element(row + block.first, row + block.last + 1, byDisplay);
    return {ends.first->display, ends.second->display};
}

// Shifts the block toward the mean of its true values.
void centre(Place* row, int count, const Block& block, double length)
{
    double sum = 0.0;
    for (int k = block.first; k <= block.last; ++k) {
        sum += row[k].display - row[k].value;
    }
    const double shift = sum / (block.last - block.first + 1);
    const Ends ends = endsOf(row, block, length);
    double delta;
    if (shift > 0.0) {
        const double room = block.first > 0 ? ends.least - row[block.first - 1].display - length : ends.least;
        delta = -std::min(room, shift);
    } else {
        const double room
            = block.last < count - 1 ? row[block.last + 1].display - ends.greatest - length : 1.0 - ends.greatest;
        delta = std::min(-shift, room);
    }
    shiftBy(row, block, delta);
    // Exactly, and not but for the last bit: this is how the two numbers of a handle meet again.
    if (block.first == block.last && delta == -shift) {
        row[block.first].display = row[block.first].value;
    }
}

std::vector<int> sortedBy(const std::vector<Place>& places, std::vector<int> order)
{
    // What is no number stands at the end, or there would be no order at all.
    const auto key = [&places](int index) {
        const double display = places[static_cast<std::size_t>(index)].display;
        return std::isnan(display) ? std::numeric_limits<double>::infinity() : display;
    };
    std::sort(order.begin(), order.end(), [&key](int a, int b) {
        const double left = key(a);
        const double right = key(b);
        return left < right || (left == right && a < b);
    });
    return order;
}

bool isInOrder(const std::vector<Place>& row, const Block& block, double length)
{
    const auto byDisplay = [](const Place& a, const Place& b) { return a.display < b.display; };
    if (length < 0.0) {
        const auto notBefore = [](const Place& a, const Place& b) { return !(a.display < b.display); };
        return std::adjacent_find(row.begin(), row.end(), notBefore) == row.end();
    }
    const auto first = row.begin() + block.first;
    const auto last = row.begin() + block.last;
    return (first == row.begin() || !byDisplay(*first, *(first - 1)))
        && (last + 1 == row.end() || !byDisplay(*(last + 1), *last));
}
}

double handleLength(double size, double extent)
{
    // With no room at all any length would do that keeps nothing apart.
    return extent == 0.0 ? -1.0 : size / extent;
}

std::vector<int> sortedByDisplay(const std::vector<Place>& places)
{
    std::vector<int> order(places.size());
    std::iota(order.begin(), order.end(), 0);
    return sortedBy(places, std::move(order));
}

Block enqueue(Place* row, int count, int seed, double length)
{
    Block block {seed, seed};

    double limit = row[seed].display + length;
    block.last = pushUp(row, count, seed, limit, length);
    const double top = limit - length;

    limit = row[seed].display - length;
    block.first = pushDown(row, seed, limit, length);
    const double bottom = limit + length;

    // The top comes first: a block longer than the scale hangs over at the bottom.
    if (top > 1.0) {
        shiftBy(row, block, -(top - 1.0));
        limit = row[block.first].display - length;
        block.first = pushDown(row, block.first, limit, length);
    } else if (bottom < 0.0) {
        shiftBy(row, block, -bottom);
        limit = row[block.last].display + length;
        block.last = pushUp(row, count, block.last, limit, length);
    }

    centre(row, count, block, length);
    return block;
}

Block pullInThoseAbove(Place* row, int count, int index, double amount)
{
    int k = index + 1;
    for (; k < count; ++k) {
        const double excess = row[k].display - row[k].value;
        if (!(excess > 0.0)) {
            break;
        }
        amount = std::min(excess, amount);
        row[k].display -= amount;
    }
    return {index + 1, k - 1};
}

Block pullInThoseBelow(Place* row, int index, double amount)
{
    int k = index - 1;
    for (; k >= 0; --k) {
        const double excess = row[k].display - row[k].value;
        if (!(excess < 0.0)) {
            break;
        }
        amount = std::min(-excess, amount);
        row[k].display += amount;
    }
    return {k + 1, index - 1};
}

Drift dequeue(Place* row, int count, int index, double length)
{
    const Place* const above = index + 1 < count ? row + index + 1 : nullptr;
    const Place* const below = index > 0 ? row + index - 1 : nullptr;
    const auto gap = [=] { return above->display - below->display - length; };

    double pullAbove = 0.0;
    if (above && above->display - above->value > 0.0) {
        pullAbove = std::min(above->display - above->value, below ? gap() : above->display);
    }
    double pullBelow = 0.0;
    if (below && below->display - below->value < 0.0) {
        pullBelow = std::min(below->value - below->display, above ? gap() : 1.0 - below->display);
    }

    Drift drift {{index, index - 1}, {index + 1, index}};
    if (pullAbove > pullBelow) {
        drift.above = pullInThoseAbove(row, count, index, pullAbove);
        if (above && below) {
            drift.below = pullInThoseBelow(row, index, gap());
        }
    } else {
        drift.below = pullInThoseBelow(row, index, pullBelow);
        if (above && below) {
            drift.above = pullInThoseAbove(row, count, index, gap());
        }
    }
    return drift;
}

void enqueueAll(std::vector<Place>& places, const std::vector<double>& lengths)
{
    const int count = static_cast<int>(places.size());
    std::vector<int> order = sortedByDisplay(places);
    std::vector<int> rank(places.size());
    std::vector<Place> row(places.size());
    const auto line = [&] {
        for (int k = 0; k < count; ++k) {
            const std::size_t at = static_cast<std::size_t>(k);
            const std::size_t handle = static_cast<std::size_t>(order[at]);
            row[at] = places[handle];
            rank[handle] = k;
        }
    };
    const auto putBack = [&] {
        for (std::size_t k = 0; k < row.size(); ++k) {
            places[static_cast<std::size_t>(order[k])] = row[k];
        }
    };

    line();
    for (std::size_t handle = 0; handle < places.size(); ++handle) {
        const Block block = enqueue(row.data(), count, rank[handle], lengths[handle]);
        if (!isInOrder(row, block, lengths[handle])) {
            putBack();
            order = sortedBy(places, std::move(order));
            line();
        }
    }
    putBack();
}
}
}
