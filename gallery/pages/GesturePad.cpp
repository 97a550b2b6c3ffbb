// SPDX-License-Identifier: MIT
// Paints the trail.
#include "GesturePad.h"

#include <QtGui/QPainter>

namespace gallery
{
GesturePad::GesturePad(QWidget* parent)
    : QWidget(parent)
{
    setMinimumSize(260, 150);
    setCursor(Qt::CrossCursor);
}

void GesturePad::clear()
{
    m_trail.clear();
    m_presses.clear();
    m_releases.clear();
    m_verdict.clear();
    update();
}

void GesturePad::addPress(const QPoint& position)
{
    m_presses.append(position);
    m_trail.append(position);
    update();
}

void GesturePad::addMove(const QPoint& position)
{
    m_trail.append(position);
    update();
}

void GesturePad::addRelease(const QPoint& position)
{
    m_releases.append(position);
    m_trail.append(position);
    update();
}

void GesturePad::setVerdict(const QString& text)
{
    m_verdict = text;
    update();
}

void GesturePad::setClickRadius(int radius)
{
    m_clickRadius = radius;
    update();
}

void GesturePad::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QColor accent = palette().color(QPalette::Highlight);
    const QColor text = palette().color(QPalette::Text);
    painter.setPen(palette().color(QPalette::Mid));
    painter.setBrush(palette().color(QPalette::Base));
    painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), 8, 8);

    painter.setPen(Qt::NoPen);
    painter.setBrush(palette().color(QPalette::Mid));
    for (int y = 20; y < height() - 8; y += 20) {
        for (int x = 20; x < width() - 8; x += 20) {
            painter.drawRect(x, y, 1, 1);
        }
    }

    QFont big = font();
    big.setPixelSize(m_verdict.isEmpty() ? 16 : 30);
    painter.setFont(big);
    QColor faint = text;
    faint.setAlpha(m_verdict.isEmpty() ? 130 : 230);
    painter.setPen(faint);
    const QRect head = rect().adjusted(16, 14, -16, -14);
    if (m_verdict.isEmpty() && m_presses.isEmpty()) {
        painter.drawText(head, Qt::AlignCenter, tr("Click, hold, drag or flick here"));
    } else {
        painter.drawText(head, Qt::AlignHCenter | Qt::AlignTop, m_verdict);
    }

    if (!m_presses.isEmpty()) {
        const QPointF center = m_presses.constFirst();
        const double r = m_clickRadius + 0.5;
        QColor wash = accent;
        wash.setAlpha(60);
        painter.setPen(QPen(accent, 1));
        painter.setBrush(wash);
        painter.drawConvexPolygon(QPolygonF({center + QPointF(r, 0), center + QPointF(0, r), center - QPointF(r, 0),
                                             center - QPointF(0, r)}));
    }
    if (m_trail.size() > 1) {
        painter.setPen(QPen(accent, 3, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter.setBrush(Qt::NoBrush);
        painter.drawPolyline(QPolygon(m_trail));
    }
    painter.setPen(Qt::NoPen);
    painter.setBrush(accent);
    for (const QPoint& press : qAsConst(m_presses)) {
        painter.drawEllipse(QPointF(press), 4, 4);
    }
    painter.setPen(QPen(accent, 2));
    painter.setBrush(palette().color(QPalette::Base));
    for (const QPoint& release : qAsConst(m_releases)) {
        painter.drawEllipse(QPointF(release), 5, 5);
    }
}
}
