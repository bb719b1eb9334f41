// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>
#include <cstddef>
#include <functional>
#include <vector>

#include "machining/leads/Leads.h"
#include "machining/moves/Toolpath.h"
#include "part/offset/PartOffset.h"

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

/// What became of leads, approaches and departures alike.
struct LeadTally {
    std::size_t made = 0;  ///< the shortened ones included
    std::size_t shortened = 0;
    std::size_t dropped = 0;     ///< for want of room
    std::size_t tooSmall = 0;    ///< left out because they are too small to be built
    double smallest = HUGE_VAL;  ///< least size of the shortened ones
};

/// What became of a contour.
struct ContourCut {
    bool fits = true;       ///< false when nothing of the last pass comes from it
    bool runRound = false;  ///< it has no inside and is cut all round
    bool keepsAway = true;  ///< false when a cut along it comes too near to an edge
    LeadTally leads;        ///< of the runs of which it is the first contour
};

struct ToolpathResult {
    Toolpath moves;
    std::vector<ContourCut> contours;  ///< one entry a contour
    /// Contours between which the tool does not fit in the last pass: they are cut as one.
    std::vector<std::vector<std::size_t>> together;
    gmpart::PartOffsets offsets;  ///< what they tell; their paths have faults and are not cut
};

/// Cuts the part out on its waste side; open contours are run round.
///
/// Contours that share a run are cut as one. Of those that may come next (`CutOrder`) the one whose
/// start is nearest is cut, in all its passes; a pass is cut run by run, the nearest first, and a
/// run through all levels at once. All cuts and leads are compared with the edges of the part and
/// with open contours.
ToolpathResult makeToolpath(
    const std::vector<gmpart::Path>& contours, const ToolpathRequest& request,
    const std::function<void(std::size_t done, std::size_t total)>& progress);

}  // namespace gmmachining
