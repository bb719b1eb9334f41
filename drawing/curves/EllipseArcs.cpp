// SPDX-License-Identifier: MIT
/// @file
/// Ellipses as rational curves.
///
/// A piece of the unit circle about the direction u that sweeps 2 h has its middle control point
/// where the tangents at its ends meet, at the distance 1 / cos h, with the weight cos h; an
/// ellipse is an affine image of the circle.

#include "drawing/curves/EllipseArcs.h"

#include <cmath>

namespace gmdrawing {

using gmregion::Element;
using gmregion::kPi;
using gmregion::Vec2;

namespace {

Vec2 at(const Ellipse& ellipse, double u, double stretch = 1.0) {
    return ellipse.centre + (stretch * std::cos(u)) * ellipse.first +
           (stretch * std::sin(u)) * ellipse.second;
}

}  // namespace

std::vector<Bezier> ellipseArc(const Ellipse& ellipse, double start, double sweep) {
    // A quarter turn that is off by rounding alone is not divided.
    constexpr double kRounding = 1e-9;
    const auto count =
        static_cast<int>(std::max(1.0, std::ceil(std::abs(sweep) / (0.5 * kPi) - kRounding)));
    const double half = 0.5 * sweep / count;
    const bool whole = std::abs(sweep) == 2.0 * kPi;
    std::vector<Bezier> pieces;
    Vec2 from = at(ellipse, start);
    for (int i = 0; i < count; ++i) {
        const double middle = start + (2 * i + 1) * half;
        const bool endsAtStart = whole && i + 1 == count;
        const Vec2 to = endsAtStart ? pieces.front().front().p : at(ellipse, middle + half);
        pieces.push_back(
            {{from, 1.0}, {at(ellipse, middle, 1.0 / std::cos(half)), std::cos(half)}, {to, 1.0}});
        from = to;
    }
    return pieces;
}

std::vector<Bezier> ellipseArc(const Element& arc) {
    const Vec2 m = centre(arc);
    const double r = radius(arc);
    const double start = std::atan2(arc.sp.y - m.y, arc.sp.x - m.x);
    std::vector<Bezier> pieces = ellipseArc({m, {r, 0.0}, {0.0, r}}, start, sweep(arc));
    pieces.front().front().p = arc.sp;
    pieces.back().back().p = arc.ep;
    return pieces;
}

}  // namespace gmdrawing
