// SPDX-License-Identifier: MIT
#include "tests/fuzz/SetPromises.h"

#include <algorithm>
#include <cmath>
#include <cstring>

#include "gmregion/Questions.h"
#include "region/plane/Measures.h"
#include "tests/support/PathDistance.h"
#include "tests/support/RegionShapes.h"

namespace gmregion::fuzz {

namespace {

/// In parts of the tolerance, for areas of the length as well: what counts as nothing.
constexpr double kRounding = 1.0 / 64.0;

bool isFinite(const Element& e) {
    return std::isfinite(e.sp.x) && std::isfinite(e.sp.y) && std::isfinite(e.ep.x) &&
           std::isfinite(e.ep.y) && std::isfinite(e.bulge);
}

bool sameBits(double a, double b) {
    return std::memcmp(&a, &b, sizeof a) == 0;
}

bool sameBits(Point a, Point b) {
    return sameBits(a.x, b.x) && sameBits(a.y, b.y);
}

bool sameBits(const Element& a, const Element& b) {
    return sameBits(a.sp, b.sp) && sameBits(a.ep, b.ep) && sameBits(a.bulge, b.bulge);
}

bool sameOrigins(const RegionSet& a, const RegionSet& b, std::size_t element) {
    const Origins ofA = a.origins(element);
    const Origins ofB = b.origins(element);
    return std::equal(ofA.begin(), ofA.end(), ofB.begin(), ofB.end(),
                      [](const Origin& p, const Origin& q) {
                          return p.path == q.path && p.element == q.element && p.kind == q.kind;
                      });
}

void checkOrigins(const RegionSet& set, const PathSizes& sizes, Complaints& complaints) {
    for (std::size_t i = 0; i < set.elements().size(); ++i) {
        const Origins origins = set.origins(i);
        complaints.expect(origins.size() > 0, "an element has an origin");
        for (const Origin& origin : origins) {
            const auto path = sizes.find(origin.path);
            const bool isKnown = path != sizes.end() && origin.element < path->second;
            complaints.expect(isKnown, "an origin is an element of the input");
        }
    }
}

void checkLoop(const RegionSet& set, std::size_t number, Complaints& complaints) {
    const Loop& loop = set.loops()[number];
    const std::vector<Element>& elements = set.elements();
    complaints.expect(loop.last - loop.first >= 2, "a loop has two elements at least");
    for (std::size_t i = loop.first; i < loop.last; ++i) {
        const Element& before = elements[i == loop.first ? loop.last - 1 : i - 1];
        const Element& e = elements[i];
        if (!complaints.expect(isFinite(e), "numbers are finite")) return;
        complaints.expect(sameBits(before.ep, e.sp), "a loop is closed bit by bit");
        const double length = lengthAlong(e);
        complaints.expect(length >= set.tolerance(), "no element is shorter than the tolerance",
                          length / set.tolerance());
    }
    // Of what is hardly wider than the tolerance rounding decides the sense.
    const double sense = loop.hole ? -1.0 : 1.0;
    const double area = gmregion::area(set, loopAlone(number));
    const double least = set.tolerance() * perimeter(set, loopAlone(number));
    complaints.expect(sense * area > -kRounding * least,
                      "outlines run counter-clockwise and holes clockwise", area / least);
}

/// Loops stand region by region, an outline first, and cover the elements without a gap.
void checkOrder(const RegionSet& set, Complaints& complaints) {
    std::size_t element = 0;
    std::size_t outlines = 0;
    for (const Loop& loop : set.loops()) {
        complaints.expect(loop.first == element, "loops follow each other");
        element = loop.last;
        if (!loop.hole) ++outlines;
        complaints.expect(loop.region + std::size_t{1} == outlines,
                          "loops stand region by region, the outline first");
    }
    complaints.expect(element == set.elements().size(), "every element belongs to a loop");
    complaints.expect(outlines == set.regionCount(), "regions are counted by outlines");
}

/// Whether another element comes near a point of one.
bool isBesideAnother(const RegionSet& set, const Element& e, Point p, double near) {
    return std::any_of(set.elements().begin(), set.elements().end(), [&](const Element& other) {
        return &other != &e && shapes::distanceFrom({other}, p) <= near;
    });
}

/// Asks beside the middle of each element, where nothing else is near: what lies on its left must
/// be covered once, what lies on its right not at all. So crossings, doubled loops and loops that
/// do not nest are seen.
void checkSides(const RegionSet& set, Complaints& complaints) {
    const Locator locator(set);
    const double away = 2.0 * set.tolerance();
    for (const Element& e : set.elements()) {
        const Point m = middleOf(e);
        if (isBesideAnother(set, e, m, 4.0 * away)) continue;
        const Carrier carrier = carrierOf(halved(e).second);
        for (const double side : {1.0, -1.0}) {
            const Point p = m + side * away * carrier.normal;
            const std::optional<BoundaryPoint> nearest = locator.nearest(p);
            if (!nearest || nearest->distance < 0.999 * away) continue;
            complaints.expect(shapes::winding(set, p) == (side > 0.0 ? 1 : 0),
                              "what is covered lies on the left of every element", side);
        }
    }
}

}  // namespace

PathSizes pathSizes(const std::array<Heap, 2>& heaps) {
    PathSizes sizes;
    for (const Heap& heap : heaps) {
        for (std::size_t i = 0; i < heap.paths.size(); ++i)
            sizes[heap.paths[i].id] = heap.paths[i].size();
    }
    return sizes;
}

double slackOf(const RegionSet& set) {
    return set.tolerance() * (perimeter(set) + 8.0 * set.tolerance());
}

bool isRoomy(const RegionSet& set) {
    const double room = 4.0 * set.tolerance();
    const auto isApart = [&](const Element& e, const Element& other) {
        if (e.sp == other.sp || e.sp == other.ep || other.sp == other.ep) return true;
        return shapes::distanceFrom({other}, e.sp) > room;
    };
    for (std::size_t i = 0; i < set.elements().size(); ++i) {
        const Element& e = set.elements()[i];
        if (!(distance(e.sp, e.ep) > room)) return false;
        for (std::size_t k = 0; k < set.elements().size(); ++k) {
            const Element& other = set.elements()[k];
            if (!isApart(e, other) || (i != k && e.sp == other.sp)) return false;
        }
    }
    return true;
}

bool isSame(const RegionSet& a, const RegionSet& b) {
    if (!sameBits(a.tolerance(), b.tolerance()) || a.loops().size() != b.loops().size() ||
        a.elements().size() != b.elements().size())
        return false;
    for (std::size_t i = 0; i < a.loops().size(); ++i) {
        const Loop& p = a.loops()[i];
        const Loop& q = b.loops()[i];
        if (p.last != q.last || p.region != q.region || p.hole != q.hole) return false;
    }
    for (std::size_t i = 0; i < a.elements().size(); ++i) {
        if (!sameBits(a.elements()[i], b.elements()[i]) || !sameOrigins(a, b, i)) return false;
    }
    return true;
}

void checkOutcome(const Outcome& outcome, bool answered, Complaints& complaints) {
    complaints.expect(answered == !outcome.refusal, "no result means a refusal");
    if (answered) return;
    complaints.expect(outcome.regions.empty() && outcome.regions.elements().empty(),
                      "a refusal goes with an empty set");
    complaints.expect(outcome.marginal.empty(), "a refusal goes without marginal points");
}

void checkSet(const RegionSet& set, const PathSizes& sizes, Complaints& complaints) {
    checkOrder(set, complaints);
    for (std::size_t i = 0; i < set.loops().size(); ++i)
        checkLoop(set, i, complaints);
    checkOrigins(set, sizes, complaints);
    checkSides(set, complaints);
}

}  // namespace gmregion::fuzz
