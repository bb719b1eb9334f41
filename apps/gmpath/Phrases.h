// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "gmregion/Verify.h"

#include "part/kernel/KernelLimits.h"

namespace gmpath {

/// Digits of distances in remarks.
constexpr int kDistanceDigits = 9;

/// Where something is, to be put behind a text.
std::string placeText(gmregion::Point p);

/// "contour 3 on layer CUT near (1, 2)", counted from 1, with the start of the contour; its number
/// alone where there is no such contour.
std::string contourText(std::size_t contour, const std::vector<gmpart::Path>& contours);

/// What is wrong with a result: the first of a number of faults.
std::string faultText(const gmregion::Fault& fault, std::size_t count);

/// The numbers of contours as users count them, the first ten by name.
std::string numbersText(const std::vector<std::size_t>& contours);

/// Why the kernel could do nothing with a contour, and what its owner can do about it.
std::string refusalText(gmpart::KernelRefusal refusal);

}  // namespace gmpath
