// SPDX-License-Identifier: MIT
#include "LiveView.h"

#include "Fleet.h"
#include "ZelkovUtils/TimeUtils.h"
#include "controls/DateTimeEdit.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/IconOverlayView.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"
#include "input/MouseAdapter.h"

#include <QtCore/QEvent>
#include <QtGui/QMouseEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QPushButton>

namespace client
{
namespace
{
constexpr int s_inset = 6;
constexpr int s_captionMargin = 6;
constexpr int s_widthForDate = 120; // below, a line with date and time would be too small to read
constexpr int s_signSize = 110;
constexpr double s_frameWidth = 3;
constexpr double s_overscan = 1.16; // how much higher than the picture the ground is, so that it can look up and down
constexpr double s_farthest = 4;
constexpr int s_settleMillis = 150;
const QSize s_countSize(20, 20);
const QColor s_dim(12, 15, 20, 190); // over a picture: the same in every theme

// The part of the ground that is seen.
QSizeF seenPart(double zoom)
{
    return QSizeF(1 / (gallery::Scene::s_width * s_overscan), 1 / s_overscan) / zoom;
}

// With a ground of its own a label covers the picture, so that a new frame does not repaint it. A style sheet takes
// the ground away when it dresses the label.
void makeOpaque(QWidget& label)
{
    label.ensurePolished();
    label.setAutoFillBackground(true);
}

QSize groundPicture(const QSize& view)
{
    return QSize(int(view.width() * s_overscan), int(view.height() * s_overscan));
}
}

LiveView::LiveView(QWidget* parent)
    : QWidget(parent)
    , m_scene(0)
    , m_centre(0.5, 0.5)
    , m_count(this, this)
    , m_caption(new vx::NameTimeLabel(this))
    , m_time(new vx::TimeLabel(true, this))
    , m_busy(new vx::BusyOverlayView(this))
    , m_reconnect(new QPushButton(this))
    , m_gestures(new vx::MouseAdapter(this, false))
{
    setAttribute(Qt::WA_OpaquePaintEvent);
    m_resized.start();
    m_caption->setObjectName(QStringLiteral("cameraName"));
    m_caption->setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    for (QWidget* const label : {static_cast<QWidget*>(m_caption), static_cast<QWidget*>(m_time)}) {
        label->setAttribute(Qt::WA_TransparentForMouseEvents);
        label->installEventFilter(this);
    }
    m_time->getDateTimeEit()->setFocusPolicy(Qt::NoFocus);
    connect(m_time, &vx::TimeLabel::reposTimeLabel, this,
        [this] { m_time->move((width() - m_time->width()) / 2, height() - m_time->height() - s_inset); });

    m_busy->setAttribute(Qt::WA_TransparentForMouseEvents);
    connect(m_busy, &vx::BusyOverlayView::updatedLayout, this, &LiveView::placeBusy);
    m_reconnect->setObjectName(QStringLiteral("reconnectButton"));
    m_reconnect->setFocusPolicy(Qt::NoFocus);
    m_reconnect->hide();
    connect(m_reconnect, &QPushButton::clicked, this, [this] { Q_EMIT reconnectWanted(this); });

    m_count.setBadgeSize(s_countSize);
    makeGestures();
    retranslate();
}

LiveView::~LiveView() = default;

void LiveView::makeGestures()
{
    m_gestures->setMouseTracking(false);
    const auto isLeft = [](const vx::MouseGesture::Ptr& gesture) { return gesture->buttons() == Qt::LeftButton; };
    // At the press: a click is only known to be one when the time for the second has passed.
    connect(m_gestures, &vx::MouseAdapter::pressed, this, [this] { Q_EMIT chosen(this); });
    connect(m_gestures, &vx::MouseAdapter::panning, this, [this, isLeft](const vx::MouseGesture::Ptr& gesture) {
        if (isLeft(gesture) && width() > 0 && height() > 0) {
            const QPointF offset = gesture->lastPanOffset();
            lookBy(QPointF(-offset.x() / width(), -offset.y() / height()));
        }
    });
    connect(m_gestures, &vx::MouseAdapter::longPressed, this, [this, isLeft](const vx::MouseGesture::Ptr& gesture) {
        if (isLeft(gesture)) {
            Q_EMIT snapshotWanted(this);
        }
    });
    connect(m_gestures, &vx::MouseAdapter::doubleClicked, this, [this, isLeft](const vx::MouseGesture::Ptr& gesture) {
        if (isLeft(gesture)) {
            Q_EMIT enlargeWanted(this);
        }
    });
}

void LiveView::retranslate()
{
    m_reconnect->setText(tr("Reconnect"));
}

void LiveView::setGestures(bool on)
{
    if (on != m_hasGestures) {
        m_hasGestures = on;
        if (on) {
            m_gestures->attachTo(this);
        } else {
            m_gestures->detachFrom(this);
        }
    }
}

void LiveView::setCamera(const Camera& camera)
{
    m_camera = camera.id;
    setObjectName(QStringLiteral("liveView%1").arg(camera.id));
    m_scene = gallery::Scene(camera.id);
    m_ground = QPixmap();
    m_centre = QPointF(0.5, 0.5);
    m_zoom = 1;
    // Some have waited for a while already.
    m_events = m_current ? 0 : camera.id * 7 % 5 * (camera.id % 3);
    m_nextEvent = 0;
    m_secondsOffline = 0;
    showEventCount();
    setName(camera.name);
    setOnline(camera.online);
    update();
}

void LiveView::setName(const QString& name)
{
    m_name = name;
    setAccessibleName(name);
    m_caption->setText(name, QString(), QString());
    place();
}

void LiveView::setOnline(bool online)
{
    if (online == m_online) {
        return;
    }
    m_online = online;
    m_secondsOffline = 0;
    showConnection();
}

// A camera that is offline still has its records.
void LiveView::showConnection()
{
    const bool isLost = m_live && !m_online;
    m_time->showErrorSymbol(isLost);
    if (isLost) {
        showBusy();
    } else {
        hideBusy();
    }
    update();
}

void LiveView::setSecondsOffline(int seconds)
{
    m_secondsOffline = seconds;
    showBusy();
}

void LiveView::showBusy()
{
    if (m_live && !m_online && isVisible()) {
        m_busy->showBusyOverlay(true);
        if (m_secondsOffline > 1) {
            m_busy->setBusySeconds(m_secondsOffline);
        }
    }
}

void LiveView::hideBusy()
{
    m_busy->hideBusyOverlay();
    m_reconnect->hide();
}

void LiveView::placeBusy()
{
    const int gap = 8;
    const QSize button = m_reconnect->sizeHint();
    const int below = m_caption->geometry().bottom() + 1;
    const bool hasRoom = button.width() <= width() - 2 * s_inset
        && below + m_busy->height() + gap + button.height() <= height() - s_inset;
    const int whole = m_busy->height() + (hasRoom ? gap + button.height() : 0);
    const int top = qMax(hasRoom ? below : 0, (height() - whole) / 2);
    m_busy->move((width() - m_busy->width()) / 2, top);
    m_reconnect->setGeometry(QRect(QPoint((width() - button.width()) / 2, top + m_busy->height() + gap), button));
    m_reconnect->setVisible(hasRoom && m_busy->isVisible());
}

void LiveView::showFrame(quint64 microseconds, bool live)
{
    if (live != m_live) {
        m_live = live;
        m_time->changeRecordingSymbol(live);
        showConnection();
    }
    if (microseconds == m_frame || (live && !m_online)) {
        return;
    }
    m_frame = microseconds;
    if (live) {
        countEvents();
    }
    if (m_showTime) {
        if (m_time->isVisible()) {
            m_time->setFrametime(microseconds);
        } else {
            place();
        }
    }
    update();
}

int LiveView::takePaintedFrames()
{
    const int result = m_paintedFrames;
    m_paintedFrames = 0;
    return result;
}

void LiveView::countEvents()
{
    const quint64 second = 1000000;
    if (m_nextEvent == 0 || m_frame > m_nextEvent + 60 * second) {
        m_nextEvent = m_frame + (3 + quint64(m_camera) * 5 % 17) * second;
    } else if (m_frame >= m_nextEvent) {
        m_nextEvent = m_frame + (9 + quint64(m_camera) * 7 % 13) * second;
        if (!m_current) {
            ++m_events;
            showEventCount();
        }
    }
}

void LiveView::showEventCount()
{
    if (m_events > 0) {
        m_count.setBadgeLabel(m_events > 99 ? QStringLiteral("99+") : QString::number(m_events), false);
    } else if (m_count.hasBadge()) {
        m_count.unsetBadgeLabel();
    }
}

void LiveView::setCurrent(bool current)
{
    if (current != m_current) {
        m_current = current;
        m_events = 0;
        showEventCount();
        update();
    }
}

void LiveView::setShowName(bool on)
{
    if (on != m_showName) {
        m_showName = on;
        place();
    }
}

void LiveView::setShowTime(bool on)
{
    if (on != m_showTime) {
        m_showTime = on;
        place();
    }
}

void LiveView::setShowBadge(bool on)
{
    if (on != m_showBadge) {
        m_showBadge = on;
        place();
        update();
    }
}

void LiveView::lookBy(const QPointF& parts)
{
    const QSizeF seen = seenPart(m_zoom);
    m_centre += QPointF(parts.x() * seen.width(), parts.y() * seen.height());
    m_centre.setX(qBound(seen.width() / 2, m_centre.x(), 1 - seen.width() / 2));
    m_centre.setY(qBound(seen.height() / 2, m_centre.y(), 1 - seen.height() / 2));
    update();
}

void LiveView::zoomBy(double factor)
{
    m_zoom = qBound(1.0, m_zoom * factor, s_farthest);
    lookBy(QPointF());
}

void LiveView::settle()
{
    if (m_groundFor != size()) {
        update();
    }
}

void LiveView::showSign(const QString& name, const QString& text)
{
    if (!isVisible()) {
        return;
    }
    // A sign that needs more room than there is would stay hidden.
    const int room = qMin(width(), height());
    if (room < s_signSize) {
        vx::IconOverlayView::showIcon(this, name + QLatin1String("Small"), false);
    } else if (text.isEmpty() || room < 2 * s_signSize) {
        vx::IconOverlayView::showIcon(this, name, false);
    } else {
        vx::IconOverlayView::showTextAndIcon(this, text, name, false);
    }
}

void LiveView::place()
{
    makeOpaque(*m_caption);
    makeOpaque(*m_time);
    QFont captions = font();
    captions.setPixelSize(qBound(10, height() / 14, 14));
    m_caption->setFont(captions);
    const QFontMetrics metrics(captions);
    const int badge = m_showBadge ? s_countSize.width() + s_inset : 0;
    const int wanted = metrics.horizontalAdvance(m_name) + 2 * s_captionMargin;
    const int room = qMax(0, width() - 2 * s_inset - badge);
    // A shortened name takes the whole label.
    m_caption->setIndent(wanted <= room ? s_captionMargin : 0);
    m_caption->setGeometry(s_inset, s_inset, qMin(wanted, room), metrics.height() + 4);
    m_caption->setVisible(m_showName);

    const bool hasDate = width() >= s_widthForDate;
    if (hasDate != m_hasDate) {
        m_hasDate = hasDate;
        writeDates();
    }
    const bool hasTime = m_showTime && m_frame != 0;
    m_time->showFrametime(hasTime, m_frame, qBound(14, height() / 9, 22), s_inset, true,
        Qt::AlignHCenter | Qt::AlignBottom, false);
    m_time->resizeContent(true);
    if (m_busy->isVisible()) {
        placeBusy();
    }
}

// As the language does it.
void LiveView::writeDates()
{
    vx::DateTimeEdit* const edit = m_time->getDateTimeEit();
    edit->setDisplayFormat(TimeUtils::getDateTimeFormat(m_hasDate, true));
    // Without a date to show, Qt limits the edit to the day of its time.
    edit->clearMinimumDateTime();
    edit->clearMaximumDateTime();
}

void LiveView::resizeEvent(QResizeEvent*)
{
    m_resized.restart();
    place();
}

void LiveView::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    place();
    showBusy();
}

