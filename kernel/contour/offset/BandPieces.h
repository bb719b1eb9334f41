// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "kernel/contour/offset/OffsetElement.h"

namespace gmkernel_detail {

/// The closed boundary of an element's band of half-width |d|, in order: start cap, offset on the
/// chosen side, end cap, offset on the other side reversed.
///
/// Offsets that vanish are left out. A curve that is neither stretch nor arc has no band.
/// @param element the source element
/// @param source its index
/// @param id its identifier
/// @param d the offset distance, positive to the right of the direction of travel
std::vector<GmOffsetElement> bandPieces(GmCurve const& element, int source, int id, double d);

}  // namespace gmkernel_detail
