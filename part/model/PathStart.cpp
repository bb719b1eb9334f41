// SPDX-License-Identifier: MIT
/// @file
/// Where a closed path starts.
///
/// The place is the nearest point over all elements; a path is started there by turning the row of
/// its elements and splitting the one that holds the place. Near a joint nothing is split, so that
/// no element comes out too short. Linear in the elements.

#include "part/model/PathStart.h"

#include <algorithm>
#include <cmath>

namespace gmpart {

namespace {

/// Nearer to a joint than this no element is split.
constexpr double kJointReach = 10.0 * kKernelTolerance;

/// Signed angle that the arc turns from its start to one of its points.
double sweepTo(const Element& e, Vec2 p) {
    const Vec2 m = centre(e);
    const double angle = std::atan2(cross(e.sp - m, p - m), dot(e.sp - m, p - m));
    const double turn = e.bulge > 0.0 ? 1.0 : -1.0;
    return angle * turn < 0.0 ? angle + turn * 2.0 * kPi : angle;
}

/// The first part of the element up to p, and the rest.
std::pair<Element, Element> splitAt(const Element& e, Vec2 p) {
    if (!isArc(e)) return {{e.sp, p}, {p, e.ep}};
    const double before = sweepTo(e, p);
    const double behind = sweep(e) - before;
    return {{e.sp, p, std::tan(0.25 * before)}, {p, e.ep, std::tan(0.25 * behind)}};
}

Path startedAtElement(Path path, std::size_t index) {
    const auto first = path.elements.begin() + static_cast<std::ptrdiff_t>(index);
    std::rotate(path.elements.begin(), first, path.elements.end());
    return path;
}

}  // namespace

PathPlace nearestPlace(const Path& path, Vec2 p) {
    PathPlace nearest{0, nearestPoint(path.elements.front(), p)};
    for (std::size_t i = 1; i < path.elements.size(); ++i) {
        const Vec2 point = nearestPoint(path.elements[i], p);
        if (distance(point, p) < distance(nearest.point, p)) nearest = {i, point};
    }
    return nearest;
}

Path startedAt(const Path& path, const PathPlace& place) {
    const Element e = path.elements[place.element];
    const std::size_t next = (place.element + 1) % path.elements.size();
    if (distance(place.point, e.sp) < kJointReach) return startedAtElement(path, place.element);
    if (distance(place.point, e.ep) < kJointReach) return startedAtElement(path, next);
    const auto [before, behind] = splitAt(e, place.point);
    Path result = startedAtElement(path, place.element);
    result.elements.front() = behind;
    result.elements.push_back(before);
    return result;
}

}  // namespace gmpart
