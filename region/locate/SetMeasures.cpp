// SPDX-License-Identifier: MIT
#include <algorithm>

#include "gmregion/Questions.h"
#include "region/locate/Moments.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/Measures.h"

namespace gmregion {

namespace {

/// Calls visit for every element of the loops that the set has.
template <class Visit>
void visitElements(const RegionSet& set, LoopRange loops, const Visit& visit) {
    const std::size_t last = std::min(loops.last, set.loops().size());
    for (std::size_t loop = loops.first; loop < last; ++loop) {
        for (std::size_t i = set.loops()[loop].first; i < set.loops()[loop].last; ++i)
            visit(set.elements()[i]);
    }
}

/// A point of the loops, near which sums keep their digits.
Point localPoint(const RegionSet& set, LoopRange loops) {
    const bool exists = !loops.empty() && loops.first < set.loops().size();
    return exists ? set.elements()[set.loops()[loops.first].first].sp : Point{};
}

}  // namespace

LoopRange loopsOf(const RegionSet& set) {
    return {0, set.loops().size()};
}

LoopRange loopsOf(const RegionSet& set, std::size_t region) {
    const auto first = set.loops().begin();
    const auto isBefore = [](const Loop& loop, std::size_t number) { return loop.region < number; };
    const auto from = std::lower_bound(first, set.loops().end(), region, isBefore);
    const auto to = std::find_if(from, set.loops().end(),
                                 [&](const Loop& loop) { return loop.region != region; });
    return {static_cast<std::size_t>(from - first), static_cast<std::size_t>(to - first)};
}

double area(const RegionSet& set, LoopRange loops) {
    const Point about = localPoint(set, loops);
    double twice = 0.0;
    visitElements(set, loops, [&](const Element& e) { twice += sweptTwice(e, about); });
    return 0.5 * twice;
}

double perimeter(const RegionSet& set, LoopRange loops) {
    double sum = 0.0;
    visitElements(set, loops, [&](const Element& e) { sum += lengthAlong(e); });
    return sum;
}

std::optional<Point> centroid(const RegionSet& set, LoopRange loops) {
    const Point about = localPoint(set, loops);
    Moment sum;
    visitElements(set, loops, [&](const Element& e) {
        const Moment moment = sweptMoment(e, about);
        sum.area += moment.area;
        sum.first = sum.first + moment.first;
    });
    if (sum.area == 0.0) return std::nullopt;
    return about + (1.0 / sum.area) * sum.first;
}

std::optional<Bounds> bounds(const RegionSet& set, LoopRange loops) {
    Box box;
    visitElements(set, loops, [&](const Element& e) {
        visitHalves(e, [&](const Element& half) { box.include(closeBox(half)); });
    });
    if (box.isEmpty()) return std::nullopt;
    return Bounds{box.low, box.high};
}

}  // namespace gmregion
