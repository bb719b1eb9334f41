// SPDX-License-Identifier: MIT
/// @file
/// Winding by a ray to the left, x falling, that runs just above its point.
///
/// The chord counts when it passes the height of the point and the point lies east of it: +1 when
/// it goes down, -1 when it goes up. An arc adds one turn for the points between it and its chord.
/// A point on the chord's line counts as west of it, and one on a level chord as above it, for both
/// halves alike, so that no rounding can count one and miss the other.
#include "region/plane/ElementWinding.h"

#include <algorithm>

#include "region/plane/Carrier.h"

namespace gmregion {

namespace {

int ofChord(const Element& e, Vec2 p, bool onRight) {
    const bool startsAbove = e.sp.y > p.y;
    const bool endsAbove = e.ep.y > p.y;
    if (startsAbove == endsAbove) return 0;
    if (endsAbove) return onRight ? -1 : 0;
    return onRight ? 0 : 1;
}

bool isRightOfChord(const Element& e, Vec2 p) {
    const double side = cross(e.ep - e.sp, p - e.sp);
    if (side != 0.0) return side < 0.0;
    const bool down = e.sp.y > p.y && e.ep.y <= p.y;
    const bool levelBack = e.sp.y == e.ep.y && e.ep.x < e.sp.x;
    return down || levelBack;
}

}  // namespace

int windingOf(const Element& e, Vec2 p) {
    const bool onRight = isRightOfChord(e, p);
    const int winding = ofChord(e, p, onRight);
    if (e.bulge == 0.0 || onRight != (e.bulge > 0.0)) return winding;
    const bool onLeftOfArc = sideOf(carrierOf(e), p).value > 0.0;
    if (onLeftOfArc != (e.bulge > 0.0)) return winding;
    return e.bulge > 0.0 ? winding + 1 : winding - 1;
}

int windingRightOf(const Element& e) {
    const Vec2 p = middleOf(e);
    // Where the middle is no higher than the upper end, by rounding or because the element is
    // level, the ray runs just above the whole element.
    const bool passes = (e.sp.y > p.y) != (e.ep.y > p.y);
    if (!passes && p.y == std::max(e.sp.y, e.ep.y)) return e.ep.x > e.sp.x ? -1 : 0;
    if (e.bulge < 0.0) return ofChord(e, p, false) - 1;
    return ofChord(e, p, true);
}

Vec2 middleOf(const Element& e) {
    const Vec2 chord = e.ep - e.sp;
    return middle(e.sp, e.ep) + (0.5 * e.bulge) * rightNormal(chord);
}

}  // namespace gmregion
