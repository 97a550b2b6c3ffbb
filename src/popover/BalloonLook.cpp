// SPDX-License-Identifier: MIT
// The colours of a balloon.
#include "popover/BalloonLook.h"

namespace vx
{
namespace PopoverWidget
{
namespace
{
QColor balloonMix(const QColor& a, const QColor& b, qreal share)
{
    return QColor::fromRgbF(a.redF() + (b.redF() - a.redF()) * share,
        a.greenF() + (b.greenF() - a.greenF()) * share, a.blueF() + (b.blueF() - a.blueF()) * share);
}
}

BalloonLook BalloonLook::resolved(
    const QColor& background, const QColor& background2, const QColor& border, const QPalette& palette)
{
    BalloonLook look{background, background2, border};
    if (background.isValid() || background2.isValid()) {
        if (!background.isValid()) {
            look.lower = background2;
        } else if (!background2.isValid()) {
            look.upper = background;
        }
        return look;
    }
    const QColor window = palette.color(QPalette::Window);
    const QColor text = palette.color(QPalette::WindowText);
    const bool dark = window.lightnessF() < text.lightnessF();
    look.upper = balloonMix(window, Qt::white, dark ? 0.09 : 0.7);
    look.lower = balloonMix(window, Qt::white, dark ? 0.05 : 0.45);
    if (!border.isValid()) {
        look.border = balloonMix(window, text, dark ? 0.4 : 0.35);
    }
    return look;
}
}
}
