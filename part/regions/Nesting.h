// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "gmregion/RegionSet.h"

#include "part/model/Path.h"

namespace gmpart {

/// How the contours of a drawing lie in one another.
struct Nesting {
    /// For every contour, open ones too, the closed ones that it lies in directly: those that lie
    /// in no other of them. More than one only where these cross.
    std::vector<std::vector<std::size_t>> holders;
    /// How many closed contours lie round each. Even depths are outlines, odd ones holes.
    std::vector<std::size_t> depths;
};

/// Finds which contour lies in which.
///
/// A contour lies in a larger closed one when no part of it is outside of what that one runs round
/// and some part is inside, both by more than the kernel's tolerance. So contours that cross are
/// siblings, and so are two copies of one. Cost: near-linear for drawings, and the pairs whose
/// boxes lie in one another.
/// @param contours the contours
/// @param regions what each runs round, as contourRegions() gives it
Nesting nestingOf(const std::vector<Path>& contours,
                  const std::vector<gmregion::RegionSet>& regions);

/// The same for contours alone.
Nesting nestingOf(const std::vector<Path>& contours);

}  // namespace gmpart
