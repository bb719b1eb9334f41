// SPDX-License-Identifier: MIT
#pragma once

#include "region/model/Path.h"

namespace gmregion {

/// Axis-parallel box. Starts empty: `low` above `high`.
struct Box {
    Vec2 low{HUGE_VAL, HUGE_VAL};
    Vec2 high{-HUGE_VAL, -HUGE_VAL};

    bool isEmpty() const { return low.x > high.x; }
    Vec2 size() const { return isEmpty() ? Vec2{} : high - low; }
    void include(Vec2 p);
    void include(const Box& other);
    /// True when the other box lies in this one, borders included. An empty box lies in every box.
    bool holds(const Box& other) const;
    /// True when the boxes have a point in common. An empty box has none.
    bool overlaps(const Box& other) const {
        return low.x <= other.high.x && other.low.x <= high.x && low.y <= other.high.y &&
               other.low.y <= high.y;
    }
    /// The box grown by `margin` on every side.
    Box grown(double margin) const;
};

/// Exact bounding box, arcs included up to their extreme points.
Box boundingBox(const Element& e);
Box boundingBox(const Path& path);

}  // namespace gmregion
