#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "region/bridge/PathConversion.h"

namespace gmpath {

/// Offsets of one path.
struct KernelOffset {
    std::vector<Path> results;  ///< on the layer of the source
    /// For every result the index of the source element from which each of its elements comes; an
    /// arc about a corner comes from the element that ends there.
    std::vector<std::vector<std::size_t>> origins;
    /// The place where the kernel starts a path along the results; nothing where it finds none.
    std::optional<Vec2> start;
    /// The kernel took the path over; false when its joints are off beyond the kernel's tolerance
    /// or an element cannot be built.
    bool accepted = true;
};

/// Offsets a path at the signed distance d, positive to the right of the direction of travel, as
/// the kernel does it. Distances below the kernel's tolerance give the path itself.
///
/// Elements below the length `shortest` are passed over, and the offsets keep their distance
/// within that length only. Cost: up to the square of the number of elements, and more where many
/// offsets cross.
KernelOffset offsetByKernel(const Path& path, double d, double shortest = kShortestForKernel);

}  // namespace gmpath
