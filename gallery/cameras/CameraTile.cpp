// SPDX-License-Identifier: MIT
// Paints one camera. Everything that does not move is painted once for a size.
#include "CameraTile.h"

#include <QtCore/QDateTime>
#include <QtGui/QPainter>

namespace gallery
{
namespace
{
const int s_inset = 8;
const QSize s_countSize(22, 22);
const QSize s_spinnerSize(44, 44);
}

CameraTile::CameraTile(const QString& name, int seed, QWidget* parent)
    : QWidget(parent), m_name(name), m_scene(seed), m_count(this, this), m_spinner(this, this),
      m_events((seed * 7) % 5 * ((seed % 4) * 6 + 1)), m_seed(seed)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMinimumSize(96, 64);
    m_spinner.setBadgeSize(s_spinnerSize);
    m_spinner.setBusyColor1(QColor(255, 255, 255));
    m_spinner.setBusyColor2(QColor(255, 255, 255, 30));
    showEvents(m_events);
}

void CameraTile::showEvents(int count)
{
    m_events = count;
    if (count > 0) {
        m_count.setBadgeLabel(QString::number(count), s_countSize, false, false);
    } else {
        m_count.unsetBadgeLabel();
    }
}

void CameraTile::advance(qint64 epochMillis)
{
    if (m_dropped) {
        return;
    }
    m_millis = epochMillis;
    if (m_nextEvent == 0) {
        m_nextEvent = epochMillis + 2000 + 700 * m_seed;
    } else if (epochMillis >= m_nextEvent) {
        m_nextEvent = epochMillis + 9000 + 1300 * (m_seed % 5);
        if (!m_selected) {
            showEvents(m_events + 1);
        }
    }
    update();
}

void CameraTile::setSelected(bool selected)
{
    m_selected = selected;
    if (selected) {
        showEvents(0);
    }
    update();
}

void CameraTile::setDropped(bool dropped)
{
    m_dropped = dropped;
    m_spinner.setBadgeBusy(dropped);
    update();
}

void CameraTile::lookBy(int pixels)
{
    m_look = qBound(0, m_look + pixels, int(width() * Scene::s_width) - width());
    update();
}

void CameraTile::resizeEvent(QResizeEvent*)
{
    m_ground = QPixmap();
}

void CameraTile::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    if (m_ground.isNull()) {
        const double room = width() * (Scene::s_width - 1);
        m_ground = m_scene.ground(size(), devicePixelRatioF());
        m_look = int(room / 2);
    }
    const QSize ground(int(width() * Scene::s_width), height());
    painter.drawPixmap(-m_look, 0, m_ground);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(-m_look, 0);
    m_scene.drawMovers(painter, ground, m_millis);
    painter.translate(m_look, 0);

    QFont captions = font();
    captions.setPixelSize(qBound(11, height() / 15, 17));
    painter.setFont(captions);
    if (m_dropped) {
        painter.fillRect(rect(), QColor(12, 15, 20, 200));
        painter.setPen(QColor(214, 220, 230));
        const QRect below(0, height() / 2 + s_spinnerSize.height() / 2 + 4, width(), captions.pixelSize() * 2);
        painter.drawText(below, Qt::AlignHCenter | Qt::AlignTop, tr("No signal"));
        m_spinner.drawBadge(painter, Qt::AlignCenter);
    }
    const int line = painter.fontMetrics().height() + 4;
    drawCaption(painter, QPointF(s_inset, s_inset), m_name);
    drawCaption(painter, QPointF(s_inset, height() - s_inset - line),
                m_millis ? QDateTime::fromMSecsSinceEpoch(m_millis).toString(QStringLiteral("yyyy-MM-dd  HH:mm:ss.zzz"))
                         : QString());

    painter.translate(-s_inset, s_inset);
    m_count.drawBadge(painter, Qt::AlignRight | Qt::AlignTop);
    painter.translate(s_inset, -s_inset);

    if (m_selected) {
        QPen frame(palette().color(QPalette::Highlight), 3);
        frame.setJoinStyle(Qt::MiterJoin);
        painter.setPen(frame);
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(QRectF(rect()).adjusted(1.5, 1.5, -1.5, -1.5));
    }
}

void CameraTile::drawCaption(QPainter& painter, const QPointF& corner, const QString& text)
{
    if (text.isEmpty()) {
        return;
    }
    const QFontMetrics metrics = painter.fontMetrics();
    const QRectF box(corner, QSizeF(metrics.horizontalAdvance(text) + 10, metrics.height() + 4));
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(8, 11, 16, 150));
    painter.drawRoundedRect(box, 3, 3);
    painter.setPen(QColor(240, 243, 247));
    painter.drawText(box, Qt::AlignCenter, text);
}
}
