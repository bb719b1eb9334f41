// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>

#include "region/model/Element.h"

namespace gmregion {

/// Axis-parallel box. Starts empty: `low` above `high`.
struct Box {
    Vec2 low{HUGE_VAL, HUGE_VAL};
    Vec2 high{-HUGE_VAL, -HUGE_VAL};

    bool isEmpty() const { return low.x > high.x; }
    Vec2 size() const { return isEmpty() ? Vec2{} : high - low; }
    void include(Vec2 p) {
        low = {std::min(low.x, p.x), std::min(low.y, p.y)};
        high = {std::max(high.x, p.x), std::max(high.y, p.y)};
    }
    /// Nothing for an empty box.
    void include(const Box& other) {
        low = {std::min(low.x, other.low.x), std::min(low.y, other.low.y)};
        high = {std::max(high.x, other.high.x), std::max(high.y, other.high.y)};
    }
    /// True when the point lies in the box, borders included.
    bool holds(Vec2 p) const {
        return low.x <= p.x && p.x <= high.x && low.y <= p.y && p.y <= high.y;
    }
    /// True when the other box lies in this one, borders included. An empty box lies in every box.
    bool holds(const Box& other) const;
    /// True when the boxes have a point in common. An empty box has none.
    bool overlaps(const Box& other) const {
        return low.x <= other.high.x && other.low.x <= high.x && low.y <= other.high.y &&
               other.low.y <= high.y;
    }
    /// The box grown by `margin` on every side.
    Box grown(double margin) const {
        const Vec2 by{margin, margin};
        return isEmpty() ? *this : Box{low - by, high + by};
    }
};

/// Exact bounding box, arcs included up to their extreme points.
Box boundingBox(const Element& e);

}  // namespace gmregion
