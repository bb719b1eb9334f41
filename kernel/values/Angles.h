// SPDX-License-Identifier: MIT
/// @file
/// Angles in plain numbers: the formulas behind GmVec and GmAngle.
#pragma once

#include "gmkernel/GmBase.h"
#include "kernel/values/Constants.h"
#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

inline double degreesOf(double radians) {
    return radians / kPi * 180.0;
}
inline double radiansOf(double degrees) {
    return degrees * kPi / 180.0;
}
/// Brings degrees into (-180, 180] by whole turns.
double standardizedDegrees(double degrees);

/// The polar angle of a vector in the x-y plane, in (-180, 180] degrees. Components below the
/// length tolerance snap to the axes; both below it give 0.
double polarDegrees(Vec3 const& v);
/// The same in radians, before it was turned into degrees.
double polarRadians(Vec3 const& v);
/// The same with the arc tangent turned into degrees alone, which rounds differently.
double polarDegreesOfTangent(Vec3 const& v);

/// The angle from `a` to `b` in degrees, in (-180, 180]; 0 for a zero vector.
double degreesBetween(Vec3 const& a, Vec3 const& b);
/// The same in one sense: clockwise in (-360, 0], otherwise in [0, 360).
double degreesBetween(Vec3 const& a, Vec3 const& b, GmBase::eRotDir rot);

/// The unit vector of a polar angle.
Vec3 directionAt(double degrees);

}  // namespace gmkernel_detail
