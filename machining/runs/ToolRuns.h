#pragma once

#include <vector>

#include "region/offset/OffsetCheck.h"

namespace gmpath {

/// On which side of the tool the part lies, seen along the cut.
enum class PartSide { kRight, kLeft };

/// One offset, as the tool follows it.
struct ToolRun {
    Path path;
    /// The path starts where it has to: it is open, or it starts where the kernel places the start
    /// of a path along these offsets. Other runs may start anywhere.
    bool startFixed = false;
};

/// The offsets of a contour at one distance.
struct ToolRuns {
    std::vector<ToolRun> runs;
    bool accepted = true;  ///< false when the kernel refused the contour
    OffsetFault fault = OffsetFault::kNone;
};

/// Offsets a contour at the signed distance d, positive to the right of its direction of travel,
/// and runs the results so that the contour lies on the given side of the tool.
ToolRuns toolRuns(const Path& contour, double d, PartSide side);

}  // namespace gmpath
