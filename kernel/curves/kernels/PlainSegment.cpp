// SPDX-License-Identifier: MIT
/// @file
/// The segment in plain numbers.
///
/// A point lies on the segment when its foot on the supporting line does, and when it is near to
/// the foot. The coordinate in which the segment is longer gives the parameter along it, which
/// avoids the division by the smaller extent. The range of the parameter is taken exactly, and the
/// ends by the tolerance of points, so that the tolerance does not depend on the length. Where a
/// foot lies beyond the ends the nearer end is the nearest point, as distance along a line grows
/// away from the foot.
#include "kernel/curves/kernels/PlainSegment.h"

#include <cmath>

namespace gmkernel_detail {

namespace {

void followEnds(PlainSegment& segment) {
    if (!isSamePoint(segment.sp, segment.ep)) segment.dir = standardized(segment.ep - segment.sp);
}

}  // namespace

Vec3 footOn(PlainSegment const& segment, Vec3 const& p) {
    return segment.sp + dot(p - segment.sp, segment.dir) * segment.dir;
}

bool isBetweenEnds(PlainSegment const& segment, Vec3 const& q) {
    // A segment without extent along its dominant axis gives a parameter that is no number or
    // infinite; both fail the range and leave the decision to the ends.
    Vec3 const& sp = segment.sp;
    Vec3 const& ep = segment.ep;
    const bool alongX = std::fabs(segment.dir.y) < std::fabs(segment.dir.x);
    const double t = alongX ? (q.x - sp.x) / (ep.x - sp.x) : (q.y - sp.y) / (ep.y - sp.y);
    return (t >= 0.0 && t <= 1.0) || isSamePoint(q, sp) || isSamePoint(q, ep);
}

bool isOn(PlainSegment const& segment, Vec3 const& p, double eps) {
    const Vec3 foot = footOn(segment, p);
    return isBetweenEnds(segment, foot) && distance(foot, p) < eps;
}

double distanceTo(PlainSegment const& segment, Vec3 const& p) {
    const Vec3 foot = footOn(segment, p);
    if (isOn(segment, foot, GmBase::m_scdPrec)) return distance(p, foot);
    const bool endIsNearer = squaredDistance(segment.ep, p) <= squaredDistance(segment.sp, p);
    return distance(p, endIsNearer ? segment.ep : segment.sp);
}

void moveStart(PlainSegment& segment, Vec3 const& p) {
    segment.sp = p;
    followEnds(segment);
}

void moveEnd(PlainSegment& segment, Vec3 const& p) {
    segment.ep = p;
    followEnds(segment);
}

}  // namespace gmkernel_detail
