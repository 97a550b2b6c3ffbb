// SPDX-License-Identifier: MIT
// The sliding panels above and below the pictures, with the time line.
#pragma once

#include <QtCore/QObject>
#include <QtWidgets/QWidget>

namespace client
{
class Fleet;
class Session;

/// Two stripe panels over an area: events above, the time line with the export flags below. They lie over the area and
/// follow its size.
class RecordStripes : public QObject
{
    Q_OBJECT

public:
    /// \a area is the widget that the panels lie over; it owns them. This object is its child.
    RecordStripes(Fleet& fleet, Session& session, QWidget* area);

    void setStripesVisible(bool visible);

    /// Asks for the options of an export in a modal popover beside \a target and runs it. Returns when the user has
    /// decided.
    void runExport(QWidget* target);

Q_SIGNALS:
    /// The user scrubs: microseconds since 1970-01-01 UTC, within the last 24 hours.
    void timeChosen(quint64 microseconds);
    /// The user goes back to the live pictures.
    void liveWanted();
    /// An export has run to its end, or the user has stopped it.
    void exportFinished(bool complete);

private:
    Fleet& m_fleet;
    Session& m_session;
    QWidget* m_area;
};
}
