// SPDX-License-Identifier: MIT
// vx::MouseAdapter: turns the pointer events of a widget into clicks, presses, pans and swipes.
#include "input/MouseAdapter.h"

#include "CoreQt/Connect.h"
#include "input/GeometryUtils.h"

#include <QAbstractScrollArea>
#include <QAbstractSlider>
#include <QApplication>
#include <QEasingCurve>
#include <QMetaMethod>
#include <QPropertyAnimation>
#include <QScrollBar>
#include <QSize>
#include <QWidget>

#include <limits>

namespace vx
{

namespace
{

constexpr int longClickDefault = 1000; // ms
constexpr int autoClickDefault = 1000; // ms
constexpr int pageDuration = 1000; // ms
constexpr double millisPerSecond = 1000.0;

QWidget* asWidget(QObject* object)
{
    return object->isWidgetType() ? static_cast<QWidget*>(object) : nullptr;
}

int toInt(qint64 value)
{
    return static_cast<int>(
        qBound<qint64>(std::numeric_limits<int>::min(), value, std::numeric_limits<int>::max()));
}

int shifted(int value, qint64 delta, const QAbstractSlider* slider)
{
    return GeometryUtils::between(toInt(value + delta), slider);
}

// The time for the whole way at the speed that covers `step` in a second.
int continuousDuration(qint64 way, qint64 step)
{
    const double duration = static_cast<double>(way) * (millisPerSecond / static_cast<double>(step));
    return duration < std::numeric_limits<int>::max() ? static_cast<int>(duration)
                                                      : std::numeric_limits<int>::max();
}

void setInterval(QTimer& timer, int& stored, int interval)
{
    stored = interval;
    // QTimer would start a running timer anew.
    if (!timer.isActive())
        timer.setInterval(interval);
}

void startIfWanted(QTimer& timer, int interval)
{
    if (interval > 0)
        timer.start(interval);
}

} // namespace

MouseAdapter::MouseAdapter(QWidget* parent, bool filterEvents)
    : QObject(parent)
    , m_filterEvents(filterEvents)
    , m_doubleClickInterval(QApplication::doubleClickInterval())
    , m_longClickInterval(longClickDefault)
    , m_autoClickInterval(autoClickDefault)
{
    // A queued connection made by signature text does not register them by itself.
    qRegisterMetaType<vx::MouseEvent>("vx::MouseEvent");
    qRegisterMetaType<vx::MouseGesture::Ptr>("vx::MouseGesture::Ptr");

    m_doubleClickTimer.setSingleShot(true);
    m_doubleClickTimer.setInterval(m_doubleClickInterval);
    m_longClickTimer.setSingleShot(true);
    m_longClickTimer.setInterval(m_longClickInterval);
    m_autoClickTimer.setInterval(m_autoClickInterval);

    vx::connect(&m_doubleClickTimer, "2timeout()", this, "1onDoubleClickTimeout()", Qt::AutoConnection);
    vx::connect(&m_longClickTimer, "2timeout()", this, "1onLongClickTimeout()", Qt::AutoConnection);
    vx::connect(&m_autoClickTimer, "2timeout()", this, "1onAutoClickTimeout()", Qt::AutoConnection);

    if (parent)
        parent->installEventFilter(this);
}

MouseAdapter::~MouseAdapter()
{
    if (parent())
        parent()->removeEventFilter(this);
}

QWidget* MouseAdapter::parentWidget() const
{
    return qobject_cast<QWidget*>(parent());
}

void MouseAdapter::setClickRadius(int radius)
{
    m_clickRadius = radius;
}

void MouseAdapter::setDoubleClickRadius(int radius)
{
    m_doubleClickRadius = radius;
}

void MouseAdapter::setDoubleClickInterval(int interval)
{
    setInterval(m_doubleClickTimer, m_doubleClickInterval, interval);
}

void MouseAdapter::setLongClickInterval(int interval)
{
    setInterval(m_longClickTimer, m_longClickInterval, interval);
}

void MouseAdapter::setAutoClickInterval(int interval)
{
    setInterval(m_autoClickTimer, m_autoClickInterval, interval);
}

void MouseAdapter::setSwipeInterval(int interval)
{
    m_swipeInterval = interval;
}

void MouseAdapter::setMouseTracking(bool on)
{
    m_mouseTracking = on;
    if (QWidget* widget = parentWidget())
        widget->setMouseTracking(on);
}

bool MouseAdapter::hasMouseTracking() const
{
    return m_mouseTracking;
}

void MouseAdapter::attachTo(QWidget* widget)
{
    if (!widget)
        return;
    widget->installEventFilter(this);
    widget->setMouseTracking(m_mouseTracking);
}

void MouseAdapter::detachFrom(QWidget* widget)
{
    if (!widget)
        return;
    widget->removeEventFilter(this);
    if (m_mouseTracking)
        widget->setMouseTracking(false);
}

bool MouseAdapter::eventFilter(QObject* object, QEvent* event)
{
    // Double clicks are left out on purpose: their press must not start or touch anything. Clients rely on it.
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
        return handleButton(object, event);
    case QEvent::MouseMove:
        return handleMove(object, event);
    case QEvent::Enter:
        return handleEnter(object, event);
    case QEvent::Leave:
        return handleLeave(object);
    case QEvent::Hide:
        handleHide(object);
        return false;
    default:
        return false;
    }
}

