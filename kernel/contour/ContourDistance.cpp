// SPDX-License-Identifier: MIT
/// @file
/// Distances from a contour and nearest points on it.
///
/// The nearest point of a chain is the nearest of its elements' own: every element is asked, and
/// the first of equally near ones stays. With a second point to break ties, distances that agree
/// within a tolerance count as equal; as such a comparison is not transitive, the order of the
/// elements has a say. Crossings are not looked for. Cost: linear in the elements, elements times
/// elements for two contours.
#include <algorithm>
#include <cmath>
#include <limits>

#include "gmkernel/GmContour.h"
#include "kernel/curves/VerifiedCast.h"

namespace {

/// The distance from a contour without elements, in length units.
constexpr double kNoElementDist = 1e30;

/// Two distances from the first point count as equal, and two squared distances from the second as
/// different, by this number; it is fixed apart from the library's length tolerance.
constexpr double kTie = 1e-4;

double largest() {
    return std::numeric_limits<double>::max();
}

/// The best pair so far of a nearest-approach search.
struct Approach {
    double dist = largest();
    GmPoint point;

    void offer(double candidateDist, GmPoint const& candidate) {
        if (!(candidateDist < dist)) return;
        dist = candidateDist;
        point = candidate;
    }
};

/// Offers the pairs of the contour's elements with one curve.
void approachCurve(GmContour const& contour, GmCurve const* c, Approach& best) {
    for (int i = 0; i < contour.ElementCount(); ++i) {
        double dist = largest();
        const GmPoint candidate = contour.GetElement(i)->MinDist(dist, c, false);
        best.offer(dist, candidate);
    }
}

}  // namespace

double GmContour::Dist(GmPoint const& p) const {
    if (ElementCount() == 0) return kNoElementDist;
    double nearest = std::numeric_limits<double>::infinity();
    for (int i = 0; i < ElementCount(); ++i) {
        nearest = std::min(nearest, GetElement(i)->Dist(p));
    }
    return nearest;
}

GmPoint GmContour::MinDist(double& d, GmPoint const& p, bool bPreferSP) const {
    Approach best;
    for (int i = 0; i < ElementCount(); ++i) {
        double dist = largest();
        const GmPoint candidate = GetElement(i)->MinDist(dist, p, bPreferSP);
        best.offer(dist, candidate);
    }
    d = best.dist;
    return best.point;
}

GmPoint GmContour::MinDist(double& d, GmCurve const* c, bool) const {
    Approach best;
    GmContour const* const other =
        c && c->IsContour() ? gmkernel_detail::verifiedCast<GmContour>(*c) : nullptr;
    if (other) {
        for (int i = 0; i < other->ElementCount(); ++i) {
            approachCurve(*this, other->GetElement(i), best);
        }
    } else if (c) {
        approachCurve(*this, c, best);
    }
    d = best.dist;
    return best.point;
}

GmPoint GmContour::MinDist(double& d, GmPoint const& p, GmPoint const& q, bool) {
    d = -1.0;
    GmPoint nearest;
    double nearestToQ = largest();
    for (int i = 0; i < ElementCount(); ++i) {
        double dist = largest();
        const GmPoint candidate = GetElement(i)->MinDist(dist, p, true);
        const double candidateToQ = candidate.Dist2(q);
        const bool nearer = d < 0.0 || d - dist > kTie;
        const bool tieWon = std::fabs(d - dist) < kTie && nearestToQ - candidateToQ > kTie;
        if (nearer) d = dist;
        if (!nearer && !tieWon) continue;
        nearest = candidate;
        nearestToQ = candidateToQ;
    }
    return nearest;
}

GmPoint GmContour::MinDist(GmPoint const&, bool) const {
    return GmPoint();
}

GmPoint GmContour::NP(GmPoint const&) const {
    return GmPoint();
}
