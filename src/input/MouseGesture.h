// SPDX-License-Identifier: MIT
// vx::MouseGesture: the recording of one gesture of the user, and what it was.
#pragma once

#include "foundation/Export.h"
#include "input/Direction.h"
#include "input/GestureVerdicts.h"
#include "input/MouseEvent.h"

#include <QList>
#include <QMetaType>
#include <QModelIndex>
#include <QPoint>
#include <QSharedPointer>

class QTableView;

namespace vx
{

/// One gesture: the recorded pointer events in order, a life-cycle state and the thresholds that were in force
/// when it began. All questions are answered from the recording at the moment they are asked; nothing runs in the
/// background. Gestures are made by vx::MouseAdapter alone, and slots may keep the Ptr as long as they like.
///
/// Positions are global, in screen pixels; distances are Manhattan lengths; times are MouseEvent::timeMillis().
/// Questions about events that were not recorded are answered from an event that is not valid: they never fail.
class ZELKOV_WIDGETS_EXPORT MouseGesture
{
public:
    /// How gestures are handed out.
    using Ptr = QSharedPointer<vx::MouseGesture>;

    /// The life of a gesture.
    enum State : int
    {
        gsIdle = 0, ///< nothing added yet
        gsJustStarted = 1, ///< one event added
        gsStarted = 2, ///< running
        gsFinished = 3, ///< over; the verdicts can be asked
        gsCanceled = 4 ///< over without verdict
    };

    MouseGesture(const MouseGesture& other);
    MouseGesture(MouseGesture&& other);
    MouseGesture& operator=(const MouseGesture& other);
    MouseGesture& operator=(MouseGesture&& other);
    ~MouseGesture();

    // The first and the last event recorded.
    MouseEvent first() const;
    MouseEvent last() const;
    /// The n-th press, counted from 1. The second press of a double click is not recorded.
    MouseEvent pressed(int n) const;
    /// The n-th release, counted from 1.
    MouseEvent released(int n) const;

    /// Buttons held at the first event; a press counts its own button as held.
    Qt::MouseButtons buttons() const;
    /// Number of recorded releases.
    int clickCount() const;

    /// Widget of the first release if there is one, else of the first press; null if it is dead.
    QWidget* clickedWidget() const;
    /// Name of that widget, see MouseEvent::sourceWidgetName().
    QString clickedWidgetName();
    /// Index under the first press, see GeometryUtils.
    QModelIndex indexAt(const QTableView* view) const;

    bool isJustStarted() const; ///< gsJustStarted
    bool isStarted() const; ///< gsJustStarted or gsStarted
    bool isFinished() const; ///< gsFinished
    bool isCanceled() const; ///< gsCanceled

    /// Whether the last event is near the n-th press (counted from 1): not farther than the greater one of the
    /// radii for clicks and double clicks.
    bool insideClickRadius(int n) const;

    /// Live: held in place for the long click time, not released. Asked of an unfinished gesture.
    bool isLongPress(Qt::MouseButtons buttons) const;
    // Live: moved out of the click radius, not released.
    bool isPan(vx::Direction direction) const;
    bool isPan(Qt::Orientation orientation) const;

    // The verdicts; true only for a finished gesture. Swipe and pan are drags out of the click radius: released
    // within the swipe interval it is a swipe, later a pan.
    bool wasSingleClick(Qt::MouseButtons buttons) const;
    bool wasDoubleClick(Qt::MouseButtons buttons) const;
    bool wasLongClick(Qt::MouseButtons buttons) const;
    bool wasPan(vx::Direction direction) const;
    bool wasPan(Qt::Orientation orientation) const;
    bool wasSwipe(vx::Direction direction) const;
    bool wasSwipe(Qt::Orientation orientation) const;

    /// From the latest press to the last event.
    QPoint panOffset() const;
    /// The one direction nearest to panOffset().
    Direction panDirection() const;
    /// From the last event of the previous call (at first from the latest press) to the last event: increments for
    /// a slot of panning(). Asking moves the starting point.
    QPoint lastPanOffset();
    /// Direction of what lastPanOffset() would give. Asking moves nothing.
    Direction lastPanDirection() const;
    /// From the first press to the last event.
    QPoint swipeOffset() const;
    /// The one direction nearest to swipeOffset().
    Direction swipeDirection() const;

    // Change the state; true if that changed anything. Finished and canceled are final.
    bool finish();
    bool cancel();
    bool startOrUpdate();

protected:
    friend class MouseAdapter;

    /// Intervals in ms (0 switches double or long clicks off), radii in pixels.
    MouseGesture(qint64 doubleClickInterval, qint64 longClickInterval, qint64 swipeInterval, int clickRadius,
        int doubleClickRadius);

    /// Records a press, a release, a move with a button held, an enter or a leave. Other events, among them
    /// QEvent::MouseButtonDblClick, are not recorded and give false, as does a gesture that is over.
    bool add(QEvent* event, QWidget* widget);
    /// How many recorded events have the type.
    int count(QEvent::Type type) const;
    /// Position of the n-th event of the type, counted from 0, or -1.
    int indexOf(QEvent::Type type, int n) const;

private:
    // In the class, since they are asked for every move.
    const MouseEvent& eventAt(int index) const
    {
        // The bounds matter for a gesture that was moved from: it has its indexes, but no events.
        return index >= 0 && index < m_events.size() ? m_events.at(index) : MouseEvent::nothing;
    }
    const MouseEvent& lastEvent() const { return eventAt(m_events.size() - 1); }
    const MouseEvent& firstPress() const { return eventAt(m_firstPress); }
    const MouseEvent& firstRelease() const { return eventAt(m_firstRelease); }
    int clickedIndex() const;
    void record(const MouseEvent& event);
    bool matches(Qt::MouseButtons buttons) const;
    GestureLimits limits() const;

    int m_state = gsIdle;
    QPoint m_panStart;
    QPoint m_lastPan;
    QList<vx::MouseEvent> m_events;
    int m_clickRadius;
    int m_doubleClickRadius;
    qint64 m_doubleClickInterval;
    qint64 m_longClickInterval;
    bool m_longPressFired = false;
    qint64 m_swipeInterval;

    // Positions in m_events or -1, so that no question walks through the recording.
    int m_firstPress = -1;
    int m_firstRelease = -1;
    int m_secondRelease = -1;
    int m_releaseCount = 0;
    bool m_reported = false; // the adapter has told its verdict
};

} // namespace vx

Q_DECLARE_METATYPE(vx::MouseGesture::Ptr)
