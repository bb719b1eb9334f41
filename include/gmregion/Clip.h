// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "gmregion/Questions.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// A part of a path that lies on one side of a boundary: a range of elements of a clipping.
struct ClippedPart {
    std::uint32_t first = 0;
    std::uint32_t last = 0;  ///< behind the last element
    bool closed = false;     ///< a closed path as a whole
    Place place = Place::kOutside;
};

/// What clipping gives: parts of paths, or a refusal and nothing.
struct Clipping {
    /// Path by path, along each from its start; those of a closed path that is cut from where it
    /// first changes its place. Each element starts exactly where the one before ends.
    std::vector<ClippedPart> parts;
    std::vector<Element> elements;
    std::vector<Origin> origins;  ///< of each element
    Refusal refusal;
};

/// Cuts open and closed paths where they enter and leave what a set covers.
///
/// Where a path runs along the boundary, within the tolerance, that part is on the boundary. Paths
/// that cross themselves or each other are not cut there. A path that stays within the tolerance
/// of its start has no parts. The tolerance is that of the set, or the finest that the paths allow
/// where that is more; for an empty set the default one of the paths. Refused is what cleanUp()
/// refuses but for open paths. Cost: near-linear in the number of elements and of places where
/// paths and set meet.
/// @param paths the paths to be cut
/// @param set what they are cut by
/// @param workspace working memory of the call
/// @param clipping gets the result; its memory is used again
/// @return whether there is a result
GMREGION_EXPORT bool clip(const Paths& paths, const RegionSet& set, Workspace& workspace,
                          Clipping& clipping);

/// The same with a working memory of its own.
GMREGION_EXPORT Clipping clip(const Paths& paths, const RegionSet& set);

}  // namespace gmregion
