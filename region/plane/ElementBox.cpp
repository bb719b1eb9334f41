// SPDX-License-Identifier: MIT
/// @file
/// Boxes of elements from their ends.
///
/// An arc leaves the box of its ends where it runs along an axis, that is where its normal v is an
/// axis direction: in the point at + (n - v) / k with n the normal at the start and k the
/// curvature. For flat arcs the division costs digits, and there the height of the arc is a margin
/// that is small enough.
#include "region/plane/ElementBox.h"

#include <cmath>

#include "region/plane/Carrier.h"

namespace gmregion {

namespace {

/// Arcs of a smaller bulge are flat: their height is below a twentieth of the chord.
constexpr double kFlat = 0.1;

void includeExtremes(Box& box, const Element& e) {
    const Carrier c = carrierOf(e);
    const Vec2 atEnd = c.normal - c.curvature * (e.ep - c.at);
    const double sense = e.bulge > 0.0 ? 1.0 : -1.0;
    for (const Vec2 v : {Vec2{1, 0}, Vec2{0, 1}, Vec2{-1, 0}, Vec2{0, -1}}) {
        const bool passes = sense * cross(c.normal, v) >= 0.0 && sense * cross(v, atEnd) >= 0.0;
        if (passes) box.include(c.at + (1.0 / c.curvature) * (c.normal - v));
    }
}

}  // namespace

Box boxAbout(const Element& e) {
    Box box;
    box.include(e.sp);
    box.include(e.ep);
    if (std::fabs(e.bulge) < kFlat) {
        const Vec2 chord = e.ep - e.sp;
        return box.grown(0.5 * std::fabs(e.bulge) * std::sqrt(dot(chord, chord)));
    }
    includeExtremes(box, e);
    return box;
}

}  // namespace gmregion
