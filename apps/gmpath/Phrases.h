// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "region/offset/OffsetJob.h"

namespace gmpath {

/// Digits of distances in remarks.
constexpr int kDistanceDigits = 9;

/// What is wrong with an offset.
std::string faultText(const gmregion::FaultyOffset& faulty);

/// Why nothing could be done with a contour, and what its owner can do about it.
std::string refusalText(gmregion::Refusal refusal);

}  // namespace gmpath
