// SPDX-License-Identifier: MIT
#include "LiveWall.h"

#include "CountingTools.h"
#include "Fleet.h"
#include "LiveView.h"
#include "MarkingTool.h"
#include "Reconnection.h"
#include "WallGeometry.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtGui/QKeyEvent>

#include <algorithm>
#include <cmath>

namespace client
{
namespace
{
constexpr int s_frameMillis = 40;
constexpr int s_settleMillis = 200;
constexpr int s_gap = 2;
constexpr int s_toolsWidth = 372;
constexpr int s_leastWidth = 200; // of the views beside them
constexpr double s_turnSpeed = 0.8; // pictures a second
constexpr double s_zoomSpeed = 2.5; // factor a second
}

LiveWall::LiveWall(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
    , m_reconnection(new Reconnection(fleet, this))
    , m_marking(new MarkingTool(this))
    , m_counting(new CountingTools(this))
{
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_StyledBackground);
    m_counting->hide();
    m_clock.start();
    m_frames.setTimerType(Qt::PreciseTimer);
    m_frames.setInterval(s_frameMillis);
    connect(&m_frames, &QTimer::timeout, this, &LiveWall::tick);
    m_settle.setSingleShot(true);
    m_settle.setInterval(s_settleMillis);
    connect(&m_settle, &QTimer::timeout, this, [this] {
        for (LiveView* const view : m_views) {
            view->settle();
        }
    });
    connect(&fleet, &Fleet::orderChanged, this, &LiveWall::fill);
    connect(&fleet, &Fleet::onlineChanged, this, &LiveWall::setCameraOnline);
    connect(&fleet, &Fleet::renamed, this, [this](int id) {
        LiveView* const renamed = view(id);
        const Camera* const camera = m_fleet.camera(id);
        if (renamed && camera) {
            renamed->setName(camera->name);
        }
    });
    connect(m_marking, &MarkingTool::marked, this, [this](const QRectF& region) { Q_EMIT marked(m_current, region); });
    connect(m_counting, &CountingTools::lineChanged, this, &LiveWall::countingLineChanged);
    fill();
}

LiveWall::~LiveWall()
{
    m_marking->workIn(nullptr);
}

LiveView* LiveWall::makeView()
{
    auto* const made = new LiveView(this);
    made->setShowName(m_showNames);
    made->setShowTime(m_showTimes);
    made->setShowBadge(m_showBadges);
    connect(made, &LiveView::chosen, this, [this](LiveView* chosen) {
        setFocus(Qt::MouseFocusReason);
        chooseCamera(chosen->camera());
    });
    connect(made, &LiveView::enlargeWanted, this,
        [this](LiveView* wanted) { setEnlarged(m_enlarged == wanted->camera() ? -1 : wanted->camera()); });
    connect(made, &LiveView::snapshotWanted, this, [this](LiveView* wanted) {
        wanted->showSign(QStringLiteral("snapshotSign"), tr("Picture saved"));
        Q_EMIT snapshotTaken(wanted->camera());
    });
    connect(made, &LiveView::reconnectWanted, this,
        [this](LiveView* wanted) { m_fleet.setOnline(wanted->camera(), true); });
    return made;
}

LiveView* LiveWall::view(int id) const
{
    const auto found = std::find_if(m_views.begin(), m_views.end(), [id](LiveView* each) { return each->camera() == id; });
    return found == m_views.end() ? nullptr : *found;
}

QVector<int> LiveWall::shownCameras() const
{
    QVector<int> result;
    for (const LiveView* const each : m_views) {
        result.append(each->camera());
    }
    return result;
}

// Views stay with their cameras; those that are left over take new ones.
void LiveWall::fill()
{
    QVector<int> wanted;
    if (m_fleet.indexOf(m_front) < m_viewCount) {
        m_front = -1;
    } else {
        wanted.append(m_front);
    }
    for (const Camera& camera : m_fleet.cameras()) {
        if (wanted.size() == m_viewCount) {
            break;
        }
        wanted.append(camera.id);
    }

    if (!wanted.contains(m_current)) {
        m_marking->workIn(nullptr);
        m_counting->workIn(nullptr, -1);
    }
    QVector<LiveView*> views(wanted.size());
    QVector<LiveView*> spare;
    for (LiveView* const each : m_views) {
        const int place = wanted.indexOf(each->camera());
        if (place >= 0) {
            views[place] = each;
        } else {
            spare.append(each);
        }
    }
    for (int i = 0; i < wanted.size(); ++i) {
        if (!views.at(i)) {
            views[i] = spare.isEmpty() ? makeView() : spare.takeLast();
            views.at(i)->setCurrent(false);
            views.at(i)->setCamera(*m_fleet.camera(wanted.at(i)));
            views.at(i)->setSecondsOffline(m_reconnection->secondsOffline(wanted.at(i)));
        }
    }
    m_views = views;
    for (LiveView* const each : spare) {
        each->hide();
        each->deleteLater(); // it may be in its own signal
    }
    if (!wanted.contains(m_enlarged)) {
        m_enlarged = -1;
    }
    const int current = wanted.contains(m_current) ? m_current : wanted.value(0, -1);
    arrange();
    showMoment();
    if (current != m_current) {
        setCurrent(current);
    } else {
        placeTools();
    }
}

void LiveWall::arrange()
{
    QRect wall = rect();
    m_counting->setVisible(m_counts);
    if (m_counts) {
        const int width = qMin(s_toolsWidth, wall.width());
        m_counting->setGeometry(wall.right() + 1 - width, wall.top(), width, wall.height());
        m_counting->raise(); // where both have no room it covers a part of the views
        wall.setWidth(qMax(wall.width() - width - 4 * s_gap, qMin(wall.width(), s_leastWidth)));
    }
    for (int i = 0; i < m_views.size(); ++i) {
        LiveView* const each = m_views.at(i);
        if (m_enlarged < 0) {
            each->setGeometry(wallCell(wall, wallColumns(m_viewCount), i, s_gap));
        } else if (m_enlarged == each->camera()) {
            each->setGeometry(wall);
        }
        each->setVisible(m_enlarged < 0 || m_enlarged == each->camera());
    }
    if (isVisible()) {
        m_settle.start();
    }
}

void LiveWall::setViewCount(int count)
{
    const int next = wallViewCount(count);
    if (next == m_viewCount) {
        return;
    }
    m_viewCount = next;
    if (m_fleet.indexOf(m_current) >= next) {
        m_front = m_current;
    }
    fill();
}

void LiveWall::chooseCamera(int id)
{
    if (!m_fleet.camera(id) || id == m_current) {
        return;
    }
    if (!view(id)) {
        m_front = id;
        fill();
    }
    if (m_enlarged >= 0) {
        m_enlarged = id;
        arrange();
    }
    setCurrent(id);
}

void LiveWall::setCurrent(int id)
{
    m_pan = m_tilt = m_zoom = 0;
    m_current = id;
    for (LiveView* const each : m_views) {
        each->setCurrent(each->camera() == id);
    }
    placeTools();
    Q_EMIT currentChanged(id);
}

void LiveWall::placeTools()
{
    LiveView* const current = view(m_current);
    m_marking->workIn(m_marks ? current : nullptr);
    m_counting->workIn(m_counts ? current : nullptr, m_current);
    for (LiveView* const each : m_views) {
        each->setGestures(each != current || !(m_marks || m_counts));
    }
}

void LiveWall::setEnlarged(int id)
{
    if (id != m_enlarged && (id < 0 || view(id))) {
        m_enlarged = qMax(-1, id);
        arrange();
        showMoment();
        if (id >= 0 && id != m_current) {
            setCurrent(id);
        }
    }
}

void LiveWall::setMarking(bool on)
{
    m_marks = on;
    placeTools();
}

void LiveWall::setCounting(bool on)
{
    m_counts = on;
    arrange();
    placeTools();
}

void LiveWall::setCameraOnline(int id, bool online)
{
    if (LiveView* const changed = view(id)) {
        changed->setOnline(online);
        if (online) {
            changed->showSign(QStringLiteral("reconnectedSign"), tr("Connected again"));
        }
    }
}

void LiveWall::showRecorded(quint64 microseconds)
{
    m_live = false;
    m_moment = microseconds;
    showMoment();
}

void LiveWall::showLive()
{
    m_live = true;
    showMoment();
}

// One moment for all.
void LiveWall::showMoment()
{
    const quint64 moment = m_live ? quint64(QDateTime::currentMSecsSinceEpoch()) * 1000 : m_moment;
    for (LiveView* const each : m_views) {
        if (!each->isHidden()) {
            each->showFrame(moment, m_live);
        }
    }
}

void LiveWall::tick()
{
    // A late frame is left out: what is shown is always now.
    const qint64 now = m_clock.elapsed();
    const double seconds = double(now - m_tick) / 1000;
    m_tick = now;
    if (m_pan != 0 || m_tilt != 0 || m_zoom != 0) {
        turn(qMin(seconds, 0.2));
    }
    if (m_live) {
        showMoment();
    }
    if (now - m_measured >= 1000) {
        measure();
    }
}

void LiveWall::turn(double seconds)
{
    if (LiveView* const current = view(m_current)) {
        current->zoomBy(std::pow(s_zoomSpeed, m_zoom * seconds));
        current->lookBy(QPointF(m_pan, -m_tilt) * (s_turnSpeed * seconds));
    }
}

void LiveWall::measure()
{
    const qint64 now = m_clock.elapsed();
    int frames = 0;
    for (LiveView* const each : m_views) {
        frames += each->takePaintedFrames();
    }
    m_framesPerSecond = int(std::lround(frames * 1000.0 / double(now - m_measured)));
    m_measured = now;
    Q_EMIT frameRateChanged();
}

void LiveWall::steer(double pan, double tilt, double zoom)
{
    const Camera* const camera = m_fleet.camera(m_current);
    const bool isPossible = camera && camera->steerable && camera->online;
    m_pan = isPossible ? qBound(-1.0, pan, 1.0) : 0;
    m_tilt = isPossible ? qBound(-1.0, tilt, 1.0) : 0;
    m_zoom = isPossible ? qBound(-1.0, zoom, 1.0) : 0;
}

void LiveWall::setShowNames(bool on)
{
    m_showNames = on;
    for (LiveView* const each : m_views) {
        each->setShowName(on);
    }
}

void LiveWall::setShowTimes(bool on)
{
    m_showTimes = on;
    for (LiveView* const each : m_views) {
        each->setShowTime(on);
    }
}

void LiveWall::setShowBadges(bool on)
{
    m_showBadges = on;
    for (LiveView* const each : m_views) {
        each->setShowBadge(on);
    }
}

void LiveWall::resizeEvent(QResizeEvent*)
{
    arrange();
}

void LiveWall::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_tick = m_measured = m_clock.elapsed();
    showMoment();
    m_frames.start();
    m_reconnection->setActive(true);
}

