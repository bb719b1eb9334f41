#include "region/corners/CornerJob.h"

#include <cmath>

#include "gmkernel/GmContour.h"
#include "region/bridge/PathConversion.h"
#include "region/corners/CornerRoom.h"
#include "region/model/Measure.h"

namespace gmpath {

namespace {

/// The angle by which the path turns between two elements, positive to the left.
double bend(const Element& first, const Element& second) {
    const Vec2 leaving = tangentEnd(first);
    const Vec2 entering = tangentStart(second);
    return std::atan2(cross(leaving, entering), dot(leaving, entering));
}

bool isWanted(double turn, Sense sense, const CornerRequest& request) {
    if (std::abs(turn) < request.leastBend) return false;
    if (request.choice == CornerChoice::kAll || sense == Sense::kNone) return true;
    const bool turnsWith = (turn > 0.0) == (sense == Sense::kCounterClockwise);
    return turnsWith == (request.choice == CornerChoice::kConvex);
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

/// The element that a contour made itself, of a contour whose other elements it did not; -1 when
/// there is none.
int insertedElement(const GmContour& contour) {
    for (int i = 0; i < contour.ElementCount(); ++i) {
        if (contour.GetContElement(i)->bInserted) return i;
    }
    return -1;
}

/// Puts a transition into the corner where the element `index` ends, if there is room.
bool breakCorner(GmContour& contour, std::size_t index, const CornerRoom& room,
                 const CornerRequest& request) {
    GmContour attempt(contour);
    const int first = static_cast<int>(index);
    const Vec2 corner = fromKernel(attempt.GetElement(first)->EP());
    if (!attempt.AddTrans(kernelType(request.kind), first, request.value, true)) return false;
    const int made = insertedElement(attempt);
    if (made < 0 || !room.allows(attempt, made, corner)) return false;
    contour = attempt;
    return true;
}

CornerResult cornersBroken(const Path& contour, const CornerRoom& room,
                           const CornerRequest& request) {
    CornerResult result{contour};
    const SimplifiedPath source = simplifiedForKernel(contour);
    GmContour kernel;
    result.accepted = fillContour(kernel, source);
    if (!result.accepted) return result;
    const std::vector<std::size_t> corners = cornersOf(source.path, request);
    // From the last one to the first, so that new elements do not move the corners still to do.
    for (auto corner = corners.rbegin(); corner != corners.rend(); ++corner) {
        const bool done = breakCorner(kernel, *corner, room, request);
        ++(done ? result.done : result.notDone);
    }
    if (result.done > 0) result.path = pathFromKernel(kernel, contour.layer).path;
    return result;
}

}  // namespace

std::vector<std::size_t> cornersOf(const Path& path, const CornerRequest& request) {
    const std::size_t count = path.elements.size();
    const std::size_t joints = path.closed || count == 0 ? count : count - 1;
    const Sense turn = sense(path);
    std::vector<std::size_t> corners;
    for (std::size_t i = 0; i < joints; ++i) {
        const double angle = bend(path.elements[i], path.elements[(i + 1) % count]);
        if (isWanted(angle, turn, request)) corners.push_back(i);
    }
    return corners;
}

std::vector<CornerResult> breakCorners(const std::vector<Path>& contours,
                                       const CornerRequest& request) {
    std::vector<CornerResult> results;
    for (std::size_t i = 0; i < contours.size(); ++i)
        results.push_back(cornersBroken(contours[i], CornerRoom(contours, i), request));
    return results;
}

}  // namespace gmpath
