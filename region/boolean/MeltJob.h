// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "region/bridge/KernelLimits.h"
#include "region/model/Path.h"

namespace gmregion {

/// What a loop of two melted contours runs round.
enum class LoopKind {
    kOutline,  ///< what lies in one of them or both; holes that both close in run the other way
    kCommon    ///< what lies in both
};

struct MeltLoop {
    LoopKind kind;
    Path path;
};

/// How two contours lie to each other, and what came of melting them.
enum class MeltOutcome {
    kLoops,         ///< they cross: loops
    kApart,         ///< they do not overlap
    kFirstInside,   ///< the first lies inside the second
    kSecondInside,  ///< the second lies inside the first
    kSame,          ///< they run along each other all the way
    kFailed,        ///< they meet, and the loops are not outline and common parts of them
    kRefused        ///< one of them has no place in the kernel
};

/// Two contours, by index, whose boxes overlap.
struct MeltedPair {
    std::size_t first;
    std::size_t second;
    MeltOutcome outcome;
    std::vector<MeltLoop> loops;
    Refusal refusal = Refusal::kNone;  ///< why one of them is refused
};

/// Melts the closed contours of one list with those of the other, pair by pair; pairs whose boxes
/// are apart are left out. All contours count as counter-clockwise.
///
/// The loops are compared with their contours: there is one outline, besides holes that both close
/// in; no point of an outline lies inside a contour, none of a common part outside; and the areas
/// add up to those of the contours. Where the kernel's loops do not, as when sides lie flush on
/// each other or a corner on a side, the pair counts as failed, with the loops that came.
std::vector<MeltedPair> meltContours(const std::vector<Path>& first,
                                     const std::vector<Path>& second);

}  // namespace gmregion