void LiveWall::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
    m_frames.stop();
    m_settle.stop();
    m_reconnection->setActive(false);
    m_pan = m_tilt = m_zoom = 0;
    m_framesPerSecond = 0;
    for (LiveView* const each : m_views) {
        each->takePaintedFrames();
    }
}

void LiveWall::keyPressEvent(QKeyEvent* event)
{
    const QVector<int> shown = shownCameras();
    const int place = shown.indexOf(m_current);
    int next = place;
    switch (event->key()) {
    case Qt::Key_Left:
        next = place - 1;
        break;
    case Qt::Key_Right:
        next = place + 1;
        break;
    case Qt::Key_Up:
        next = place - wallColumns(m_viewCount);
        break;
    case Qt::Key_Down:
        next = place + wallColumns(m_viewCount);
        break;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        setEnlarged(m_enlarged < 0 ? m_current : -1);
        return;
    case Qt::Key_Escape:
        if (m_enlarged >= 0) {
            setEnlarged(-1);
            return;
        }
        Q_FALLTHROUGH();
    default:
        QWidget::keyPressEvent(event);
        return;
    }
    if (next >= 0 && next < shown.size()) {
        chooseCamera(shown.at(next));
    }
}

void LiveWall::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        m_marking->retranslate();
    }
}
}
