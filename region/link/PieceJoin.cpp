// SPDX-License-Identifier: MIT
#include "region/link/PieceJoin.h"

#include <cmath>

#include "region/plane/Carrier.h"

namespace gmregion {

namespace {

/// The largest bulge of an element of a result, that of 300 degrees: beyond it the ends come near
/// each other in comparison to the radius.
constexpr double kLargestBulge = 3.7320508075688772;

/// In parts of the tolerance, how far an end between two pieces may lie beside both as one.
constexpr double kStraight = 1.0 / 1024.0;

}  // namespace

bool makeOne(const Element& a, const Element& b, double tolerance) {
    if ((a.bulge == 0.0) != (b.bulge == 0.0)) return false;
    const double product = a.bulge * b.bulge;
    if (product < 0.0 || product >= 1.0) return false;
    const double bulge = joinedBulge(a.bulge, b.bulge);
    if (std::fabs(bulge) > kLargestBulge) return false;
    const Vec2 chord = b.ep - a.sp;
    if (!(dot(chord, chord) > 0.0)) return false;
    const double beside = std::fabs(signedDistance(carrierOf({a.sp, b.ep, bulge}), a.ep));
    return beside <= kStraight * tolerance;
}

}  // namespace gmregion
