// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>

#include "region/model/Box.h"
#include "region/plane/Carrier.h"

namespace gmregion {

/// Whether one of two carriers passes by all that two boxes have in common, farther off than a
/// margin: then what of them lies in the boxes meets nowhere. False does not say that they meet.
/// Cost: less than that of any crossing.
inline bool areApart(const Carrier& a, const Box& aboutA, const Carrier& b, const Box& aboutB,
                     double margin) {
    const Vec2 low{std::max(aboutA.low.x, aboutB.low.x), std::max(aboutA.low.y, aboutB.low.y)};
    const Vec2 high{std::min(aboutA.high.x, aboutB.high.x), std::min(aboutA.high.y, aboutB.high.y)};
    const Vec2 centre = 0.5 * (low + high);
    const double radius = 0.5 * (high.x - low.x + high.y - low.y) + margin;
    return !isWithin(a, centre, radius) || !isWithin(b, centre, radius);
}

}  // namespace gmregion
