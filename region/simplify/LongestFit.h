// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/simplify/Chain.h"

namespace gmregion {

/// Replaces a chain by one of few pieces. Corners stay, and so do the ends of open chains; a closed
/// chain without corners may begin elsewhere afterwards. Joints have to be set, and are not set
/// for the result. Cost: n log n in the pieces.
/// @param chain must have pieces
void makeFew(Chain& chain, const Limits& limits, std::vector<Piece>& result);

}  // namespace gmregion
