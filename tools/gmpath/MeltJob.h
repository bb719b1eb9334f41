#pragma once

#include <cstddef>
#include <vector>

#include "Path.h"

namespace gmpath {

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
    kFailed         ///< they meet, and the loops do not have the areas that they must have
};

/// Two contours, by index, whose boxes overlap.
struct MeltedPair {
    std::size_t first;
    std::size_t second;
    MeltOutcome outcome;
    std::vector<MeltLoop> loops;
};

/// Melts the closed contours of one list with those of the other, pair by pair; pairs whose boxes
/// are apart are left out. All contours count as counter-clockwise.
///
/// The outlines less the holes they close in, and the common parts, together have the areas of both
/// contours. Where the kernel's loops do not, as when sides lie flush on each other, the pair
/// counts as failed, with the loops that came.
std::vector<MeltedPair> meltContours(const std::vector<Path>& first,
                                     const std::vector<Path>& second);

}  // namespace gmpath
