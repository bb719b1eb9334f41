// SPDX-License-Identifier: MIT
#include "part/regions/ContourRegions.h"

#include <algorithm>

#include "gmregion/CleanUp.h"

#include "region/model/Box.h"

namespace gmpart {

using gmregion::CleanUpOptions;
using gmregion::FillRule;
using gmregion::Loop;
using gmregion::Outcome;
using gmregion::Paths;
using gmregion::RegionSet;
using gmregion::Workspace;

namespace {

constexpr double kToleranceOfSize = 1e-6;
constexpr double kLargestTolerance = 1e-4;

}  // namespace

double partTolerance(const std::vector<Path>& contours) {
    Paths heap;
    Box all;
    for (const Path& contour : contours) {
        heap.add(contour.elements, contour.closed);
        all.include(boundingBox(contour));
    }
    const double size = std::max(all.size().x, all.size().y);
    return std::max(std::min(kToleranceOfSize * size, kLargestTolerance), defaultTolerance(heap));
}

std::vector<RegionSet> contourRegions(const std::vector<Path>& contours, double tolerance) {
    std::vector<RegionSet> regions;
    regions.reserve(contours.size());
    Workspace workspace;
    Outcome outcome;
    Paths alone;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        regions.emplace_back();
        if (!contours[i].closed) continue;
        alone.clear();
        alone.add(contours[i].elements, true, static_cast<std::int64_t>(i));
        if (cleanUp(alone, {FillRule::kNonZero, tolerance}, workspace, outcome)) {
            regions.back() = outcome.regions;
        }
    }
    return regions;
}

void addLoops(Paths& heap, const RegionSet& set, std::int64_t id, bool reversed) {
    std::vector<Element> turned;
    for (const Loop& loop : set.loops()) {
        const Element* first = set.elements().data() + loop.first;
        const Element* last = set.elements().data() + loop.last;
        if (reversed) {
            turned.assign(std::make_reverse_iterator(last), std::make_reverse_iterator(first));
            for (Element& e : turned)
                e = {e.ep, e.sp, -e.bulge};
            heap.add(turned, true, id);
        } else {
            heap.add(first, last, true, id);
        }
    }
}

Path loopPath(const RegionSet& set, std::size_t loop) {
    const Loop& range = set.loops()[loop];
    return {{set.elements().begin() + range.first, set.elements().begin() + range.last}, true, {}};
}

}  // namespace gmpart
