// SPDX-License-Identifier: MIT
// What the synthetic cameras have recorded: a number for each stretch of time decides what was in it.
#include "Recordings.h"

#include "Fleet.h"

namespace client
{
namespace
{
const qint64 s_minute = 60 * 1000;
const qint64 s_gapSlot = 50 * s_minute;
const qint64 s_eventSlot = 7 * s_minute;

quint64 scrambled(qint64 number)
{
    quint64 x = quint64(number) + 0x9e3779b97f4a7c15ULL;
    x = (x ^ (x >> 30)) * 0xbf58476d1ce4e5b9ULL;
    x = (x ^ (x >> 27)) * 0x94d049bb133111ebULL;
    return x ^ (x >> 31);
}

/// Empty if nothing is missing in the slot.
RecordedSpan gapOf(qint64 slot)
{
    const quint64 dice = scrambled(slot);
    if (dice % 6 != 0) {
        return {};
    }
    const qint64 begin = slot * s_gapSlot + qint64((dice >> 8) % 20) * s_minute;
    return {begin, begin + qint64(8 + (dice >> 16) % 20) * s_minute};
}
}

QVector<RecordedSpan> Recordings::spans(qint64 begin, qint64 end)
{
    QVector<RecordedSpan> result;
    qint64 from = begin;
    for (qint64 slot = begin / s_gapSlot - 1; slot * s_gapSlot < end; ++slot) {
        const RecordedSpan gap = gapOf(slot);
        if (gap.end <= from || gap.begin >= end) {
            continue;
        }
        if (gap.begin > from) {
            result.append({from, gap.begin});
        }
        from = gap.end;
    }
    if (from < end) {
        result.append({from, end});
    }
    return result;
}

QVector<RecordedEvent> Recordings::events(qint64 begin, qint64 end, const Fleet& fleet)
{
    QVector<RecordedEvent> result;
    for (qint64 slot = begin / s_eventSlot; slot * s_eventSlot < end; ++slot) {
        const quint64 dice = scrambled(slot * 31 + 7);
        RecordedEvent event;
        event.time = slot * s_eventSlot + qint64((dice >> 16) % 420) * 1000;
        event.camera = int((dice >> 32) % quint64(Fleet::s_count));
        event.alarm = (dice >> 40) % 6 == 0;
        const qint64 gapSlot = event.time / s_gapSlot;
        const RecordedSpan gap = gapOf(gapSlot);
        const bool isMissing = event.time >= gap.begin && event.time < gap.end;
        if (dice % 5 < 3 && !isMissing && event.time >= begin && event.time < end && fleet.camera(event.camera)) {
            result.append(event);
        }
    }
    return result;
}
}
