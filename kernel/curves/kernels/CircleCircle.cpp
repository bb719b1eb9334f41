// SPDX-License-Identifier: MIT
/// @file
/// Circle against circle.
///
/// Pythagoras in the triangles of both radii over the line of centres gives the foot of the common
/// chord and half its length. Circles a little apart or inside each other, by up to the calculation
/// tolerance, still count as touching, and a half chord below the length tolerance gives one point.
/// Near contact the root makes errors large: a gap of 1e-9 moves the points by far more. Constant
/// cost.
#include "kernel/curves/kernels/CircleCircle.h"

#include <cmath>

#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

namespace {

bool apartOrNested(double dist, double r0, double r1) {
    return dist > r0 + r1 + GmBase::m_scdPrecCalc ||
           dist < std::fabs(r0 - r1) - GmBase::m_scdPrecCalc || dist < GmBase::m_scdPrec;
}

}  // namespace

Hits<2> intersectCircleCircle(Vec3 const& m0, double r0, Vec3 const& m1, double r1) {
    Hits<2> hits;
    const double dx = m1.x - m0.x;
    const double dy = m1.y - m0.y;
    const double dist = std::sqrt(dx * dx + dy * dy);
    if (apartOrNested(dist, r0, r1)) return hits;

    const double a = (r0 * r0 - r1 * r1 + dist * dist) / (2.0 * dist);
    const double footX = m0.x + a * dx / dist;
    const double footY = m0.y + a * dy / dist;
    const double h2 = r0 * r0 - a * a;
    const double h = h2 >= 0.0 ? std::sqrt(h2) : 0.0;
    if (h < GmBase::m_scdPrec) {
        hits.add({footX, footY, m0.z});
        return hits;
    }
    hits.add({footX + h * dy / dist, footY - h * dx / dist, m0.z});
    hits.add({footX - h * dy / dist, footY + h * dx / dist, m0.z});
    return hits;
}

}  // namespace gmkernel_detail
