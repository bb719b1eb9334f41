// SPDX-License-Identifier: MIT
/// @file
/// Polar angles, and angles between vectors.
///
/// The angle between vectors is the arc cosine of their scalar product with the sign of the cross
/// product, which loses digits next to 0 and 180 degrees. The polar angle instead snaps to the
/// axes: a component below the length tolerance counts as zero, so that vectors meant to be
/// axis-parallel are. As this is a length, short vectors snap from far off the axes.
#include "kernel/values/Angles.h"

#include <cmath>

namespace gmkernel_detail {

namespace {

constexpr double kFullTurn = 360.0;

bool nearZero(double component) {
    return std::fabs(component) < GmBase::m_scdPrec;
}

/// The polar angle of (x, y) in the unit in which half a turn is `halfTurn` and an arc tangent in
/// radians becomes `atan * factor / divisor`.
double polarAngle(Vec3 const& v, double halfTurn, double factor, double divisor) {
    if (nearZero(v.x)) {
        if (v.y < 0) return -halfTurn / 2;
        return nearZero(v.y) ? 0.0 : halfTurn / 2;
    }
    if (nearZero(v.y)) return v.x > 0 ? 0.0 : halfTurn;

    const double principal = std::atan(v.y / v.x) * factor / divisor;
    if (v.x > 0) return principal;
    return v.y < 0 ? principal - halfTurn : principal + halfTurn;
}

}  // namespace

double standardizedDegrees(double degrees) {
    // Stepping by 360 would take for ever on huge values and not end on infinite ones.
    constexpr double fewTurns = 10 * kFullTurn;
    if (std::fabs(degrees) > fewTurns) degrees = std::fmod(degrees, kFullTurn);
    while (degrees > 180.0)
        degrees -= kFullTurn;
    while (degrees <= -180.0)
        degrees += kFullTurn;
    return degrees;
}

double polarDegrees(Vec3 const& v) {
    return standardizedDegrees(degreesOf(polarRadians(v)));
}

double polarRadians(Vec3 const& v) {
    return polarAngle(v, kPi, 1.0, 1.0);
}

double polarDegreesOfTangent(Vec3 const& v) {
    return polarAngle(v, 180.0, 180.0, kPi);
}

double degreesBetween(Vec3 const& a, Vec3 const& b) {
    const double lengthA = length(a);
    const double lengthB = length(b);
    if (lengthA == 0.0 || lengthB == 0.0) return 0.0;

    const double cosine = dot(a, b) / lengthA / lengthB;
    const double sine = (a.x * b.y - a.y * b.x) / lengthA / lengthB;
    if (std::fabs(cosine) - 1.0 < 0.0) {
        const double angle = std::acos(cosine);
        return standardizedDegrees(degreesOf(sine < 0.0 ? -angle : angle));
    }
    // Parallel or opposite; rounding may have taken the cosine beyond the domain of acos.
    return standardizedDegrees(degreesOf(cosine > 0.0 ? 0.0 : kPi));
}

double degreesBetween(Vec3 const& a, Vec3 const& b, GmBase::eRotDir rot) {
    const double degrees = degreesBetween(a, b);
    if (rot == GmBase::eRotCW) return degrees > 0.0 ? degrees - kFullTurn : degrees;
    return degrees < 0.0 ? degrees + kFullTurn : degrees;
}

Vec3 directionAt(double degrees) {
    const double radians = radiansOf(degrees);
    return {std::cos(radians), std::sin(radians), 0.0};
}

}  // namespace gmkernel_detail
