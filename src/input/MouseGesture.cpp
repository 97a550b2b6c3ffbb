// SPDX-License-Identifier: MIT
// vx::MouseGesture: the recording of one gesture of the user, and what it was.
#include "input/MouseGesture.h"

#include "input/GeometryUtils.h"

#include <QTableView>

namespace vx
{

namespace
{

GestureSample sampleOf(const MouseEvent& event)
{
    return {event.globalPos(), event.timeMillis()};
}

Direction directionsOf(Qt::Orientation orientation)
{
    return orientation == Qt::Horizontal ? dLeft | dRight : dUp | dDown;
}

} // namespace

MouseGesture::MouseGesture(qint64 doubleClickInterval, qint64 longClickInterval, qint64 swipeInterval,
    int clickRadius, int doubleClickRadius)
    : m_clickRadius(clickRadius)
    , m_doubleClickRadius(doubleClickRadius)
    , m_doubleClickInterval(doubleClickInterval)
    , m_longClickInterval(longClickInterval)
    , m_swipeInterval(swipeInterval)
{
}

MouseGesture::MouseGesture(const MouseGesture& other) = default;
MouseGesture::MouseGesture(MouseGesture&& other) = default;
MouseGesture& MouseGesture::operator=(const MouseGesture& other) = default;
MouseGesture& MouseGesture::operator=(MouseGesture&& other) = default;
MouseGesture::~MouseGesture() = default;

int MouseGesture::clickedIndex() const
{
    return m_firstRelease >= 0 ? m_firstRelease : m_firstPress;
}

GestureLimits MouseGesture::limits() const
{
    return {m_clickRadius, m_doubleClickRadius, m_doubleClickInterval, m_longClickInterval, m_swipeInterval};
}

bool MouseGesture::matches(Qt::MouseButtons buttons) const
{
    return (eventAt(0).buttons() & buttons) != 0;
}

MouseEvent MouseGesture::first() const
{
    return eventAt(0);
}

MouseEvent MouseGesture::last() const
{
    return lastEvent();
}

MouseEvent MouseGesture::pressed(int n) const
{
    return eventAt(indexOf(QEvent::MouseButtonPress, n - 1));
}

MouseEvent MouseGesture::released(int n) const
{
    return eventAt(indexOf(QEvent::MouseButtonRelease, n - 1));
}

Qt::MouseButtons MouseGesture::buttons() const
{
    return eventAt(0).buttons();
}

int MouseGesture::clickCount() const
{
    return m_releaseCount;
}

QWidget* MouseGesture::clickedWidget() const
{
    return eventAt(clickedIndex()).sourceWidget();
}

QString MouseGesture::clickedWidgetName()
{
    const int index = clickedIndex();
    return index >= 0 && index < m_events.size() ? m_events[index].sourceWidgetName() : QString();
}

QModelIndex MouseGesture::indexAt(const QTableView* view) const
{
    return GeometryUtils::indexAtGlobalPos(view, firstPress().globalPos());
}

bool MouseGesture::isJustStarted() const
{
    return m_state == gsJustStarted;
}

bool MouseGesture::isStarted() const
{
    return m_state == gsJustStarted || m_state == gsStarted;
}

bool MouseGesture::isFinished() const
{
    return m_state == gsFinished;
}

bool MouseGesture::isCanceled() const
{
    return m_state == gsCanceled;
}

bool MouseGesture::insideClickRadius(int n) const
{
    const MouseEvent& press = n == 1 ? firstPress() : eventAt(indexOf(QEvent::MouseButtonPress, n - 1));
    // The larger radius counts, whichever kind of click is meant: clients rely on it.
    return GestureVerdicts::distance(press.globalPos(), lastEvent().globalPos())
        <= qMax(m_clickRadius, m_doubleClickRadius);
}

bool MouseGesture::isLongPress(Qt::MouseButtons buttons) const
{
    // A canceled gesture can still be a long press: clients rely on it.
    return m_state != gsFinished
        && GestureVerdicts::isLongPress((firstPress().buttons() & buttons) != 0, sampleOf(firstPress()),
            sampleOf(lastEvent()), m_releaseCount, m_longPressFired, limits());
}

bool MouseGesture::isPan(vx::Direction direction) const
{
    return GestureVerdicts::isPan(
        direction, sampleOf(firstPress()), sampleOf(lastEvent()), m_releaseCount, limits());
}

bool MouseGesture::isPan(Qt::Orientation orientation) const
{
    return isPan(directionsOf(orientation));
}

bool MouseGesture::wasSingleClick(Qt::MouseButtons buttons) const
{
    return isFinished()
        && GestureVerdicts::wasSingleClick(
            matches(buttons), sampleOf(firstPress()), sampleOf(firstRelease()), m_releaseCount, limits());
}

bool MouseGesture::wasDoubleClick(Qt::MouseButtons buttons) const
{
    return isFinished()
        && GestureVerdicts::wasDoubleClick(matches(buttons), sampleOf(firstPress()),
            sampleOf(eventAt(m_secondRelease)), m_releaseCount, limits());
}

bool MouseGesture::wasLongClick(Qt::MouseButtons buttons) const
{
    return isFinished()
        && GestureVerdicts::wasLongClick(
            matches(buttons), sampleOf(firstPress()), sampleOf(firstRelease()), m_releaseCount, limits());
}

bool MouseGesture::wasPan(vx::Direction direction) const
{
    return isFinished()
        && GestureVerdicts::wasPan(
            direction, sampleOf(firstPress()), sampleOf(lastEvent()), m_releaseCount, limits());
}

bool MouseGesture::wasPan(Qt::Orientation orientation) const
{
    return wasPan(directionsOf(orientation));
}

bool MouseGesture::wasSwipe(vx::Direction direction) const
{
    return isFinished()
        && GestureVerdicts::wasSwipe(
            direction, sampleOf(firstPress()), sampleOf(firstRelease()), m_releaseCount, limits());
}

bool MouseGesture::wasSwipe(Qt::Orientation orientation) const
{
    return wasSwipe(directionsOf(orientation));
}

QPoint MouseGesture::panOffset() const
{
    return GestureVerdicts::offset(m_panStart, lastEvent().globalPos());
}

Direction MouseGesture::panDirection() const
{
    return GeometryUtils::direction(panOffset());
}

QPoint MouseGesture::lastPanOffset()
{
    const QPoint position = lastEvent().globalPos();
    const QPoint offset = GestureVerdicts::offset(m_lastPan, position);
    m_lastPan = position;
    return offset;
}

Direction MouseGesture::lastPanDirection() const
{
    return GeometryUtils::direction(GestureVerdicts::offset(m_lastPan, lastEvent().globalPos()));
}

QPoint MouseGesture::swipeOffset() const
{
    return GestureVerdicts::offset(firstPress().globalPos(), lastEvent().globalPos());
}

Direction MouseGesture::swipeDirection() const
{
    return GeometryUtils::direction(swipeOffset());
}

bool MouseGesture::finish()
{
    if (!isStarted())
        return false;
    m_state = gsFinished;
    return true;
}

bool MouseGesture::cancel()
{
    if (!isStarted())
        return false;
    m_state = gsCanceled;
    return true;
}

bool MouseGesture::startOrUpdate()
{
    if (m_state == gsFinished || m_state == gsCanceled)
        return false;
    m_state = m_state == gsIdle ? gsJustStarted : gsStarted;
    return true;
}

bool MouseGesture::add(QEvent* event, QWidget* widget)
{
    if (!event || m_state == gsFinished || m_state == gsCanceled)
        return false;

    switch (event->type()) {
    case QEvent::MouseButtonPress: {
        auto* mouseEvent = static_cast<QMouseEvent*>(event);
        m_panStart = mouseEvent->globalPos();
        m_lastPan = m_panStart;
        record(MouseEvent(mouseEvent, widget, 0));
        break;
    }
    case QEvent::MouseButtonRelease:
        record(MouseEvent(static_cast<QMouseEvent*>(event), widget, 0));
        break;
    case QEvent::MouseMove:
        if (static_cast<QMouseEvent*>(event)->buttons() != Qt::NoButton)
            record(MouseEvent(static_cast<QMouseEvent*>(event), widget, 0));
        break;
    case QEvent::Enter:
        if (auto* enterEvent = dynamic_cast<QEnterEvent*>(event))
            record(MouseEvent(enterEvent, widget, 0));
        else
            record(MouseEvent(QEvent::Enter, widget, 0));
        break;
    case QEvent::Leave:
        record(MouseEvent(QEvent::Leave, widget, 0));
        break;
    default:
        // Qt sends the second press of a double click as MouseButtonDblClick; it stays out: clients rely on it.
        return false;
    }
    return startOrUpdate();
}

void MouseGesture::record(const MouseEvent& event)
{
    const int index = m_events.size();
    m_events.append(event);
    if (event.type() == QEvent::MouseButtonPress && m_firstPress < 0)
        m_firstPress = index;
    if (event.type() == QEvent::MouseButtonRelease) {
        ++m_releaseCount;
        if (m_releaseCount == 1)
            m_firstRelease = index;
        else if (m_releaseCount == 2)
            m_secondRelease = index;
    }
}

int MouseGesture::count(QEvent::Type type) const
{
    int found = 0;
    for (const MouseEvent& event : m_events) {
        if (event.type() == type)
            ++found;
    }
    return found;
}

int MouseGesture::indexOf(QEvent::Type type, int n) const
{
    if (n < 0)
        return -1;
    for (int i = 0; i < m_events.size(); ++i) {
        if (m_events.at(i).type() == type && n-- == 0)
            return i;
    }
    return -1;
}

} // namespace vx
