// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmregion/Boolean.h"
#include "gmregion/Outcome.h"
#include "gmregion/Verify.h"

#include "part/model/Path.h"

namespace gmpart {

/// What came of combining parts.
struct PartCombination {
    gmregion::Outcome result;       ///< origins number the contours of all parts in a row
    gmregion::Verdict verdict;      ///< what the checks of all steps found
    std::vector<bool> hasRegions;   ///< for every contour of all parts; open ones have none
    std::size_t regionsBefore = 0;  ///< outlines of the parts
};

/// Combines parts from the first to the last: the union or intersection of all, or the first
/// without the others. Each is a part with holes (PartRegions); contours that enclose nothing are
/// left out. Every step is checked (gmregion::verifyBoolean()). Cost: near-linear for two parts.
/// @param parts the contours of each; two at least
/// @param combination union, intersection or difference
PartCombination combineParts(const std::vector<const std::vector<Path>*>& parts,
                             gmregion::Combination combination);

}  // namespace gmpart
