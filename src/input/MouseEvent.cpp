// SPDX-License-Identifier: MIT
// vx::MouseEvent: a pointer event that outlives its delivery.
#include "input/MouseEvent.h"

#include <QCursor>
#include <QGuiApplication>

#include <utility>

namespace vx
{

namespace
{

// MouseEvent::nothing is made at library load, mostly before there is an application to ask.
QPoint cursorPosition()
{
    return qobject_cast<QGuiApplication*>(QCoreApplication::instance()) ? QCursor::pos() : QPoint();
}

QString nameOf(const QWidget* widget)
{
    return widget ? widget->objectName() : QString();
}

QPoint inWindow(const QWidget* widget, const QPoint& globalPos)
{
    return widget ? widget->window()->mapFromGlobal(globalPos) : QPoint();
}

QPoint inWidget(const QWidget* widget, const QPoint& globalPos)
{
    return widget ? widget->mapFromGlobal(globalPos) : QPoint();
}

QPoint localPosition(const QWheelEvent* event)
{
    if (!event)
        return QPoint();
#if QT_VERSION >= QT_VERSION_CHECK(5, 14, 0)
    return event->position().toPoint();
#else
    return event->pos();
#endif
}

QPoint globalPosition(const QWheelEvent* event)
{
    if (!event)
        return QPoint();
#if QT_VERSION >= QT_VERSION_CHECK(5, 14, 0)
    return event->globalPosition().toPoint();
#else
    return event->globalPos();
#endif
}

} // namespace

const MouseEvent MouseEvent::nothing(QEvent::None, nullptr, 0);

MouseEvent::MouseEvent()
    : MouseEvent(QEvent::None, nullptr, 0)
{
}

MouseEvent::MouseEvent(QMouseEvent* event, QWidget* widget, qint64 millis)
    : MouseEvent(event ? *event : static_cast<const QMouseEvent&>(nothing), event, widget, millis)
{
}

MouseEvent::MouseEvent(const QMouseEvent& event, const QInputEvent* stamped, QWidget* widget, qint64 millis)
    : QMouseEvent(event.type(), event.localPos(), event.windowPos(), event.screenPos(), event.button(),
        event.buttons(), event.modifiers())
    , m_sourceWidget(widget)
    , m_sourceWidgetName(nameOf(widget))
    , m_timeMillis(MouseEvent::millis(millis, stamped))
{
}

MouseEvent::MouseEvent(QEnterEvent* event, QWidget* widget, qint64 millis)
    : QMouseEvent(event ? event->type() : QEvent::None, event ? event->localPos() : QPointF(),
        event ? event->windowPos() : QPointF(), event ? event->screenPos() : QPointF(), Qt::NoButton, Qt::NoButton,
        Qt::NoModifier)
    , m_sourceWidget(widget)
    , m_sourceWidgetName(nameOf(widget))
    , m_timeMillis(MouseEvent::millis(millis, nullptr))
{
}

MouseEvent::MouseEvent(QWheelEvent* event, QWidget* widget, qint64 millis)
    : QMouseEvent(event ? event->type() : QEvent::None, localPosition(event),
        inWindow(widget, globalPosition(event)), globalPosition(event), Qt::NoButton, Qt::NoButton,
        event ? event->modifiers() : Qt::NoModifier)
    , m_sourceWidget(widget)
    , m_sourceWidgetName(nameOf(widget))
    , m_timeMillis(MouseEvent::millis(millis, event))
{
}

MouseEvent::MouseEvent(QEvent::Type type, QWidget* widget, qint64 millis)
    : MouseEvent(type, widget, millis, cursorPosition())
{
}

MouseEvent::MouseEvent(QEvent::Type type, QWidget* widget, qint64 millis, const QPoint& cursor)
    : QMouseEvent(type, inWidget(widget, cursor), inWindow(widget, cursor), cursor, Qt::NoButton, Qt::NoButton,
        Qt::NoModifier)
    , m_sourceWidget(widget)
    , m_sourceWidgetName(nameOf(widget))
    , m_timeMillis(MouseEvent::millis(millis, nullptr))
{
}

MouseEvent::MouseEvent(const MouseEvent& other) = default;
MouseEvent::MouseEvent(MouseEvent&& other) = default;
MouseEvent& MouseEvent::operator=(const MouseEvent& other) = default;
MouseEvent& MouseEvent::operator=(MouseEvent&& other) = default;
MouseEvent::~MouseEvent() = default;

bool MouseEvent::isValid() const
{
    return type() != QEvent::None;
}

bool MouseEvent::isInside(const QRect& rect) const
{
    return rect.contains(globalPos());
}

bool MouseEvent::isInside(const QWidget* widget) const
{
    if (!widget)
        return false;
    QRect area = widget->rect();
    area.moveTopLeft(widget->mapToGlobal(area.topLeft()));
    return area.contains(globalPos());
}

QPointer<QWidget> MouseEvent::sourceWidget() const
{
    return m_sourceWidget;
}

QString MouseEvent::sourceWidgetName()
{
    if (m_sourceWidget && m_sourceWidget->isVisible() && m_sourceWidget->isEnabled()) {
        const QString name = m_sourceWidget->objectName();
        if (!name.isEmpty())
            m_sourceWidgetName = name;
    }
    return m_sourceWidgetName;
}

QDateTime MouseEvent::time() const
{
    return QDateTime::fromMSecsSinceEpoch(m_timeMillis);
}

qint64 MouseEvent::timeMillis() const
{
    return m_timeMillis;
}

qint64 MouseEvent::millis(qint64 millis, const QInputEvent* event)
{
    if (millis != 0)
        return millis;
    if (event && event->timestamp() != 0)
        return static_cast<qint64>(event->timestamp());
    return QDateTime::currentMSecsSinceEpoch();
}
} // namespace vx
