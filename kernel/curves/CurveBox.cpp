// SPDX-License-Identifier: MIT
/// @file
/// The box of all points that can come out of an intersection with a curve.
///
/// Points of an intersection are kept where membership tests accept them, and these accept points
/// beside the curve. So the box is that of the curve, the stored angles and ends of an arc
/// included, which may differ a little, and is grown by more than any such tolerance. It is never
/// too small for segments and arcs; it may be larger than needed. Endless curves have no such box.
#include "kernel/curves/CurveBox.h"

#include "gmkernel/GmRect.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Twice the membership tolerance of arcs, in length units.
constexpr double kReachMargin = 0.02;

/// Does the arc's membership test accept points all around the circle? Arcs whose ends are equal
/// within the point tolerance count as full circles there, whatever their sweep.
bool reachesAround(PlainArc const& arc) {
    const bool hasSense = arc.sense == GmBase::eRotCW || arc.sense == GmBase::eRotCCW;
    return !hasSense || isSamePoint(arc.sp, arc.ep);
}

CurveBox circleBox(PlainArc const& arc) {
    return {arc.m.x - arc.r, arc.m.x + arc.r, arc.m.y - arc.r, arc.m.y + arc.r};
}

/// The point of the circle in the direction of a stored angle. Angles next to an axis are stored as
/// the axis, so that on large circles this point differs from the end point.
PlanePoint onCircle(PlainArc const& arc, PlanePoint direction) {
    return {arc.m.x + arc.r * direction.x, arc.m.y + arc.r * direction.y};
}

}  // namespace

CurveBox reachOf(GmCurve const& curve) {
    if (auto const* stretch = curveAs<GmStretch>(curve)) return reachOf(plainOf(*stretch));
    if (auto const* arc = curveAs<GmArc>(curve)) {
        const PlainArc numbers = plainOf(*arc);
        return reachOf(numbers, QuickSweep(numbers));
    }
    const GmRect box = curve.BoundingRect();
    return CurveBox{box.Left(), box.Right(), box.Bottom(), box.Top()}.grown(kReachMargin);
}

CurveBox reachOf(PlainSegment const& segment) {
    CurveBox box = CurveBox::empty();
    box.include(planePoint(segment.sp));
    box.include(planePoint(segment.ep));
    return box.grown(kReachMargin);
}

CurveBox reachOf(PlainArc const& arc, QuickSweep const& sweep) {
    CurveBox box = boundsOf(arc);
    if (reachesAround(arc)) box.include(circleBox(arc));
    box.include(onCircle(arc, sweep.start()));
    box.include(onCircle(arc, sweep.end()));
    return box.grown(kReachMargin);
}

}  // namespace gmkernel_detail
