// SPDX-License-Identifier: MIT
/// @file
/// Directions at the ends of elements, and elements by their directions.
#pragma once

#include <cmath>

#include "region/model/Element.h"

namespace gmregion {

inline double lengthOf(Vec2 v) {
    return std::sqrt(dot(v, v));
}

/// Unit direction of travel at the start; the ends must differ.
Vec2 startDirection(const Element& e);
Vec2 endDirection(const Element& e);

/// The bulge of the arc over a chord that leaves its start along a unit direction: the tangent of
/// half the angle from the direction to the chord. Infinite against the chord.
double bulgeLeaving(Vec2 direction, Vec2 chord);

/// The bulge of the arc over a chord that reaches its end along a unit direction.
double bulgeReaching(Vec2 chord, Vec2 direction);

/// Whether the angle between two unit directions is one whose half has a tangent above the limit.
bool jumpsBy(Vec2 a, Vec2 b, double limit);

/// The element cut at one of its points, which is neither of its ends.
struct Parts {
    Element first;
    Element second;
};
Parts cutAt(const Element& e, Vec2 p);

/// The element in two equal parts.
Parts halved(const Element& e);

}  // namespace gmregion
