// SPDX-License-Identifier: MIT
#pragma once

#include "region/plane/Carrier.h"

namespace gmregion {

/// The point nearest to p of an element that turns by half a turn at the most: the foot on its
/// carrier where that lies on the element, else the nearer end, of two equally near ones the start.
/// @param c the carrier of the element
Vec2 nearestOn(const Element& e, const Carrier& c, Vec2 p);

}  // namespace gmregion
