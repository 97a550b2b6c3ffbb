// SPDX-License-Identifier: MIT
// Arithmetic of thumbnail cells.
#include "models/ThumbnailGeometry.h"

#include <algorithm>
#include <limits>

namespace vx
{
namespace thumbnail
{
namespace
{
constexpr int c_smallestFont = 12;
constexpr int c_titleHeight = 20;
constexpr float c_fontShare = 0.6f;

/// a * b / c as if int had no end.
int scaled(int a, int b, int c)
{
    const qint64 value = qint64(a) * b / c;
    return int(std::clamp<qint64>(value, std::numeric_limits<int>::min() / 4, std::numeric_limits<int>::max() / 4));
}
}

QRect fitWithAspectRatio(const QRect& rect, const QSize& size, bool expand)
{
    if (size.isEmpty()) {
        return rect;
    }
    const int width = scaled(rect.height(), size.width(), size.height());
    if (expand == (width > rect.width())) {
        return QRect(rect.x() + (rect.width() - width) / 2, rect.y(), width, rect.height());
    }
    const int height = scaled(rect.width(), size.height(), size.width());
    return QRect(rect.x(), rect.y() + (rect.height() - height) / 2, rect.width(), height);
}

QRect align(const QSize& imageSize, const QRect& rect, int alignment)
{
    QRect result(QPoint(0, 0), rect.size());
    if ((alignment & Qt::AlignAbsolute) != 0) {
        result = fitWithAspectRatio(rect, imageSize, (alignment & Qt::AlignJustify) != 0);
    }
    if ((alignment & Qt::AlignLeft) != 0) {
        result.moveLeft(rect.left());
    }
    if ((alignment & Qt::AlignRight) != 0) {
        result.moveRight(rect.right());
    }
    if ((alignment & Qt::AlignTop) != 0) {
        result.moveTop(rect.top());
    }
    if ((alignment & Qt::AlignBottom) != 0) {
        result.moveBottom(rect.bottom());
    }
    if ((alignment & Qt::AlignHCenter) != 0) {
        result.moveCenter(QPoint(rect.center().x(), result.center().y()));
    }
    if ((alignment & Qt::AlignVCenter) != 0) {
        result.moveCenter(QPoint(result.center().x(), rect.center().y()));
    }
    return result;
}

int titleHeight(int height, bool scaled)
{
    return scaled ? height / 4 + 1 : c_titleHeight;
}

int fontSize(int height, bool scaled)
{
    return scaled ? std::max(c_smallestFont, int(float(height) * c_fontShare)) : c_smallestFont;
}

QRect titleRect(const QRect& rect, bool scaled)
{
    QRect result = rect;
    result.setTop(rect.bottom() - (scaled ? rect.height() / 4 : c_titleHeight));
    return result;
}

int fittingSize(int size, int width, const std::function<int(int)>& widthAt)
{
    while (widthAt(size) > width && size >= 8) {
        --size;
    }
    return size;
}
}
}
