// SPDX-License-Identifier: MIT
/// @file
/// Rays to the left.
///
/// With t the way along the ray, G of the carrier (see Carrier.cpp) is v + b t - k/2 t t there. How
/// often an arc passes the height of the point follows from its ends alone, once or not or twice;
/// once, it is the root on its own side of the chord, twice, both are.
#include "region/plane/LevelHits.h"

#include <cmath>

#include "region/plane/Carrier.h"

namespace gmregion {

namespace {

constexpr LevelHit kNoHit{-HUGE_VAL, false};

/// How far a point of the carrier lies on the arc's side of its chord, in squares of length.
double ownSide(const Element& e, Vec2 p) {
    const double side = cross(e.ep - e.sp, p - e.sp);
    return e.bulge > 0.0 ? -side : side;
}

LevelHit hitOfLine(const Element& e, Vec2 p) {
    const bool startsAbove = e.sp.y > p.y;
    const bool endsAbove = e.ep.y > p.y;
    if (startsAbove == endsAbove) return kNoHit;
    const double share = (p.y - e.sp.y) / (e.ep.y - e.sp.y);
    const double x = e.sp.x + share * (e.ep.x - e.sp.x);
    return x < p.x ? LevelHit{x, startsAbove} : kNoHit;
}

LevelHit hitOfArc(const Element& e, Vec2 p) {
    const Carrier carrier = carrierOf(e);
    const Side side = sideOf(carrier, p);
    const double b = -side.gradient.x;
    const double discriminant = b * b + 2.0 * carrier.curvature * side.value;
    if (!(discriminant >= 0.0)) return kNoHit;
    const double root = std::sqrt(discriminant);
    const double q = b < 0.0 ? b - root : b + root;
    const double first = -2.0 * side.value / q;
    const double second = q / carrier.curvature;
    const double ownFirst = ownSide(e, {p.x - first, p.y});
    const double ownSecond = ownSide(e, {p.x - second, p.y});
    const bool startsAbove = e.sp.y > p.y;
    if (startsAbove != (e.ep.y > p.y)) {
        const double t = ownFirst > ownSecond ? first : second;
        return t > 0.0 ? LevelHit{p.x - t, startsAbove} : kNoHit;
    }
    if (!(ownFirst > 0.0 && ownSecond > 0.0)) return kNoHit;
    const double nearer = std::fmin(first, second);
    const double t = nearer > 0.0 ? nearer : std::fmax(first, second);
    return t > 0.0 ? LevelHit{p.x - t, side.value > 0.0} : kNoHit;
}

}  // namespace

LevelHit hitLeftOf(const Element& e, Vec2 p) {
    return e.bulge == 0.0 ? hitOfLine(e, p) : hitOfArc(e, p);
}

}  // namespace gmregion
