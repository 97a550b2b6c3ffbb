// SPDX-License-Identifier: MIT
// vx::MouseAdapter: turns the pointer events of a widget into clicks, presses, pans and swipes.
#pragma once

#include "foundation/Export.h"
#include "input/Direction.h"
#include "input/MouseEvent.h"
#include "input/MouseGesture.h"

#include <QAbstractAnimation>
#include <QEvent>
#include <QObject>
#include <QPointer>
#include <QTimer>

class QAbstractScrollArea;
class QAbstractSlider;
class QSize;
class QWidget;

namespace vx
{

/// An event filter that watches a widget (its parent) and reports what the user does with the pointer: hovering,
/// presses and releases, single, double and long clicks, long presses, pans and swipes. More widgets can be
/// attached; all of them feed the one gesture that an adapter has at a time. For slots that scroll an area with a
/// pan or a swipe there are scroll helpers. The parent owns the adapter.
///
/// A typical run, with the intervals as they come:
///  - quick click: pressed, released, and when the double click interval since the press is over clicked, finished
///  - slower click: pressed, released, clicked, finished
///  - long click: pressed, longPressed, released, longClicked, finished
///  - double click: pressed, released, released, doubleClicked, finished
///  - drag, released within the swipe interval: pressed, panning..., released, swiped, finished
///  - drag, released later: pressed, panning..., released, panned, finished
///
/// A gesture whose widget is hidden, or whose release got lost outside (seen when the pointer enters again with no
/// button down), is canceled and ends without finished().
///
/// The parent's mouse tracking is on during every gesture. Slots may do what they like, deleting adapter and
/// widget included.
class ZELKOV_WIDGETS_EXPORT MouseAdapter : public QObject
{
    Q_OBJECT

public:
    /// @p filterEvents: whether presses, releases and moves are kept from the widget. Leaves the mouse tracking of
    /// the parent as it is; call setMouseTracking(true) for hover signals.
    MouseAdapter(QWidget* parent, bool filterEvents);
    ~MouseAdapter() override;

    /// Largest Manhattan distance in pixels that is still a click; 8 by default. Counts for later gestures.
    void setClickRadius(int radius);
    /// The same for a double click; 8 by default.
    void setDoubleClickRadius(int radius);

    /// Intervals in ms. 0 or less switches the feature off. A timer that runs is left alone; the new value counts
    /// from its next start.
    void setDoubleClickInterval(int interval); ///< default QApplication::doubleClickInterval()
    void setLongClickInterval(int interval); ///< default 1000
    void setAutoClickInterval(int interval); ///< default 1000
    /// Up to this time in ms a drag is a swipe, beyond it a pan; 1000 by default.
    void setSwipeInterval(int interval);

    /// Whether entered(), left() and moved() are wanted (default: yes). Sets the parent's mouse tracking, too.
    void setMouseTracking(bool on);
    bool hasMouseTracking() const;

    /// Watches a further widget and sets its mouse tracking to hasMouseTracking().
    void attachTo(QWidget* widget);
    /// No longer watches the widget; switches its mouse tracking off if hasMouseTracking().
    void detachFrom(QWidget* widget);

    bool eventFilter(QObject* object, QEvent* event) override;

    /// Moves the content of the area by the offset (pixels): the bars' values decrease by it. Stops the animation.
    /// For slots of panning() with MouseGesture::lastPanOffset().
    void scroll(QAbstractScrollArea* area, const QPoint& offset);

    /// Starts an animation of the slider's value and returns it; it deletes itself when it stops. Null without a
    /// slider. Not continuous: by @p delta in one second, easing out. Continuous: to the end of the range in the
    /// direction of @p delta, with a constant speed of |delta| a second; where @p delta cannot move the slider the
    /// animation ends at once.
    static QAbstractAnimation* scrollAnimated(QAbstractSlider* slider, int delta, bool continuous);

    /// Lets the content follow a swipe without end, at a speed of one @p size a second.
    void scrollContinous(QAbstractScrollArea* area, vx::Direction direction, const QSize& size);
    /// Lets the content follow a swipe by one @p size.
    void scrollPage(QAbstractScrollArea* area, vx::Direction direction, const QSize& size);
    /// Stops the animation of scrollContinous() or scrollPage(), if one runs.
    void stopAnimation();

Q_SIGNALS:
    // Hovering; only with hasMouseTracking().
    void entered(vx::MouseEvent event);
    void left(vx::MouseEvent event);
    void moved(vx::MouseEvent event);
    /// A button went down; not for the second press of a double click.
    void pressed(vx::MouseGesture::Ptr gesture);
    /// A button went up. Comes a second time when the long click interval ends a gesture that was already
    /// released, which needs a double click interval longer than the long click interval. Clients rely on it.
    void released(vx::MouseGesture::Ptr gesture);
    // The verdicts: at most one of clicked, doubleClicked, longClicked, panned, swiped a gesture, then finished.
    void clicked(vx::MouseGesture::Ptr gesture);
    void doubleClicked(vx::MouseGesture::Ptr gesture);
    void longClicked(vx::MouseGesture::Ptr gesture);
    /// Repeats after a gesture that the long click interval has ended, until the next gesture starts. The gesture
    /// is the running one, mostly null.
    void autoClicked(vx::MouseGesture::Ptr gesture);
    /// Held in place for the long click interval; the button is still down.
    void longPressed(vx::MouseGesture::Ptr gesture);
    /// Moved outside the click radius with a button down.
    void panning(vx::MouseGesture::Ptr gesture);
    /// A drag that was released after the swipe interval; finished() follows.
    void panned(vx::MouseGesture::Ptr gesture);
    /// A drag that was released within the swipe interval; finished() follows.
    void swiped(vx::MouseGesture::Ptr gesture);
    /// The gesture is over, whether it got a verdict or not. Not for canceled gestures.
    void finished(vx::MouseGesture::Ptr gesture);

protected Q_SLOTS:
    // The ends of the three intervals.
    void onLongClickTimeout();
    void onDoubleClickTimeout();
    void onAutoClickTimeout();

protected:
    /// Replaces the gesture by a new one, starts the timers, switches the parent's mouse tracking on.
    void startNewGesture();
    /// Ends the gesture without telling anybody; notify() does that.
    void finishGesture();
    /// Whether no further click can follow: two releases, or one with the double click time over.
    bool canFinishGesture();
    /// Emits what the event means for the gesture; if that is finished, then its verdict and finished().
    void notify(QEvent::Type type);

private:
    bool handleButton(QObject* object, QEvent* event);
    bool handleMove(QObject* object, QEvent* event);
    bool handleEnter(QObject* object, QEvent* event);
    bool handleLeave(QObject* object);
    void handleHide(QObject* object);
    void notifyFinished(const vx::MouseGesture::Ptr& gesture);
    void startScrolling(QAbstractScrollArea* area, vx::Direction direction, const QSize& size, bool continuous);
    QWidget* parentWidget() const;

    vx::MouseGesture::Ptr m_gesture;
    QPointer<QAbstractAnimation> m_animation;
    int m_clickRadius = 8;
    int m_doubleClickRadius = 8;
    QTimer m_doubleClickTimer;
    QTimer m_longClickTimer;
    QTimer m_autoClickTimer;
    qint64 m_swipeInterval = 1000;
    bool m_filterEvents;
    bool m_mouseTracking = true;

    // What the next start of the timer uses.
    int m_doubleClickInterval;
    int m_longClickInterval;
    int m_autoClickInterval;
};

} // namespace vx
