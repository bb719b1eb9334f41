// SPDX-License-Identifier: MIT
#include "tests/fuzz/QuestionPromises.h"

#include <algorithm>
#include <cmath>

#include "gmregion/Questions.h"
#include "tests/support/RegionShapes.h"

namespace gmregion::fuzz {

namespace {

/// In parts of the tolerance: what distances may be off by.
constexpr double kRounding = 1.0 / 64.0;

void checkMeasures(const RegionSet& set, Complaints& complaints) {
    double sum = 0.0;
    double length = 0.0;
    for (std::size_t i = 0; i < set.regionCount(); ++i) {
        sum += area(set, loopsOf(set, i));
        length += perimeter(set, loopsOf(set, i));
        const std::optional<Bounds> box = bounds(set, loopsOf(set, i));
        if (!complaints.expect(box.has_value(), "a region has bounds")) continue;
        for (std::size_t k = loopsOf(set, i).first; k < loopsOf(set, i).last; ++k) {
            for (std::size_t e = set.loops()[k].first; e < set.loops()[k].last; ++e) {
                const Point p = set.elements()[e].sp;
                const bool isIn = p.x >= box->low.x && p.x <= box->high.x && p.y >= box->low.y &&
                                  p.y <= box->high.y;
                complaints.expect(isIn, "bounds hold all vertices");
            }
        }
    }
    const double slack = kRounding * set.tolerance() * perimeter(set);
    complaints.expect(std::fabs(sum - area(set)) <= slack, "areas of regions add up",
                      std::fabs(sum - area(set)) / slack);
    complaints.expect(std::fabs(length - perimeter(set)) <= 1e-9 * length,
                      "lengths of regions add up");
    complaints.expect(centroid(set).has_value() == !set.empty(), "what has area has a centre");
}

void checkNesting(const RegionSet& set, const Locator& locator, Complaints& complaints) {
    for (std::size_t i = 0; i < set.regionCount(); ++i) {
        const LoopRange loops = loopsOf(set, i);
        for (std::size_t hole = loops.first + 1; hole < loops.last; ++hole) {
            complaints.expect(locator.loopAbout(hole) == loops.first,
                              "the loop about a hole is its outline");
        }
        for (const std::size_t inner : locator.regionsIn(i)) {
            const std::optional<std::size_t> about = locator.loopAbout(loopsOf(set, inner).first);
            const bool isOurs = about && *about > loops.first && *about < loops.last;
            complaints.expect(isOurs, "a region stands in a hole of the one about it");
        }
    }
}

void checkPoint(const RegionSet& set, const Locator& locator, Point p, Complaints& complaints) {
    const double tolerance = set.tolerance();
    const std::optional<BoundaryPoint> nearest = locator.nearest(p);
    const Place side = locator.where(p, -1.0);
    const std::optional<double> depth = locator.signedDistance(p);
    complaints.expect(nearest.has_value() == depth.has_value(), "a point has a distance or none");
    complaints.expect((side == Place::kInside) == locator.regionAt(p).has_value(),
                      "what is inside is in a region");
    if (!nearest || !depth) return;
    complaints.expect(nearest->element < set.elements().size() &&
                          nearest->loop < set.loops().size() &&
                          nearest->element >= set.loops()[nearest->loop].first &&
                          nearest->element < set.loops()[nearest->loop].last,
                      "the nearest element belongs to the loop named");
    const double rounding = kRounding * tolerance + 1e-14 * nearest->distance;
    const double way = std::hypot(nearest->at.x - p.x, nearest->at.y - p.y);
    complaints.expect(std::fabs(way - nearest->distance) <= rounding,
                      "the distance is that of the nearest point",
                      (way - nearest->distance) / rounding);
    for (const Element& e : set.elements()) {
        const double toVertex = std::hypot(e.sp.x - p.x, e.sp.y - p.y);
        complaints.expect(nearest->distance <= toVertex + rounding,
                          "no vertex is nearer than the nearest point",
                          (nearest->distance - toVertex) / tolerance);
    }
    if (nearest->distance <= tolerance - rounding)
        complaints.expect(locator.where(p) == Place::kOnBoundary, "what is near is on it");
    if (nearest->distance <= tolerance + rounding) return;
    complaints.expect(std::fabs(*depth) == nearest->distance, "both distances are the same");
    complaints.expect(locator.where(p) == side, "what is not near is on one side");
    complaints.expect((*depth > 0.0) == (side == Place::kInside), "distances are positive inside");
    complaints.expect((shapes::winding(set, p) == 1) == (side == Place::kInside),
                      "loops run once round what is inside");
}

}  // namespace

void checkQuestions(const RegionSet& set, Point p, Complaints& complaints) {
    checkMeasures(set, complaints);
    const Locator locator(set);
    checkNesting(set, locator, complaints);
    checkPoint(set, locator, p, complaints);
    for (const Element& e : set.elements()) {
        const Point m = middleOf(e);
        complaints.expect(locator.where(e.sp) == Place::kOnBoundary, "a vertex is on the boundary");
        complaints.expect(locator.where(m) == Place::kOnBoundary, "a middle is on the boundary");
        checkPoint(set, locator, {0.5 * (m.x + p.x), 0.5 * (m.y + p.y)}, complaints);
    }
}

}  // namespace gmregion::fuzz
