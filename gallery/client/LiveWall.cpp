// SPDX-License-Identifier: MIT
// The live or recorded pictures of the cameras, side by side.
#include "LiveWall.h"

namespace client
{
LiveWall::LiveWall(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
{
    Q_UNUSED(m_fleet)
}

void LiveWall::setViewCount(int count)
{
    m_viewCount = count;
}

void LiveWall::chooseCamera(int id)
{
    m_current = id;
}

void LiveWall::showRecorded(quint64)
{
    m_live = false;
}

void LiveWall::showLive()
{
    m_live = true;
}

void LiveWall::setMarking(bool) {}
void LiveWall::setCounting(bool) {}
void LiveWall::steer(double, double, double) {}
void LiveWall::setShowNames(bool) {}
void LiveWall::setShowTimes(bool) {}
void LiveWall::setShowBadges(bool) {}

int LiveWall::framesPerSecond() const
{
    return 0;
}
}
