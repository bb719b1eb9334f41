// SPDX-License-Identifier: MIT
/// @file
/// Does a point of a line lie between two ends?
///
/// The coordinate in which the segment is longer gives the parameter along it, which avoids the
/// division by the smaller extent. The range of the parameter is taken exactly, and the ends by the
/// tolerance of points, so that the tolerance does not depend on the length. The distance of the
/// point from the line is not tested.
#include "kernel/curves/kernels/OnSegment.h"

#include <cmath>

namespace gmkernel_detail {

bool onSegment(GmPoint const& q, GmPoint const& sp, GmPoint const& ep, GmDir const& dir) {
    // A segment without extent along its dominant axis gives a parameter that is no number or
    // infinite; both fail the range and leave the decision to the ends.
    const bool alongX = std::fabs(dir.Y()) < std::fabs(dir.X());
    const double t =
        alongX ? (q.X() - sp.X()) / (ep.X() - sp.X()) : (q.Y() - sp.Y()) / (ep.Y() - sp.Y());
    return (t >= 0.0 && t <= 1.0) || q == sp || q == ep;
}

}  // namespace gmkernel_detail
