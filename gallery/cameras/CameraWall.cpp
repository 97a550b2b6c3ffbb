// SPDX-License-Identifier: MIT
// Lays the cameras out.
#include "CameraWall.h"

#include "CameraTile.h"

namespace gallery
{
namespace
{
const int s_gap = 4;
}

CameraWall::CameraWall(const QStringList& names, QWidget* parent)
    : QWidget(parent)
{
    for (int i = 0; i < names.size(); ++i) {
        auto* tile = new CameraTile(names.at(i), i, this);
        tile->setObjectName(QStringLiteral("camera%1").arg(i + 1));
        m_tiles.append(tile);
    }
    setMinimumSize(s_columns * 110, s_columns * 72);
    arrange();
}

int CameraWall::wallCount() const
{
    return (m_tiles.size() + s_perWall - 1) / s_perWall;
}

void CameraWall::select(CameraTile* tile)
{
    for (CameraTile* other : qAsConst(m_tiles)) {
        other->setSelected(other == tile);
    }
    Q_EMIT changed();
}

void CameraWall::toggleEnlarged(CameraTile* tile)
{
    m_enlarged = m_enlarged ? nullptr : tile;
    arrange();
    Q_EMIT changed();
}

void CameraWall::turn(int step)
{
    if (m_enlarged) {
        const int count = m_tiles.size();
        const int next = (m_tiles.indexOf(m_enlarged) + step + count) % count;
        m_enlarged = m_tiles.at(next);
        m_wall = next / s_perWall;
    } else {
        m_wall = (m_wall + step + wallCount()) % wallCount();
    }
    arrange();
    Q_EMIT changed();
}

void CameraWall::advance(qint64 epochMillis)
{
    for (CameraTile* tile : qAsConst(m_tiles)) {
        if (tile->isVisible()) {
            tile->advance(epochMillis);
        }
    }
}

void CameraWall::resizeEvent(QResizeEvent*)
{
    arrange();
}

void CameraWall::arrange()
{
    for (int i = 0; i < m_tiles.size(); ++i) {
        CameraTile* tile = m_tiles.at(i);
        const int place = i - m_wall * s_perWall;
        const bool onWall = place >= 0 && place < s_perWall;
        if (m_enlarged) {
            tile->setGeometry(tile == m_enlarged ? rect() : tile->geometry());
        } else if (onWall) {
            const int column = place % s_columns;
            const int row = place / s_columns;
            const int left = (width() + s_gap) * column / s_columns;
            const int top = (height() + s_gap) * row / s_columns;
            const int right = (width() + s_gap) * (column + 1) / s_columns - s_gap;
            const int bottom = (height() + s_gap) * (row + 1) / s_columns - s_gap;
            tile->setGeometry(left, top, right - left, bottom - top);
        }
        tile->setVisible(m_enlarged ? tile == m_enlarged : onWall);
    }
}
}
