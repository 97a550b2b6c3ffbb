// SPDX-License-Identifier: MIT
// What the synthetic cameras have recorded.
#pragma once

#include <QtCore/QVector>

namespace client
{
class Fleet;

struct RecordedSpan
{
    qint64 begin = 0; ///< milliseconds since 1970-01-01 UTC
    qint64 end = 0;
};

struct RecordedEvent
{
    qint64 time = 0; ///< milliseconds since 1970-01-01 UTC
    int camera = -1;
    bool alarm = false; ///< and not only a movement
};

/// The same for the same moments, whenever it is asked.
namespace Recordings
{
/// Oldest first; they do not touch each other.
QVector<RecordedSpan> spans(qint64 begin, qint64 end);
/// Of the cameras that there are, oldest first.
QVector<RecordedEvent> events(qint64 begin, qint64 end, const Fleet& fleet);
}
}
