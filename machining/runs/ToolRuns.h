// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/offset/PartOffset.h"

namespace gmmachining {

/// On which side of the tool the part lies, seen along the cut.
enum class PartSide { kRight, kLeft };

/// One path of an offset, as the tool follows it.
struct ToolRun {
    gmpart::Path path;
    std::vector<std::size_t> contours;  ///< which it cuts, rising
    /// The path starts where it has to: beside the start of a contour. Others may start anywhere.
    bool startFixed = false;
};

/// The runs of a drawing, and what came of its offsets.
struct ToolRuns {
    std::vector<std::vector<ToolRun>> passes;  ///< one entry a distance
    /// What the offsets tell besides; the paths that stay there have faults and are not cut.
    gmpart::PartOffsets rest;
};

/// Offsets the part to its waste side at each of some positive distances and runs the results so
/// that the part lies on the given side of the tool. Of the runs of a contour in a pass, the one
/// nearest to the contour's own start, moved sideways by the distance, begins there.
ToolRuns toolRuns(const std::vector<gmpart::Path>& contours, const gmpart::PartRegions& regions,
                  const std::vector<double>& distances, PartSide side,
                  const gmpart::ProgressCall& progress);

}  // namespace gmmachining
