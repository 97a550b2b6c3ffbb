// SPDX-License-Identifier: MIT
// The sliding panels above and below the pictures, with the time line.
#include "RecordStripes.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>

#include "EventStripe.h"
#include "ExportPopover.h"
#include "ExportRun.h"
#include "Fleet.h"
#include "RecordTimeLine.h"
#include "Session.h"
#include "TimeTrack.h"
#include "indicators/IconOverlayView.h"
#include "popover/Manager.h"
#include "views/FadeStripeView.h"

namespace client
{
namespace
{
const int s_bars = 2 * c_Bordersize;
const int s_openEvents = EventStripe::s_rowHeight + s_bars;
const int s_openTimeLine = RecordTimeLine::s_height + s_bars;
const int s_openShare = 3; // of the area's height for the time line, at most one part of so many
}

RecordStripes::RecordStripes(Fleet& fleet, Session& session, QWidget* area)
    : QObject(area)
    , m_fleet(fleet)
    , m_session(session)
    , m_area(area)
{
    vx::PopoverWidget::Manager::init(1000);
    makeStripes();
    m_area->installEventFilter(this);
    connect(&m_session, &Session::roleChanged, this, &RecordStripes::followRights);
    followRights();
    watchAncestors();
    place();
}

RecordStripes::~RecordStripes()
{
    delete m_popover.data();
    delete m_run.data();
    delete m_top.data();
    delete m_bottom.data();
}

void RecordStripes::makeStripes()
{
    m_events = new EventStripe(m_fleet);
    m_top = new FadeStripeView(FadeView::ePositionTop, m_events, m_area);
    m_top->setObjectName(QStringLiteral("eventStripe"));
    m_top->setFadeStripeAsPartOfLayout(false);
    m_top->setContentsHeight(EventStripe::s_rowHeight);
    m_top->setStyleDefault();
    m_top->setRows(0);
    m_top->show();

    m_timeLine = new RecordTimeLine(m_fleet);
    m_bottom = new FadeStripeView(FadeView::ePositionBottom, m_timeLine, m_area);
    m_bottom->setObjectName(QStringLiteral("timeStripe"));
    m_bottom->setFadeStripeAsPartOfLayout(false);
    m_bottom->setMaximumHeight(s_openTimeLine); // there is one row
    m_bottom->setContentsHeight(RecordTimeLine::s_height);
    m_bottom->setStyleDefault();
    m_bottom->setRows(1);
    m_bottom->show();

    connect(m_bottom, &FadeView::geometryChanged, this, &RecordStripes::follow);
    connect(m_bottom, &FadeView::fadingOut, this, &RecordStripes::reserve);
    connect(m_bottom, &FadeView::fadingInFinished, this, &RecordStripes::reserve);
    // Where there is no room for both, the one that opens shuts the other.
    connect(m_bottom, &FadeView::fadingIn, this, [this] {
        if (!fitsBoth() && m_top->isFadedIn() && !m_eventsOnTop) {
            m_top->fadeout();
        }
    });
    connect(m_top, &FadeView::fadingIn, this, [this] {
        if (!fitsBoth() && m_bottom->isFadedIn()) {
            m_bottom->fadeout();
        }
    });
    connect(m_bottom, &FadeView::fadingInFinished, this, &RecordStripes::share);
    connect(m_bottom, &FadeView::fadingOutFinished, this, &RecordStripes::share);
    connect(m_top, &FadeView::appearingFullscreen, this, [this] { stackEvents(true); });
    connect(m_top, &FadeView::fullscreenLeft, this, [this] { stackEvents(false); });
    connect(m_events, &EventStripe::eventClicked, this, &RecordStripes::chooseEvent);
    connect(m_timeLine, &RecordTimeLine::momentChosen, this,
        [this](qint64 moment) { Q_EMIT timeChosen(quint64(moment) * 1000); });
    connect(m_timeLine, &RecordTimeLine::liveWanted, this, &RecordStripes::liveWanted);
    connect(m_timeLine, &RecordTimeLine::exportWanted, this, &RecordStripes::runExport);
}

void RecordStripes::setStripesVisible(bool visible)
{
    m_top->setVisible(visible);
    m_bottom->setVisible(visible);
    place();
}

FadeStripeView* RecordStripes::eventStripe() const
{
    return m_top;
}

FadeStripeView* RecordStripes::timeStripe() const
{
    return m_bottom;
}

RecordTimeLine* RecordStripes::timeLine() const
{
    return m_timeLine;
}

void RecordStripes::setCurrentCamera(int id)
{
    m_camera = id;
}

void RecordStripes::showLive()
{
    m_timeLine->setLive();
}

void RecordStripes::showTime(quint64 microseconds)
{
    m_timeLine->setMoment(qint64(microseconds / 1000));
}

void RecordStripes::chooseEvent(int camera, qint64 time)
{
    const QPointer<RecordStripes> alive(this);
    m_timeLine->setMoment(time);
    if (m_top->isFullscreen()) {
        m_top->exitFullscreen(); // the pictures are to be seen
    }
    Q_EMIT cameraChosen(camera);
    if (alive) {
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        Q_EMIT timeChosen(quint64(qMax(now - TimeTrack::s_length, time)) * 1000);
    }
}

void RecordStripes::followRights()
{
    m_timeLine->setExportAllowed(
        !m_session.isRightRefused(QStringLiteral("export"), true, false, false));
    if (m_session.role() == Session::Role::None) {
        // Nobody is there any more to wait for it.
        const QPointer<RecordStripes> alive(this);
        delete m_popover.data();
        if (alive && m_run) {
            finishRun(false);
        }
    }
}

// The handles of the time line are children of the window: they do not move with what the area stands in.
void RecordStripes::watchAncestors()
{
    for (const QPointer<QWidget>& widget : qAsConst(m_watched)) {
        if (widget) {
            widget->removeEventFilter(this);
        }
    }
    m_watched.clear();
    for (QWidget* widget = m_area; !widget->isWindow() && widget->parentWidget(); widget = widget->parentWidget()) {
        if (widget != m_area) {
            widget->installEventFilter(this);
            m_watched.append(widget);
        }
    }
}

void RecordStripes::place()
{
    if (!m_top || !m_bottom) {
        return;
    }
    const int areaTop = m_area->mapTo(m_area->window(), QPoint()).y();
    if (areaTop != m_areaTop) {
        // A drag at the bottom edge goes by the window. The panel takes this offset only in its other mode.
        m_areaTop = areaTop;
        const bool isHidden = m_bottom->isHidden();
        m_bottom->setFadeStripeAsPartOfLayout(true);
        m_bottom->setVerticalOffset(areaTop);
        m_bottom->setFadeStripeAsPartOfLayout(false);
        m_bottom->setHidden(isHidden);
    }
    if (!fitsBoth() && m_top->isFadedIn() && m_bottom->isFadedIn() && !m_eventsOnTop) {
        m_top->fadeout();
    }
    m_top->resize();
    m_bottom->resize();
    share();
    if (m_run) {
        m_run->place();
    }
    reserve();
    follow();
}

bool RecordStripes::fitsBoth() const
{
    return m_area->height() >= s_openEvents + s_openTimeLine;
}

// The bar of the upper panel must not get below the lower one: nobody could shut it again.
void RecordStripes::share()
{
    if (!m_top || !m_bottom) {
        return;
    }
    const int lower = m_bottom->isHidden() ? 0 : m_bottom->isFadedIn() ? s_openTimeLine : c_Bordersize;
    const int room = qMax(c_Bordersize, m_area->height() - lower);
    m_top->setMaximumHeight(room);
    if (m_top->isFadedIn() && !m_eventsOnTop && m_top->height() > room && room >= s_openEvents) {
        m_top->setSizeHint(room, true);
    }
}

// At full height the upper panel covers the lower one, and with it what is above all in the window.
void RecordStripes::stackEvents(bool onTop)
{
    m_eventsOnTop = onTop;
    (onTop ? m_top : m_bottom)->raise();
    follow();
}

// Once a movement, and not with each step of it: the pictures are laid out anew.
void RecordStripes::reserve()
{
    if (!m_top || !m_bottom) {
        return;
    }
    const bool isOpen = m_bottom->isFadedIn() && s_openTimeLine * s_openShare <= m_area->height();
    const QMargins margins(0, m_top->isHidden() ? 0 : c_Bordersize, 0,
        m_bottom->isHidden() ? 0 : isOpen ? s_openTimeLine : c_Bordersize);
    if (m_area->contentsMargins() != margins) {
        m_area->setContentsMargins(margins);
    }
}

void RecordStripes::follow()
{
    if (!m_timeLine || !m_bottom) {
        return;
    }
    // They would lie over the card of a running export where the area is too low for both.
    const bool isCovered = m_eventsOnTop || (m_run && m_run->geometry().intersects(m_bottom->geometry()));
    m_timeLine->track()->setHandlesVisible(!isCovered);
    m_timeLine->track()->follow();
}

bool RecordStripes::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::Resize:
        if (watched == m_area) {
            place();
        }
        break;
    case QEvent::Move:
        place();
        break;
    case QEvent::Show:
    case QEvent::ParentChange:
        watchAncestors();
        place();
        break;
    default: break;
    }
    return QObject::eventFilter(watched, event);
}

