// SPDX-License-Identifier: MIT
/// @file
/// Lines and circles in one form.
///
/// With x the vector from a point of the curve, n the unit normal to the left there and k the
/// curvature, the curve is G(x) = n x - k/2 x x = 0, and G is positive on the left. For a line that
/// is the distance; for a circle of radius 1/k about the centre n/k, G = (r^2 - rho^2) / (2 r) with
/// rho the distance from the centre. The signed distance follows as 2 G / (1 + sqrt(1 - 2 k G)),
/// which loses no digits when k goes to 0. The gradient n - k x has the length sqrt(1 - 2 k G).
///
/// An arc with the chord c of length L and the bulge b (the tangent of a quarter of its sweep)
/// starts turned by half its sweep from the chord, whose cosine is (1 - b^2) / (1 + b^2) and whose
/// sine is 2 b / (1 + b^2); its curvature is 4 b / (L (1 + b^2)). So a flat arc is computed from
/// its chord and its height, never from a centre far away.
#include "region/plane/Carrier.h"

#include <algorithm>
#include <cmath>

namespace gmregion {

Carrier carrierOf(const Element& e) {
    const Vec2 chord = e.ep - e.sp;
    const double width = std::sqrt(dot(chord, chord));
    const Vec2 along = (1.0 / width) * chord;
    const Vec2 left{-along.y, along.x};
    const double b = e.bulge;
    const double q = 1.0 + b * b;
    const double cosine = (1.0 - b) * (1.0 + b) / q;
    const double sine = 2.0 * b / q;
    return {e.sp, cosine * left + sine * along, 2.0 * sine / width};
}

std::optional<Carrier> parallel(const Carrier& c, double d) {
    const double growth = 1.0 + c.curvature * d;
    if (!(growth > 0.0)) return std::nullopt;
    return Carrier{c.at - d * c.normal, c.normal, c.curvature / growth};
}

Side sideOf(const Carrier& c, Vec2 p) {
    const Vec2 x = p - c.at;
    return {dot(c.normal, x) - 0.5 * c.curvature * dot(x, x), c.normal - c.curvature * x};
}

double signedDistance(const Carrier& c, Vec2 p) {
    const double value = sideOf(c, p).value;
    const double squared = std::max(0.0, 1.0 - 2.0 * c.curvature * value);
    return 2.0 * value / (1.0 + std::sqrt(squared));
}

// At the distance d, G = d - k/2 d^2, which grows up to the centre; a limit beyond the centre takes
// in all of the inside.
bool isWithin(const Carrier& c, Vec2 p, double limit) {
    const double value = sideOf(c, p).value;
    const double bend = c.curvature * limit;
    const bool isBelow = value <= limit - 0.5 * bend * limit || bend > 1.0;
    return isBelow && (value >= -limit - 0.5 * bend * limit || bend < -1.0);
}

Vec2 footOn(const Carrier& c, Vec2 p) {
    const Side side = sideOf(c, p);
    const double steepness = std::sqrt(dot(side.gradient, side.gradient));
    if (!(steepness > 0.0)) return c.at;
    const double distance = 2.0 * side.value / (1.0 + steepness);
    return p - (distance / steepness) * side.gradient;
}

// The tangent of a quarter of the angle a between two vectors of which the product of the lengths
// is m: of tan(a/4) = tan(a/2) / (1 + sqrt(1 + tan(a/2)^2)) with tan(a/2) = cross / (m + dot) below
// a quarter-turn, and with tan(a/2) = (m - dot) / cross above, where that has the digits.
double bulgeOfTurn(Vec2 from, Vec2 to, bool counterClockwise) {
    const double m = std::sqrt(dot(from, from) * dot(to, to));
    const double along = dot(from, to);
    const double aside = cross(from, to);
    if (!(m > 0.0)) return 0.0;
    if (along >= 0.0) return aside / (m + along + std::sqrt(2.0 * m * (m + along)));
    const double sense = counterClockwise ? 1.0 : -1.0;
    return sense * (std::sqrt(2.0 * m * (m - along)) - sense * aside) / (m - along);
}

double bulgeBetween(const Carrier& c, Vec2 from, Vec2 to) {
    if (c.curvature == 0.0) return 0.0;
    return bulgeOfTurn(sideOf(c, from).gradient, sideOf(c, to).gradient, c.curvature > 0.0);
}

}  // namespace gmregion
