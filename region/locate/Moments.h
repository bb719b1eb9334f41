// SPDX-License-Identifier: MIT
/// @file
/// First moments and boxes of elements, exact over arcs.
#pragma once

#include "region/model/Box.h"

namespace gmregion {

/// The area swept from a point along an element, and its moment about that point: area times the
/// way from there to its centre of gravity. Any sweep.
struct Moment {
    double area = 0.0;
    Vec2 first;
};
Moment sweptMoment(const Element& e, Vec2 from);

/// The smallest box about an element that turns by half a turn at the most, right to rounding for
/// flat arcs, too.
Box closeBox(const Element& e);

}  // namespace gmregion
