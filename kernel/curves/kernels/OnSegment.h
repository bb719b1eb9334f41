// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

/// Does a point `q` of the supporting line lie on the segment from `sp` to `ep`? Decided by the
/// parameter along the dominant axis of the direction, in 0..1; the ends count within the length
/// tolerance.
bool onSegment(GmPoint const& q, GmPoint const& sp, GmPoint const& ep, GmDir const& dir);

}  // namespace gmkernel_detail
