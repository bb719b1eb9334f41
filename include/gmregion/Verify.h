// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "gmregion/Boolean.h"
#include "gmregion/Offset.h"
#include "gmregion/RegionSet.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// What is wrong with a result.
enum class FaultKind : std::uint8_t {
    kTooNear,     ///< an element is nearer to the source than the distance
    kTooFar,      ///< an element is farther from the source than the distance
    kMissing,     ///< a piece of the true boundary is not in the result
    kWrongSide,   ///< the distance is right, but on the other side of the source
    kWrongSense,  ///< what is covered lies on the right of an element
    kOpenLoop,    ///< an element does not start where the one before ends
    kShort,       ///< an element has no length, or less than the tolerance
    kCrossing,    ///< two elements cross or run along each other
    kNesting,     ///< an outline in what is covered, or a hole in what is not
    kForeign,     ///< an element of a boolean lies on no boundary of an operand
    kWinding,     ///< a boolean covers what it must not, or does not cover what it must
    kArea,        ///< the area of a boolean does not fit those of its operands
    kUndefined    ///< the distance, or a number of a set, is not finite
};

/// A short text for a fault, in English, without a full stop. Never null.
GMREGION_EXPORT const char* textOf(FaultKind kind);

/// One fault.
struct Fault {
    FaultKind kind = FaultKind::kUndefined;
    Point at;         ///< a point of it
    double by = 0.0;  ///< in length units, for areas in their squares; 0 where nothing is measured
    /// Number of the element of the result; for what is missing, that of the source, of the first
    /// operand for booleans, and for an area 0.
    std::size_t element = 0;
};

/// What a check found.
struct Verdict {
    std::vector<Fault> faults;  ///< the first hundred
    std::size_t count = 0;      ///< of all

    bool isSound() const { return count == 0; }
};

/// Checks an offset with geometry of its own.
///
/// With round joins every element of the result must be at the distance from the source over its
/// whole length, on the side of the distance, within twice the tolerance, the larger one of both
/// sets; stretches shorter than the tolerance are passed over. Wherever the true offset has a
/// boundary, the result must have one within some tolerances; two boundaries nearer to each other
/// than eight tolerances may be missing. Loops must close, must not cross, and must nest.
///
/// With miters the result may lie as far as the limit from the source, with bevels, and at corners
/// beyond the limit, as near as it likes; what is missing is looked for along the parallels alone,
/// and with miters not at all where it is behind another corner's. Ends are not asked for: sets
/// have none.
///
/// Cost: near-linear, about that of the offset.
GMREGION_EXPORT Verdict verifyOffset(const RegionSet& source, double distance,
                                     const RegionSet& result, const OffsetOptions& options = {});

/// The same with a working memory that calls reuse.
/// @param source what was offset
/// @param distance by which it was, positive outward
/// @param result what is to be checked
/// @param options of the offset
/// @param workspace working memory of the call
/// @param verdict gets the result; its memory is used again
/// @return whether it is sound
GMREGION_EXPORT bool verifyOffset(const RegionSet& source, double distance, const RegionSet& result,
                                  const OffsetOptions& options, Workspace& workspace,
                                  Verdict& verdict);

/// Checks a boolean with geometry of its own: the ends and middles of the result's elements must
/// lie on boundaries of the operands, and the windings on both sides must be those that the
/// combination asks for, beside elements of the result and beside those of the operands; the area
/// must fit the areas of the operands and of the common part as the elements themselves give them.
/// Cost: near-linear.
GMREGION_EXPORT Verdict verifyBoolean(const RegionSet& first, const RegionSet& second,
                                      Combination combination, const RegionSet& result);

}  // namespace gmregion
