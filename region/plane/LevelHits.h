// SPDX-License-Identifier: MIT
#pragma once

#include "region/model/Element.h"

namespace gmregion {

/// Where a ray from a point to the left, x falling, meets an element first.
struct LevelHit {
    double x;            ///< -infinity where it does not
    bool coveredToEast;  ///< whether the element's left lies east of it there, towards the point
};

/// The hit of an element that turns by half a turn at the most. As for windingOf the ray runs just
/// above its point, so that of two elements that meet at its height it hits the one or both or
/// none, as the path crosses it once, twice or not. Cost: constant.
LevelHit hitLeftOf(const Element& e, Vec2 p);

}  // namespace gmregion
