// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/SourceSpan.h"

#include <cmath>
#include <limits>

#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// The box of the points that may be nearer to a source element than |d|; everywhere for elements
/// that are neither segments nor arcs.
CurveBox nearbyOf(GmCurve const& element, double d) {
    constexpr double kEverywhere = std::numeric_limits<double>::max();
    if (!isSegmentOrArc(element)) return {-kEverywhere, kEverywhere, -kEverywhere, kEverywhere};
    return reachOf(element).grown(std::fabs(d));
}

}  // namespace

bool SourceSpan::append(GmCurve const& element) {
    if (!isEmpty() && !(element.SP() == m_elements.back()->EP())) return false;
    m_elements.push_back(&element);
    m_quick.emplace_back(element);
    m_nearby.append(nearbyOf(element, m_d));
    return true;
}

}  // namespace gmkernel_detail
