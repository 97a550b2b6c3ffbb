// SPDX-License-Identifier: MIT
// The sliding panels above and below the pictures, with the time line.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtCore/QVector>
#include <QtWidgets/QWidget>

class FadeStripeView;

namespace client
{
class EventStripe;
class ExportPopover;
class ExportRun;
class Fleet;
class RecordTimeLine;
class Session;

/// Two stripe panels over an area: events above, the time line with the export flags below. They lie over the area and
/// follow its size. The lower one is open at first.
///
/// The contents margins of the area are what the panels take away from it while they rest, so that a layout in it
/// leaves that free: the strips, and the time line where there is room enough for it. What slides, and the events, lie
/// over the pictures.
class RecordStripes : public QObject
{
    Q_OBJECT

public:
    /// \a area is the widget that the panels lie over; it owns them. This object is its child.
    RecordStripes(Fleet& fleet, Session& session, QWidget* area);
    ~RecordStripes() override;

    void setStripesVisible(bool visible);

    /// Asks for the options of an export in a modal popover beside \a target and runs it. Returns when the user has
    /// decided. Nothing happens, and nothing is emitted, if the user has no right to it or one is under way.
    void runExport(QWidget* target);
    bool isExporting() const;

    /// The camera that an export of a single camera takes; the first of the fleet if there is no such camera.
    void setCurrentCamera(int id);
    /// The handle goes to the end, as after the user has gone there; nothing is emitted.
    void showLive();
    /// The handle goes to that moment; nothing is emitted.
    void showTime(quint64 microseconds);

    FadeStripeView* eventStripe() const;
    FadeStripeView* timeStripe() const;
    RecordTimeLine* timeLine() const;

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// The user scrubs: microseconds since 1970-01-01 UTC, within the last 24 hours.
    void timeChosen(quint64 microseconds);
    /// The user goes back to the live pictures.
    void liveWanted();
    /// The user has clicked on an event of that camera; timeChosen() follows.
    void cameraChosen(int id);
    /// An export has run to its end, or the user has stopped it, be it before it began.
    void exportFinished(bool complete);

private:
    void makeStripes();
    void watchAncestors();
    void place();
    void follow();
    void reserve();
    void share();
    bool fitsBoth() const;
    void stackEvents(bool onTop);
    void followRights();
    void chooseEvent(int camera, qint64 time);
    void startRun(const QString& fileName);
    void finishRun(bool complete);

    Fleet& m_fleet;
    Session& m_session;
    QWidget* m_area;
    QPointer<FadeStripeView> m_top;
    QPointer<FadeStripeView> m_bottom;
    QPointer<EventStripe> m_events;
    QPointer<RecordTimeLine> m_timeLine;
    QPointer<ExportPopover> m_popover;
    QPointer<ExportRun> m_run;
    QVector<QPointer<QWidget>> m_watched;
    int m_areaTop = 0; // in its window
    bool m_eventsOnTop = false; // while they take the full height
    int m_camera = -1;
};
}
