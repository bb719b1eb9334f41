// SPDX-License-Identifier: MIT
/// @file
/// What one element adds to the winding number of a point, so that the sum over closed loops is
/// exact: neighbours agree on their common end.
#pragma once

#include "region/model/Element.h"

namespace gmregion {

/// What an element adds to the winding number of a point that does not lie on it. The element
/// turns by half a turn at the most.
int windingOf(const Element& e, Vec2 p);

/// What a chain between two points adds for a point that its box lies left of: however it runs, the
/// same.
inline int windingOfChain(Vec2 from, Vec2 to, Vec2 p) {
    return static_cast<int>(from.y > p.y) - static_cast<int>(to.y > p.y);
}

/// What an element adds for points beside its middle, on its right; on its left it is one more.
int windingRightOf(const Element& e);

/// A point of the element, half way along an arc and near the middle of a segment.
Vec2 middleOf(const Element& e);

}  // namespace gmregion
