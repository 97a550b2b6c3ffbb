// SPDX-License-Identifier: MIT
// The arithmetic of the overlays: how a text is fitted to its parent and what a growing sign starts and ends with.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/QSize>

namespace vx
{
/// What becomes of a text line that is \a textWidth pixels wide at \a pointSize points.
struct BusyTextFit
{
    /// The three outcomes.
    enum EFit : int
    {
        Fits,   ///< at the base size, which is also the largest
        Shrink, ///< to pointSize points
        TooLong ///< it would need 8 points or less
    };
    EFit fit; ///< what becomes of the text
    double pointSize; ///< the size to draw it in
};

/// 50 pixels of the parent's width stay free. A text that is not wide at all fits.
ZELKOV_WIDGETS_EXPORT BusyTextFit fitBusyText(int parentWidth, int textWidth, double pointSize);

/// Where the spinner and the text line of the busy overlay go, in its own coordinates, and its size.
struct BusyLayout
{
    QPoint icon; ///< top left corner of the spinner
    QRect label; ///< of the text line
    QSize size; ///< of the whole overlay
};

/// The gap of 6 pixels counts in the height even where there is no text: clients rely on it.
ZELKOV_WIDGETS_EXPORT BusyLayout busyLayout(const QSize& icon, bool hasText, int textWidth, int textHeight);

/// The rectangle a sign grows to: the given one, moved out by a pixel on the left and on the top where its size is
/// even, so that there is a centre pixel.
ZELKOV_WIDGETS_EXPORT QRectF signFullRect(const QRect& geometry);
/// The rectangle a sign grows from: the centre pixel of the given one.
ZELKOV_WIDGETS_EXPORT QRectF signCenterRect(const QRect& geometry);
}
