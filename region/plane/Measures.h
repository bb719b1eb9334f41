// SPDX-License-Identifier: MIT
/// @file
/// Areas and lengths of elements, by sums, products, quotients and roots alone.
#pragma once

#include "region/model/Element.h"

namespace gmregion {

/// The angle, in radians, of which x >= 0 is the tangent; the same bits from every compiler.
double arcTangent(double x);

/// The area between an element and its chord, positive counter-clockwise. Any sweep.
double segmentArea(const Element& e);

/// Twice the area swept from a point along an element, positive counter-clockwise.
double sweptTwice(const Element& e, Vec2 from);

/// The length along an element. Any sweep.
double lengthAlong(const Element& e);

}  // namespace gmregion
