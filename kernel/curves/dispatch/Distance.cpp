/// @file
/// Which function measures which ordered pair of points, stretches and arcs.
#include "kernel/curves/dispatch/Distance.h"

#include <limits>
#include <unordered_map>

#include "kernel/curves/dispatch/DistanceFunctions.h"
#include "kernel/curves/dispatch/PairKey.h"

namespace {

using namespace gmkernel_detail;
using DistanceEntry = double (*)(GmBase const&, GmBase const&);
using DistanceMap = std::unordered_map<int, DistanceEntry>;

template <class A, class B>
double measurePair(GmBase const& first, GmBase const& second) {
    return distance(static_cast<A const&>(first), static_cast<B const&>(second));
}

template <class A, class B>
double measureSwapped(GmBase const& first, GmBase const& second) {
    return measurePair<A, B>(second, first);
}

DistanceMap buildMap() {
    constexpr auto kPoint = GmBase::eGmPoint;
    constexpr auto kArc = GmBase::eGmArc;
    constexpr auto kStretch = GmBase::eGmStretch;
    return {
        {pairKey(kPoint, kPoint), measurePair<GmPoint, GmPoint>},
        {pairKey(kPoint, kArc), measurePair<GmPoint, GmArc>},
        {pairKey(kArc, kPoint), measureSwapped<GmPoint, GmArc>},
        {pairKey(kPoint, kStretch), measurePair<GmPoint, GmStretch>},
        {pairKey(kStretch, kPoint), measureSwapped<GmPoint, GmStretch>},
        {pairKey(kArc, kArc), measurePair<GmArc, GmArc>},
        {pairKey(kArc, kStretch), measurePair<GmArc, GmStretch>},
        {pairKey(kStretch, kArc), measureSwapped<GmArc, GmStretch>},
        {pairKey(kStretch, kStretch), measurePair<GmStretch, GmStretch>},
    };
}

/// Built on first use, so that calls from static initialisers elsewhere find it complete.
DistanceMap const& distanceMap() {
    static const DistanceMap map = buildMap();
    return map;
}

/// Fills the map when the library is loaded.
[[maybe_unused]] const bool filledAtLoad = !distanceMap().empty();

/// The nearest approach of two curves of any kind.
double measureCurves(GmBase const& a, GmBase const& b) {
    double d = std::numeric_limits<double>::max();
    auto const* first = dynamic_cast<GmCurve const*>(&a);
    auto const* second = dynamic_cast<GmCurve const*>(&b);
    if (first != nullptr && second != nullptr) first->MinDist(d, second, false);
    return d;
}

}  // namespace

double Distance(GmBase const& a, GmBase const& b) {
    const auto found = distanceMap().find(pairKey(a.GetType(), b.GetType()));
    return found != distanceMap().end() ? found->second(a, b) : measureCurves(a, b);
}
