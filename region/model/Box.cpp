// SPDX-License-Identifier: MIT
#include "region/model/Box.h"

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

bool Box::holds(const Box& other) const {
    return other.isEmpty() || (low.x <= other.low.x && low.y <= other.low.y &&
                               high.x >= other.high.x && high.y >= other.high.y);
}

Box boundingBox(const Element& e) {
    Box box;
    box.include(e.sp);
    box.include(e.ep);
    if (isArc(e)) includeArcExtremes(box, e);
    return box;
}

}  // namespace gmregion
