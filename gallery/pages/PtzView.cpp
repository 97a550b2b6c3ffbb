// SPDX-License-Identifier: MIT
// Cuts a window out of a wide ground.
#include "PtzView.h"

#include <QtCore/QTimer>
#include <QtGui/QPainter>

#include "../cameras/Scene.h"

namespace gallery
{
namespace
{
const QSize s_ground(1280, 900);
constexpr double s_step = 14;
}

PtzView::PtzView(QWidget* parent)
    : QWidget(parent), m_ground(Scene(4).ground(s_ground, 1))
{
    m_centre = QRectF(m_ground.rect()).center();
    setMinimumSize(320, 240);
    auto* timer = new QTimer(this);
    connect(timer, &QTimer::timeout, this, &PtzView::move);
    timer->start(20);
}

void PtzView::setSpeed(double pan, double tilt)
{
    m_speed = QPointF(pan, -tilt) * s_step;
}

void PtzView::setZoom(double factor)
{
    m_zoom = factor;
    update();
}

QRectF PtzView::window() const
{
    const QSizeF whole(m_ground.size());
    const QSizeF size = QSizeF(rect().size()).scaled(whole * 0.7 / m_zoom, Qt::KeepAspectRatio);
    const double x = qBound(size.width() / 2, m_centre.x(), whole.width() - size.width() / 2);
    const double y = qBound(size.height() / 2, m_centre.y(), whole.height() - size.height() / 2);
    return QRectF(QPointF(x - size.width() / 2, y - size.height() / 2), size);
}

void PtzView::move()
{
    if (!m_speed.isNull()) {
        m_centre = window().center() + m_speed / m_zoom;
        m_centre = window().center();
        update();
    }
}

void PtzView::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.drawPixmap(QRectF(rect()), m_ground, window());
}
}
