// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmregion/Paths.h"
#include "gmregion/RegionSet.h"
#include "gmregion/Workspace.h"

#include "part/model/Path.h"

namespace gmpart {

/// The distance within which points and sides of drawings count as the same: a millionth of the
/// size of what is drawn, 1e-4 at the most, and never below what its numbers bear.
double partTolerance(const std::vector<Path>& contours);

/// What every contour runs round by itself, in whatever sense, however often it crosses itself.
/// One set a contour, whose origins have the contour's number; an empty one for an open contour,
/// one that encloses nothing, and one that is refused, as for numbers beyond 1e12.
std::vector<gmregion::RegionSet> contourRegions(const std::vector<Path>& contours,
                                                double tolerance);

/// Appends the loops of a set to a heap under one number, turned the other way where asked for.
void addLoops(gmregion::Paths& heap, const gmregion::RegionSet& set, std::int64_t id,
              bool reversed);

/// A loop of a set as a path without layer.
Path loopPath(const gmregion::RegionSet& set, std::size_t loop);

}  // namespace gmpart
