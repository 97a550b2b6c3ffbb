// SPDX-License-Identifier: MIT
// Where a thumbnail and its title bar go in a cell, and which font size its caption takes.
#pragma once

#include <functional>

#include <QtCore/QRect>
#include <QtCore/QSize>

#include "foundation/Export.h"

namespace vx
{
/// Arithmetic of thumbnail cells, in whole pixels of the given rectangle's coordinate system.
namespace thumbnail
{
/// A rectangle with the aspect ratio of @p size, centred in @p rect: inside of it, or covering it with @p expand.
/// An empty @p size gives @p rect.
ZELKOV_WIDGETS_EXPORT QRect fitWithAspectRatio(const QRect& rect, const QSize& size, bool expand);

/// The rectangle of a picture of @p imageSize in @p rect. @p alignment is a set of Qt::AlignmentFlag bits, of which
/// two are borrowed: AlignAbsolute keeps the aspect ratio of the picture, and AlignJustify with it lets the picture
/// cover the rectangle. Without one of these and without a positional flag the result stands at (0, 0).
ZELKOV_WIDGETS_EXPORT QRect align(const QSize& imageSize, const QRect& rect, int alignment);

// Height of the title bar, and the font size to start with, for a cell and a bar of @p height.
ZELKOV_WIDGETS_EXPORT int titleHeight(int height, bool scaled);
ZELKOV_WIDGETS_EXPORT int fontSize(int height, bool scaled);

/// The lower edge of @p rect, from the title's upper edge to the bottom.
ZELKOV_WIDGETS_EXPORT QRect titleRect(const QRect& rect, bool scaled);

/// The largest size from @p size down at which the width that @p widthAt gives is not above @p width; sizes below 8
/// are not made smaller, so the result may still be too wide.
ZELKOV_WIDGETS_EXPORT int fittingSize(int size, int width, const std::function<int(int size)>& widthAt);
}
}
