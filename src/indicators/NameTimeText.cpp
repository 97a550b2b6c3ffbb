// SPDX-License-Identifier: MIT
#include "indicators/NameTimeText.h"

namespace vx
{
QString dropUntilFits(NameTimeText& parts, const std::function<bool(const QString&)>& fits,
    const std::function<QString(const QString&)>& elide)
{
    const QString blank(QLatin1Char(' '));
    const bool wide = fits(parts.name + blank + parts.time);
    for (;;) {
        QString text;
        if (wide) {
            if (parts.showName) {
                text += parts.name + blank;
            }
            if (parts.showDate) {
                text += parts.date + blank;
            }
            if (parts.showTime) {
                text += parts.time;
            }
        } else if (parts.nameInNarrowMode) {
            text = parts.name;
        } else if (parts.showTime) {
            text = parts.time + blank + parts.date;
        }
        if (fits(text)) {
            parts.timeDropped = false;
            return text;
        }
        if (!parts.showName || !parts.showTime) {
            return elide(text);
        }
        if (parts.showDate) {
            parts.showDate = false;
        } else {
            parts.showTime = false;
            parts.timeDropped = true;
        }
    }
}
}
