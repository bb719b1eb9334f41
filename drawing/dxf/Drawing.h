// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>
#include <vector>

#include "drawing/ReadReport.h"
#include "drawing/curves/Shape.h"

namespace gmdrawing {

/// A block placed in the drawing or in another block: scaled, turned by `angle`, then moved to
/// `at`, `columns` times `rows` over. Spacing is measured along the turned axes.
struct BlockReference {
    std::string block;
    std::string layer;
    gmregion::Vec2 at;
    gmregion::Vec2 scale{1.0, 1.0};
    double angle = 0.0;  ///< radians
    int columns = 1;
    int rows = 1;
    gmregion::Vec2 spacing;
    bool mirrored = false;  ///< drawn on the back of the plane: x runs the other way
};

/// What a block, or the drawing itself, holds, in drawing order.
struct Block {
    gmregion::Vec2 base;                     ///< the point that comes to lie where it is placed
    std::vector<Shape> shapes;               ///< entities as drawn
    std::vector<BlockReference> references;  ///< blocks placed inside
    ReadReport report;                       ///< entities that cannot be used
};

/// A drawing as read, before its blocks are placed.
struct Drawing {
    Block model;                          ///< the drawing itself
    std::map<std::string, Block> blocks;  ///< definitions by name
};

}  // namespace gmdrawing