bool RecordStripes::isExporting() const
{
    return m_popover || m_run;
}

void RecordStripes::runExport(QWidget* target)
{
    if (isExporting() || m_fleet.cameras().isEmpty()
        || m_session.isRightRefused(QStringLiteral("export"), true, false, false)) {
        return;
    }
    const TimeTrack* const track = m_timeLine->track();
    ExportOptions suggested;
    suggested.cameras << (m_fleet.camera(m_camera) ? m_camera : m_fleet.cameras().constFirst().id);
    suggested.from = track->from();
    suggested.to = track->to();
    suggested.fileName
        = QDateTime::fromMSecsSinceEpoch(suggested.from).toString(QStringLiteral("'export-'yyyyMMdd-HHmmss"));

    m_popover = new ExportPopover(m_fleet, suggested.cameras.constFirst(), track->begin(), track->end(), this);
    connect(m_popover, &ExportPopover::rangeChosen, m_timeLine,
        [this](qint64 from, qint64 to) { m_timeLine->track()->setRange(from, to); });
    connect(m_timeLine, &RecordTimeLine::rangeChosen, m_popover, &ExportPopover::setRange);
    const QPointer<RecordStripes> alive(this);
    const QPointer<ExportPopover> popover = m_popover;
    const bool accepted = popover->ask(target && target->isVisible() ? target : m_area, suggested);
    if (!alive) {
        return;
    }
    if (popover && accepted) {
        const QString fileName = popover->options().fileName;
        m_popover = nullptr;
        popover->deleteLater();
        startRun(fileName);
        return;
    }
    if (popover) {
        m_popover = nullptr;
        popover->deleteLater();
    }
    Q_EMIT exportFinished(false);
}

void RecordStripes::startRun(const QString& fileName)
{
    m_run = new ExportRun(fileName, ExportRun::s_duration, m_area);
    connect(m_run, &ExportRun::finished, this, &RecordStripes::finishRun);
    m_run->show();
    follow();
}

void RecordStripes::finishRun(bool complete)
{
    if (m_run) {
        m_run->hide();
        m_run->deleteLater();
        m_run = nullptr;
    }
    follow();
    if (complete && m_area->isVisible()) {
        vx::IconOverlayView::showTextAndIcon(m_area, tr("Export finished"), QStringLiteral("exportDoneSign"), false);
    }
    Q_EMIT exportFinished(complete);
}
}
