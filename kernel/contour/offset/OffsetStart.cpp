// SPDX-License-Identifier: MIT
/// @file
/// Where a path along the offsets of a contour starts.
///
/// An offset begins where the source begins, so the element with the smallest identifier is looked
/// for, and of several the one whose start is nearest to the start of the source moved sideways by
/// the distance. The only open offset of an open contour is taken without such a comparison: there
/// the first of the smallest identifier is the beginning. Linear in the elements of all offsets.
#include <cmath>
#include <limits>

#include "gmkernel/GmContour.h"
#include "kernel/contour/ContourElements.h"

namespace {

constexpr long kNoIdentifier = std::numeric_limits<int>::max();
constexpr double kFarthestStart = 1e11;

/// The element found so far.
struct Search {
    long smallestId = kNoIdentifier;
    double dist = std::numeric_limits<double>::max();
};

/// The start of the contour moved sideways by the distance of the offset.
GmPoint startBeside(GmContour const& contour, double d) {
    GmCurve const& first = *contour.GetElement(0);
    const GmDir aside = first.TangSP().Normalized(d > 0.0 ? GmBase::eRotCW : GmBase::eRotCCW);
    return GmPoint(first.SP() + std::fabs(d) * GmVec(aside));
}

/// The index of the only open sub-contour; -1 when there is none or more than one.
int onlyOpenSubContour(GmContour const& contour, int count) {
    int open = -1;
    for (int i = 0; i < count; ++i) {
        if (contour.GetSubContour(i)->IsClosed()) continue;
        if (open >= 0) return -1;
        open = i;
    }
    return open;
}

/// The first element of the smallest identifier.
void searchOpen(GmContour const& path, GmPoint const& start, Search& found, int& elem) {
    for (int i = 0; i < path.ElementCount(); ++i) {
        if (path.GetContElement(i)->lId >= found.smallestId) continue;
        found = {path.GetContElement(i)->lId, path.GetElement(i)->SP().Dist(start)};
        elem = i;
    }
}

long smallestIdentifier(GmContour const& contour, int count) {
    long smallest = kNoIdentifier;
    for (int i = 0; i < count; ++i) {
        GmContour const& path = *contour.GetSubContour(i);
        for (int j = 0; j < path.ElementCount(); ++j) {
            if (path.GetContElement(j)->lId < smallest) smallest = path.GetContElement(j)->lId;
        }
    }
    return smallest;
}

/// Of the elements with the smallest identifier the one whose start is nearest.
void searchAll(GmContour const& contour, int count, GmPoint const& start, Search& found, int& sub,
               int& elem) {
    found.smallestId = smallestIdentifier(contour, count);
    for (int i = 0; i < count; ++i) {
        GmContour const& path = *contour.GetSubContour(i);
        for (int j = 0; j < path.ElementCount(); ++j) {
            if (path.GetContElement(j)->lId != found.smallestId) continue;
            const double dist = path.GetElement(j)->SP().Dist(start);
            if (!(dist < found.dist)) continue;
            found.dist = dist;
            sub = i;
            elem = j;
        }
    }
}

int existingSubContours(GmContour const& contour, int count) {
    int existing = 0;
    while (existing < count && contour.GetSubContour(existing))
        ++existing;
    return existing;
}

}  // namespace

bool FindTPCCont(GmContour const* c, int count, double d, int& sub, int& elem) {
    sub = -1;
    elem = -1;
    if (!c || c->ElementCount() == 0) return false;
    const int existing = existingSubContours(*c, count);
    const GmPoint start = startBeside(*c, d);
    Search found;
    if (!c->IsClosed()) sub = onlyOpenSubContour(*c, existing);
    if (sub >= 0)
        searchOpen(*c->GetSubContour(sub), start, found, elem);
    else
        searchAll(*c, existing, start, found, sub, elem);
    return found.smallestId < kNoIdentifier && sub >= 0 && elem >= 0 && found.dist < kFarthestStart;
}
