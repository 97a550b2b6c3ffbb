// SPDX-License-Identifier: MIT
// vx::GeometryUtils: angles, clamping, directions and table look-ups for code that handles a pointer.
#pragma once

#include "foundation/Export.h"
#include "input/Direction.h"

#include <QModelIndex>
#include <QPoint>
#include <QPointF>

class QAbstractSlider;
class QEvent;
class QMouseEvent;
class QTableView;

namespace vx
{

/// Static helpers, no state. A null view or event gives an invalid index, a null slider leaves the value as it is.
///
/// All index look-ups map into the coordinates of the view itself, not of its viewport, so visible headers shift
/// the result by their size. Clients rely on it.
class ZELKOV_WIDGETS_EXPORT GeometryUtils
{
public:
    GeometryUtils() = delete;

    /// Angle of the vector in degrees, -180..180: 0 points to larger x, 90 to larger y (down on the screen).
    static double angle(const QPoint& p);

    /// @p v, not below @p min, else not above @p max. With min > max the lower bound is looked at first.
    static int between(int v, int min, int max);
    /// @p v, inside the range of the slider.
    static int between(int v, const QAbstractSlider* s);

    /// The one direction nearest to the vector. Exact diagonals belong to dUp and dDown on the right side and to
    /// dLeft on the left side; the null vector is dLeft.
    static Direction direction(const QPoint& p);
    /// Direction from one global position to another.
    static Direction direction(const QMouseEvent& from, const QMouseEvent& to);

    // Index under a mouse event; any other event gives an invalid index.
    static QModelIndex indexAt(const QTableView* view, QEvent* event);
    static QModelIndex indexAt(const QTableView* view, QMouseEvent* event);
    /// @p p in global coordinates.
    static QModelIndex indexAtGlobalPos(const QTableView* view, const QPoint& p);
    /// @p p in the view's own coordinates.
    static QModelIndex indexAtPoint(const QTableView* view, const QPoint& p);
    /// @p p from the top left of the screen that the view is on. A view without a native window of its own is
    /// looked up on the screen of its top-level window.
    static QModelIndex indexAtScreenPos(const QTableView* view, const QPointF& p);
    /// @p p in the coordinates of the view's top-level window.
    static QModelIndex indexAtWindowPos(const QTableView* view, const QPointF& p);
};

} // namespace vx
