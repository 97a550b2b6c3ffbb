// SPDX-License-Identifier: MIT
#include "indicators/OverlayGeometry.h"

namespace vx
{
BusyTextFit fitBusyText(int parentWidth, int textWidth, double pointSize)
{
    if (textWidth <= 0) {
        return {BusyTextFit::Fits, pointSize};
    }
    const double ratio = (parentWidth - 50.0) / textWidth;
    if (ratio > 0.99) {
        return {BusyTextFit::Fits, pointSize};
    }
    const double size = pointSize * ratio;
    return {size > 8.0 ? BusyTextFit::Shrink : BusyTextFit::TooLong, size};
}

BusyLayout busyLayout(const QSize& icon, bool hasText, int textWidth, int textHeight)
{
    BusyLayout layout;
    if (hasText) {
        layout.icon = QPoint((textWidth - icon.width()) / 2, 0);
        layout.label = QRect(0, icon.height() + 6, textWidth + 8, textHeight + 2);
    } else {
        layout.icon = QPoint(0, 0);
        layout.label = QRect(0, icon.height(), 0, textHeight + 2);
    }
    layout.size = QSize(qMax(icon.width(), layout.label.width()), icon.height() + layout.label.height() + 6);
    return layout;
}

QRectF signFullRect(const QRect& geometry)
{
    QRect full = geometry;
    if (full.width() % 2 == 0) {
        full.setLeft(full.left() - 1);
    }
    if (full.height() % 2 == 0) {
        full.setTop(full.top() - 1);
    }
    return full;
}

QRectF signCenterRect(const QRect& geometry)
{
    return QRect(geometry.center(), geometry.center());
}
}
