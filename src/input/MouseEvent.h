// SPDX-License-Identifier: MIT
// vx::MouseEvent: a pointer event that outlives its delivery.
#pragma once

#include "foundation/Export.h"

#include <QDateTime>
#include <QMetaType>
#include <QMouseEvent>
#include <QPointer>
#include <QString>
#include <QWidget>

class QEnterEvent;
class QInputEvent;
class QWheelEvent;

namespace vx
{

/// A self-contained copy of a pointer event, with the widget it was delivered to and the time it happened. Copy
/// it, keep it, send it through queued connections: it owns nothing and survives the widget.
///
/// Times are milliseconds. An event that brings its own time stamp keeps it, and such stamps often count from the
/// start of the system; all others get the time since the epoch. Compare timeMillis() only between events of the
/// same kind; time() is right only where the value counts from the epoch.
///
/// In every constructor a non-zero @p millis wins over the event's own time. A null @p event gives an event that
/// is not valid, a null @p widget one without a source.
class ZELKOV_WIDGETS_EXPORT MouseEvent : public QMouseEvent
{
public:
    /// An event that is not valid, at the position of the cursor.
    MouseEvent();
    /// Copies type, positions, button, buttons and modifiers.
    MouseEvent(QMouseEvent* event, QWidget* widget, qint64 millis);
    /// Copies type and positions; no buttons, no modifiers.
    MouseEvent(QEnterEvent* event, QWidget* widget, qint64 millis);
    /// Copies type, positions and modifiers; no buttons. The window position is the null point without a widget.
    MouseEvent(QWheelEvent* event, QWidget* widget, qint64 millis);
    /// An event made up at the position of the cursor. Without a widget, window and local position are the null
    /// point; without an application the screen position is the null point, too.
    MouseEvent(QEvent::Type type, QWidget* widget, qint64 millis);

    MouseEvent(const MouseEvent& other);
    MouseEvent(MouseEvent&& other);
    MouseEvent& operator=(const MouseEvent& other);
    MouseEvent& operator=(MouseEvent&& other);
    ~MouseEvent() override;

    /// Whether this is an event at all: its type is not QEvent::None.
    bool isValid() const;

    /// Whether the rectangle (global coordinates) contains the global position, border included.
    bool isInside(const QRect& rect) const;
    /// Whether the widget's area on the screen contains the global position. False for null.
    bool isInside(const QWidget* widget) const;

    /// The widget the event was delivered to; null once it is dead.
    QPointer<QWidget> sourceWidget() const;
    /// Object name of that widget. Reads it again while the widget is alive, visible, enabled and has a name;
    /// later the last good name stays.
    QString sourceWidgetName();

    /// timeMillis() understood as time since the epoch.
    QDateTime time() const;
    /// When it happened; see the class for what it counts from.
    qint64 timeMillis() const;

protected:
    /// Stands for an event that is not there, so that nobody has to deal with null pointers. Made at library load.
    static const MouseEvent nothing;

    /// @p millis if not 0, else the time stamp of the event if there is one, else the current time.
    static qint64 millis(qint64 millis, const QInputEvent* event);

private:
    friend class MouseGesture;

    MouseEvent(QEvent::Type type, QWidget* widget, qint64 millis, const QPoint& cursor);
    MouseEvent(const QMouseEvent& event, const QInputEvent* stamped, QWidget* widget, qint64 millis);

    QPointer<QWidget> m_sourceWidget;
    QString m_sourceWidgetName;
    qint64 m_timeMillis;
};

} // namespace vx

Q_DECLARE_METATYPE(vx::MouseEvent)
