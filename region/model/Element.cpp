// SPDX-License-Identifier: MIT
/// @file
/// Segments and arcs by their ends and bulge.
///
/// The bulge is the tangent of a quarter of the sweep, so that half and full sweep, centre, halving
/// point and tangents follow from it by rational formulas: the sine and cosine of half the sweep
/// are 2b/(1+b^2) and (1-b^2)/(1+b^2). Flat arcs keep all digits, since nothing is taken from a
/// far-off centre but the centre itself. Full circles have no bulge; they come as halves.

#include "region/model/Element.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace gmregion {

namespace {

/// An arc nearer to its chord than this is as good as straight.
constexpr double kFlatSagitta = 0.1 * kKernelTolerance;

/// v turned by half the sweep of the bulge, counter-clockwise when `sign` is positive.
Vec2 turnedHalfSweep(Vec2 v, double bulge, double sign) {
    const double scale = 1.0 + bulge * bulge;
    const double cosine = (1.0 - bulge * bulge) / scale;
    const double sine = sign * 2.0 * bulge / scale;
    return {cosine * v.x - sine * v.y, sine * v.x + cosine * v.y};
}

/// v turned counter-clockwise by an angle in radians.
Vec2 turned(Vec2 v, double angle) {
    const double cosine = std::cos(angle);
    const double sine = std::sin(angle);
    return {cosine * v.x - sine * v.y, sine * v.x + cosine * v.y};
}

Vec2 nearestOnSegment(const Element& e, Vec2 p) {
    const Vec2 d = e.ep - e.sp;
    const double lengthSquared = dot(d, d);
    if (lengthSquared == 0.0) return e.sp;
    return e.sp + std::clamp(dot(p - e.sp, d) / lengthSquared, 0.0, 1.0) * d;
}

}  // namespace

double sweep(const Element& e) {
    return 4.0 * std::atan(e.bulge);
}

double radius(const Element& e) {
    if (!isArc(e)) return std::numeric_limits<double>::infinity();
    return distance(e.sp, e.ep) * (1.0 + e.bulge * e.bulge) / (4.0 * std::abs(e.bulge));
}

Vec2 centre(const Element& e) {
    const double offset = (e.bulge * e.bulge - 1.0) / (4.0 * e.bulge);
    return middle(e.sp, e.ep) + offset * rightNormal(e.ep - e.sp);
}

Vec2 halvingPoint(const Element& e) {
    return middle(e.sp, e.ep) + 0.5 * e.bulge * rightNormal(e.ep - e.sp);
}

// The chord from the start turns half as far from the chord of the whole as the tangent does; its
// length follows from the sines of both half sweeps. So a flat arc needs no far-off centre.
Vec2 pointAt(const Element& e, double t) {
    if (!isArc(e)) return e.sp + t * (e.ep - e.sp);
    const double half = 0.5 * sweep(e);
    const double share = std::sin(t * half) / std::sin(half);
    return e.sp + share * turned(e.ep - e.sp, (t - 1.0) * half);
}

Vec2 tangentAt(const Element& e, double t) {
    return unit(turned(e.ep - e.sp, (t - 0.5) * sweep(e)));
}

double length(const Element& e) {
    return isArc(e) ? radius(e) * std::abs(sweep(e)) : distance(e.sp, e.ep);
}

Vec2 tangentStart(const Element& e) {
    return unit(turnedHalfSweep(e.ep - e.sp, e.bulge, -1.0));
}

Vec2 tangentEnd(const Element& e) {
    return unit(turnedHalfSweep(e.ep - e.sp, e.bulge, 1.0));
}

Element reversed(const Element& e) {
    return {e.ep, e.sp, -e.bulge};
}

double sideOfChord(const Element& e, Vec2 p) {
    return cross(e.ep - e.sp, p - e.sp);
}

// A counter-clockwise arc lies right of its chord, a clockwise one left of it.
bool arcHolds(const Element& e, Vec2 q) {
    return e.bulge * sideOfChord(e, q) <= 0.0;
}

Vec2 nearestPoint(const Element& e, Vec2 p) {
    if (!isArc(e)) return nearestOnSegment(e, p);
    const Vec2 m = centre(e);
    const Vec2 foot = m + radius(e) * unit(p - m);
    if (foot != m && arcHolds(e, foot)) return foot;
    return distance(e.sp, p) <= distance(e.ep, p) ? e.sp : e.ep;
}

double distance(const Element& e, Vec2 p) {
    return distance(nearestPoint(e, p), p);
}

Element straightened(const Element& e) {
    const double sagitta = 0.5 * std::abs(e.bulge) * distance(e.sp, e.ep);
    return sagitta < kFlatSagitta ? Element{e.sp, e.ep, 0.0} : e;
}

Element arcThrough(Vec2 sp, Vec2 through, Vec2 ep) {
    // The turn from the first chord to the second is half the sweep (inscribed angle).
    const Vec2 first = through - sp;
    const Vec2 second = ep - through;
    const double halfSweep = std::atan2(cross(first, second), dot(first, second));
    return straightened({sp, ep, std::tan(0.5 * halfSweep)});
}

Element withEnds(const Element& e, Vec2 sp, Vec2 ep) {
    if (e.sp == sp && e.ep == ep) return e;
    if (!isArc(e)) return {sp, ep, 0.0};
    return arcThrough(sp, halvingPoint(e), ep);
}

}  // namespace gmregion
