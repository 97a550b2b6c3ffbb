// SPDX-License-Identifier: MIT
// A scroll area whose wheel zooms.
#include "views/ZoomScrollArea.h"

#include "CoreQt/Connect.h"
#include "sliders/NicerScrollBar.h"
#include "views/ZoomLaw.h"

#include <QtCore/QPointer>
#include <QtCore/QTimeLine>
#include <QtCore/QTimer>
#include <QtGui/QWheelEvent>
#include <QtWidgets/QScrollBar>

namespace
{
constexpr int c_TouchMemory = 2000; // ms
constexpr int c_ZoomStop = 825; // ms
constexpr int c_ZoomDuration = 750; // ms
constexpr int c_ZoomTick = 75; // ms

QTimer* newZoomTimer(QObject* parent, int interval)
{
    auto* const timer = new QTimer(parent);
    timer->setSingleShot(true);
    timer->setInterval(interval);
    return timer;
}
}

ZoomScrollArea::ZoomScrollArea(QWidget* parent)
    : QScrollArea(parent)
    , m_horizontalBar(new NicerScrollBar(this, Qt::Horizontal, NicerScrollBar::epTop, this))
    , m_verticalBar(new NicerScrollBar(this, Qt::Vertical, NicerScrollBar::epAutomatic, this))
    , m_wheelTimer(newZoomTimer(this, c_TouchMemory))
    , m_zoomTimer(newZoomTimer(this, c_ZoomStop))
    , m_watchedBars {horizontalScrollBar(), verticalScrollBar()}
{
    // Behind Qt's own slots.
    connect(horizontalScrollBar(), &QScrollBar::valueChanged, this, &ZoomScrollArea::reportScrolling);
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, &ZoomScrollArea::reportScrolling);
    vx::connect(m_wheelTimer, "2timeout()", this, "1wheelTimeout()", Qt::AutoConnection);
    vx::connect(m_zoomTimer, "2timeout()", this, "1stopAllZooming()", Qt::AutoConnection);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    m_horizontalBar->setScrollBarPolicy(Qt::ScrollBarAsNeeded);
    m_verticalBar->setScrollBarPolicy(Qt::ScrollBarAsNeeded);
}

ZoomScrollArea::~ZoomScrollArea() = default;

QScrollBar* ZoomScrollArea::horizontalNicerScrollBar() const
{
    return m_horizontalBar;
}

QScrollBar* ZoomScrollArea::verticalNicerScrollBar() const
{
    return m_verticalBar;
}

void ZoomScrollArea::enableScrollbars(bool enable)
{
    const Qt::ScrollBarPolicy policy = enable ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOff;
    m_horizontalBar->setScrollBarPolicy(policy);
    m_verticalBar->setScrollBarPolicy(policy);
}

void ZoomScrollArea::setTouchActive(bool active)
{
    if (active) {
        m_touchActive = true;
    }
    m_wheelTimer->start();
}

bool ZoomScrollArea::isTouchActive() const
{
    return m_touchActive;
}

double ZoomScrollArea::zoomFactor() const
{
    return m_zooming ? vx::ZoomLaw::factor(m_scheduledScalings) : 0.0;
}

void ZoomScrollArea::wheelEvent(QWheelEvent* event)
{
    m_scheduledScalings
        = vx::ZoomLaw::scheduled(m_scheduledScalings, vx::ZoomLaw::stepsOf(event->angleDelta().y()));

    auto* const ticks = new QTimeLine(c_ZoomDuration, this);
    ticks->setUpdateInterval(c_ZoomTick);
    vx::connect(ticks, "2valueChanged(qreal)", this, "1scalingTime(qreal)", Qt::AutoConnection);
    vx::connect(ticks, "2finished()", this, "1animFinished()", Qt::AutoConnection);
    const QPointer<ZoomScrollArea> alive(this);
    ticks->start();
    // The first tick may come from within.
    if (alive) {
        m_zooming = true;
        m_zoomTimer->start();
    }
    event->ignore();
}

void ZoomScrollArea::scalingTime(double)
{
    Q_EMIT updateZoomFactor(zoomFactor());
}

void ZoomScrollArea::animFinished()
{
    // A slot may delete the area and the ended time line with it.
    const QPointer<QTimeLine> ended(qobject_cast<QTimeLine*>(sender()));
    m_scheduledScalings = vx::ZoomLaw::afterOne(m_scheduledScalings);
    Q_EMIT updateZoomFactor(zoomFactor());
    // At once and in its own signal: the signal is the last thing that a time line does.
    delete ended;
}

void ZoomScrollArea::stopAllZooming()
{
    m_scheduledScalings = 0;
    m_zooming = false;
    Q_EMIT updateZoomFactor(0.0);
}

void ZoomScrollArea::wheelTimeout()
{
    m_touchActive = false;
}

bool ZoomScrollArea::viewportEvent(QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
        setTouchActive(true);
        return true;
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        m_wheelTimer->start();
        return true;
    default:
        return QScrollArea::viewportEvent(event);
    }
}

void ZoomScrollArea::scrollContentsBy(int dx, int dy)
{
    QScrollArea::scrollContentsBy(dx, dy);
    m_scrolled = true;
    // Called by a bar, Qt touches the area once more when this returns, so a slot could not delete it: the report
    // waits for reportScrolling(), which the same value of the bar calls next.
    const QObject* const caller = sender();
    if (caller == nullptr || (caller != m_watchedBars[0] && caller != m_watchedBars[1])) {
        reportScrolling();
    }
}

void ZoomScrollArea::reportScrolling()
{
    if (m_scrolled) {
        m_scrolled = false;
        Q_EMIT scrollAreaChanged();
    }
}
