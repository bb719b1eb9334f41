// SPDX-License-Identifier: MIT
/// @file
/// Circle against line.
///
/// With the line as y = k x + d and u the x offset from the centre, the crossings are the roots
/// of A u^2 + B u + C = 0. The roots come from q = -(B + sgn(B) sqrt(D)) / 2 as q / A and C / q,
/// the form without cancellation (Press et al., Numerical Recipes, section 5.6). A line that passes
/// within the length tolerance of the circle touches it: then the foot on the circle in the
/// direction of the line's normal counts, provided that the line really comes that near.
#pragma once

#include <cmath>

#include "gmkernel/GmBase.h"
#include "kernel/curves/kernels/Hits.h"
#include "kernel/curves/kernels/SlopeForm.h"

namespace gmkernel_detail {

/// Is a point on a straight curve, within the length tolerance? `distance` is the curve's own
/// distance of a point, so that a segment is touched only where it is.
template <class Distance>
bool touches(Distance const& distance, Vec3 const& p) {
    return distance(p) < GmBase::m_scdPrec;
}

/// The line x = x0: the upper crossing first.
template <class Distance>
Hits<2> intersectCircleVertical(Vec3 const& m, double r, double x0, Distance const& distance) {
    Hits<2> hits;
    const double dx = std::fabs(x0 - m.x);
    const double s = std::fabs(r * r - dx * dx);
    if (4.0 * s < GmBase::m_scdPrecSqr) {
        const Vec3 touching{x0, m.y, m.z};
        if (touches(distance, touching)) hits.add(touching);
    } else if (r > dx) {
        const double h = std::sqrt(s);
        hits.add({x0, m.y + h, m.z});
        hits.add({x0, m.y - h, m.z});
    }
    return hits;
}

/// The two distinct crossings with y = k x + d, none where they merge or are missing.
Hits<2> crossCircleSlope(Vec3 const& m, double r, double k, double d);

/// The feet of the centre on the circle, above (side +1) and below (-1) a line of slope k.
Vec3 footOnCircle(Vec3 const& m, double r, double k, double side);

/// The crossings of the circle about `m` with the line through `sp` along `dir`: 0, 1 or 2.
/// @param distance callable (Vec3 const&) -> double, the straight curve's distance of a point
template <class Distance>
Hits<2> intersectCircleLine(Vec3 const& m, double r, Vec3 const& sp, Vec3 const& dir,
                            Distance const& distance) {
    const SlopeForm line = slopeForm(sp, dir);
    if (line.parallelToY) return intersectCircleVertical(m, r, line.d, distance);

    Hits<2> hits = crossCircleSlope(m, r, line.k, line.d);
    if (hits.begin() != hits.end()) return hits;

    for (const double side : {1.0, -1.0}) {
        const Vec3 foot = footOnCircle(m, r, line.k, side);
        if (!touches(distance, foot)) continue;
        hits.add(foot);
        break;
    }
    return hits;
}

}  // namespace gmkernel_detail
