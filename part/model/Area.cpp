// SPDX-License-Identifier: MIT
/// @file
/// Area of closed chains of segments and arcs: the shoelace sum of the polygon of the chords plus
/// the signed area of the circular segment between every arc and its chord. Exact but for rounding,
/// also for chains that cross themselves, where areas count as often as the chain runs round them.
/// It does not tell simple chains from others.

#include "part/model/Area.h"

#include <cmath>

namespace gmpart {

namespace {

/// Area between an arc and its chord, with the sign of the sweep.
double circularSegmentArea(const Element& e) {
    const double angle = sweep(e);
    // For flat arcs angle - sin(angle) cancels; its series is exact enough there.
    const double difference = std::abs(angle) < 1e-2
                                  ? angle * angle * angle / 6.0 * (1.0 - angle * angle / 20.0)
                                  : angle - std::sin(angle);
    const double r = radius(e);
    return 0.5 * r * r * difference;
}

}  // namespace

double signedArea(const Path& path) {
    if (path.elements.empty()) return 0.0;
    // Measured from a point of the path, so that far-away parts lose no digits.
    const Vec2 origin = path.elements.front().sp;
    double area = 0.0;
    for (const Element& e : path.elements) {
        area += 0.5 * cross(e.sp - origin, e.ep - origin);
        if (isArc(e)) area += circularSegmentArea(e);
    }
    return area;
}

Sense sense(const Path& path) {
    if (!path.closed) return Sense::kNone;
    const double area = signedArea(path);
    const double perimeter = length(path);
    constexpr double kRelativeRounding = 1e-12;
    if (std::abs(area) <= kRelativeRounding * perimeter * perimeter) return Sense::kNone;
    return area > 0.0 ? Sense::kCounterClockwise : Sense::kClockwise;
}

}  // namespace gmpart
