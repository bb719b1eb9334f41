// SPDX-License-Identifier: MIT
/// @file
/// Forms over an element, without samples.
///
/// On a circle with the curvature k through the origin, x x = 2 n x / k. So the form of another
/// carrier, value + g x - k'/2 x x, is a linear function on it, and goes up and down along it as a
/// sine does: over half a turn or less it has an extreme between the ends only where its slope
/// changes sign from one end to the other. On a segment it is a square polynomial, for which the
/// same holds. Where there is such an extreme it is bounded by the middle: a linear function leaves
/// the straight way between its values at the ends by its slope square to the chord times the
/// height over the chord, which is greatest in the middle.
#include "region/verify/Alongside.h"

#include <algorithm>
#include <cmath>

#include "region/plane/ElementWinding.h"

namespace gmregion {

namespace {

FormRange ranged(double atStart, double atEnd, double slopeAtStart, double slopeAtEnd,
                 double atMiddle) {
    FormRange range{std::min(atStart, atEnd), std::max(atStart, atEnd)};
    const double leaves = std::fabs(atMiddle - 0.5 * (atStart + atEnd));
    if (slopeAtStart < 0.0 && slopeAtEnd > 0.0) range.low -= leaves;
    if (slopeAtStart > 0.0 && slopeAtEnd < 0.0) range.high += leaves;
    return range;
}

}  // namespace

Probe::Probe(const BoundaryPiece& piece) : Probe(piece, piece.carrier) {}

Probe::Probe(const Element& e, const Carrier& c)
    : sp(e.sp),
      ep(e.ep),
      mid(middleOf(e)),
      startNormal(sideOf(c, e.sp).gradient),
      endNormal(sideOf(c, e.ep).gradient) {}

FormRange formOver(const Carrier& c, const Probe& p) {
    const Side atStart = sideOf(c, p.sp);
    const Side atEnd = sideOf(c, p.ep);
    // The direction of travel is the left normal turned to the right.
    const double slopeAtStart = dot(atStart.gradient, rightNormal(p.startNormal));
    const double slopeAtEnd = dot(atEnd.gradient, rightNormal(p.endNormal));
    const double atMiddle =
        (slopeAtStart < 0.0) != (slopeAtEnd < 0.0) ? sideOf(c, p.mid).value : 0.0;
    return ranged(atStart.value, atEnd.value, slopeAtStart, slopeAtEnd, atMiddle);
}

FormRange heightOver(Vec2 from, Vec2 direction, const Probe& p) {
    return ranged(dot(p.sp - from, direction), dot(p.ep - from, direction),
                  dot(direction, rightNormal(p.startNormal)),
                  dot(direction, rightNormal(p.endNormal)), dot(p.mid - from, direction));
}

}  // namespace gmregion
