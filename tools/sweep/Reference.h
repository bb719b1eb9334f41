// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>

#include "gmregion/RegionSet.h"
#include "gmregion/Workspace.h"

namespace sweep {

/// What the offset of a part must be when the part was rounded.
///
/// Rounding takes no point of a part farther than h. So what the rounded part covers lies between
/// the part shrunk and grown by h, and its offset by d lies between those of the part by d - h and
/// d + h, whatever happens to it between.
struct Reference {
    double leastArea = 0.0;
    double mostArea = 0.0;
    /// The number of loops; nothing where the offsets between do not agree about it.
    std::optional<std::size_t> loops;
};

/// The reference for an exact part; nothing when one of its offsets was refused.
std::optional<Reference> referenceOf(const gmregion::RegionSet& exact, double d, double rounding,
                                     gmregion::Workspace& workspace);

}  // namespace sweep
