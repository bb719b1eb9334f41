// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/bridge/KernelLimits.h"
#include "region/model/Path.h"

namespace gmregion {

/// What the kernel makes of the boundaries of two closed paths that run counter-clockwise.
struct KernelLoops {
    std::vector<Path> loops;           ///< on the layer of the first path
    bool meet = false;                 ///< false when the boundaries have no crossings
    Refusal refusal = Refusal::kNone;  ///< why one of the paths is refused; then there are no loops
};

/// Splits two closed paths at their crossings and joins the pieces to the loops that run round
/// what lies in one of them or in both.
KernelLoops meltByKernel(const Path& a, const Path& b);

}  // namespace gmregion
