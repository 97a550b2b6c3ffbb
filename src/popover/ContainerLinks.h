// SPDX-License-Identifier: MIT
// What containers know of particular rows. The only place of this room that looks into rows.
#pragma once

namespace vx
{
namespace PopoverWidget
{
class Container;
class Item;

namespace ContainerLinks
{

/// The container that a row leads to, or null for rows that lead nowhere.
Container* containerOf(Item* item);

} // namespace ContainerLinks
} // namespace PopoverWidget
} // namespace vx
