// SPDX-License-Identifier: MIT
#pragma once

#include "part/model/Path.h"

namespace gmpart {

/// Elements below this length, over which the kernel joins pieces, may tear its results.
constexpr double kShortestForKernel = 3.0 * kKernelTolerance;

/// Why a path has no place in the kernel.
enum class KernelRefusal {
    kNone,         ///< it has
    kTooSmall,     ///< an element is shorter than the kernel's tolerance, or no number
    kJoint,        ///< an arc too flat, or too far from the origin, misses its neighbour
    kEndsAtStart,  ///< an open path ends where it starts, within the tolerance
    kPassesStart   ///< an open path comes by its start again, within the tolerance
};

}  // namespace gmpart
