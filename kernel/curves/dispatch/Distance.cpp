// SPDX-License-Identifier: MIT
/// @file
/// Which function measures which ordered pair of points, stretches and arcs.
///
/// Of two different kinds both orders run the same function, so that they answer the same number. A
/// pair without a function, and a pair in which an object is not of the class its tag promises,
/// goes to the general search for the nearest points of two curves, which does not look for
/// crossings.
#include "kernel/curves/dispatch/Distance.h"

#include <limits>

#include "kernel/curves/VerifiedCast.h"
#include "kernel/curves/dispatch/DistanceFunctions.h"
#include "kernel/curves/dispatch/PairTable.h"

namespace {

using namespace gmkernel_detail;
using DistanceEntry = double (*)(GmBase const&, GmBase const&);
using DistanceMap = PairTable<DistanceEntry>;

/// The nearest approach of two curves of any kind.
double measureCurves(GmBase const& a, GmBase const& b) {
    double d = std::numeric_limits<double>::max();
    auto const* first = dynamic_cast<GmCurve const*>(&a);
    auto const* second = dynamic_cast<GmCurve const*>(&b);
    if (first != nullptr && second != nullptr) first->MinDist(d, second, false);
    return d;
}

template <class A, class B>
double measurePair(GmBase const& first, GmBase const& second) {
    auto const* a = verifiedCast<A>(first);
    auto const* b = verifiedCast<B>(second);
    return a != nullptr && b != nullptr ? distance(*a, *b) : measureCurves(first, second);
}

template <class A, class B>
double measureSwapped(GmBase const& first, GmBase const& second) {
    auto const* a = verifiedCast<A>(second);
    auto const* b = verifiedCast<B>(first);
    return a != nullptr && b != nullptr ? distance(*a, *b) : measureCurves(first, second);
}

DistanceMap buildMap() {
    constexpr auto kPoint = GmBase::eGmPoint;
    constexpr auto kArc = GmBase::eGmArc;
    constexpr auto kStretch = GmBase::eGmStretch;
    DistanceMap map;
    map.enter(kPoint, kPoint, measurePair<GmPoint, GmPoint>);
    map.enter(kPoint, kArc, measurePair<GmPoint, GmArc>);
    map.enter(kArc, kPoint, measureSwapped<GmPoint, GmArc>);
    map.enter(kPoint, kStretch, measurePair<GmPoint, GmStretch>);
    map.enter(kStretch, kPoint, measureSwapped<GmPoint, GmStretch>);
    map.enter(kArc, kArc, measurePair<GmArc, GmArc>);
    map.enter(kArc, kStretch, measurePair<GmArc, GmStretch>);
    map.enter(kStretch, kArc, measureSwapped<GmArc, GmStretch>);
    map.enter(kStretch, kStretch, measurePair<GmStretch, GmStretch>);
    return map;
}

/// Built on first use, so that calls from static initialisers elsewhere find it complete.
DistanceMap const& distanceMap() {
    static const DistanceMap map = buildMap();
    return map;
}

/// Fills the map when the library is loaded.
[[maybe_unused]] DistanceMap const& filledAtLoad = distanceMap();

}  // namespace

double Distance(GmBase const& a, GmBase const& b) {
    const DistanceEntry measure = distanceMap().find(a.GetType(), b.GetType());
    return measure != nullptr ? measure(a, b) : measureCurves(a, b);
}
