// SPDX-License-Identifier: MIT
#include "region/model/Box.h"

#include <algorithm>

namespace gmregion {

namespace {

void includeArcExtremes(Box& box, const Element& e) {
    const Vec2 m = centre(e);
    const double r = radius(e);
    for (const Vec2 direction : {Vec2{1, 0}, Vec2{0, 1}, Vec2{-1, 0}, Vec2{0, -1}}) {
        const Vec2 extreme = m + r * direction;
        if (arcHolds(e, extreme)) box.include(extreme);
    }
}

}  // namespace

void Box::include(Vec2 p) {
    low = {std::min(low.x, p.x), std::min(low.y, p.y)};
    high = {std::max(high.x, p.x), std::max(high.y, p.y)};
}

void Box::include(const Box& other) {
    if (other.isEmpty()) return;
    include(other.low);
    include(other.high);
}

bool Box::holds(const Box& other) const {
    return other.isEmpty() || (low.x <= other.low.x && low.y <= other.low.y &&
                               high.x >= other.high.x && high.y >= other.high.y);
}

Box Box::grown(double margin) const {
    const Vec2 by{margin, margin};
    return isEmpty() ? *this : Box{low - by, high + by};
}

Box boundingBox(const Element& e) {
    Box box;
    box.include(e.sp);
    box.include(e.ep);
    if (isArc(e)) includeArcExtremes(box, e);
    return box;
}

Box boundingBox(const Path& path) {
    Box box;
    for (const Element& e : path.elements)
        box.include(boundingBox(e));
    return box;
}

}  // namespace gmregion
