// SPDX-License-Identifier: MIT
// The line drawings on the buttons, in the colours of the palette.
#pragma once

#include <QtGui/QIcon>

class QPalette;

namespace client
{
enum class Sign : int
{
    Views,
    Thumbnails,
    Mark,
    Line,
    Export,
    Ptz,
    Drop,
    Restore,
    Settings,
    User,
    Live,
    Recorded
};

/// Edge of a sign in pixels that do not depend on the screen.
constexpr int c_signExtent = 22;

/// \a locked: faint, with a small lock, for what the user may not do.
QIcon signIcon(Sign sign, const QPalette& palette, qreal ratio, bool locked = false);
}
