// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "machining/leads/Leads.h"
#include "machining/moves/Toolpath.h"
#include "region/offset/OffsetJob.h"

namespace gmmachining {

/// How the contours of a drawing are cut out.
struct ToolpathRequest {
    /// One a pass, from the farthest to the last, which leaves the part as it shall be; positive.
    std::vector<double> distances;
    PartSide part = PartSide::kRight;
    LeadShape lead;
    std::vector<double> levels;  ///< heights to cut at, going down, all below 0
    double safeZ = 5.0;          ///< height that clears everything, positive
};

/// What became of the leads of a contour, approaches and departures alike.
struct LeadTally {
    std::size_t made = 0;  ///< the shortened ones included
    std::size_t shortened = 0;
    std::size_t dropped = 0;     ///< for want of room
    std::size_t tooSmall = 0;    ///< left out because they are too small to be built
    double smallest = HUGE_VAL;  ///< least size of the shortened ones
};

/// What became of a contour.
struct ContourCut {
    gmregion::Refusal refusal = gmregion::Refusal::kNone;  ///< why the contour has no offsets
    bool fits = true;         ///< false when nothing is left for the last pass
    bool bothSides = false;   ///< the contour has no waste side and is cut on both
    bool keepsOthers = true;  ///< false when its cuts come too near to another contour
    std::vector<gmregion::FaultyOffset>
        faults;  ///< offsets that do not stand the check; they are not cut
    std::vector<gmregion::Path> doubtful;  ///< the results of those offsets
    LeadTally leads;
};

struct ToolpathResult {
    Toolpath moves;
    std::vector<ContourCut> contours;  ///< one entry a contour
};

/// Cuts every contour on its waste side, open ones on both sides. Of the contours that may come
/// next (`CutOrder`) the one whose start is nearest is cut, in all its passes; a pass is cut
/// run by run, the nearest first, and a run through all levels at once.
ToolpathResult makeToolpath(
    const std::vector<gmregion::Path>& contours, const ToolpathRequest& request,
    const std::function<void(std::size_t done, std::size_t total)>& progress);

}  // namespace gmmachining
