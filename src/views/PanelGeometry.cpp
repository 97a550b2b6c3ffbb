// SPDX-License-Identifier: MIT
// Where a panel at the edge of a view stands, and the heights that it snaps to.
#include "views/PanelGeometry.h"

#include <QtCore/QtGlobal>

namespace vx
{
namespace PanelGeometry
{
namespace
{
// The largest size of a widget, and as good a limit for its position.
constexpr qint64 c_Farthest = (1 << 24) - 1;
constexpr double c_RequestFactor = 0.6666666666666666;
constexpr double c_ReleaseFactor = 0.66;

QRect panelRectAt(qint64 top, int width, qint64 height)
{
    return {0, static_cast<int>(qBound(-c_Farthest, top, c_Farthest)), widgetHeight(width), widgetHeight(height)};
}

int snap(int height, int contentsHeight, double factor)
{
    if (height < contentsHeight * factor) {
        return 0;
    }
    return height < qint64(contentsHeight) + c_Bars ? 1 : -1;
}
}

int widgetHeight(qint64 height)
{
    return static_cast<int>(qBound<qint64>(0, height, c_Farthest));
}

QRect panelRect(const Surroundings& s, int height)
{
    switch (s.edge) {
    case c_Top:
        return panelRectAt(qint64(s.neighbourOffset) + s.verticalOffset, s.parentWidth, height);
    case c_Bottom:
        return panelRectAt(qint64(s.parentHeight) - s.neighbourOffset - height, s.parentWidth, height);
    default:
        return {};
    }
}

QRect stillStripRect(const Surroundings& s)
{
    Surroundings seen = s;
    if (s.edge == c_Top) {
        seen.neighbourOffset = 0;
    }
    return panelRect(seen, c_Strip);
}

QRect fullRect(const Surroundings& s, int height)
{
    return s.edge == c_Top ? panelRectAt(s.verticalOffset, s.parentWidth, height) : QRect();
}

QVector<int> rowHeights(int contentsHeight, int maximumRows)
{
    QVector<int> heights {c_Strip};
    for (int i = 1; i <= maximumRows; ++i) {
        const qint64 height = qint64(i) * contentsHeight + c_Bars;
        heights.append(static_cast<int>(qBound(-c_Farthest, height, c_Farthest)));
    }
    return heights;
}

int snapOfRequest(int height, int contentsHeight)
{
    return snap(height, contentsHeight, c_RequestFactor);
}

int snapOfRelease(int height, int contentsHeight)
{
    return snap(height, contentsHeight, c_ReleaseFactor);
}
}
}
