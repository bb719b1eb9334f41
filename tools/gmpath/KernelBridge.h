#pragma once

#include <vector>

#include "Path.h"

namespace gmpath {

/// Offsets of one path, as the kernel finds them.
struct KernelOffset {
    std::vector<Path> results;  ///< on the layer of the source
    /// The kernel took the path over; false when its joints are off beyond the kernel's tolerance
    /// or an element cannot be built.
    bool accepted = true;
};

/// Offsets a path at the signed distance d, positive to the right of the direction of travel.
/// Distances below the kernel's tolerance give the path itself.
///
/// Elements shorter than 3e-4, over which the kernel joins pieces, are passed over, so there the
/// offsets keep their distance within 3e-4 only. When a closed path yields nothing or open pieces,
/// as an element that turns back for such a length makes it, the offset is tried again without
/// elements shorter than 1e-3. Cost: up to the square of the number of elements, and more where
/// many offsets cross.
KernelOffset offsetByKernel(const Path& path, double d);

}  // namespace gmpath
