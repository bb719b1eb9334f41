// SPDX-License-Identifier: MIT
/// @file
/// Searches among the joints of a contour.
///
/// Each is one pass in which a later joint has to be clearly better than the best so far. "Clearly"
/// means by a fixed number, which acts on distances in some searches and on squared distances in
/// others, so that there it is wide near to the point and narrow far from it. With it the order of
/// the elements has a say among nearly equal joints.
#include <cmath>

#include "gmkernel/GmContour.h"
#include "kernel/contour/ContourElements.h"

using gmkernel_detail::chainStart;

namespace {

/// Two starts are equally near within this number: of distances in the search by one point, of
/// squared distances in the search with a second point.
constexpr double kTie = 1e-4;

/// Index of the element whose start is nearest, -1 without elements.
int nearestStart(GmContour const& contour, GmPoint const& p) {
    int nearest = -1;
    double best = -1.0;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const double dist = contour.GetElement(i)->SP().Dist(p);
        if (!(best < 0.0) && !(best - dist > kTie)) continue;
        best = dist;
        nearest = i;
    }
    return nearest;
}

}  // namespace

GmPoint GmContour::NearPoint(GmPoint const& p) {
    const int nearest = nearestStart(*this, p);
    return nearest < 0 ? GmPoint() : GetElement(nearest)->SP();
}

int GmContour::NearPointElem(GmPoint const& p) {
    return nearestStart(*this, p);
}

int GmContour::NearPointElem(GmPoint const& p, GmPoint const& q) {
    int nearest = -1;
    double best = -1.0;
    double nearestToQ = 0.0;
    for (int i = 0; i < ElementCount(); ++i) {
        const GmPoint start = GetElement(i)->SP();
        const double dist = start.Dist2(p);
        const double startToQ = start.Dist2(q);
        const bool nearer = best - dist > kTie || best < 0.0;
        const bool tieTaken = std::fabs(best - dist) < kTie && !(nearestToQ - startToQ >= kTie);
        if (nearer) best = dist;
        if (!nearer && !tieTaken) continue;
        nearestToQ = startToQ;
        nearest = i;
    }
    return nearest;
}

GmPoint GmContour::FarPoint(GmPoint const& p) {
    if (ElementCount() == 0) return GmPoint();
    GmPoint farthest = chainStart(*this);
    double best = farthest.Dist(p);
    for (int i = 0; i < ElementCount(); ++i) {
        const GmPoint end = GetElement(i)->EP();
        const double dist = end.Dist(p);
        if (!(dist - best > kTie)) continue;
        best = dist;
        farthest = end;
    }
    return farthest;
}

int GmContour::LastPointElem(GmPoint const& p) const {
    int i = static_cast<int>(ElementCount()) - 1;
    while (i >= 0 && !GetElement(i)->Element(p))
        --i;
    return i;
}
