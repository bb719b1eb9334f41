// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "gmregion/Simplify.h"
#include "region/simplify/Chain.h"

namespace gmregion {

/// Appends pieces as a path. Halves of one element that both stayed are that element again, bit by
/// bit, and arcs on one circle one arc, of three quarters of a turn at the most; a closed path of
/// two half circles stays two.
/// @param elements working memory
void writePath(const std::vector<Piece>& pieces, bool closed, std::int64_t id, const Limits& limits,
               std::vector<Element>& elements, Simplified& result);

}  // namespace gmregion
