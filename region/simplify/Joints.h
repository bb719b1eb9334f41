// SPDX-License-Identifier: MIT
#pragma once

#include "region/simplify/Chain.h"

namespace gmregion {

/// Sets the joints of a chain from its pieces. Cost: linear, as no walk takes more than a fixed
/// number of pieces.
void setJoints(Chain& chain, const Limits& limits);

/// Makes a piece of a closed chain the first one, with its joints.
void turnTo(Chain& chain, std::size_t first);

/// The number of the first corner of a closed chain; the number of pieces when it has none.
std::size_t firstCorner(const Chain& chain);

}  // namespace gmregion
