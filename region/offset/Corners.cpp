// SPDX-License-Identifier: MIT
#include "region/offset/Corners.h"

#include <cmath>

namespace gmregion {

namespace {

/// Directions that turn back within this sine are told apart by where the elements lie.
constexpr double kTurnsBack = 1e-6;

/// Whether an element that turns back lies on the left of the one before.
bool turnsBackOnLeft(const SourceElement& before, const SourceElement& after) {
    const Vec2 chordBefore = before.ep - before.sp;
    const Vec2 chordAfter = after.ep - after.sp;
    if (dot(chordAfter, chordAfter) <= dot(chordBefore, chordBefore))
        return sideOf(before.carrier(), after.ep).value >= 0.0;
    return sideOf(after.carrier(), before.sp).value >= 0.0;
}

}  // namespace

bool opensTo(const SourceElement& before, const SourceElement& after, double distance) {
    const double turn = cross(before.endNormal, after.startNormal);
    const bool back = dot(before.endNormal, after.startNormal) < 0.0;
    const bool turnsLeft =
        back && std::fabs(turn) < kTurnsBack ? turnsBackOnLeft(before, after) : turn > 0.0;
    return turnsLeft == (distance > 0.0);
}

}  // namespace gmregion
