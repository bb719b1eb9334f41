// SPDX-License-Identifier: MIT
#pragma once

#include "drawing/curves/Bezier.h"

namespace gmdrawing {

/// An ellipse by its centre and two half diameters that are conjugate; the point at the parameter u
/// is `centre + cos(u) first + sin(u) second`.
struct Ellipse {
    gmregion::Vec2 centre;
    gmregion::Vec2 first;
    gmregion::Vec2 second;
};

/// The arc from the parameter `start` over the signed `sweep`, radians, up to a whole turn, as
/// exact pieces of degree two, of a quarter turn at the most. A whole turn ends exactly where it
/// starts.
std::vector<Bezier> ellipseArc(const Ellipse& ellipse, double start, double sweep);

/// A circular arc of any sweep as such pieces, with exactly its ends.
std::vector<Bezier> ellipseArc(const gmregion::Element& arc);

}  // namespace gmdrawing
