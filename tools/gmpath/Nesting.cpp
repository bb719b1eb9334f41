#include "Nesting.h"

#include <algorithm>

#include "Measure.h"

namespace gmpath {

namespace {

/// Points looked at along a path, at most.
constexpr std::size_t kMaxSamples = 64;

struct ClosedRegion {
    const Path* path;
    Box box;
    double area;
};

ClosedRegion regionOf(const Path& path) {
    return {&path, boundingBox(path), std::abs(signedArea(path))};
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

bool liesIn(const ClosedRegion& inner, const ClosedRegion& outer) {
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

}  // namespace

std::vector<std::optional<int>> nestingDepths(const std::vector<Path>& paths) {
    std::vector<ClosedRegion> regions;
    for (const Path& path : paths)
        regions.push_back(regionOf(path));

    std::vector<std::optional<int>> depths(paths.size());
    for (std::size_t i = 0; i < paths.size(); ++i) {
        if (!paths[i].closed) continue;
        const auto enclosing = [&](const ClosedRegion& outer) {
            return outer.path->closed && liesIn(regions[i], outer);
        };
        depths[i] = static_cast<int>(std::count_if(regions.begin(), regions.end(), enclosing));
    }
    return depths;
}

}  // namespace gmpath
