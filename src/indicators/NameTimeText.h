// SPDX-License-Identifier: MIT
// Which parts of name, date and time fit into a line.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QString>

#include <functional>

namespace vx
{
/// The parts of a line and what is wanted of them. dropUntilFits() lowers the flags for lack of room; nothing raises
/// them again but the owner.
struct NameTimeText
{
    QString name; ///< of the device
    QString date; ///< as it is to be shown
    QString time; ///< as it is to be shown
    bool showName = true; ///< lowered where the name has no room
    bool showDate = true; ///< lowered where the date has no room
    bool showTime = true; ///< lowered where the time has no room
    /// Where not even name and time fit: the name, else time and date.
    bool nameInNarrowMode = true;
    bool timeDropped = false; ///< the time has no room beside the name
};

/// The text to show: name, date and time, each but the time followed by a blank. First the date goes, then the time.
/// \a fits judges a text; \a elide shortens the last resort.
ZELKOV_WIDGETS_EXPORT QString dropUntilFits(NameTimeText& parts, const std::function<bool(const QString&)>& fits,
    const std::function<QString(const QString&)>& elide);
}
