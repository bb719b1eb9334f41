// SPDX-License-Identifier: MIT
/// @file
/// Area of closed chains of segments and arcs: the shoelace sum of the polygon of the chords plus
/// the signed area of the circular segment between every arc and its chord. Exact but for rounding,
/// also for chains that cross themselves, where areas count as often as the chain runs round them.
/// It does not tell simple chains from others.

#include "part/model/Area.h"

#include <cmath>

#include "region/plane/Measures.h"

namespace gmpart {

double signedArea(const Path& path) {
    if (path.elements.empty()) return 0.0;
    // Measured from a point of the path, so that far-away parts lose no digits.
    const Vec2 origin = path.elements.front().sp;
    double area = 0.0;
    for (const Element& e : path.elements) {
        area += 0.5 * cross(e.sp - origin, e.ep - origin) + gmregion::segmentArea(e);
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
