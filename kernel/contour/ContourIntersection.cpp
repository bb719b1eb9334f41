// SPDX-License-Identifier: MIT
/// @file
/// Intersections of a contour with a curve and with another contour.
///
/// Every element is intersected by itself. A crossing at a joint is found with both elements and
/// listed with the first: a point at the start of an element is left out when the element before
/// had a point too. That it was the same one is not tested. Points are collected aside and handed
/// over at the end: intersecting a contour with itself comes back to this list through the
/// elements, and an exception must leave it empty. Cost: linear in the elements, elements times
/// elements for two contours.
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

bool isFullCircle(GmCurve const& element) {
    auto const* const arc = gmkernel_detail::curveAs<GmArc>(element);
    return arc && arc->IsFullCircle();
}

bool isEndOf(GmPoint const& p, GmCurve const& element) {
    return p == element.SP() || p == element.EP();
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

/// Intersects one element with all of the other contour; returns whether there was any point,
/// listed or not.
bool intersectElement(GmCurve const& a, GmContour const& other, bool atEnds, bool afterA,
                      std::vector<GmPoint>& points) {
    bool afterB = other.IsClosed();
    bool found = false;
    for (int i = 0; i < other.ElementCount(); ++i) {
        GmCurve const& b = *other.GetElement(i);
        const int hits = a.Intersection(&b);
        keepPairPoints(a, b, atEnds, afterA, afterB, points);
        afterB = hits > 0;
        found = found || afterB;
    }
    return found;
}

}  // namespace

void GmContour::IntersectionWithCurve(GmCurve const* c) const {
    m_ptSol.clear();
    if (!c) return;
    std::vector<GmPoint> points;
    bool afterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        GmCurve const& element = *GetElement(i);
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
    std::vector<GmPoint> points;
    bool afterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        afterHit = intersectElement(*GetElement(i), *other, bAtEnds, afterHit, points);
    }
    m_ptSol.swap(points);
    return static_cast<int>(m_ptSol.size());
}
