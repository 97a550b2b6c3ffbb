// SPDX-License-Identifier: MIT
// Whether a press on a click button was held long enough, said with numbers alone.
#pragma once

#include <QtGlobal>

namespace vx
{
/// Whether a press counts as long. With automatic clicks, a hold timer that no longer runs has expired and decides
/// at once; otherwise the time does: \a heldFor and \a span are milliseconds, and just \a span is long.
constexpr bool isLongHold(bool autoClick, bool timerRuns, qint64 heldFor, int span)
{
    return (autoClick && !timerRuns) || heldFor >= span;
}
}
