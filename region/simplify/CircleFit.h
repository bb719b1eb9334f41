// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <optional>

#include "region/simplify/Chain.h"

namespace gmregion {

/// The circle that a closed chain without corners runs round once, as two half circles within the
/// tolerance both ways. They begin at the start of the chain, or beside it where that is not on the
/// circle. Cost: linear in the pieces.
std::optional<std::array<Piece, 2>> fitCircle(const Chain& chain, const Limits& limits);

}  // namespace gmregion
