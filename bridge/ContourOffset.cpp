// SPDX-License-Identifier: MIT
#include "gmbridge/ContourOffset.h"

#include <utility>

#include "bridge/OutlineRegion.h"
#include "gmbridge/Curves.h"
#include "gmregion/Boolean.h"
#include "gmregion/Offset.h"
#include "gmregion/Parallels.h"

namespace gmbridge {

using gmregion::Outcome;
using gmregion::RegionSet;
using gmregion::Workspace;

namespace {

Refusal addClosed(ContourPaths& paths, const GmContour* contour) {
    const std::size_t number = paths.paths().size();
    if (!contour) return {Reason::kUndefined, number};
    Refusal refusal = paths.add(*contour);
    if (refusal || paths.paths()[number].closed) return refusal;
    return {Reason::kOpen, number, 0, contour->GetElement(0)->SP()};
}

/// What the islands cover, the paths from 1 on.
/// @param covered gets the set
Refusal unite(const ContourPaths& paths, Workspace& workspace, Outcome& covered) {
    std::vector<RegionSet> islands;
    for (std::size_t i = 1; i < paths.paths().size(); ++i) {
        Outcome island = cleanedUp(paths.paths()[i], gmregion::FillRule::kNonZero, workspace);
        if (island.refusal) return refusalOf(island.refusal, i);
        islands.push_back(std::move(island.regions));
    }
    gmregion::uniteAll(islands.data(), islands.size(), workspace, covered);
    return refusalOf(covered.refusal, 0);
}

/// Takes the islands out of the outline's region.
Refusal takeOutIslands(const ContourPaths& paths, Workspace& workspace, RegionSet& region) {
    Outcome covered;
    Refusal refusal = unite(paths, workspace, covered);
    if (refusal) return refusal;
    Outcome part;
    gmregion::combine(region, covered.regions, gmregion::Combination::kDifference, workspace, part);
    region = std::move(part.regions);
    return refusalOf(part.refusal, 0);
}

/// The offset of an open contour, the only one of the paths.
ContourOffset offsetOpen(const ContourPaths& paths, double distance) {
    ContourOffset result;
    Workspace workspace;
    gmregion::Parallels beside;
    gmregion::makeParallels(paths.paths(), distance, 0.0, {}, workspace, beside);
    result.refusal = refusalOf(beside.refusal, 0);
    result.contours = contoursOf(beside, paths);
    for (const gmregion::Point& p : beside.marginal)
        result.marginal.push_back(kernelPoint(p));
    return result;
}

}  // namespace

ContourOffset offsetContour(const GmContour& contour, double distance) {
    ContourPaths paths;
    const Refusal refusal = paths.add(contour);
    if (refusal || paths.paths()[0].closed) return offsetPart(contour, {}, distance);
    return offsetOpen(paths, distance);
}

ContourOffset offsetPart(const GmContour& outline, const std::vector<const GmContour*>& islands,
                         double distance) {
    ContourOffset result;
    ContourPaths paths;
    result.refusal = addClosed(paths, &outline);
    for (const GmContour* island : islands) {
        if (result.refusal) return result;
        result.refusal = addClosed(paths, island);
    }
    if (result.refusal) return result;

    Workspace workspace;
    OutlineRegion part = outlineRegion(paths.paths()[0], workspace);
    result.refusal = part.refusal;
    if (!result.refusal && !islands.empty())
        result.refusal = takeOutIslands(paths, workspace, part.region);
    if (result.refusal) return result;

    Outcome offset;
    const double outward = part.sense == GmBase::eRotCW ? -distance : distance;
    gmregion::offset(part.region, outward, {}, workspace, offset);
    result.refusal = refusalOf(offset.refusal, 0);
    result.contours = contoursOf(offset.regions, paths, part.sense);
    for (const gmregion::Point& p : offset.marginal)
        result.marginal.push_back(kernelPoint(p));
    return result;
}

}  // namespace gmbridge
