// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

#include "gmregion/Outcome.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// Which points of two sets belong to the result.
enum class Combination : std::uint8_t {
    kUnion,               ///< those of either
    kIntersection,        ///< those of both
    kDifference,          ///< those of the first that are not of the second
    kSymmetricDifference  ///< those of one of them only
};

/// Combines two sets. Where they only touch, in points or along sides and arcs, nothing of zero
/// width is left: sides shared from both sides vanish from a union.
///
/// The tolerance of the result is the larger of both. Origins are those of the elements; where
/// elements of both sets coincide, of both. Empty sets are allowed. Cost: near-linear in the number
/// of elements and of places where the sets meet.
/// @param first the one set
/// @param second the other one
/// @param combination what to make of them
/// @param workspace working memory of the call
/// @param outcome gets the result; must not hold one of the operands
/// @return whether there is a result
GMREGION_EXPORT bool combine(const RegionSet& first, const RegionSet& second,
                             Combination combination, Workspace& workspace, Outcome& outcome);

/// The same with a working memory of its own.
GMREGION_EXPORT Outcome combine(const RegionSet& first, const RegionSet& second,
                                Combination combination);

/// The union of any number of sets, in one go.
/// @param sets the first of the sets; not looked at when there are none
/// @param count how many there are
/// @param workspace working memory of the call
/// @param outcome gets the result; must not hold one of the sets
/// @return whether there is a result
GMREGION_EXPORT bool uniteAll(const RegionSet* sets, std::size_t count, Workspace& workspace,
                              Outcome& outcome);

}  // namespace gmregion
