// SPDX-License-Identifier: MIT
// All cameras as small pictures.
#include "ThumbnailWall.h"

namespace client
{
ThumbnailWall::ThumbnailWall(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
{
    Q_UNUSED(m_fleet)
}
}
