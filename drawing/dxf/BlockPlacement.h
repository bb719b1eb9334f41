// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "drawing/curves/Placement.h"
#include "drawing/dxf/Drawing.h"

namespace gmdrawing {

/// Where a block with the given base point comes to lie by one cell of a reference, column and row
/// counted from 0. Nothing when the scale is 0 in one direction.
std::optional<Placement> blockPlacement(const BlockReference& reference, gmregion::Vec2 base,
                                        int column, int row);

}  // namespace gmdrawing
