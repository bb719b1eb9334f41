#include <algorithm>
#include <cmath>
#include <limits>

#include "gmkernel/GmContour.h"

namespace {

constexpr double kNoElementDist = 1e30;  // length units: the distance from nothing

// Two distances from the first point count as equal, and two squared distances from the second as
// different, by this number; it is fixed apart from the library's length tolerance.
constexpr double kTie = 1e-4;

double Largest() {
    return std::numeric_limits<double>::max();
}

// Best pair so far of a nearest-approach search.
struct Approach {
    double dist = Largest();
    GmPoint point;

    void Offer(double candidateDist, GmPoint const& candidate) {
        if (!(candidateDist < dist)) return;
        dist = candidateDist;
        point = candidate;
    }
};

void ApproachCurve(GmContour const& contour, GmCurve const* c, Approach& best) {
    for (int i = 0; i < contour.ElementCount(); ++i) {
        double dist = Largest();
        const GmPoint candidate = contour.GetElement(i)->MinDist(dist, c, false);
        best.Offer(dist, candidate);
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
        double dist = Largest();
        const GmPoint candidate = GetElement(i)->MinDist(dist, p, bPreferSP);
        best.Offer(dist, candidate);
    }
    d = best.dist;
    return best.point;
}

GmPoint GmContour::MinDist(double& d, GmCurve const* c, bool) const {
    Approach best;
    if (c && c->IsContour()) {
        GmContour const& other = static_cast<GmContour const&>(*c);
        for (int i = 0; i < other.ElementCount(); ++i) {
            ApproachCurve(*this, other.GetElement(i), best);
        }
    } else if (c) {
        ApproachCurve(*this, c, best);
    }
    d = best.dist;
    return best.point;
}

GmPoint GmContour::MinDist(double& d, GmPoint const& p, GmPoint const& q, bool) {
    d = -1.0;
    GmPoint nearest;
    double nearestToQ = Largest();
    for (int i = 0; i < ElementCount(); ++i) {
        double dist = Largest();
        const GmPoint candidate = GetElement(i)->MinDist(dist, p, true);
        const double candidateToQ = candidate.Dist2(q);
        const bool bNearer = d < 0.0 || d - dist > kTie;
        const bool bTieWon = std::fabs(d - dist) < kTie && nearestToQ - candidateToQ > kTie;
        if (bNearer) d = dist;
        if (!bNearer && !bTieWon) continue;
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
