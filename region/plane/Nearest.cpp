// SPDX-License-Identifier: MIT
#include "region/plane/Nearest.h"

#include "region/plane/Crossing.h"

namespace gmregion {

Vec2 nearestOn(const Element& e, const Carrier& c, Vec2 p) {
    const Vec2 foot = footOn(c, p);
    if (spans(e, foot)) return foot;
    const Vec2 toStart = e.sp - p;
    const Vec2 toEnd = e.ep - p;
    return dot(toStart, toStart) <= dot(toEnd, toEnd) ? e.sp : e.ep;
}

}  // namespace gmregion
