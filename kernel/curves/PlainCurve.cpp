// SPDX-License-Identifier: MIT
#include "kernel/curves/PlainCurve.h"

#include "kernel/curves/VerifiedCast.h"
#include "kernel/curves/kernels/CircleCircle.h"
#include "kernel/curves/kernels/CircleLine.h"
#include "kernel/curves/kernels/LineLine.h"

namespace gmkernel_detail {

namespace {

Hits<2> supportHits(PlainSegment const& a, PlainSegment const& b) {
    Hits<2> hits;
    for (Vec3 const& p : intersectLineLine(a.sp, a.dir, b.sp, b.dir))
        hits.add(p);
    return hits;
}
Hits<2> supportHits(PlainArc const& a, PlainSegment const& b) {
    return intersectCircleLine(a.m, a.r, b.sp, b.dir,
                               [&](Vec3 const& p) { return distanceTo(b, p); });
}
Hits<2> supportHits(PlainArc const& a, PlainArc const& b) {
    return intersectCircleCircle(a.m, a.r, b.m, b.r);
}
/// The round curve comes first.
Hits<2> supportHits(PlainSegment const& a, PlainArc const& b) {
    return supportHits(b, a);
}

}  // namespace

PlainSegment plainOf(GmStretch const& stretch) {
    return {plain(stretch.GmLine::SP()), plain(stretch.GmStretch::EP()), plain(stretch.Dir())};
}

PlainArc plainOf(GmArc const& arc) {
    return {plain(arc.M()), arc.R(),  plain(arc.GmArc::SP()), plain(arc.GmArc::EP()), arc.SAngDeg(),
            arc.EAngDeg(),  arc.Dir()};
}

std::optional<PlainCurve> plainCurveOf(GmCurve const& curve) {
    if (auto const* stretch = curveAs<GmStretch>(curve)) return plainOf(*stretch);
    if (auto const* arc = curveAs<GmArc>(curve)) return plainOf(*arc);
    return std::nullopt;
}

Hits<2> supportHits(PlainCurve const& a, PlainCurve const& b) {
    return std::visit(
        [](auto const& first, auto const& second) { return supportHits(first, second); }, a, b);
}

bool isOn(PlainCurve const& curve, Vec3 const& p) {
    if (auto const* arc = std::get_if<PlainArc>(&curve)) return isOn(*arc, p, kArcElementPrec);
    return isOn(std::get<PlainSegment>(curve), p, GmBase::m_scdPrec);
}

double distanceFromStart(PlainCurve const& curve, Vec3 const& p) {
    if (auto const* arc = std::get_if<PlainArc>(&curve)) return lengthUpTo(*arc, p);
    return distance(startOf(curve), p);
}

Vec3 halvingPointOf(PlainCurve const& curve) {
    if (auto const* arc = std::get_if<PlainArc>(&curve)) return halvingPointOf(*arc);
    return (startOf(curve) + endOf(curve)) / 2.0;
}

double lengthOf(PlainCurve const& curve) {
    if (auto const* arc = std::get_if<PlainArc>(&curve)) return lengthOf(*arc);
    return distance(startOf(curve), endOf(curve));
}

void moveStart(PlainCurve& curve, Vec3 const& p) {
    std::visit([&](auto& c) { moveStart(c, p); }, curve);
}

void moveEnd(PlainCurve& curve, Vec3 const& p) {
    std::visit([&](auto& c) { moveEnd(c, p); }, curve);
}

}  // namespace gmkernel_detail
