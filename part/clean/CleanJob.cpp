// SPDX-License-Identifier: MIT
#include "part/clean/CleanJob.h"

#include "gmregion/Simplify.h"

#include "part/regions/ContourRegions.h"
#include "part/regions/PartRegions.h"

namespace gmpart {

using gmregion::FillRule;
using gmregion::Outcome;
using gmregion::Paths;
using gmregion::RegionSet;
using gmregion::Simplified;
using gmregion::SimplifyOptions;
using gmregion::Workspace;

namespace {

Outcome regionsOf(const std::vector<Path>& contours, const CleanRequest& request,
                  double tolerance) {
    if (!request.rule) return PartRegions(contours, 0, tolerance).part();
    Paths heap;
    for (std::size_t i = 0; i < contours.size(); ++i) {
        if (contours[i].closed) {
            heap.add(contours[i].elements, true, static_cast<std::int64_t>(i));
        }
    }
    return cleanUp(heap, {*request.rule, tolerance});
}

/// The loops of a set by fewer elements; they are laid over each other again, since they may have
/// come to touch.
Outcome fitted(const RegionSet& set, double fit) {
    Paths heap;
    for (std::size_t loop = 0; loop < set.loops().size(); ++loop) {
        heap.add(loopPath(set, loop).elements, true,
                 static_cast<std::int64_t>(sourcesOf(set, loop).main));
    }
    Simplified simplified;
    if (!simplify(heap, SimplifyOptions{fit}, simplified)) return {{}, simplified.refusal, {}};
    return cleanUp(simplified.paths, {FillRule::kPositive, set.tolerance()});
}

}  // namespace

CleanResult cleanPart(const std::vector<Path>& contours, const CleanRequest& request) {
    const double tolerance = request.tolerance > 0.0 ? request.tolerance : partTolerance(contours);
    CleanResult cleaned;
    for (const RegionSet& alone : contourRegions(contours, tolerance))
        cleaned.left += alone.empty() ? 1 : 0;
    for (const Path& contour : contours)
        cleaned.elements += contour.closed ? contour.elements.size() : 0;
    cleaned.result = regionsOf(contours, request, tolerance);
    cleaned.unfitted = cleaned.result.regions.elements().size();
    if (request.fit > 0.0 && !cleaned.result.refusal) {
        cleaned.result = fitted(cleaned.result.regions, request.fit);
    }
    return cleaned;
}

}  // namespace gmpart
