#include "ToolpathOffsets.h"

#include <optional>

#include "KernelBridge.h"
#include "KernelShapes.h"
#include "PathStart.h"
#include "ShortElements.h"
#include "gmkernel/GmContour.h"

namespace gmpath {

namespace {

constexpr int kWholeContour = 1'000'000;

/// Elements below this length may tear offsets, so the start is searched without them.
constexpr double kShortestElement = 3.0 * kKernelTolerance;

/// Offsets taken once with and once without the shortest elements differ by less than this.
constexpr double kSamePlace = 1e-3;

int subContourCount(const GmContour& contour) {
    int count = 0;
    while (contour.GetSubContour(count) != nullptr)
        ++count;
    return count;
}

/// Where the kernel starts a path along the offsets at the distance d.
std::optional<Vec2> startPoint(const Path& contour, double d) {
    Path source = contour;
    dropShortElements(source, kShortestElement);
    GmContour kernel;
    for (const Element& e : source.elements) {
        const std::unique_ptr<GmCurve> curve = kernelCurve(e);
        const long id = kernel.ElementCount();
        if (!curve->CreationOK() || !kernel.AddElement(curve.get(), false, id)) return std::nullopt;
    }
    kernel.Offsetting(d, kWholeContour, !source.closed);
    int sub = 0;
    int elem = 0;
    if (!FindTPCCont(&kernel, subContourCount(kernel), d, sub, elem)) return std::nullopt;
    return fromKernel(kernel.GetSubContour(sub)->GetElement(elem)->SP());
}

/// True when the contour lies right of the offset at the distance d from it: stepping to the right
/// off the longest element comes nearer to the contour.
bool liesOnRight(const Path& contour, const Path& offset, double d) {
    const Element* longest = &offset.elements.front();
    for (const Element& e : offset.elements) {
        if (length(e) > length(*longest)) longest = &e;
    }
    constexpr double kStepOfDistance = 0.01;
    const Vec2 p = halvingPoint(*longest);
    // The chord of an arc runs like the tangent at its halving point.
    const Vec2 step = kStepOfDistance * std::abs(d) * rightNormal(unit(longest->ep - longest->sp));
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
    KernelOffset offset = offsetByKernel(contour, d);
    ToolRuns result{{}, offset.accepted};
    for (Path& path : offset.results)
        result.runs.push_back(runAlong(contour, std::move(path), d, side));
    if (result.runs.empty()) return result;
    if (const std::optional<Vec2> start = startPoint(contour, d)) fixStart(result.runs, *start);
    for (ToolRun& run : result.runs)
        run.startFixed = run.startFixed || !run.path.closed;
    return result;
}

}  // namespace gmpath
