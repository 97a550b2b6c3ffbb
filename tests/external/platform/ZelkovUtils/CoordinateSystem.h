// SPDX-License-Identifier: MIT
// Second platform set: the interface of coordinate systems, with constants of its own.
#pragma once

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QRectF>
#include <QtCore/Qt>

namespace vx
{
class CoordinateSystem
{
public:
    static constexpr double IGNORE_ASPECT_RATIO = -100.0;
    static constexpr double CALC_ASPECT_RATIO = -200.0;

    virtual ~CoordinateSystem() = default;
    virtual QRect mapToScreen(const QRectF& rect) const = 0;
    virtual void setLeft(QRectF& rect, int screenX) const = 0;
    virtual void setTop(QRectF& rect, int screenY) const = 0;
    virtual void setRight(QRectF& rect, int screenX) const = 0;
    virtual void setBottom(QRectF& rect, int screenY) const = 0;
    virtual void move(QRectF& rect, const QPoint& screenOffset, Qt::Alignment alignment) const = 0;
    virtual void adjustToAspectRatio(QRectF& rect, double ratio, Qt::Alignment alignment,
        const QRectF& original = QRectF()) const = 0;
};
}
