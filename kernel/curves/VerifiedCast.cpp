// SPDX-License-Identifier: MIT
#include "kernel/curves/VerifiedCast.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

GmLine const* straightPart(GmCurve const& curve) {
    if (auto const* stretch = curveAs<GmStretch>(curve)) return stretch;
    if (auto const* beam = curveAs<GmBeam>(curve)) return beam;
    const bool straight = curve.IsLine() || curve.IsBeam() || curve.IsStretch();
    return straight ? verifiedCast<GmLine>(curve) : nullptr;
}

GmCircle const* roundPart(GmCurve const& curve) {
    if (auto const* arc = curveAs<GmArc>(curve)) return arc;
    return curve.IsCircle() || curve.IsArc() ? verifiedCast<GmCircle>(curve) : nullptr;
}

bool isSegmentOrArc(GmCurve const& curve) {
    return curveAs<GmStretch>(curve) != nullptr || curveAs<GmArc>(curve) != nullptr;
}

}  // namespace gmkernel_detail
