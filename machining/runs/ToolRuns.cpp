// SPDX-License-Identifier: MIT
/// @file
/// Offsets as a tool runs along them.
///
/// Loops of regions have on their left what they cover, which is the grown part. So those of one
/// side only have to be turned for the other.

#include "machining/runs/ToolRuns.h"

#include <algorithm>
#include <utility>

#include "part/model/Area.h"
#include "part/model/PathStart.h"

namespace gmmachining {

using gmpart::OffsetPath;
using gmpart::Path;
using gmpart::PathPlace;
using gmregion::Element;
using gmregion::Vec2;

namespace {

constexpr std::size_t kNoRun = static_cast<std::size_t>(-1);

/// Both points beside the start of a contour at a distance; a run comes by one of them.
std::vector<Vec2> besideStart(const Path& contour, double d) {
    const Element& first = contour.elements.front();
    const Vec2 by = d * rightNormal(tangentStart(first));
    return {first.sp + by, first.sp - by};
}

/// A run and where it comes nearest to a point.
struct RunPlace {
    std::size_t run = kNoRun;
    PathPlace place{};
    double distance = HUGE_VAL;
};

RunPlace nearer(const RunPlace& a, const RunPlace& b) {
    return b.distance < a.distance ? b : a;
}

/// Lets one run of each contour begin beside the contour's start.
void fixStarts(std::vector<ToolRun>& runs, const std::vector<Path>& contours, double d) {
    std::vector<RunPlace> starts(contours.size());
    for (std::size_t run = 0; run < runs.size(); ++run) {
        const std::size_t contour = runs[run].contours.front();
        for (const Vec2 wanted : besideStart(contours[contour], d)) {
            const PathPlace place = nearestPlace(runs[run].path, wanted);
            starts[contour] = nearer(starts[contour], {run, place, distance(place.point, wanted)});
        }
    }
    for (const RunPlace& start : starts) {
        if (start.run == kNoRun || !runs[start.run].path.closed) continue;
        runs[start.run].path = startedAt(runs[start.run].path, start.place);
        runs[start.run].startFixed = true;
    }
}

}  // namespace

ToolRuns toolRuns(const std::vector<Path>& contours, const gmpart::PartRegions& regions,
                  const std::vector<double>& distances, PartSide side,
                  const gmpart::ProgressCall& progress) {
    ToolRuns result;
    result.rest =
        offsetPart(contours, regions, {gmpart::Side::kWaste, distances, {}, false}, progress);
    result.passes.resize(distances.size());
    std::vector<OffsetPath> doubtful;
    for (OffsetPath& offset : result.rest.paths) {
        if (offset.doubtful) {
            doubtful.push_back(std::move(offset));
            continue;
        }
        Path path = side == PartSide::kRight ? reversed(offset.path) : std::move(offset.path);
        result.passes[offset.pass].push_back({std::move(path), std::move(offset.contours)});
    }
    result.rest.paths = std::move(doubtful);
    for (std::size_t pass = 0; pass < distances.size(); ++pass)
        fixStarts(result.passes[pass], contours, distances[pass]);
    return result;
}

}  // namespace gmmachining
