// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace gmregion {

/// The number of something in an array; operations refuse more things than it can count.
using Index = std::uint32_t;

/// No number.
constexpr Index kNone = 0xffffffffu;

}  // namespace gmregion
