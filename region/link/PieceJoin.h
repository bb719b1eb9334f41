// SPDX-License-Identifier: MIT
#pragma once

#include "region/model/Element.h"

namespace gmregion {

/// The bulge of two arcs of one circle that follow each other: the tangents of their quarter
/// sweeps, added.
inline double joinedBulge(double a, double b) {
    return (a + b) / (1.0 - a * b);
}

/// Whether two pieces that follow each other make one element of at most 300 degrees, which passes
/// their common end within a 2^-10th of the tolerance.
bool makeOne(const Element& a, const Element& b, double tolerance);

}  // namespace gmregion
