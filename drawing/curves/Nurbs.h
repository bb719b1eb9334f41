// SPDX-License-Identifier: MIT
#pragma once

#include "drawing/curves/Bezier.h"

namespace gmdrawing {

/// A spline by control points and knots.
struct Nurbs {
    std::size_t degree = 3;
    std::vector<double> knots;
    Bezier points;  ///< control points with their weights
};

/// Why there is no curve for control points and knots, empty when there is one: degrees from 1 to
/// 15, more control points than that, degree + 1 more knots than control points that never fall and
/// have no more than `degree` inner ones in one place, weights above 0.
const char* faultOf(const Nurbs& spline);

/// The curve from the knot number `degree` to the knot number of the control points, one piece for
/// each span between knots; the spline must be without fault.
/// Cost: the cube of the degree a piece.
std::vector<Bezier> bezierPieces(const Nurbs& spline);

}  // namespace gmdrawing
