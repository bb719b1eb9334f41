// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <optional>
#include <vector>

#include "region/bridge/KernelLimits.h"
#include "region/offset/OffsetCheck.h"

namespace gmregion {

/// On which side of a contour to offset.
enum class Side {
    kWaste,    ///< outside of outlines, inside of holes, by nesting depth
    kRight,    ///< right of the direction of travel
    kLeft,     ///< left of the direction of travel
    kInside,   ///< towards what a closed contour encloses
    kOutside,  ///< away from what a closed contour encloses
    kBoth      ///< both sides
};

/// What to offset, and how far.
struct OffsetRequest {
    Side side = Side::kWaste;
    /// One distance a pass, in units of the contours; a negative distance lies on the other side.
    std::vector<double> distances;
};

/// An offset that does not stand the check against its source.
struct FaultyOffset {
    double distance;  ///< signed, positive to the right of the direction of travel
    OffsetFault fault;
};

/// One path of an offset.
struct OffsetPath {
    std::size_t pass;  ///< index of the pass
    Path path;
    bool doubtful;  ///< the offset that it belongs to has a fault
};

/// What became of one source contour.
struct ContourOffsets {
    std::vector<OffsetPath> paths;         ///< by pass
    std::vector<std::size_t> emptyPasses;  ///< passes that yielded nothing, and rightly so
    std::vector<FaultyOffset> faults;      ///< by pass
    Refusal refusal = Refusal::kNone;      ///< why the contour has no offsets at all
};

/// Called with the number of offsets done and their total.
using ProgressCall = std::function<void(std::size_t done, std::size_t total)>;

/// Signed kernel distances (positive: right) for a distance on the side asked for. Open contours,
/// and closed ones that enclose nothing, have no inside: they get both sides unless right or left
/// is asked for. `depth` is the nesting depth, even for outlines.
std::vector<double> signedDistances(const Path& contour, int depth, Side side, double distance);

/// Offsets every contour in every pass and checks the offsets (offsetChecked); the result has one
/// entry a contour, in order. `depths` has the nesting depth of every contour, nothing for open
/// ones.
std::vector<ContourOffsets> offsetContours(const std::vector<Path>& contours,
                                           const std::vector<std::optional<int>>& depths,
                                           const OffsetRequest& request,
                                           const ProgressCall& progress);

}  // namespace gmregion
