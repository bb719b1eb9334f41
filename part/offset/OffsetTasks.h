// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "gmregion/Outcome.h"

#include "part/offset/PartOffset.h"
#include "part/regions/PartRegions.h"

namespace gmpart {

/// Regions that are offset together.
struct OffsetTask {
    gmregion::Outcome source;
    bool outward = true;  ///< for a positive distance
    /// The contour whose regions they are; nothing for those of several.
    std::optional<std::size_t> contour = {};
};

/// The regions that a side stands for, and the way that it leads: the part as a whole, or the
/// contours of every depth that go the same way, or each contour alone.
std::vector<OffsetTask> offsetTasks(const std::vector<Path>& contours, const PartRegions& regions,
                                    Side side, bool each);

/// Whether a side leads away from what a contour runs round.
bool leadsOutward(Side side, const Path& contour, std::size_t depth);

}  // namespace gmpart
