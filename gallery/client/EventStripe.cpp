// SPDX-License-Identifier: MIT
// The contents of the upper stripe: small pictures of recorded events.
#include "EventStripe.h"

#include <algorithm>

#include <QtCore/QDateTime>
#include <QtGui/QHelpEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtGui/QWheelEvent>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>
#include <QtWidgets/QToolTip>

#include "../cameras/Scene.h"
#include "Fleet.h"
#include "TimeTrack.h"
#include "ZelkovUtils/TimeUtils.h"

namespace client
{
namespace
{
const QSize s_picture(128, 72);
const int s_gap = 10;
const int s_margin = 12;
const int s_top = 8;
const int s_caption = 20;
const int s_refresh = 20 * 1000;
const int s_picturesAtOnce = 4;
}

EventStripe::EventStripe(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
{
    setMouseTracking(true);
    m_timer.setInterval(s_refresh);
    connect(&m_timer, &QTimer::timeout, this, &EventStripe::readEvents);
    connect(&m_fleet, &Fleet::orderChanged, this, &EventStripe::readEvents);
    connect(&m_fleet, &Fleet::renamed, this, [this] { update(); });
    readEvents();
}

void EventStripe::readEvents()
{
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    m_events = Recordings::events(now - TimeTrack::s_length, now, m_fleet);
    std::reverse(m_events.begin(), m_events.end());
    // What has moved out of the list is not kept.
    QHash<QPair<qint64, int>, QPixmap> pictures;
    for (const RecordedEvent& event : qAsConst(m_events)) {
        const auto found = m_pictures.constFind({event.time, event.camera});
        if (found != m_pictures.constEnd()) {
            pictures.insert(found.key(), found.value());
        }
    }
    m_pictures = pictures;
    m_pressed = -1;
    hover(isVisible() && underMouse() ? indexAt(mapFromGlobal(QCursor::pos())) : -1);
    scrollTo(m_top);
    update();
}

int EventStripe::columns() const
{
    return qMax(1, (width() - 2 * s_margin + s_gap) / (s_picture.width() + s_gap));
}

QRect EventStripe::rectOf(int index) const
{
    if (index < 0 || index >= m_events.size()) {
        return {};
    }
    const int count = columns();
    // The pictures of a row share what is left of the width.
    const int spare = width() - 2 * s_margin - count * s_picture.width();
    const double step = s_picture.width() + (count > 1 ? qMin(double(spare) / (count - 1), 2.5 * s_gap) : s_gap);
    const QRect cell(s_margin + qRound((index % count) * step), s_top + (index / count) * s_rowHeight - m_top,
        s_picture.width(), s_picture.height() + s_caption);
    return cell.bottom() < 0 || cell.top() > height() ? QRect() : cell;
}

int EventStripe::indexAt(const QPoint& point) const
{
    for (int i = 0; i < m_events.size(); ++i) {
        if (rectOf(i).contains(point)) {
            return i;
        }
    }
    return -1;
}

void EventStripe::hover(int index)
{
    setCursor(index < 0 ? Qt::ArrowCursor : Qt::PointingHandCursor);
    if (m_hovered != index) {
        m_hovered = index;
        update();
    }
}

void EventStripe::scrollTo(int top)
{
    const int rows = (m_events.size() + columns() - 1) / columns();
    m_top = qBound(0, top, qMax(0, rows * s_rowHeight - height()));
    update();
}

// The camera looked straight ahead; what moves is where it was at that moment.
QPixmap EventStripe::pictureOf(const RecordedEvent& event, bool& mayMake)
{
    const QPair<qint64, int> key(event.time, event.camera);
    const auto found = m_pictures.constFind(key);
    if (found != m_pictures.constEnd() || !mayMake) {
        return found != m_pictures.constEnd() ? found.value() : QPixmap();
    }
    const gallery::Scene scene(event.camera);
    QPixmap& ground = m_grounds[event.camera];
    if (ground.isNull()) {
        ground = scene.ground(s_picture, devicePixelRatioF());
    }
    QPixmap picture(s_picture * devicePixelRatioF());
    picture.setDevicePixelRatio(devicePixelRatioF());
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    const QSize whole(int(s_picture.width() * gallery::Scene::s_width), s_picture.height());
    painter.translate((s_picture.width() - whole.width()) / 2, 0);
    painter.drawPixmap(0, 0, ground);
    scene.drawMovers(painter, whole, event.time);
    painter.end();
    m_pictures.insert(key, picture);
    return picture;
}

void EventStripe::paintCell(QPainter& painter, int index, const QRect& cell, bool& mayMake)
{
    const RecordedEvent& event = m_events.at(index);
    const QRect box(cell.topLeft(), s_picture);
    const QPixmap picture = pictureOf(event, mayMake);
    QPainterPath outline;
    outline.addRoundedRect(box, 4, 4);
    painter.save();
    painter.setClipPath(outline);
    if (picture.isNull()) {
        painter.fillRect(box, palette().color(QPalette::Mid));
    } else {
        painter.drawPixmap(box.topLeft(), picture);
    }
    painter.restore();
    if (event.alarm) {
        painter.setPen(QPen(Qt::white, 1));
        painter.setBrush(QColor(214, 50, 50));
        painter.drawEllipse(QRectF(box.right() - 13, box.top() + 5, 9, 9));
    }
    if (index == m_hovered) {
        painter.setPen(QPen(palette().color(QPalette::Highlight), 2));
        painter.setBrush(Qt::NoBrush);
        painter.drawRoundedRect(QRectF(box).adjusted(-1, -1, 1, 1), 5, 5);
    }

    const Camera* const camera = m_fleet.camera(event.camera);
    const QString time = QDateTime::fromMSecsSinceEpoch(event.time).time().toString(QStringLiteral("HH:mm"));
    const QRect words(cell.left() + 1, box.bottom() + 2, cell.width() - 2, s_caption - 2);
    QColor color = palette().color(QPalette::WindowText);
    painter.setPen(color);
    painter.drawText(words, Qt::AlignLeft | Qt::AlignVCenter, time);
    const int used = fontMetrics().horizontalAdvance(time) + 8;
    color.setAlphaF(0.7);
    painter.setPen(color);
    painter.drawText(words.adjusted(used, 0, 0, 0), Qt::AlignRight | Qt::AlignVCenter,
        fontMetrics().elidedText(camera ? camera->name : QString(), Qt::ElideRight, words.width() - used));
}

void EventStripe::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().window());
    QStyleOption option;
    option.initFrom(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
    painter.setRenderHint(QPainter::Antialiasing);
    if (m_events.isEmpty()) {
        painter.setPen(palette().color(QPalette::WindowText));
        painter.drawText(rect(), Qt::AlignCenter, tr("No events within the last 24 hours"));
        return;
    }
    int made = m_pictures.size();
    bool isComplete = true;
    for (int i = 0; i < m_events.size(); ++i) {
        const QRect cell = rectOf(i);
        if (cell.isNull() || !cell.adjusted(-2, -2, 2, 2).intersects(event->rect())) {
            continue;
        }
        // A few at a time: a stripe that has just been opened must not make the window wait.
        bool mayMake = m_pictures.size() - made < s_picturesAtOnce;
        isComplete = isComplete && (mayMake || m_pictures.contains({m_events.at(i).time, m_events.at(i).camera}));
        paintCell(painter, i, cell, mayMake);
    }
    if (!isComplete) {
        QTimer::singleShot(0, this, [this] { update(); });
    }
}

void EventStripe::mousePressEvent(QMouseEvent* event)
{
    m_pressed = event->button() == Qt::LeftButton ? indexAt(event->pos()) : -1;
    event->accept();
}

void EventStripe::mouseMoveEvent(QMouseEvent* event)
{
    hover(indexAt(event->pos()));
    event->accept();
}

void EventStripe::mouseReleaseEvent(QMouseEvent* event)
{
    const int pressed = m_pressed;
    m_pressed = -1;
    event->accept();
    if (event->button() == Qt::LeftButton && pressed >= 0 && pressed == indexAt(event->pos())) {
        const RecordedEvent clicked = m_events.at(pressed);
        Q_EMIT eventClicked(clicked.camera, clicked.time);
    }
}

void EventStripe::leaveEvent(QEvent* event)
{
    hover(-1);
    QWidget::leaveEvent(event);
}

void EventStripe::wheelEvent(QWheelEvent* event)
{
    scrollTo(m_top - event->angleDelta().y() * s_rowHeight / 120);
    hover(indexAt(mapFromGlobal(QCursor::pos())));
    event->accept();
}

void EventStripe::resizeEvent(QResizeEvent*)
{
    scrollTo(m_top);
}

void EventStripe::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_timer.start();
    readEvents();
}

