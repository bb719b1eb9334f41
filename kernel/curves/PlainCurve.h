// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <variant>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/kernels/Hits.h"
#include "kernel/curves/kernels/PlainArc.h"
#include "kernel/curves/kernels/PlainSegment.h"

namespace gmkernel_detail {

/// A segment or an arc in plain numbers, for work on many of them; the curve classes answer by the
/// same functions.
using PlainCurve = std::variant<PlainSegment, PlainArc>;

PlainSegment plainOf(GmStretch const& stretch);
PlainArc plainOf(GmArc const& arc);
/// Nothing for a curve that is neither a stretch nor an arc.
std::optional<PlainCurve> plainCurveOf(GmCurve const& curve);

inline Vec3 const& startOf(PlainCurve const& curve) {
    return std::visit([](auto const& c) -> Vec3 const& { return c.sp; }, curve);
}
inline Vec3 const& endOf(PlainCurve const& curve) {
    return std::visit([](auto const& c) -> Vec3 const& { return c.ep; }, curve);
}

/// The points of the supporting lines and circles, of which those that lie on both curves are what
/// `Intersection` answers, in the same order.
Hits<2> supportHits(PlainCurve const& a, PlainCurve const& b);

bool isOn(PlainCurve const& curve, Vec3 const& p);

/// GmCurve::DistSP of a point.
double distanceFromStart(PlainCurve const& curve, Vec3 const& p);
/// The halving point, HP of the curve.
Vec3 halvingPointOf(PlainCurve const& curve);
double lengthOf(PlainCurve const& curve);
void moveStart(PlainCurve& curve, Vec3 const& p);
void moveEnd(PlainCurve& curve, Vec3 const& p);

}  // namespace gmkernel_detail
