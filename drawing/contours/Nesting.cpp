// SPDX-License-Identifier: MIT
/// @file
/// Which paths lie in which.
///
/// A path that does not cross another one lies in it when any of its points does; so a few dozen
/// points are looked at, and those on the other's border, within the tolerance, do not count. Paths
/// that cross have points on both sides and lie in neither. Boxes and areas spare most comparisons.
/// It answers for pairs: paths that touch themselves are taken as their winding numbers are.

#include "drawing/contours/Nesting.h"

#include <cmath>

#include "region/model/Area.h"
#include "region/model/Box.h"
#include "region/model/Winding.h"

namespace gmdrawing {

using gmregion::Box;
using gmregion::kKernelTolerance;
using gmregion::Path;
using gmregion::Vec2;

namespace {

/// Points looked at along a path, at most.
constexpr std::size_t kMaxSamples = 64;

struct Region {
    const Path* path;
    Box box;
    double area;
};

Region regionOf(const Path& path) {
    return {&path, boundingBox(path), path.closed ? std::abs(signedArea(path)) : 0.0};
}

std::vector<Vec2> samplesAlong(const Path& path) {
    std::vector<Vec2> samples;
    const std::size_t stride = path.elements.size() / kMaxSamples + 1;
    for (std::size_t i = 0; i < path.elements.size(); i += stride) {
        samples.push_back(path.elements[i].sp);
        samples.push_back(halvingPoint(path.elements[i]));
    }
    return samples;
}

bool liesIn(const Region& inner, const Region& outer) {
    if (inner.area >= outer.area) return false;
    if (!outer.box.grown(kKernelTolerance).holds(inner.box)) return false;
    bool anyInside = false;
    for (const Vec2 p : samplesAlong(*inner.path)) {
        if (distance(*outer.path, p) < kKernelTolerance) continue;
        if (windingNumber(*outer.path, p) == 0) return false;
        anyInside = true;
    }
    return anyInside;
}

std::vector<Region> regionsOf(const std::vector<Path>& paths) {
    std::vector<Region> regions;
    for (const Path& path : paths)
        regions.push_back(regionOf(path));
    return regions;
}

std::vector<std::size_t> enclosing(const std::vector<Region>& regions, std::size_t inner) {
    std::vector<std::size_t> found;
    for (std::size_t outer = 0; outer < regions.size(); ++outer) {
        if (regions[outer].path->closed && liesIn(regions[inner], regions[outer])) {
            found.push_back(outer);
        }
    }
    return found;
}

}  // namespace

std::vector<std::optional<int>> nestingDepths(const std::vector<Path>& paths) {
    const std::vector<Region> regions = regionsOf(paths);
    std::vector<std::optional<int>> depths(paths.size());
    for (std::size_t i = 0; i < paths.size(); ++i) {
        if (paths[i].closed) depths[i] = static_cast<int>(enclosing(regions, i).size());
    }
    return depths;
}

std::vector<std::vector<std::size_t>> enclosingPaths(const std::vector<Path>& paths) {
    const std::vector<Region> regions = regionsOf(paths);
    std::vector<std::vector<std::size_t>> found;
    for (std::size_t i = 0; i < paths.size(); ++i)
        found.push_back(enclosing(regions, i));
    return found;
}

}  // namespace gmdrawing
