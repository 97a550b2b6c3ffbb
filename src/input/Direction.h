// SPDX-License-Identifier: MIT
// vx::Direction: the four directions of a pointer movement as a bit set.
#pragma once

namespace vx
{

/// Directions on the screen, where y grows downward. The values are bits, so one value can name several
/// directions at once: `dLeft | dRight` asks for any horizontal movement.
enum Direction : int
{
    dLeft = 1, ///< towards smaller x
    dRight = 2, ///< towards larger x
    dUp = 4, ///< towards smaller y
    dDown = 8, ///< towards larger y
    dAny = 255 ///< whatever direction
};

/// Either of them.
constexpr Direction operator|(Direction a, Direction b)
{
    return static_cast<Direction>(static_cast<int>(a) | static_cast<int>(b));
}

/// What both have in common; 0 for nothing.
constexpr Direction operator&(Direction a, Direction b)
{
    return static_cast<Direction>(static_cast<int>(a) & static_cast<int>(b));
}

} // namespace vx
