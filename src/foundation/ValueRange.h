// SPDX-License-Identifier: MIT
// A closed interval of integers, the key of all maps from value ranges to things.
#pragma once

namespace vx
{
/// The integers from first to second, both included. Sorts by first, then by second. Nothing is normalised: a range
/// whose second is under its first holds no value.
///
/// Maps keyed by it are searched by walking them in key order and taking the first entry that contains the value,
/// so of overlapping ranges the one that starts lower wins.
struct ValueRange
{
    constexpr ValueRange() = default;
    /// The range of this value alone.
    constexpr ValueRange(int value)
        : first(value)
        , second(value)
    {
    }
    /// Both ends belong to it. Empty if \a to is below \a from.
    constexpr ValueRange(int from, int to)
        : first(from)
        , second(to)
    {
    }

    /// Both ends count.
    constexpr bool contains(int value) const { return first <= value && value <= second; }

    int first = 0; ///< lower end
    int second = 0; ///< upper end, included
};

constexpr bool operator<(const ValueRange& a, const ValueRange& b)
{
    return a.first < b.first || (a.first == b.first && a.second < b.second);
}

constexpr bool operator==(const ValueRange& a, const ValueRange& b)
{
    return a.first == b.first && a.second == b.second;
}

constexpr bool operator!=(const ValueRange& a, const ValueRange& b)
{
    return !(a == b);
}
}
