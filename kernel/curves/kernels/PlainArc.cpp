// SPDX-License-Identifier: MIT
/// @file
/// The arc in plain numbers.
///
/// Whether a point lies in the sweep is told by the cyclic order of the angles of start, point and
/// end, and not by ranges, so that the seam of the angles at 180 degrees is no special case. The
/// ends are accepted first and by their own tolerance, since the order of angles next to them is a
/// matter of rounding.
#include "kernel/curves/kernels/PlainArc.h"

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmVec.h"
#include "kernel/curves/kernels/AngleOrder.h"
#include "kernel/values/Angles.h"

namespace gmkernel_detail {

double angleOfEnd(PlainArc const& arc, Vec3 const& p) {
    return polarDegrees(standardized(p - arc.m));
}

bool isOn(PlainArc const& arc, Vec3 const& p, double eps) {
    if (isSamePoint(p, arc.sp) || isSamePoint(p, arc.ep)) return true;
    const bool full = isSamePoint(arc.sp, arc.ep);
    if (!full &&
        angleOrder(arc.startDegrees, polarDegrees(p - arc.m), arc.endDegrees) != arc.sense) {
        return false;
    }
    return std::fabs(distance(arc.m, p) - arc.r) < eps;
}

double lengthUpTo(PlainArc const& arc, double degrees) {
    const Vec3 start = directionAt(arc.startDegrees);
    const Vec3 upTo = directionAt(degrees);
    return std::fabs(radiansOf(degreesBetween(start, upTo, arc.sense))) * arc.r;
}

double lengthUpTo(PlainArc const& arc, Vec3 const& p) {
    return isSamePoint(p, arc.sp) ? 0.0 : lengthUpTo(arc, angleOfEnd(arc, p));
}

double sweepOf(PlainArc const& arc) {
    const Vec3 start = directionAt(arc.startDegrees);
    const Vec3 end = directionAt(arc.endDegrees);
    return std::fabs(radiansOf(degreesBetween(start, end, arc.sense)));
}

bool isFullCircle(PlainArc const& arc) {
    const double dx = arc.ep.x - arc.sp.x;
    const double dy = arc.ep.y - arc.sp.y;
    return std::sqrt(dx * dx + dy * dy) < GmBase::m_scdPrecCalc;
}

double lengthOf(PlainArc const& arc) {
    return arc.r * (isFullCircle(arc) ? 2.0 * kPi : sweepOf(arc));
}

Vec3 pointAfter(PlainArc const& arc, double radians) {
    const Vec3 radius = arc.r * directionAt(arc.startDegrees);
    const GmVec turned = GmVec(radius.x, radius.y, radius.z).Rotated(GmAngle(radians, true));
    return arc.m + plain(turned);
}

Vec3 halvingPointOf(PlainArc const& arc) {
    const double half = sweepOf(arc) / 2;
    return pointAfter(arc, arc.sense == GmBase::eRotCW ? -half : half);
}

void moveStart(PlainArc& arc, Vec3 const& p) {
    arc.sp = p;
    arc.startDegrees = angleOfEnd(arc, p);
}

void moveEnd(PlainArc& arc, Vec3 const& p) {
    arc.ep = p;
    arc.endDegrees = angleOfEnd(arc, p);
}

}  // namespace gmkernel_detail
