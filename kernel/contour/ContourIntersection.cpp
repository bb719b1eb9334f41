#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"

// Points are collected aside and handed over at the end: intersecting a contour with itself comes
// back to this list through the elements, and an exception must leave it empty.

namespace {

bool IsFullCircle(GmCurve const& element) {
    return element.IsArc() && static_cast<GmArc const&>(element).IsFullCircle();
}

bool IsEndOf(GmPoint const& p, GmCurve const& element) {
    return p == element.SP() || p == element.EP();
}

// Appends the points of one pair of elements. bAfterA and bAfterB say whether the element before
// `a` and the one before `b` had a point, which then was listed as their end.
void KeepPairPoints(GmCurve const& a, GmCurve const& b, bool bAtEnds, bool bAfterA, bool bAfterB,
                    std::vector<GmPoint>& points) {
    for (GmPoint const& p : a.GetPtSol()) {
        const bool bSkip = bAtEnds ? (bAfterA && p == a.SP()) || (bAfterB && p == b.SP())
                                   : IsEndOf(p, a) || IsEndOf(p, b);
        if (!bSkip) points.push_back(p);
    }
}

// Intersects one element with all of the other contour; returns whether there was any point, listed
// or not.
bool IntersectElement(GmCurve const& a, GmContour const& other, bool bAtEnds, bool bAfterA,
                      std::vector<GmPoint>& points) {
    bool bAfterB = other.IsClosed();
    bool bFound = false;
    for (int i = 0; i < other.ElementCount(); ++i) {
        GmCurve const& b = *other.GetElement(i);
        const int hits = a.Intersection(&b);
        KeepPairPoints(a, b, bAtEnds, bAfterA, bAfterB, points);
        bAfterB = hits > 0;
        bFound = bFound || bAfterB;
    }
    return bFound;
}

}  // namespace

void GmContour::IntersectionWithCurve(GmCurve const* c) const {
    m_ptSol.clear();
    if (!c) return;
    std::vector<GmPoint> points;
    bool bAfterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        GmCurve const& element = *GetElement(i);
        const int hits = element.Intersection(c);
        const bool bSkipStart = bAfterHit && !IsFullCircle(element);
        for (GmPoint const& p : element.GetPtSol()) {
            if (!(bSkipStart && p == element.SP())) points.push_back(p);
        }
        bAfterHit = hits > 0;
    }
    m_ptSol.swap(points);
}

int GmContour::Intersection(GmContour const* other, bool bAtEnds) const {
    m_ptSol.clear();
    if (!other) return 0;
    std::vector<GmPoint> points;
    bool bAfterHit = m_bClosed;
    for (int i = 0; i < ElementCount(); ++i) {
        bAfterHit = IntersectElement(*GetElement(i), *other, bAtEnds, bAfterHit, points);
    }
    m_ptSol.swap(points);
    return static_cast<int>(m_ptSol.size());
}