void EventStripe::hideEvent(QHideEvent* event)
{
    m_timer.stop();
    QWidget::hideEvent(event);
}

void EventStripe::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        update();
    }
    QWidget::changeEvent(event);
}

bool EventStripe::event(QEvent* event)
{
    if (event->type() == QEvent::ToolTip) {
        auto* const help = static_cast<QHelpEvent*>(event);
        const int index = indexAt(help->pos());
        if (index < 0) {
            QToolTip::hideText();
            return true;
        }
        const RecordedEvent& shown = m_events.at(index);
        const Camera* const camera = m_fleet.camera(shown.camera);
        QToolTip::showText(help->globalPos(),
            QStringLiteral("%1\n%2\n%3").arg(camera ? camera->name : QString(),
                TimeUtils::formatDateTimeRelative(
                    QDateTime::fromMSecsSinceEpoch(shown.time), true, true, true, false, false),
                shown.alarm ? tr("Alarm") : tr("Movement")),
            this, rectOf(index));
        return true;
    }
    const bool result = QWidget::event(event);
    if (event->type() == QEvent::Polish || event->type() == QEvent::StyleChange) {
        // Opaque, so that the pictures below can run without having this painted as often. Style sheets take it away.
        setAttribute(Qt::WA_OpaquePaintEvent);
    }
    return result;
}
}
