// SPDX-License-Identifier: MIT
// How far a frame time lies from an anchor time, as a text.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QDateTime>
#include <QtCore/QString>
#include <QtCore/QtGlobal>

namespace vx
{
/// Frame times and anchor times are microseconds since the epoch; this one means that there is no time.
constexpr quint64 c_NoFrameTime = ~quint64(0);

/// " +hh:mm:ss" for a frame after the anchor, " -hh:mm:ss" for one before it, in whole seconds. Empty where one of the
/// two is no time, where they are equal, and for a frame less than a second before the anchor.
///
/// The difference is taken without sign, so that a frame less than a second after the anchor gives " +00:00:00".
/// Clients rely on it.
ZELKOV_WIDGETS_EXPORT QString frameTimeDifference(quint64 frameTime, quint64 anchorTime);

/// The second of a frame time, in local time. Seconds are counted in 32 bits.
ZELKOV_WIDGETS_EXPORT QDateTime frameDateTime(quint64 frameTime);
/// Seconds since the epoch in 32 bits; all bits set for an invalid time and for one before the epoch or after 2106.
ZELKOV_WIDGETS_EXPORT quint32 secondsOfTime(const QDateTime& dateTime);
}