// The handlers below tell Qt that the event is done with when a slot has deleted the watched object: Qt would
// deliver the event to it otherwise.

bool MouseAdapter::handleButton(QObject* object, QEvent* event)
{
    const QPointer<QObject> watched(object);
    const bool answer = m_filterEvents;

    // A release alone starts a gesture, too: clients rely on it.
    if (!m_gesture || m_gesture->isFinished() || m_gesture->isCanceled())
        startNewGesture();
    m_gesture->add(event, asWidget(object));
    if (!m_gesture->insideClickRadius(1)) {
        m_doubleClickTimer.stop();
        m_longClickTimer.stop();
    }
    if (canFinishGesture())
        finishGesture();
    notify(event->type());
    return answer || !watched;
}

bool MouseAdapter::handleMove(QObject* object, QEvent* event)
{
    // Without a slot the copy of the event is not worth making.
    static const QMetaMethod movedSignal = QMetaMethod::fromSignal(&MouseAdapter::moved);
    const QPointer<QObject> watched(object);
    const bool answer = m_filterEvents;

    if (m_mouseTracking && isSignalConnected(movedSignal)) {
        const QPointer<MouseAdapter> self(this);
        Q_EMIT moved(MouseEvent(static_cast<QMouseEvent*>(event), asWidget(object), 0));
        if (!self || !watched)
            return answer || !watched;
    }
    if (!m_gesture)
        return answer;

    const bool running = m_gesture->isStarted();
    if (running && m_gesture->lastEvent().buttons() != Qt::NoButton)
        m_gesture->add(event, asWidget(object));
    if (!m_gesture->insideClickRadius(1)) {
        // For good, even if the pointer comes back.
        m_doubleClickTimer.stop();
        m_longClickTimer.stop();
    }
    if (running)
        notify(QEvent::MouseMove);
    return answer || !watched;
}

bool MouseAdapter::handleEnter(QObject* object, QEvent* event)
{
    const QPointer<QObject> watched(object);
    if (m_mouseTracking) {
        const QPointer<MouseAdapter> self(this);
        auto* enterEvent = dynamic_cast<QEnterEvent*>(event);
        Q_EMIT entered(enterEvent ? MouseEvent(enterEvent, asWidget(object), 0)
                                  : MouseEvent(QEvent::Enter, asWidget(object), 0));
        if (!self)
            return !watched;
    }
    // The release was lost outside of the widget.
    if (m_gesture && QGuiApplication::mouseButtons() == Qt::NoButton)
        m_gesture->cancel();
    return !watched;
}

bool MouseAdapter::handleLeave(QObject* object)
{
    const QPointer<QObject> watched(object);
    if (m_mouseTracking)
        Q_EMIT left(MouseEvent(QEvent::Leave, asWidget(object), 0));
    return !watched;
}

void MouseAdapter::handleHide(QObject* object)
{
    const QWidget* widget = asWidget(object);
    if (m_gesture && widget && m_gesture->clickedWidget() == widget)
        m_gesture->cancel();
}

void MouseAdapter::startNewGesture()
{
    m_autoClickTimer.stop();
    m_gesture = MouseGesture::Ptr(new MouseGesture(qMax(0, m_doubleClickInterval), qMax(0, m_longClickInterval),
        m_swipeInterval, m_clickRadius, m_doubleClickRadius));
    if (QWidget* widget = parentWidget())
        widget->setMouseTracking(true);
    startIfWanted(m_doubleClickTimer, m_doubleClickInterval);
    startIfWanted(m_longClickTimer, m_longClickInterval);
}

void MouseAdapter::finishGesture()
{
    if (!m_gesture)
        return;
    m_gesture->finish();
    m_doubleClickTimer.stop();
    m_longClickTimer.stop();
    if (!m_mouseTracking) {
        if (QWidget* widget = parentWidget())
            widget->setMouseTracking(false);
    }
}

bool MouseAdapter::canFinishGesture()
{
    if (!m_gesture || m_gesture->clickCount() == 0)
        return false;
    return m_gesture->clickCount() > 1 || !m_doubleClickTimer.isActive();
}

void MouseAdapter::notify(QEvent::Type type)
{
    const MouseGesture::Ptr gesture = m_gesture;
    if (!gesture)
        return;

    const bool pans = type == QEvent::MouseMove && gesture->isPan(dAny);
    if (type == QEvent::MouseMove && !pans && !gesture->isFinished())
        return;

    const QPointer<MouseAdapter> self(this);
    switch (type) {
    case QEvent::MouseButtonPress:
        Q_EMIT pressed(gesture);
        break;
    case QEvent::MouseButtonRelease:
        Q_EMIT released(gesture);
        break;
    case QEvent::MouseMove:
        if (pans)
            Q_EMIT panning(gesture);
        break;
    default:
        break;
    }
    if (self && gesture->isFinished())
        notifyFinished(gesture);
}

