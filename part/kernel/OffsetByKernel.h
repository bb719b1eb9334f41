// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/kernel/KernelLimits.h"
#include "part/model/Path.h"

namespace gmpart {

/// Offsets of one path.
struct KernelOffset {
    std::vector<Path> results;  ///< on the layer of the source
    /// For every result the index of the source element from which each of its elements comes; an
    /// arc about a corner comes from the element that ends there.
    std::vector<std::vector<std::size_t>> origins;
    KernelRefusal refusal = KernelRefusal::kNone;  ///< a path that is refused has no results

    bool accepted() const { return refusal == KernelRefusal::kNone; }
};

/// Offsets a path at the signed distance d, positive to the right of the direction of travel, as
/// the kernel does it. Distances below the kernel's tolerance give the path itself.
///
/// Elements below the length `shortest` are passed over, and the offsets keep their distance
/// within that length only. Cost: nearly linear in the number of elements, and up to its square
/// where many lie within the distance of each other.
KernelOffset offsetByKernel(const Path& path, double d, double shortest = kShortestForKernel);

}  // namespace gmpart
