// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "drawing/curves/Placement.h"

namespace gmdrawing {

/// A control point; weights are positive.
struct WeightedPoint {
    gmregion::Vec2 p;
    double weight = 1.0;
};

/// A rational curve over 0..1 by its control points, at least two. Whatever a drawing bends, this
/// is a row of them: ellipses in pieces of degree two, splines in pieces of their own degree.
using Bezier = std::vector<WeightedPoint>;

/// A point of a curve and its direction of travel there.
struct CurvePoint {
    gmregion::Vec2 at;
    gmregion::Vec2 direction;  ///< of length 1; zero for a curve without extent
};

/// The point at the parameter t, 0..1. Where the curve stands still, the direction is that in which
/// it goes on, at its end that in which it came. Quadratic in the degree.
CurvePoint pointAt(const Bezier& curve, double t);

/// The piece of the curve from one parameter to a later one.
Bezier piece(const Bezier& curve, double from, double to);

/// The curve under an affine map, exactly.
Bezier mapped(const Bezier& curve, const Placement& placement);

/// Length of the way over the control points, at least that of the curve.
double controlLength(const Bezier& curve);

}  // namespace gmdrawing
