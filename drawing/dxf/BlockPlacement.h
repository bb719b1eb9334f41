// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "drawing/dxf/Drawing.h"
#include "part/model/Placement.h"

namespace gmdrawing {

/// Where a block with the given base point comes to lie by one cell of a reference, column and row
/// counted from 0. Nothing when the scale is not uniform or 0, so that no similarity exists.
std::optional<gmpart::Placement> blockPlacement(const BlockReference& reference,
                                                gmregion::Vec2 base, int column, int row);

}  // namespace gmdrawing
