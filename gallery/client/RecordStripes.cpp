// SPDX-License-Identifier: MIT
// The sliding panels above and below the pictures, with the time line.
#include "RecordStripes.h"

namespace client
{
RecordStripes::RecordStripes(Fleet& fleet, Session& session, QWidget* area)
    : QObject(area)
    , m_fleet(fleet)
    , m_session(session)
    , m_area(area)
{
    Q_UNUSED(m_fleet)
    Q_UNUSED(m_session)
    Q_UNUSED(m_area)
}

void RecordStripes::setStripesVisible(bool) {}
void RecordStripes::runExport(QWidget*) {}
}
