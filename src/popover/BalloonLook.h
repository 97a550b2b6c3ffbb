// SPDX-License-Identifier: MIT
// The colours of a balloon, with those of the palette where a style sheet gives none.
#pragma once

#include "foundation/Export.h"

#include <QtGui/QColor>
#include <QtGui/QPalette>

namespace vx
{
namespace PopoverWidget
{
/// What a Balloon is painted with. The body colours are always valid; an invalid border means none.
struct ZELKOV_WIDGETS_EXPORT BalloonLook
{
    /// The look for these colours of a balloon, each of which may be invalid. One body colour stands in for the
    /// other; with neither, the body has the colour of the palette's buttons (of its windows, if words would be
    /// hard to read), and with no colour at all a border that is seen on light and on dark windows.
    static BalloonLook resolved(
        const QColor& background, const QColor& background2, const QColor& border, const QPalette& palette);

    QColor lower; ///< at the end of the gradient
    QColor upper; ///< from its middle on
    QColor border; ///< of the outline; invalid for none
};

/// Whether all three colours are the same.
inline bool operator==(const BalloonLook& a, const BalloonLook& b)
{
    return a.lower == b.lower && a.upper == b.upper && a.border == b.border;
}
}
}
