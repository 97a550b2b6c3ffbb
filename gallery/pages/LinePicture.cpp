// SPDX-License-Identifier: MIT
// Draws the line, its ends and the names of its sides.
#include "LinePicture.h"

#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>

#include "../cameras/Scene.h"

namespace gallery
{
namespace
{
const QColor s_line(255, 196, 60);
}

LinePicture::LinePicture(const QSize& picture, QWidget* parent)
    : QWidget(parent), m_size(picture)
{
    setMinimumSize(360, 200);
    setCursor(Qt::CrossCursor);
}

void LinePicture::setLine(const QPoint& start, const QPoint& end)
{
    m_start = start;
    m_end = end;
    update();
}

void LinePicture::setNames(const QString& line, const QString& left, const QString& right)
{
    m_name = line;
    m_left = left;
    m_right = right;
    update();
}

QPoint LinePicture::fromPicture(const QPoint& point) const
{
    return QPoint(point.x() * width() / m_size.width(), point.y() * height() / m_size.height());
}

void LinePicture::caption(QPainter& painter, const QPointF& centre, const QString& text) const
{
    if (text.isEmpty()) {
        return;
    }
    QRectF box = painter.fontMetrics().boundingRect(text).adjusted(-8, -4, 8, 4);
    box.moveCenter(centre);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(12, 16, 22, 190));
    painter.drawRoundedRect(box, 5, 5);
    painter.setPen(Qt::white);
    painter.drawText(box, Qt::AlignCenter, text);
}

void LinePicture::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.drawPixmap(0, 0, m_ground);
    const QPointF start = fromPicture(m_start);
    const QPointF end = fromPicture(m_end);
    painter.setPen(QPen(QColor(0, 0, 0, 120), 6, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(start, end);
    painter.setPen(QPen(s_line, 3, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(start, end);
    painter.setBrush(s_line);
    painter.setPen(QPen(Qt::black, 1));
    painter.drawEllipse(start, 6, 6);
    painter.drawEllipse(end, 6, 6);

    // The sides as one sees them who stands at the start and looks along the line.
    const QLineF line(start, end);
    if (line.length() < 1) {
        return;
    }
    const QPointF across = QPointF(line.dy(), -line.dx()) * (70 / line.length());
    caption(painter, line.center() + across, m_left);
    caption(painter, line.center() - across, m_right);
    caption(painter, line.center(), m_name);
}

void LinePicture::resizeEvent(QResizeEvent*)
{
    // The ground is wider than the picture, for cameras that turn.
    m_ground = Scene(3).ground(size(), devicePixelRatioF());
}

void LinePicture::mousePressEvent(QMouseEvent* event)
{
    const int toStart = (event->pos() - fromPicture(m_start)).manhattanLength();
    const int toEnd = (event->pos() - fromPicture(m_end)).manhattanLength();
    m_dragsEnd = toEnd < toStart;
    mouseMoveEvent(event);
}

void LinePicture::mouseMoveEvent(QMouseEvent* event)
{
    const QPoint point(event->x() * m_size.width() / qMax(1, width()), event->y() * m_size.height() / qMax(1, height()));
    if (m_dragsEnd) {
        Q_EMIT endDragged(point);
    } else {
        Q_EMIT startDragged(point);
    }
}
}
