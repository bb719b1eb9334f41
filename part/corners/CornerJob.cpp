// SPDX-License-Identifier: MIT
/// @file
/// Rounding and chamfering the corners of all contours.
///
/// A corner is a joint that bends; whether it is convex follows from the sense of the whole
/// contour. Corners are done from the last to the first, each if there is room: a corner done
/// earlier may take the room of a later one, and no best choice among them is sought.

#include "part/corners/CornerJob.h"

#include <cmath>

#include "part/model/Area.h"

namespace gmpart {

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

CornerResult cornersBroken(const Path& contour, std::size_t number, const CornerRoom& room,
                           const CornerRequest& request) {
    CornerResult result{contour};
    CornerBreaker breaker(contour, number);
    result.refusal = breaker.refusal();
    if (result.refusal != KernelRefusal::kNone) return result;
    const std::vector<std::size_t> corners = cornersOf(breaker.source(), request);
    for (auto corner = corners.rbegin(); corner != corners.rend(); ++corner) {
        const bool done = breaker.breakCorner(*corner, request.kind, request.value, room);
        ++(done ? result.done : result.notDone);
    }
    if (result.done > 0) result.path = breaker.result();
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
    const CornerRoom room(contours);
    for (std::size_t i = 0; i < contours.size(); ++i)
        results.push_back(cornersBroken(contours[i], i, room, request));
    return results;
}

}  // namespace gmpart
