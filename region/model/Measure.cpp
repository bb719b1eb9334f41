// Area and winding number of closed chains of segments and arcs.
//
// Both follow one decomposition: the polygon of the chords, and for every arc the circular segment
// between chord and arc. Area: the shoelace sum plus the signed areas of the segments. Winding
// number: the crossing count of the polygon (half-open in y, after Sunday, "Inclusion of a Point in
// a Polygon") plus one for every circular segment that holds the point. A point on a chord goes to
// the same side in both parts, as if it were moved a little towards +x and, much less, towards +y;
// so no vertex, horizontal chord or vertical tangent needs a case of its own.

#include "region/model/Measure.h"

#include <algorithm>

namespace gmpath {

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

bool isLeftOfChord(const Element& e, Vec2 p) {
    const double side = sideOfChord(e, p);
    if (side != 0.0) return side > 0.0;
    const Vec2 d = e.ep - e.sp;
    return d.y != 0.0 ? d.y < 0.0 : d.x > 0.0;
}

int chordCrossing(const Element& e, Vec2 p) {
    const bool startBelow = e.sp.y <= p.y;
    const bool endBelow = e.ep.y <= p.y;
    if (startBelow == endBelow) return 0;
    const bool left = isLeftOfChord(e, p);
    if (startBelow) return left ? 1 : 0;
    return left ? 0 : -1;
}

int circularSegmentWinding(const Element& e, Vec2 p) {
    const bool counterClockwise = e.bulge > 0.0;
    if (isLeftOfChord(e, p) == counterClockwise) return 0;
    if (distance(centre(e), p) >= radius(e)) return 0;
    return counterClockwise ? 1 : -1;
}

void includeArcExtremes(Box& box, const Element& e) {
    const Vec2 m = centre(e);
    const double r = radius(e);
    for (const Vec2 direction : {Vec2{1, 0}, Vec2{0, 1}, Vec2{-1, 0}, Vec2{0, -1}}) {
        const Vec2 extreme = m + r * direction;
        if (arcHolds(e, extreme)) box.include(extreme);
    }
}

}  // namespace

void Box::include(Vec2 p) {
    low = {std::min(low.x, p.x), std::min(low.y, p.y)};
    high = {std::max(high.x, p.x), std::max(high.y, p.y)};
}

void Box::include(const Box& other) {
    if (other.isEmpty()) return;
    include(other.low);
    include(other.high);
}

bool Box::holds(const Box& other) const {
    return other.isEmpty() || (low.x <= other.low.x && low.y <= other.low.y &&
                               high.x >= other.high.x && high.y >= other.high.y);
}

Box Box::grown(double margin) const {
    const Vec2 by{margin, margin};
    return isEmpty() ? *this : Box{low - by, high + by};
}

Box boundingBox(const Element& e) {
    Box box;
    box.include(e.sp);
    box.include(e.ep);
    if (isArc(e)) includeArcExtremes(box, e);
    return box;
}

Box boundingBox(const Path& path) {
    Box box;
    for (const Element& e : path.elements)
        box.include(boundingBox(e));
    return box;
}

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

int windingNumber(const Path& path, Vec2 p) {
    int winding = 0;
    for (const Element& e : path.elements) {
        winding += chordCrossing(e, p);
        if (isArc(e)) winding += circularSegmentWinding(e, p);
    }
    return winding;
}

}  // namespace gmpath
