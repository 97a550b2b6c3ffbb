// SPDX-License-Identifier: MIT
// The colours of a balloon.
#include "popover/BalloonLook.h"

namespace vx
{
namespace PopoverWidget
{
namespace
{
constexpr qreal c_LeastContrast = 0.55; // of lightness
constexpr qreal c_BorderShare = 0.4; // of the words' colour

QColor balloonMix(const QColor& a, const QColor& b, qreal share)
{
    return QColor::fromRgbF(a.redF() + (b.redF() - a.redF()) * share,
        a.greenF() + (b.greenF() - a.greenF()) * share, a.blueF() + (b.blueF() - a.blueF()) * share);
}
}

BalloonLook BalloonLook::resolved(
    const QColor& background, const QColor& background2, const QColor& border, const QPalette& palette)
{
    BalloonLook look {background, background2, border};
    if (background.isValid() || background2.isValid()) {
        if (!background.isValid()) {
            look.lower = background2;
        } else if (!background2.isValid()) {
            look.upper = background;
        }
        return look;
    }
    // Elements of rows fill their ground with the colour of buttons, so that is the body's, unless words would be
    // hard to read on it.
    const QColor text = palette.color(QPalette::WindowText);
    const QColor button = palette.color(QPalette::Button);
    const bool readable = qAbs(button.lightnessF() - text.lightnessF()) >= c_LeastContrast;
    look.upper = readable ? button : palette.color(QPalette::Window);
    look.lower = look.upper;
    if (!border.isValid()) {
        look.border = balloonMix(look.upper, text, c_BorderShare);
    }
    return look;
}
}
}