void LiveView::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
    hideBusy();
}

void LiveView::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
        writeDates();
        place();
    } else if (event->type() == QEvent::StyleChange || event->type() == QEvent::FontChange) {
        place();
        update();
    }
}

bool LiveView::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::StyleChange && (watched == m_caption || watched == m_time)) {
        makeOpaque(*static_cast<QWidget*>(watched));
    }
    return QWidget::eventFilter(watched, event);
}

void LiveView::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (!m_hasGestures && event->button() == Qt::LeftButton) {
        Q_EMIT enlargeWanted(this);
    }
}

void LiveView::paintPicture(QPainter& painter)
{
    const double ratio = devicePixelRatioF();
    const bool isStale = m_groundFor != size() || m_ground.devicePixelRatio() != ratio;
    if (m_ground.isNull() || (isStale && m_resized.elapsed() >= s_settleMillis)) {
        m_ground = m_scene.ground(groundPicture(size()), ratio);
        m_groundFor = size();
    }
    const QSizeF ground = QSizeF(m_ground.size()) / m_ground.devicePixelRatio();
    const QSizeF seen = seenPart(m_zoom);
    const QPointF corner(m_centre.x() - seen.width() / 2, m_centre.y() - seen.height() / 2);
    const QPointF source(corner.x() * ground.width(), corner.y() * ground.height());
    const QTransform before = painter.worldTransform();
    if (m_zoom == 1 && m_groundFor == size()) {
        painter.translate(-source.toPoint());
    } else {
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        painter.scale(width() / (seen.width() * ground.width()), height() / (seen.height() * ground.height()));
        painter.translate(-source);
    }
    painter.drawPixmap(0, 0, m_ground);
    painter.setRenderHint(QPainter::Antialiasing);
    m_scene.drawMovers(painter, ground.toSize(), qint64(m_frame / 1000));
    painter.setWorldTransform(before);
}

void LiveView::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    paintPicture(painter);
    if (!m_online && m_live) {
        painter.fillRect(rect(), s_dim);
    }
    if (m_showBadge) {
        painter.translate(-s_inset, s_inset);
        m_count.drawBadge(painter, Qt::AlignRight | Qt::AlignTop);
        painter.translate(s_inset, -s_inset);
    }
    if (m_current) {
        QPen frame(palette().color(QPalette::Highlight), s_frameWidth);
        frame.setJoinStyle(Qt::MiterJoin);
        painter.setPen(frame);
        painter.setBrush(Qt::NoBrush);
        const double half = s_frameWidth / 2;
        painter.drawRect(QRectF(rect()).adjusted(half, half, -half, -half));
    }
    if (m_frame != m_paintedFrame) {
        m_paintedFrame = m_frame;
        ++m_paintedFrames;
    }
}
}
