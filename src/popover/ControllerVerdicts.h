// SPDX-License-Identifier: MIT
// What a popover's controller decides, without a widget: ways of opening and closing, verdicts on presses and
// keys.
#pragma once

#include <QMargins>
#include <QRect>
#include <Qt>
#include <QtGlobal>

#include <limits>

namespace vx
{
namespace PopoverWidget
{
/// The way in which the balloon comes or goes.
enum class EBalloonMotion
{
    None, ///< It is left as it is.
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
    Ignore, ///< Nothing happens, and the event is not accepted.
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

/// The sum, or the end of the range that it would leave.
inline int saturatedSum(int a, int b)
{
    const qint64 sum = qint64(a) + b;
    return static_cast<int>(
        qBound(qint64(std::numeric_limits<int>::min()), sum, qint64(std::numeric_limits<int>::max())));
}

inline QMargins saturatedSum(const QMargins& a, const QMargins& b)
{
    return {saturatedSum(a.left(), b.left()), saturatedSum(a.top(), b.top()), saturatedSum(a.right(), b.right()),
        saturatedSum(a.bottom(), b.bottom())};
}

/// The area left of \a covered: insets are added as they stand, so that right and bottom ones shrink it only if
/// they are negative; margins go inwards. Edges end where no widget can be.
inline QRect coveredArea(const QRect& covered, const QMargins& insets, const QMargins& margins)
{
    const auto edge = [](int at, int inset, qint64 margin) {
        constexpr qint64 far = 1 << 24;
        return static_cast<int>(qBound(-far, qint64(at) + inset + margin, far));
    };
    return {QPoint(edge(covered.left(), insets.left(), margins.left()),
                edge(covered.top(), insets.top(), margins.top())),
        QPoint(edge(covered.right(), insets.right(), -qint64(margins.right())),
            edge(covered.bottom(), insets.bottom(), -qint64(margins.bottom())))};
}
}
}
