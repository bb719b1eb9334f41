// SPDX-License-Identifier: MIT
/// @file
/// Winding number of closed chains of segments and arcs: the crossing count of the polygon of the
/// chords (half-open in y, after Sunday, "Inclusion of a Point in a Polygon") plus one for every
/// circular segment, between an arc and its chord, that holds the point. A point on a chord goes to
/// the same side in both parts, as if it were moved a little towards +x and, much less, towards +y;
/// so no vertex, horizontal chord or vertical tangent needs a case of its own. It does not tell
/// points on the path from others.

#include "part/model/Winding.h"

namespace gmpart {

namespace {

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

}  // namespace

int windingNumber(const Path& path, Vec2 p) {
    int winding = 0;
    for (const Element& e : path.elements) {
        winding += chordCrossing(e, p);
        if (isArc(e)) winding += circularSegmentWinding(e, p);
    }
    return winding;
}

}  // namespace gmpart
