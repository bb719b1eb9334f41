// SPDX-License-Identifier: MIT
/// @file
/// Offsets as a tool runs along them.
///
/// On which side of a run the contour lies is measured, since an offset may run either way: a small
/// step off its longest element comes nearer to the contour on one side. So the sense holds also
/// for paths that cross themselves or have no inside.

#include "machining/runs/ToolRuns.h"

#include <cmath>
#include <optional>

#include "machining/runs/RunStart.h"
#include "region/model/PathStart.h"
#include "region/offset/CheckedOffset.h"

namespace gmmachining {

using gmregion::CheckedOffset;
using gmregion::Element;
using gmregion::KernelOffset;
using gmregion::Path;
using gmregion::PathPlace;
using gmregion::Vec2;

namespace {

/// A start that lies this near to a run is a point of it.
constexpr double kSamePlace = 1e-3;

/// True when the contour lies right of the offset at the distance d from it: stepping to the right
/// off the longest element comes nearer to the contour.
bool liesOnRight(const Path& contour, const Path& offset, double d) {
    constexpr double kStepOfDistance = 0.01;
    const Element& longest = longestElement(offset);
    const Vec2 p = halvingPoint(longest);
    // The chord of an arc runs like the tangent at its halving point.
    const Vec2 step = kStepOfDistance * std::abs(d) * rightNormal(unit(longest.ep - longest.sp));
    return distance(contour, p + step) < distance(contour, p - step);
}

ToolRun runAlong(const Path& contour, Path offset, double d, PartSide side) {
    const bool onRight = liesOnRight(contour, offset, d);
    if (onRight != (side == PartSide::kRight)) offset = reversed(offset);
    return {std::move(offset), false};
}

/// Starts the closed run that the point lies on there; runs that do not reach it stay as they are.
void fixStart(std::vector<ToolRun>& runs, Vec2 start) {
    for (ToolRun& run : runs) {
        if (!run.path.closed) continue;
        const PathPlace place = nearestPlace(run.path, start);
        if (distance(place.point, start) > kSamePlace) continue;
        run = {startedAt(run.path, place), true};
        return;
    }
}

}  // namespace

ToolRuns toolRuns(const Path& contour, double d, PartSide side) {
    CheckedOffset checked = offsetChecked(contour, d);
    KernelOffset& offset = checked.offset;
    ToolRuns result{{}, offset.refusal, checked.fault};
    const std::optional<Vec2> start = runStart(contour, d, offset);
    for (Path& path : offset.results)
        result.runs.push_back(runAlong(contour, std::move(path), d, side));
    if (start) fixStart(result.runs, *start);
    for (ToolRun& run : result.runs)
        run.startFixed = run.startFixed || !run.path.closed;
    return result;
}

}  // namespace gmmachining
