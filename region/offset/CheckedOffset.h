// SPDX-License-Identifier: MIT
#pragma once

#include "region/bridge/OffsetByKernel.h"
#include "region/offset/OffsetCheck.h"

namespace gmregion {

/// The best offset that was found, and what is wrong with it.
struct CheckedOffset {
    KernelOffset offset;
    OffsetFault fault = OffsetFault::kNone;
    int attempts = 0;
};

/// Offsets a path at the signed distance d, positive to the right, and compares the result with the
/// path (checkOffset). Where it does not stand the check, the offset is tried again from other
/// positions: turned in the plane, begun at another element where the path is closed, without the
/// shortest elements, in two steps, with segments for the flattest arcs. The first offset that
/// stands the check is the result, else the one with the least fault. Open scraps beside a closed
/// path that are not needed are left out, and results that all but close are closed. A path that
/// the kernel refuses is not tried again.
CheckedOffset offsetChecked(const Path& source, double d);

}  // namespace gmregion
