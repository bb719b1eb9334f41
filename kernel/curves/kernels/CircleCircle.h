// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/curves/kernels/Hits.h"

namespace gmkernel_detail {

/// The crossings of two circles in the x-y plane, with the z of the first centre: 0, 1 (touching)
/// or 2, the point on the right of the direction from `m0` to `m1` first. Concentric circles have
/// none.
///
/// The foot of the common chord lies at a = (r0^2 - r1^2 + D^2) / (2 D) from `m0` on the line of
/// centres, the crossings at h = sqrt(r0^2 - a^2) to both sides of it.
Hits<2> intersectCircleCircle(Vec3 const& m0, double r0, Vec3 const& m1, double r1);

}  // namespace gmkernel_detail
