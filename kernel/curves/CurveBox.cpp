// SPDX-License-Identifier: MIT
/// @file
/// The box of all points that can come out of an intersection with a curve.
///
/// Points of an intersection are kept where membership tests accept them, and these accept points
/// beside the curve. So the box is that of the curve, the stored angles and ends of an arc
/// included, which may differ a little, and is grown by more than any such tolerance. It is never
/// too small for segments and arcs; it may be larger than needed. Endless curves have no such box.
#include "kernel/curves/CurveBox.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Twice the membership tolerance of arcs, in length units.
constexpr double kReachMargin = 0.02;

/// Does the arc's membership test accept points all around the circle? Arcs whose ends are equal
/// within the point tolerance count as full circles there, whatever their sweep.
bool reachesAround(GmArc const& arc) {
    const bool hasSense = arc.Dir() == GmBase::eRotCW || arc.Dir() == GmBase::eRotCCW;
    return !hasSense || arc.SP() == arc.EP();
}

/// The point of the circle at a stored angle. Angles next to an axis are stored as the axis, so
/// that on large circles this point differs from the end point.
GmPoint atAngle(GmArc const& arc, double degrees) {
    return GmPoint(arc.M() + arc.R() * GmVec(GmDir(GmAngle(degrees, false))));
}

GmRect arcReach(GmArc const& arc) {
    GmRect box = arc.BoundingRect();
    if (reachesAround(arc)) box = box.Or(arc.GmCircle::BoundingRect());
    box.Include(atAngle(arc, arc.SAngDeg()));
    box.Include(atAngle(arc, arc.EAngDeg()));
    return box;
}

}  // namespace

CurveBox boxOf(GmPoint const& p) {
    return {p.X(), p.X(), p.Y(), p.Y()};
}

CurveBox reachOf(GmCurve const& curve) {
    auto const* const arc = curveAs<GmArc>(curve);
    const GmRect box = arc != nullptr ? arcReach(*arc) : curve.BoundingRect();
    return {box.Left() - kReachMargin, box.Right() + kReachMargin, box.Bottom() - kReachMargin,
            box.Top() + kReachMargin};
}

}  // namespace gmkernel_detail
