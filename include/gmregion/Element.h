// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Point.h"

namespace gmregion {

/// One piece of a path: a straight segment or a circular arc.
///
/// An arc is held by its ends and its bulge, the tangent of a quarter of the sweep: positive runs
/// counter-clockwise, 1 is a half circle, 0 a straight segment. So the ends are exact by
/// construction, and centre and radius follow from them. A full circle has no such form; it is
/// held as two half circles.
struct Element {
    Point sp;
    Point ep;
    double bulge = 0.0;
};

}  // namespace gmregion