void MouseAdapter::notifyFinished(const vx::MouseGesture::Ptr& gesture)
{
    // A slot above may have run an event loop that came here first.
    if (gesture->m_reported)
        return;
    gesture->m_reported = true;

    const QPointer<MouseAdapter> self(this);
    if (gesture->wasSwipe(dAny))
        Q_EMIT swiped(gesture);
    else if (gesture->wasPan(dAny))
        Q_EMIT panned(gesture);
    else if (gesture->wasDoubleClick(Qt::MouseButtonMask))
        Q_EMIT doubleClicked(gesture);
    else if (gesture->wasLongClick(Qt::MouseButtonMask))
        Q_EMIT longClicked(gesture);
    else if (gesture->wasSingleClick(Qt::MouseButtonMask))
        Q_EMIT clicked(gesture);
    if (!self)
        return;

    Q_EMIT finished(gesture);
    // A slot may have let a new gesture begin.
    if (self && m_gesture == gesture)
        m_gesture.reset();
}

void MouseAdapter::onDoubleClickTimeout()
{
    if (!m_gesture || m_gesture->clickCount() == 0)
        return;
    finishGesture();
    notify(QEvent::None);
}

void MouseAdapter::onLongClickTimeout()
{
    if (!m_gesture)
        return;
    m_gesture->m_longPressFired = true;
    if (m_gesture->clickCount() > 0) {
        const QPointer<MouseAdapter> self(this);
        finishGesture();
        // The second `released` of this gesture: clients rely on it.
        notify(QEvent::MouseButtonRelease);
        if (self)
            startIfWanted(m_autoClickTimer, m_autoClickInterval);
    } else if (m_gesture->isLongPress(Qt::MouseButtonMask)) {
        Q_EMIT longPressed(m_gesture);
    }
}

void MouseAdapter::onAutoClickTimeout()
{
    Q_EMIT autoClicked(m_gesture);
}

void MouseAdapter::scroll(QAbstractScrollArea* area, const QPoint& offset)
{
    const QPointer<QAbstractScrollArea> guarded(area);
    stopAnimation();
    if (!guarded)
        return;
    QScrollBar* horizontal = area->horizontalScrollBar();
    horizontal->setValue(shifted(horizontal->value(), -qint64(offset.x()), horizontal));
    if (!guarded)
        return;
    QScrollBar* vertical = area->verticalScrollBar();
    vertical->setValue(shifted(vertical->value(), -qint64(offset.y()), vertical));
}

QAbstractAnimation* MouseAdapter::scrollAnimated(QAbstractSlider* slider, int delta, bool continuous)
{
    if (!slider)
        return nullptr;

    const int value = slider->value();
    const int target = shifted(value, delta, slider);
    auto* animation = new QPropertyAnimation(slider, QByteArrayLiteral("value"));
    animation->setStartValue(value);
    if (!continuous) {
        animation->setEndValue(target);
        animation->setDuration(pageDuration);
        animation->setEasingCurve(QEasingCurve::OutExpo);
    } else {
        // Without a speed there is nowhere to go.
        const qint64 speed = qAbs(qint64(target) - value);
        const int end = speed == 0 ? value : delta < 0 ? slider->minimum() : slider->maximum();
        animation->setEndValue(end);
        animation->setDuration(speed == 0 ? 0 : continuousDuration(qAbs(qint64(end) - value), speed));
        animation->setEasingCurve(QEasingCurve::Linear);
    }
    animation->start(QAbstractAnimation::DeleteWhenStopped);
    return animation;
}

void MouseAdapter::scrollContinous(QAbstractScrollArea* area, vx::Direction direction, const QSize& size)
{
    startScrolling(area, direction, size, true);
}

void MouseAdapter::scrollPage(QAbstractScrollArea* area, vx::Direction direction, const QSize& size)
{
    startScrolling(area, direction, size, false);
}

void MouseAdapter::startScrolling(
    QAbstractScrollArea* area, vx::Direction direction, const QSize& size, bool continuous)
{
    const QPointer<MouseAdapter> self(this);
    const QPointer<QAbstractScrollArea> guarded(area);
    stopAnimation();
    if (!self || !guarded)
        return;
    const bool horizontal = (direction & (dLeft | dRight)) != 0;
    // The content follows the finger.
    const bool backward = (direction & (dRight | dDown)) != 0;
    const qint64 length = horizontal ? size.width() : size.height();
    m_animation = scrollAnimated(horizontal ? area->horizontalScrollBar() : area->verticalScrollBar(),
        toInt(backward ? -length : length), continuous);
}

void MouseAdapter::stopAnimation()
{
    const QPointer<QAbstractAnimation> animation = m_animation;
    m_animation.clear();
    if (animation)
        animation->stop();
}

} // namespace vx
