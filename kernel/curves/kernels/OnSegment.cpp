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
