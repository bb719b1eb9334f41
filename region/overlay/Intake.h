// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "region/nodes/Strands.h"

namespace gmregion {

/// The largest coordinate that operations take.
constexpr double kLargestCoordinate = 1e12;
/// The smallest size of a drawing that operations take: areas and their squares are numbers yet.
constexpr double kSmallestSize = 1e-60;
/// The tolerance is at least the largest coordinate times this.
constexpr double kFinestTolerance = 1.0 / 17592186044416.0;  // 2^-44

/// Size and largest coordinate of a heap; a refusal when numbers are no good.
struct Extent {
    double size = 0.0;
    double largest = 0.0;
    Refusal refusal;
};
Extent extentOf(const Paths& paths);

/// The tolerance to work with: the one asked for, or the default when that is 0.
double toleranceFor(const Extent& extent, double asked);

/// A refusal where a tolerance is not positive or too fine for the drawing. An empty drawing takes
/// any that is not negative.
Refusal checkedTolerance(const Extent& extent, double tolerance);

/// Appends an element, in halves when it turns by more than half a turn; nothing when it has no
/// length.
void appendElement(std::vector<StrandElement>& elements, const Element& e, Index tag);

/// Appends the paths, each a strand of that weight, and an origin for each of their elements,
/// whose number is the tag. Gaps up to the tolerance are closed.
Refusal takePaths(const Paths& paths, double tolerance, bool wantClosed, Weight weight,
                  Strands& strands, std::vector<Origin>& origins);

/// Appends the loops of a set as strands; tags are the numbers of elements, counted from
/// `firstTag`.
void takeSet(const RegionSet& set, Weight weight, Index firstTag, Strands& strands);

}  // namespace gmregion
