// SPDX-License-Identifier: MIT
#include "PtzPictures.h"

#include <QtCore/QtMath>
#include <QtGui/QPainter>
#include <QtGui/QPalette>

#include <functional>

namespace client
{
namespace
{
QPixmap drawCentred(int size, const std::function<void(QPainter&)>& draw)
{
    QPixmap result(size, size);
    result.fill(Qt::transparent);
    QPainter painter(&result);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(size / 2.0, size / 2.0);
    draw(painter);
    return result;
}

QColor marked(const QPalette& colors, bool enabled)
{
    return colors.color(enabled ? QPalette::Highlight : QPalette::Mid);
}
}

QPixmap PtzPictures::plate(const QPalette& colors, int size)
{
    return drawCentred(size, [&](QPainter& painter) {
        painter.setPen(QPen(colors.color(QPalette::Mid), size / 56.0, Qt::SolidLine, Qt::RoundCap));
        for (int i = 0; i <= 20; ++i) {
            const double angle = qDegreesToRadians(-240 + i * 15.0);
            const QPointF direction(qCos(angle), qSin(angle));
            painter.drawLine(direction * size * (i % 10 ? 0.45 : 0.42), direction * size * 0.48);
        }
    });
}

QPixmap PtzPictures::knob(const QPalette& colors, int size, bool enabled)
{
    return drawCentred(size, [&](QPainter& painter) {
        const double radius = size * 0.46;
        QLinearGradient face(0, -radius, 0, radius);
        face.setColorAt(0, colors.color(QPalette::Button).lighter(enabled ? 108 : 100));
        face.setColorAt(1, colors.color(QPalette::Button).darker(enabled ? 112 : 100));
        painter.setBrush(face);
        painter.setPen(QPen(colors.color(QPalette::Mid), size / 60.0));
        painter.drawEllipse(QPointF(), radius, radius);
        painter.setPen(QPen(marked(colors, enabled), size / 14.0, Qt::SolidLine, Qt::RoundCap));
        painter.drawLine(QPointF(0, -radius * 0.82), QPointF(0, -radius * 0.45));
    });
}

QPixmap PtzPictures::crosshair(const QPalette& colors, int size, bool enabled)
{
    return drawCentred(size, [&](QPainter& painter) {
        const double radius = size * 0.4;
        QColor line = colors.color(QPalette::Mid);
        line.setAlphaF(enabled ? 1 : 0.6);
        painter.setPen(QPen(line, size / 130.0));
        painter.drawEllipse(QPointF(), radius, radius);
        painter.drawEllipse(QPointF(), radius / 2, radius / 2);
        painter.drawLine(QPointF(-radius, 0), QPointF(radius, 0));
        painter.drawLine(QPointF(0, -radius), QPointF(0, radius));
        // An arrow on each side.
        painter.setPen(QPen(line, size / 70.0, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        for (int i = 0; i < 4; ++i) {
            const double tip = size * 0.465;
            const double wing = size * 0.028;
            painter.drawPolyline(QPolygonF({QPointF(-wing, -tip + wing), QPointF(0, -tip), QPointF(wing, -tip + wing)}));
            painter.rotate(90);
        }
    });
}

QPixmap PtzPictures::point(const QPalette& colors, int size, bool enabled)
{
    return drawCentred(size, [&](QPainter& painter) {
        painter.setPen(QPen(colors.color(QPalette::Base), size / 16.0));
        painter.setBrush(marked(colors, enabled));
        painter.drawEllipse(QPointF(), size * 0.36, size * 0.36);
    });
}
}
