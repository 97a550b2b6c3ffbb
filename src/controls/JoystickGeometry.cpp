// SPDX-License-Identifier: MIT
#include "controls/JoystickGeometry.h"

#include <QtCore/QPointF>
#include <QtCore/QtGlobal>

#include <cmath>

namespace vx
{
float joystickAxis(float value)
{
    return std::isnan(value) ? 0.0F : qBound(-1.0F, value, 1.0F);
}

QPoint joystickPoint(float x, float y, const QSize& size, float circleInset)
{
    if (size.isEmpty()) {
        return QPoint();
    }
    const float width = static_cast<float>(size.width());
    const float height = static_cast<float>(size.height());
    const float radius = (width - 2.0F * circleInset) / width;
    // Not qFuzzyIsNull: the smallest deflection has a direction.
    const double slope = x < 0.0F || x > 0.0F ? static_cast<double>(y) / static_cast<double>(x) : 0.0;

    double cx = 0.0;
    double cy = 0.0;
    if (x < 0.0F || x > 0.0F) {
        cx = std::sqrt(static_cast<double>(radius * radius) / (slope * slope + 1.0));
        if (x < 0.0F) {
            cx = -cx;
        }
        cy = std::abs(cx * slope);
        if (y > 0.0F) {
            cy = -cy;
        }
    } else {
        // The two branches are no mirror images: the upper one does not depend on y. Clients rely on it.
        const double gap = static_cast<double>(2.0F * circleInset / height);
        cy = y > 0.0F ? gap - 1.0 : -static_cast<double>(y) - gap;
    }
    if (std::abs(static_cast<double>(x)) < std::abs(cx)) {
        cx = static_cast<double>(x);
    }
    if (std::abs(static_cast<double>(y)) < std::abs(cy)) {
        cy = -static_cast<double>(y);
    }
    if (!std::isfinite(cx) || !std::isfinite(cy)) {
        return QPoint(size.width() / 2, size.height() / 2); // an inset without measure
    }
    // An inset far beyond the widget may lead out of the range of pixels.
    constexpr double limit = 1.0e6;
    cx = qBound(-limit, cx, limit);
    cy = qBound(-limit, cy, limit);
    return QPointF(qBound(-1.0e9, static_cast<double>(width) * (cx + 1.0) * 0.5, 1.0e9),
        qBound(-1.0e9, static_cast<double>(height) * (cy + 1.0) * 0.5, 1.0e9))
        .toPoint();
}
}
