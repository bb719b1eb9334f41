// SPDX-License-Identifier: MIT
/// @file
/// Rounding the corners of a contour.
///
/// The circle that touches both elements at a corner gives the arc between its two contacts, and
/// the elements are cut back to them. Only a circle with exactly one contact on each element is
/// taken, so that the contacts lie on the elements themselves. New arcs are passed over, so that
/// what was rounded is not rounded again. Cost: linear in the elements, and for each arc the
/// elements that move in the list.
#include <memory>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/transitions/FilletCircle.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/values/HandedOver.h"

namespace {

GmCircle circleInCorner(GmCurve const& prev, GmCurve const& cur, double radius) {
    auto const* const first = gmkernel_detail::curveAs<GmStretch>(prev);
    auto const* const second = gmkernel_detail::curveAs<GmStretch>(cur);
    if (!first || !second) return gmkernel_detail::filletCircle(prev, cur, radius);
    // Reversed as a line: height and rounding of the corner come from the start of `prev`.
    return GmCircle(first->GmLine::Inverted(), *second, radius);
}

/// The arc that rounds a corner and the points where it meets the elements.
struct Fillet {
    std::unique_ptr<GmArc> arc;  ///< null where no circle touches each element in exactly one point
    GmPoint start;
    GmPoint end;
};

Fillet filletBetween(GmCurve const& prev, GmCurve const& cur, double radius) {
    const GmCircle circle = circleInCorner(prev, cur, radius);
    if (!circle.CreationOK() || circle.Intersection(&prev) != 1) return {};
    const GmPoint start = circle.GetSolution(0);
    if (circle.Intersection(&cur) != 1) return {};
    const GmPoint end = circle.GetSolution(0);
    if (start == end) return {};
    return {std::make_unique<GmArc>(circle, start, end, true), start, end};
}

/// Does the mode ask for a corner that turns in the given sense?
bool isWanted(int nMode, bool turnsWithContour) {
    return turnsWithContour ? nMode <= 0 : nMode >= 0;
}

}  // namespace

void GmContour::RoundCorners(double dRadius, int nMode) {
    if (ElementCount() == 0) return;
    const eRotDir sense = Dir(GmPoint(0.0, 0.0, 0.0));
    int corners = static_cast<int>(ElementCount()) - (m_bClosed ? 0 : 1);
    for (int j = 1; j <= corners; ++j) {
        GmCurve& prev = *GetElement(j - 1);
        GmCurve& cur = *GetElement(j < ElementCount() ? j : 0);
        Fillet fillet = filletBetween(prev, cur, dRadius);
        if (!fillet.arc || (m_bClosed && !isWanted(nMode, fillet.arc->Dir() == sense))) continue;
        prev.SetEP(fillet.start);
        cur.SetSP(fillet.end);
        std::unique_ptr<GmContElement> record(CreateContElement(fillet.arc.get(), j, j, true));
        m_pElements->InsertAt(j, record.get());
        gmkernel_detail::handedOver(record);
        gmkernel_detail::handedOver(fillet.arc);
        ++j;
        ++corners;
    }
}
