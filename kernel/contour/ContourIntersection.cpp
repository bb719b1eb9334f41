// SPDX-License-Identifier: MIT
/// @file
/// Intersections of a contour with a curve and with another contour.
///
/// Every element is intersected by itself. A crossing at a joint is found with both elements and
/// listed with the first: a point at the start of an element is left out when the element before
/// had a point too. That it was the same one is not tested. Points are collected aside and handed
/// over at the end: intersecting a contour with itself comes back to this list through the
/// elements, and an exception must leave it empty.
///
/// Only elements with overlapping boxes are intersected. Against a curve that is one pass over the
/// elements with boxes made on the way; of two contours, one is measured first. Cost: linear in the
/// elements; for two contours elements times the logarithm of their number where few boxes overlap.
#include <cmath>
#include <cstddef>
#include <limits>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "kernel/contour/ElementReach.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

using namespace gmkernel_detail;

bool isFullCircle(GmCurve const& element) {
    auto const* const arc = curveAs<GmArc>(element);
    return arc && arc->IsFullCircle();
}

bool isEndOf(GmPoint const& p, GmCurve const& element) {
    return p == element.SP() || p == element.EP();
}

/// Empties the solution list of an element, as an intersection without points would.
void forgetPoints(GmCurve const& element) {
    element.Intersection(static_cast<GmCurve const*>(nullptr));
}

/// Appends the points of one pair of elements. `afterA` and `afterB` say whether the element before
/// `a` and the one before `b` had a point, which then was listed as their end.
void keepPairPoints(GmCurve const& a, GmCurve const& b, bool atEnds, bool afterA, bool afterB,
                    std::vector<GmPoint>& points) {
    for (GmPoint const& p : a.GetPtSol()) {
        const bool skip = atEnds ? (afterA && p == a.SP()) || (afterB && p == b.SP())
                                 : isEndOf(p, a) || isEndOf(p, b);
        if (!skip) points.push_back(p);
    }
}

/// Intersects one element with those of the other contour that its reach overlaps; returns whether
/// there was any point, listed or not.
bool intersectElement(GmCurve const& a, GmContour const& other, BoxLevels const& reaches,
                      bool atEnds, bool afterA, std::vector<GmPoint>& points) {
    constexpr std::size_t kNone = std::numeric_limits<std::size_t>::max();
    std::size_t next = 0;
    std::size_t afterHit = other.IsClosed() ? 0 : kNone;
    bool found = false;
    reaches.visitUntil(reachOfElement(a), 0, [&](std::size_t i) {
        GmCurve const& b = *other.GetElement(static_cast<int>(i));
        const int hits = a.Intersection(&b);
        keepPairPoints(a, b, atEnds, afterA, i == afterHit, points);
        next = i + 1;
        if (hits > 0) afterHit = next;
        found = found || hits > 0;
        return false;
    });
    if (next < reaches.size()) forgetPoints(a);
    return found;
}

}  // namespace

void GmContour::IntersectionWithCurve(GmCurve const* c) const {
    m_ptSol.clear();
    if (!c) return;
    const CurveBox reach = roughReachOfElement(*c);
    const bool bounded = std::isfinite(reach.left);
    std::vector<GmPoint> points;
    bool afterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        GmCurve const& element = *GetElement(i);
        if (bounded && !reach.overlaps(roughReachOfElement(element))) {
            forgetPoints(element);
            afterHit = false;
            continue;
        }
        const int hits = element.Intersection(c);
        const bool skipStart = afterHit && !isFullCircle(element);
        for (GmPoint const& p : element.GetPtSol()) {
            if (!(skipStart && p == element.SP())) points.push_back(p);
        }
        afterHit = hits > 0;
    }
    m_ptSol.swap(points);
}

int GmContour::Intersection(GmContour const* other, bool bAtEnds) const {
    m_ptSol.clear();
    if (!other) return 0;
    const BoxLevels reaches = reachOfElements(*other);
    std::vector<GmPoint> points;
    bool afterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        afterHit = intersectElement(*GetElement(i), *other, reaches, bAtEnds, afterHit, points);
    }
    m_ptSol.swap(points);
    return static_cast<int>(m_ptSol.size());
}
