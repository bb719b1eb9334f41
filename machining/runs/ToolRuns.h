// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/bridge/KernelLimits.h"
#include "region/offset/OffsetCheck.h"

namespace gmmachining {

/// On which side of the tool the part lies, seen along the cut.
enum class PartSide { kRight, kLeft };

/// One offset, as the tool follows it.
struct ToolRun {
    gmregion::Path path;
    /// The path starts where it has to: it is open, or it starts beside the start of the contour
    /// (`runStart`). Other runs may start anywhere.
    bool startFixed = false;
};

/// The offsets of a contour at one distance.
struct ToolRuns {
    std::vector<ToolRun> runs;
    gmregion::Refusal refusal = gmregion::Refusal::kNone;  ///< why the contour has no offsets
    gmregion::OffsetFault fault = gmregion::OffsetFault::kNone;
};

/// Offsets a contour at the signed distance d, positive to the right of its direction of travel,
/// and runs the results so that the contour lies on the given side of the tool.
ToolRuns toolRuns(const gmregion::Path& contour, double d, PartSide side);

}  // namespace gmmachining
