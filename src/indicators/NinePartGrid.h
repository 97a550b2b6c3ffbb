// SPDX-License-Identifier: MIT
// The grid of a nine-part picture: where its corners, edges and centre are cut and where they go.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMargins>
#include <QtCore/QRect>
#include <QtCore/QSize>

#include <array>

namespace vx
{
/// One part of a nine-part picture. Both rectangles are valid and not empty.
struct NinePart
{
    QRect target; ///< in the coordinates of the painter
    QRect source; ///< in the pixels of the picture
    bool centre;  ///< the middle one of the nine
};

/// Up to nine parts, row by row from the top left; parts without width or height on either side are left out.
///
/// Grid lines are shared: neighbours overlap by one pixel and the later one lies on top.
struct NinePartGrid
{
    std::array<NinePart, 9> parts; ///< the first of them count
    int count = 0; ///< 0 to 9
};

/// Margins as given at all four sides, whatever the size of the target.
ZELKOV_WIDGETS_EXPORT NinePartGrid ninePartGrid(const QRect& target, const QSize& picture, const QMargins& margins);

/// Margins that grow in whole multiples of the given ones, so that a tiled border closes without a cut; what is left
/// over goes to the right and to the bottom. Used where the border is what stretches.
///
/// The two margins of an axis should not both be 0; if they are, that axis is cut as by the function above.
ZELKOV_WIDGETS_EXPORT NinePartGrid ninePartGridWithGrowingBorder(
    const QRect& target, const QSize& picture, const QMargins& margins);
}
