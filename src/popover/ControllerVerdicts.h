// SPDX-License-Identifier: MIT
// What a popover's controller decides, without a widget: ways of opening and closing, verdicts on presses and keys.
#pragma once

#include <QMargins>
#include <QRect>
#include <Qt>

namespace vx
{
namespace PopoverWidget
{
/// The way in which the balloon comes or goes.
enum class EBalloonMotion
{
    None,   ///< It is left as it is.
    AtOnce,
    Animated
};

/// \a atOnce is the stronger of the two wishes.
constexpr EBalloonMotion balloonMotion(bool atOnce, bool grow)
{
    return atOnce ? EBalloonMotion::AtOnce : grow ? EBalloonMotion::Animated : EBalloonMotion::None;
}

/// The way in which the overlay comes.
enum class EOverlayEntry
{
    AtOnce, ///< Shown with the opacity that it has.
    Fade,
    Opaque ///< Shown with opacity 1.
};

constexpr EOverlayEntry overlayEntry(bool noFade, bool animated)
{
    return noFade ? EOverlayEntry::AtOnce : animated ? EOverlayEntry::Fade : EOverlayEntry::Opaque;
}

/// Whether a press is the first half of a click outside.
constexpr bool isPressOutside(bool insideBalloon, bool closing, bool stayVisible)
{
    return !insideBalloon && !closing && !stayVisible;
}

/// Whether a release is the second half. Press and release must both fall outside.
constexpr bool isClickOutside(bool pressedOutside, bool insideBalloon, bool closing, bool stayVisible)
{
    return pressedOutside && isPressOutside(insideBalloon, closing, stayVisible);
}

/// What the release of a key means.
enum class EKeyVerdict
{
    NotOurs, ///< For the base class.
    Ignore,  ///< Nothing happens, and the event is not accepted.
    Reject,
    Dismiss,
    Accept
};

constexpr EKeyVerdict keyVerdict(int key, bool visible, bool stayVisible, bool closing)
{
    if (key == Qt::Key_Return || key == Qt::Key_Enter) {
        return EKeyVerdict::Accept;
    }
    if (key != Qt::Key_Escape) {
        return EKeyVerdict::NotOurs;
    }
    return !visible || stayVisible ? EKeyVerdict::Reject : closing ? EKeyVerdict::Ignore : EKeyVerdict::Dismiss;
}

/// The area left of \a covered: insets are added as they stand, so that right and bottom ones shrink it only if they
/// are negative; margins go inwards.
inline QRect coveredArea(const QRect& covered, const QMargins& insets, const QMargins& margins)
{
    return covered.adjusted(insets.left(), insets.top(), insets.right(), insets.bottom()).marginsRemoved(margins);
}
}
}
