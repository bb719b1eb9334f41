// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Element.h"

#include "region/plane/Carrier.h"

namespace gmregion {

/// Where two elements come nearest to each other.
struct Approach {
    Vec2 onFirst;
    Vec2 onSecond;
    double distance = 0.0;  ///< 0 up to rounding where they cross
};

/// The nearest points of two elements that turn by half a turn at the most. Cost: constant.
/// @param carrierA the carrier of a
/// @param carrierB the carrier of b
Approach nearestBetween(const Element& a, const Carrier& carrierA, const Element& b,
                        const Carrier& carrierB);

}  // namespace gmregion
