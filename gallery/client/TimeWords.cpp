// SPDX-License-Identifier: MIT
// The words of TimeUtils for the catalogues of the client: its own library brings none.
#include <QtCore/QtGlobal>

namespace client
{
namespace
{
[[maybe_unused]] const char* const s_timeWords[] = {
    QT_TRANSLATE_NOOP("TimeUtils", "Yesterday"),
    QT_TRANSLATE_NOOP("TimeUtils", "Today"),
    QT_TRANSLATE_NOOP("TimeUtils", "Tomorrow"),
    QT_TRANSLATE_NOOP("TimeUtils", "%1 d"),
    QT_TRANSLATE_NOOP("TimeUtils", "%1 h"),
    QT_TRANSLATE_NOOP("TimeUtils", "%1 min"),
    QT_TRANSLATE_NOOP("TimeUtils", "%1 s"),
};
}
}
