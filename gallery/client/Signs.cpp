// SPDX-License-Identifier: MIT
// The line drawings on the buttons.
#include "Signs.h"

#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtGui/QPalette>

#include <cmath>

namespace client
{
namespace
{
// All in a square of 24.
QPainterPath views()
{
    QPainterPath path;
    for (const QPointF& corner : {QPointF(3.5, 3.5), QPointF(13.5, 3.5), QPointF(3.5, 13.5), QPointF(13.5, 13.5)}) {
        path.addRoundedRect(QRectF(corner, QSizeF(7, 7)), 1.5, 1.5);
    }
    return path;
}

QPainterPath thumbnails()
{
    QPainterPath path;
    for (int i = 0; i < 9; ++i) {
        path.addRoundedRect(QRectF(3 + i % 3 * 7, 3 + i / 3 * 7, 4, 4), 1, 1);
    }
    return path;
}

QPainterPath mark()
{
    QPainterPath path;
    // Four corners of a region.
    path.addPolygon(QPolygonF({{4, 9}, {4, 4}, {9, 4}}));
    path.addPolygon(QPolygonF({{15, 4}, {20, 4}, {20, 9}}));
    path.addPolygon(QPolygonF({{20, 15}, {20, 20}, {15, 20}}));
    path.addPolygon(QPolygonF({{9, 20}, {4, 20}, {4, 15}}));
    path.addEllipse(QPointF(12, 12), 2.6, 2.6);
    return path;
}

QPainterPath line()
{
    QPainterPath path;
    path.moveTo(5, 19);
    path.lineTo(19, 5);
    path.addEllipse(QPointF(4.2, 19.8), 1.6, 1.6);
    path.addEllipse(QPointF(19.8, 4.2), 1.6, 1.6);
    path.addPolygon(QPolygonF({{12.5, 18.5}, {18.5, 18.5}, {18.5, 12.5}}));
    path.moveTo(18.5, 18.5);
    path.lineTo(13, 13);
    return path;
}

QPainterPath exporting()
{
    QPainterPath path;
    path.addPolygon(QPolygonF({{4, 14}, {4, 20}, {20, 20}, {20, 14}}));
    path.moveTo(12, 3.5);
    path.lineTo(12, 15);
    path.addPolygon(QPolygonF({{7.5, 10.5}, {12, 15}, {16.5, 10.5}}));
    return path;
}

QPainterPath ptz()
{
    QPainterPath path;
    path.addEllipse(QPointF(12, 12), 3, 3);
    path.addPolygon(QPolygonF({{9, 5.5}, {12, 2.5}, {15, 5.5}}));
    path.addPolygon(QPolygonF({{9, 18.5}, {12, 21.5}, {15, 18.5}}));
    path.addPolygon(QPolygonF({{5.5, 9}, {2.5, 12}, {5.5, 15}}));
    path.addPolygon(QPolygonF({{18.5, 9}, {21.5, 12}, {18.5, 15}}));
    return path;
}

QPainterPath camera()
{
    QPainterPath path;
    path.addRoundedRect(QRectF(2.5, 7, 12.5, 10), 2, 2);
    path.addPolygon(QPolygonF({{15, 11}, {21, 7.5}, {21, 16.5}, {15, 13}}));
    return path;
}

QPainterPath dropping()
{
    QPainterPath path = camera();
    path.moveTo(3.5, 21.5);
    path.lineTo(20, 2.5);
    return path;
}

QPainterPath gear()
{
    QPainterPath path;
    const int teeth = 8;
    QPolygonF edge;
    const double pi = std::acos(-1.0);
    for (int i = 0; i < teeth; ++i) {
        const double widths[] = {-0.27, -0.16, 0.16, 0.27};
        const double radii[] = {7.0, 9.6, 9.6, 7.0};
        for (int k = 0; k < 4; ++k) {
            const double angle = i * 2 * pi / teeth + widths[k];
            edge << QPointF(12 + radii[k] * std::cos(angle), 12 + radii[k] * std::sin(angle));
        }
    }
    path.addPolygon(edge);
    path.closeSubpath();
    path.addEllipse(QPointF(12, 12), 3, 3);
    return path;
}

QPainterPath user()
{
    QPainterPath path;
    path.addEllipse(QPointF(12, 8), 4.2, 4.2);
    path.moveTo(4, 21);
    path.cubicTo(4.5, 11.8, 19.5, 11.8, 20, 21);
    return path;
}

QPainterPath pathOf(Sign sign)
{
    switch (sign) {
    case Sign::Views:
        return views();
    case Sign::Thumbnails:
        return thumbnails();
    case Sign::Mark:
        return mark();
    case Sign::Line:
        return line();
    case Sign::Export:
        return exporting();
    case Sign::Ptz:
        return ptz();
    case Sign::Drop:
        return dropping();
    case Sign::Restore:
        return camera();
    case Sign::Settings:
        return gear();
    case Sign::User:
        return user();
    case Sign::Live:
    case Sign::Recorded:
        break;
    }
    return {};
}

void drawLock(QPainter& painter, const QColor& color)
{
    // A gap around it, so that it stands out from the sign.
    painter.setCompositionMode(QPainter::CompositionMode_Clear);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Qt::black);
    painter.drawRoundedRect(QRectF(11.5, 9.5, 12.5, 14.5), 3, 3);
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    painter.setBrush(color);
    painter.drawRoundedRect(QRectF(13.5, 16, 9.5, 7.5), 1.5, 1.5);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(color, 1.6));
    painter.drawArc(QRectF(15.4, 11.4, 5.7, 8), 0, 180 * 16);
}

QPixmap drawn(Sign sign, const QColor& color, qreal ratio, bool locked)
{
    QPixmap pixmap(QSize(c_signExtent, c_signExtent) * ratio);
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.scale(c_signExtent / 24.0, c_signExtent / 24.0);
    if (sign == Sign::Live || sign == Sign::Recorded) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(color);
        if (sign == Sign::Live) {
            painter.drawEllipse(QPointF(12, 12), 5, 5);
        } else {
            painter.drawPolygon(QPolygonF({{7, 6}, {17.5, 12}, {7, 18}}));
        }
        return pixmap;
    }
    painter.setPen(QPen(color, 1.7, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPath(pathOf(sign));
    if (locked) {
        drawLock(painter, color);
    }
    return pixmap;
}
}

QIcon signIcon(Sign sign, const QPalette& palette, qreal ratio, bool locked)
{
    const QColor faint = palette.color(QPalette::Disabled, QPalette::WindowText);
    const QColor usual = sign == Sign::Live ? QColor(222, 72, 72)
        : sign == Sign::Recorded            ? palette.color(QPalette::Highlight)
                                            : palette.color(QPalette::Active, QPalette::WindowText);
    QIcon icon;
    icon.addPixmap(drawn(sign, locked ? faint : usual, ratio, locked), QIcon::Normal);
    icon.addPixmap(drawn(sign, faint, ratio, locked), QIcon::Disabled);
    return icon;
}
}
