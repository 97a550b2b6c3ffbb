// SPDX-License-Identifier: MIT
// What a gesture was, said with points, times and counts alone: no widget, no event, no allocation.
#pragma once

#include "input/GeometryUtils.h"

#include <QPoint>
#include <QtGlobal>

namespace vx
{

/// One moment of a gesture: where the pointer was (global coordinates) and when (ms).
struct GestureSample
{
    QPoint position; ///< global, in pixels
    qint64 time = 0; ///< in milliseconds
};

/// The thresholds in force for one gesture.
struct GestureLimits
{
    int clickRadius = 0; ///< largest Manhattan distance that is still a click, px
    int doubleClickRadius = 0; ///< the same for a double click
    qint64 doubleClickInterval = 0; ///< ms; 0: no double clicks
    qint64 longClickInterval = 0; ///< ms; 0: no long clicks
    qint64 swipeInterval = 0; ///< ms; up to it a swipe, beyond it a pan
};

/// The verdicts as plain functions. Those in the past tense suppose that the gesture has finished. `releases` is
/// the number of recorded releases, `buttonsMatch` whether the wanted mouse buttons took part.
namespace GestureVerdicts
{

/// Manhattan distance, in 64 bits so that no pair of points overflows.
inline qint64 distance(const QPoint& a, const QPoint& b)
{
    return qAbs(qint64(b.x()) - a.x()) + qAbs(qint64(b.y()) - a.y());
}

/// Milliseconds from one time to the other; wraps around instead of overflowing.
inline qint64 elapsed(qint64 from, qint64 to)
{
    return static_cast<qint64>(static_cast<quint64>(to) - static_cast<quint64>(from));
}

/// @p to - @p from, cut to what a point can hold.
inline QPoint offset(const QPoint& from, const QPoint& to)
{
    const auto cut = [](qint64 v) { return static_cast<int>(qBound<qint64>(-2147483647 - 1, v, 2147483647)); };
    return {cut(qint64(to.x()) - from.x()), cut(qint64(to.y()) - from.y())};
}

/// Whether the way from one point to the other has one of the wanted directions.
inline bool heads(Direction wanted, const QPoint& from, const QPoint& to)
{
    return (wanted & GeometryUtils::direction(offset(from, to))) != 0;
}

/// Running pan: the pointer has left the click radius and nothing was released yet.
inline bool isPan(Direction wanted, const GestureSample& press, const GestureSample& last, int releases,
    const GestureLimits& limits)
{
    return releases < 1 && distance(press.position, last.position) > limits.clickRadius
        && heads(wanted, press.position, last.position);
}

/// Running long press; @p fired tells that the long click time is over.
inline bool isLongPress(bool buttonsMatch, const GestureSample& press, const GestureSample& last, int releases,
    bool fired, const GestureLimits& limits)
{
    return fired && limits.longClickInterval != 0 && buttonsMatch && releases < 1
        && distance(press.position, last.position) <= limits.clickRadius;
}

/// Released once, out of the click radius, within the swipe interval, in a wanted direction.
inline bool wasSwipe(Direction wanted, const GestureSample& press, const GestureSample& release, int releases,
    const GestureLimits& limits)
{
    return releases == 1 && distance(press.position, release.position) > limits.clickRadius
        && elapsed(press.time, release.time) <= limits.swipeInterval
        && heads(wanted, press.position, release.position);
}

/// Measured to the last event where the swipe is measured to the release.
inline bool wasPan(Direction wanted, const GestureSample& press, const GestureSample& last, int releases,
    const GestureLimits& limits)
{
    return releases == 1 && distance(press.position, last.position) > limits.clickRadius
        && elapsed(press.time, last.time) > limits.swipeInterval && heads(wanted, press.position, last.position);
}

/// @p release is the second one; the time counts from the first press.
inline bool wasDoubleClick(bool buttonsMatch, const GestureSample& press, const GestureSample& release,
    int releases, const GestureLimits& limits)
{
    return limits.doubleClickInterval != 0 && buttonsMatch && releases == 2
        && distance(press.position, release.position) <= limits.doubleClickRadius
        && elapsed(press.time, release.time) <= limits.doubleClickInterval;
}

/// Released once within the click radius, at the long click interval or later.
inline bool wasLongClick(bool buttonsMatch, const GestureSample& press, const GestureSample& release, int releases,
    const GestureLimits& limits)
{
    return limits.longClickInterval != 0 && buttonsMatch && releases == 1
        && distance(press.position, release.position) <= limits.clickRadius
        && elapsed(press.time, release.time) >= limits.longClickInterval;
}

/// Released once within the click radius, before the long click interval.
inline bool wasSingleClick(bool buttonsMatch, const GestureSample& press, const GestureSample& release,
    int releases, const GestureLimits& limits)
{
    return buttonsMatch && releases == 1 && distance(press.position, release.position) <= limits.clickRadius
        && (limits.longClickInterval == 0 || elapsed(press.time, release.time) < limits.longClickInterval);
}

} // namespace GestureVerdicts

} // namespace vx
