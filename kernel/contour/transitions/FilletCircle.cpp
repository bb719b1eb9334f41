// SPDX-License-Identifier: MIT
/// @file
/// Which constructor of a circle rounds which pair of segments and arcs.
///
/// All constructors choose the circle by the way in which a path turns at the corner. Two segments
/// are lines to their constructor, which wants both directions to leave the corner: the first is
/// reversed.
#include "kernel/contour/transitions/FilletCircle.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

GmCircle filletAfter(GmStretch const& first, GmCurve const& second, double r) {
    if (auto const* stretch = curveAs<GmStretch>(second))
        return GmCircle(first.Inverted(), *stretch, r);
    if (auto const* arc = curveAs<GmArc>(second)) return GmCircle(*arc, first, r, false, false);
    return GmCircle();
}

GmCircle filletAfter(GmArc const& first, GmCurve const& second, double r) {
    if (auto const* stretch = curveAs<GmStretch>(second))
        return GmCircle(first, *stretch, r, true, false);
    if (auto const* arc = curveAs<GmArc>(second)) return GmCircle(first, *arc, r, false);
    return GmCircle();
}

}  // namespace

GmCircle filletCircle(GmCurve const& first, GmCurve const& second, double r) {
    if (auto const* stretch = curveAs<GmStretch>(first)) return filletAfter(*stretch, second, r);
    if (auto const* arc = curveAs<GmArc>(first)) return filletAfter(*arc, second, r);
    return GmCircle();
}

}  // namespace gmkernel_detail
