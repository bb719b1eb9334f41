// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "machining/runs/ToolRuns.h"

namespace gmmachining {

/// Contours that are cut at one go, with their runs.
struct CutUnit {
    std::vector<std::size_t> contours;         ///< rising
    std::vector<std::vector<ToolRun>> passes;  ///< one entry a pass, maybe empty
};

/// Puts contours together that share a run in any of the passes, and each run to its contours.
/// @param count number of contours
/// @param passes the runs, moved from
std::vector<CutUnit> cutUnits(std::size_t count, std::vector<std::vector<ToolRun>>&& passes);

/// For every unit those that some contour of it lies in.
/// @param units the units
/// @param holders for every contour the contours that it lies in
std::vector<std::vector<std::size_t>> holdersOfUnits(
    const std::vector<CutUnit>& units, const std::vector<std::vector<std::size_t>>& holders);

}  // namespace gmmachining
