// SPDX-License-Identifier: MIT
// Where labels put their text and picture, said with rectangles alone.
#pragma once

#include <QPoint>
#include <QRect>
#include <QSize>

#include <Qt>

namespace vx
{
namespace LabelGeometry
{
/// The rectangle with its edge moved in by \a indent wherever \a alignment holds the text to an edge; -1 is none.
inline QRect indented(const QRect& rect, Qt::Alignment alignment, int indent)
{
    constexpr int limit = 1 << 24; // no widget is larger
    const int i = indent == -1 ? 0 : qBound(-limit, indent, limit);
    return rect.adjusted(alignment.testFlag(Qt::AlignLeft) ? i : 0, alignment.testFlag(Qt::AlignTop) ? i : 0,
        alignment.testFlag(Qt::AlignRight) ? -i : 0, alignment.testFlag(Qt::AlignBottom) ? -i : 0);
}

/// Where the top left corner of a picture that covers the frame goes, so that what it overhangs in one direction
/// is halved between both sides. Integer division.
inline QPoint coverOrigin(const QRect& frame, const QSize& picture)
{
    if (picture.width() > frame.width()) {
        return {frame.left() - (picture.width() - frame.width()) / 2, frame.top()};
    }
    if (picture.height() > frame.height()) {
        return {frame.left(), frame.top() - (picture.height() - frame.height()) / 2};
    }
    return frame.topLeft();
}
}
}
