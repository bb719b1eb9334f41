// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "gmregion/CleanUp.h"
#include "gmregion/Outcome.h"

#include "part/model/Path.h"

namespace gmpart {

/// How a drawing is cleaned.
struct CleanRequest {
    /// What the contours cover; nothing for what their nesting says (PartRegions).
    std::optional<gmregion::FillRule> rule;
    double tolerance = 0.0;  ///< as for gmregion::cleanUp(); 0 for partTolerance()
    /// Runs of short elements become arcs and lines within that distance; 0 for none.
    double fit = 0.0;
};

/// What came of it.
struct CleanResult {
    gmregion::Outcome result;  ///< origins have the numbers of contours
    std::size_t left = 0;      ///< contours that are open or enclose nothing: they are left out
    std::size_t elements = 0;  ///< of the closed contours
    std::size_t unfitted = 0;  ///< of the regions before runs were fitted
};

/// Makes regions of the closed contours of a drawing: without overlaps, crossings and doubled
/// lines, outlines counter-clockwise and holes clockwise. Cost: near-linear.
CleanResult cleanPart(const std::vector<Path>& contours, const CleanRequest& request);

}  // namespace gmpart
