#include "CornerJob.h"

#include <cmath>

#include "KernelShapes.h"
#include "Measure.h"
#include "gmkernel/GmContour.h"

namespace gmpath {

namespace {

constexpr double kSmallestBend = 3.14159265358979323846 / 180.0;

/// The angle by which the path turns between two elements, positive to the left.
double bend(const Element& first, const Element& second) {
    const Vec2 leaving = tangentEnd(first);
    const Vec2 entering = tangentStart(second);
    return std::atan2(cross(leaving, entering), dot(leaving, entering));
}

bool isWanted(double turn, Sense sense, CornerChoice choice) {
    if (std::abs(turn) < kSmallestBend) return false;
    if (choice == CornerChoice::kAll || sense == Sense::kNone) return true;
    const bool turnsWith = (turn > 0.0) == (sense == Sense::kCounterClockwise);
    return turnsWith == (choice == CornerChoice::kConvex);
}

GmContour::eTransType kernelType(CornerKind kind) {
    switch (kind) {
        case CornerKind::kChamferDistance:
            return GmContour::eTransChamferDist;
        case CornerKind::kChamferLength:
            return GmContour::eTransChamferLength;
        case CornerKind::kRounding:
            break;
    }
    return GmContour::eTransRadius;
}

}  // namespace

std::vector<std::size_t> cornersOf(const Path& path, CornerChoice choice) {
    const std::size_t count = path.elements.size();
    const std::size_t joints = path.closed || count == 0 ? count : count - 1;
    const Sense turn = sense(path);
    std::vector<std::size_t> corners;
    for (std::size_t i = 0; i < joints; ++i) {
        const double angle = bend(path.elements[i], path.elements[(i + 1) % count]);
        if (isWanted(angle, turn, choice)) corners.push_back(i);
    }
    return corners;
}

CornerResult breakCorners(const Path& contour, const CornerRequest& request) {
    CornerResult result{contour};
    const SimplifiedPath source = simplifiedForKernel(contour);
    GmContour kernel;
    result.accepted = fillContour(kernel, source);
    if (!result.accepted) return result;
    const std::vector<std::size_t> corners = cornersOf(source.path, request.choice);
    // From the last one to the first, so that new elements do not move the corners still to do.
    for (auto corner = corners.rbegin(); corner != corners.rend(); ++corner) {
        const bool done = kernel.AddTrans(kernelType(request.kind), static_cast<int>(*corner),
                                          request.value, true);
        ++(done ? result.done : result.notDone);
    }
    if (result.done > 0) result.path = pathFromKernel(kernel, contour.layer).path;
    return result;
}

}  // namespace gmpath
