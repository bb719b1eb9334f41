// SPDX-License-Identifier: MIT
#include "kernel/contour/ContourElements.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

GmPoint middleOf(GmCurve const* element) {
    if (element == nullptr) return GmPoint();
    if (auto const* stretch = curveAs<GmStretch>(*element)) return stretch->HP();
    auto const* const arc = curveAs<GmArc>(*element);
    return arc != nullptr ? arc->HP() : GmPoint();
}

GmPoint chainStart(GmContour const& contour) {
    return contour.GetElement(0)->SP();
}

GmPoint chainEnd(GmContour const& contour) {
    return contour.GetElement(static_cast<int>(contour.ElementCount()) - 1)->EP();
}

}  // namespace gmkernel_detail
