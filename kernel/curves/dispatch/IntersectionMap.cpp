// SPDX-License-Identifier: MIT
/// @file
/// Which kernel intersects which ordered pair of curves.
///
/// A kernel works on the supporting lines and circles, which have no bounds; its points are kept
/// where every bounded curve of the pair accepts them. Swapped pairs run the same function with
/// swapped arguments, so that both give the same points in the same order. A pair without an entry
/// is refused, and so is one in which an object is not of the class that its tag promises.
#include <stdexcept>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/SupportHits.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/curves/dispatch/PairTable.h"

namespace {

using namespace gmkernel_detail;
using Points = std::vector<GmPoint>;
using IntersectionEntry = void (*)(GmBase const&, GmBase const&, Points&);
using IntersectionMap = PairTable<IntersectionEntry>;

/// Does a point that lies on the supporting line or circle also lie on the curve itself?
bool holds(GmLine const&, GmPoint const&) {
    return true;
}
bool holds(GmCircle const&, GmPoint const&) {
    return true;
}
bool holds(GmBeam const& beam, GmPoint const& p) {
    return beam.Element(p);
}
bool holds(GmStretch const& stretch, GmPoint const& p) {
    return stretch.Element(p);
}
bool holds(GmArc const& arc, GmPoint const& p) {
    return arc.Element(p);
}

[[noreturn]] void refusePair() {
    throw std::runtime_error("Function not found");
}

/// The object as the class by whose tag the entry was chosen.
template <class T>
T const& promised(GmBase const& object) {
    auto const* const curve = verifiedCast<T>(object);
    if (curve == nullptr) refusePair();
    return *curve;
}

template <class A, class B>
void intersectPair(GmBase const& first, GmBase const& second, Points& result) {
    auto const& a = promised<A>(first);
    auto const& b = promised<B>(second);
    for (Vec3 const& hit : supportHits(a, b)) {
        const GmPoint p = pointOf(hit);
        if (holds(a, p) && holds(b, p)) result.push_back(p);
    }
}

/// The contour collects the points in its own solution list.
template <class Other>
void intersectContour(GmBase const& first, GmBase const& second, Points& result) {
    auto const& contour = promised<GmContour>(first);
    contour.IntersectionWithCurve(&promised<Other>(second));
    if (&contour.GetPtSol() != &result) result = contour.GetPtSol();
}

template <IntersectionEntry entry>
void swapped(GmBase const& first, GmBase const& second, Points& result) {
    entry(second, first, result);
}

/// Enters a pair of different kinds in both orders.
template <IntersectionEntry entry>
void enterBoth(IntersectionMap& map, GmBase::eGmTypes a, GmBase::eGmTypes b) {
    map.enter(a, b, entry);
    map.enter(b, a, swapped<entry>);
}

void enterStraightPairs(IntersectionMap& map) {
    map.enter(GmBase::eGmLine, GmBase::eGmLine, intersectPair<GmLine, GmLine>);
    map.enter(GmBase::eGmBeam, GmBase::eGmBeam, intersectPair<GmBeam, GmBeam>);
    map.enter(GmBase::eGmStretch, GmBase::eGmStretch, intersectPair<GmStretch, GmStretch>);
    enterBoth<intersectPair<GmLine, GmBeam>>(map, GmBase::eGmLine, GmBase::eGmBeam);
    enterBoth<intersectPair<GmLine, GmStretch>>(map, GmBase::eGmLine, GmBase::eGmStretch);
    enterBoth<intersectPair<GmBeam, GmStretch>>(map, GmBase::eGmBeam, GmBase::eGmStretch);
}

void enterMixedPairs(IntersectionMap& map) {
    enterBoth<intersectPair<GmCircle, GmLine>>(map, GmBase::eGmCircle, GmBase::eGmLine);
    enterBoth<intersectPair<GmCircle, GmBeam>>(map, GmBase::eGmCircle, GmBase::eGmBeam);
    enterBoth<intersectPair<GmCircle, GmStretch>>(map, GmBase::eGmCircle, GmBase::eGmStretch);
    enterBoth<intersectPair<GmArc, GmLine>>(map, GmBase::eGmArc, GmBase::eGmLine);
    enterBoth<intersectPair<GmArc, GmBeam>>(map, GmBase::eGmArc, GmBase::eGmBeam);
    enterBoth<intersectPair<GmArc, GmStretch>>(map, GmBase::eGmArc, GmBase::eGmStretch);
}

void enterRoundPairs(IntersectionMap& map) {
    map.enter(GmBase::eGmCircle, GmBase::eGmCircle, intersectPair<GmCircle, GmCircle>);
    map.enter(GmBase::eGmArc, GmBase::eGmArc, intersectPair<GmArc, GmArc>);
    enterBoth<intersectPair<GmCircle, GmArc>>(map, GmBase::eGmCircle, GmBase::eGmArc);
}

void enterContourPairs(IntersectionMap& map) {
    map.enter(GmBase::eGmContour, GmBase::eGmContour, intersectContour<GmContour>);
    enterBoth<intersectContour<GmLine>>(map, GmBase::eGmContour, GmBase::eGmLine);
    enterBoth<intersectContour<GmBeam>>(map, GmBase::eGmContour, GmBase::eGmBeam);
    enterBoth<intersectContour<GmStretch>>(map, GmBase::eGmContour, GmBase::eGmStretch);
    enterBoth<intersectContour<GmCircle>>(map, GmBase::eGmContour, GmBase::eGmCircle);
    enterBoth<intersectContour<GmArc>>(map, GmBase::eGmContour, GmBase::eGmArc);
}

IntersectionMap buildMap() {
    IntersectionMap map;
    enterStraightPairs(map);
    enterMixedPairs(map);
    enterRoundPairs(map);
    enterContourPairs(map);
    return map;
}

/// Built on first use, so that calls from static initialisers elsewhere find it complete.
IntersectionMap const& intersectionMap() {
    static const IntersectionMap map = buildMap();
    return map;
}

/// Fills the map when the library is loaded.
[[maybe_unused]] IntersectionMap const& filledAtLoad = intersectionMap();

}  // namespace

void Intersection(GmBase const& a, GmBase const& b, std::vector<GmPoint>& result) {
    result.clear();
    const IntersectionEntry intersect = intersectionMap().find(a.GetType(), b.GetType());
    if (intersect == nullptr) refusePair();
    intersect(a, b, result);
}
