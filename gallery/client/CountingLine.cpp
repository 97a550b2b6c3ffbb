// SPDX-License-Identifier: MIT
#include "CountingLine.h"

#include <QtCore/QEvent>
#include <QtCore/QLineF>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>

namespace client
{
namespace
{
const QSize s_camera(1920, 1080);
constexpr double s_reach = 12;
constexpr double s_handle = 6;
// Over a picture: the same in every theme.
const QColor s_line(255, 196, 60);
const QColor s_ground(12, 16, 22, 190);

double distance(const QPointF& a, const QPointF& b)
{
    return QLineF(a, b).length();
}

// From the point to the nearest point of the line between its ends.
double distance(const QPointF& point, const QLineF& line)
{
    const QPointF along = line.p2() - line.p1();
    const double square = QPointF::dotProduct(along, along);
    const double part = square > 0 ? qBound(0.0, QPointF::dotProduct(point - line.p1(), along) / square, 1.0) : 0;
    return distance(point, line.p1() + along * part);
}
}

CountingLine::CountingLine(QWidget* view)
    : QWidget(view)
{
    setObjectName(QStringLiteral("countingLine"));
    setMouseTracking(true);
    setGeometry(view->rect());
    view->installEventFilter(this);
}

void CountingLine::setLine(const QPoint& start, const QPoint& end)
{
    m_start = start;
    m_end = end;
    update();
}

void CountingLine::setNames(const QString& line, const QString& left, const QString& right)
{
    m_name = line;
    m_left = left;
    m_right = right;
    update();
}

QPointF CountingLine::toView(const QPoint& point) const
{
    return QPointF((point.x() + 0.5) * width() / s_camera.width(), (point.y() + 0.5) * height() / s_camera.height());
}

QPoint CountingLine::toCamera(const QPointF& position) const
{
    const int x = int(position.x() * s_camera.width() / qMax(1, width()));
    const int y = int(position.y() * s_camera.height() / qMax(1, height()));
    return QPoint(qBound(0, x, s_camera.width() - 1), qBound(0, y, s_camera.height() - 1));
}

CountingLine::Part CountingLine::partAt(const QPointF& position) const
{
    const QLineF line(toView(m_start), toView(m_end));
    const double toStart = distance(position, line.p1());
    const double toEnd = distance(position, line.p2());
    if (qMin(toStart, toEnd) <= s_reach) {
        return toEnd < toStart ? Part::End : Part::Start;
    }
    return distance(position, line) <= s_reach ? Part::Middle : Part::None;
}

bool CountingLine::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == parent() && event->type() == QEvent::Resize) {
        setGeometry(parentWidget()->rect());
    }
    return QWidget::eventFilter(watched, event);
}

void CountingLine::mousePressEvent(QMouseEvent* event)
{
    m_held = event->button() == Qt::LeftButton ? partAt(event->pos()) : Part::None;
    m_grabbed = toCamera(event->pos()) - m_start;
    event->setAccepted(m_held != Part::None);
}

void CountingLine::mouseMoveEvent(QMouseEvent* event)
{
    if (m_held == Part::None) {
        const Part part = partAt(event->pos());
        setCursor(part == Part::None ? Qt::CrossCursor : part == Part::Middle ? Qt::SizeAllCursor : Qt::PointingHandCursor);
        event->ignore();
        return;
    }
    const QPoint point = toCamera(event->pos());
    QPoint start = m_start;
    QPoint end = m_end;
    if (m_held == Part::Start) {
        start = point;
    } else if (m_held == Part::End) {
        end = point;
    } else {
        // As far as both ends stay in the picture.
        const QPoint along = m_end - m_start;
        const QPoint wanted = point - m_grabbed;
        start.setX(qBound(qMax(0, -along.x()), wanted.x(), s_camera.width() - 1 - qMax(0, along.x())));
        start.setY(qBound(qMax(0, -along.y()), wanted.y(), s_camera.height() - 1 - qMax(0, along.y())));
        end = start + along;
    }
    setLine(start, end);
    Q_EMIT lineDragged(start, end);
}

void CountingLine::mouseReleaseEvent(QMouseEvent* event)
{
    event->setAccepted(m_held != Part::None);
    m_held = Part::None;
}

void CountingLine::drawCaption(QPainter& painter, const QPointF& centre, const QString& text) const
{
    if (text.isEmpty()) {
        return;
    }
    QRectF box = QRectF(painter.fontMetrics().boundingRect(text)).adjusted(-7, -3, 7, 3);
    box.moveCenter(centre);
    box.moveLeft(qMax(2.0, qMin(box.left(), width() - 2 - box.width())));
    box.moveTop(qMax(2.0, qMin(box.top(), height() - 2 - box.height())));
    painter.setPen(Qt::NoPen);
    painter.setBrush(s_ground);
    painter.drawRoundedRect(box, 4, 4);
    painter.setPen(Qt::white);
    painter.drawText(box, Qt::AlignCenter, text);
}

void CountingLine::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QLineF line(toView(m_start), toView(m_end));
    painter.setPen(QPen(QColor(0, 0, 0, 130), 5, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(line);
    painter.setPen(QPen(s_line, 2.5, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(line);
    painter.setBrush(s_line);
    painter.setPen(QPen(Qt::black, 1));
    painter.drawEllipse(line.p1(), s_handle, s_handle);
    painter.drawEllipse(line.p2(), s_handle, s_handle);
    if (line.length() < 1) {
        return;
    }
    // The sides as one sees them who stands at the start and looks along the line.
    const double away = qBound(20.0, height() / 6.0, 60.0);
    const QPointF across = QPointF(line.dy(), -line.dx()) * (away / line.length());
    drawCaption(painter, line.center() + across, m_left);
    drawCaption(painter, line.center() - across, m_right);
    drawCaption(painter, line.center(), m_name);
}
}
