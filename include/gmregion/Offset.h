// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// What fills the gap between the parallels at a corner that opens.
enum class Join : std::uint8_t {
    kRound,  ///< an arc about the corner: the exact offset
    kMiter,  ///< the tangents at both ends up to where they meet; beyond the limit as a bevel
    kBevel   ///< a segment from end to end
};

/// How the thickening of an open path ends.
enum class End : std::uint8_t {
    kRound,   ///< a half circle about the end
    kSquare,  ///< straight, half the width beyond the end
    kButt     ///< straight, at the end
};

/// How offsets are made.
struct OffsetOptions {
    Join join = Join::kRound;
    End end = End::kRound;
    /// The largest distance of a miter's tip from its corner, in offset distances, 1 or more.
    double miterLimit = 4.0;
};

/// The offset of a set, outlines, holes and neighbours together.
///
/// With round joins it is the set of all points whose distance from the source is at most the
/// distance (outward), or of those of the source whose distance from its boundary is at least that
/// (inward). What meets, merges; what vanishes, vanishes; where a neck or a gap is exactly twice
/// the distance wide, nothing of zero width is left. Arcs stay true arcs. The result is within the
/// tolerance of the exact one. Cost: near-linear in the number of elements and of places where raw
/// parallels meet.
/// @param source the set to be offset
/// @param distance in length units, positive outward, negative inward; up to half the tolerance
/// copies the source
/// @param options joins; ends do not matter
/// @param workspace working memory of the call
/// @param outcome gets the result; must not hold the source
/// @return whether there is a result
GMREGION_EXPORT bool offset(const RegionSet& source, double distance, const OffsetOptions& options,
                            Workspace& workspace, Outcome& outcome);

/// The same with a working memory of its own.
GMREGION_EXPORT Outcome offset(const RegionSet& source, double distance,
                               const OffsetOptions& options = {});

/// Several offsets of one set, each measured from the source. Stops at the first refusal.
/// @param source the set to be offset
/// @param distances in length units, positive outward
/// @param count how many there are
/// @param options joins; ends do not matter
/// @param workspace working memory of the call
/// @param outcomes as many, which get the results
/// @return whether all of them have a result
GMREGION_EXPORT bool offsetSeries(const RegionSet& source, const double* distances,
                                  std::size_t count, const OffsetOptions& options,
                                  Workspace& workspace, Outcome* outcomes);

/// What open paths cover when they are drawn with a pen: all points within half the width of a
/// path, with ends as the options say.
/// @param paths open ones; a closed one covers both its sides
/// @param halfWidth in length units, positive
/// @param tolerance as for cleanUp(); 0 for the default
/// @param options joins and ends
/// @param workspace working memory of the call
/// @param outcome gets the result
/// @return whether there is a result
GMREGION_EXPORT bool thicken(const Paths& paths, double halfWidth, double tolerance,
                             const OffsetOptions& options, Workspace& workspace, Outcome& outcome);

/// What a disc of that radius covers when it moves within the set: an inward offset, then the same
/// outward. Corners that open are rounded, necks and tips narrower than the disc vanish. Works in
/// memory of its own for the step between.
/// @param source the set to be opened
/// @param radius in length units, 0 or more
/// @param workspace working memory of the call
/// @param outcome gets the result; must not hold the source
/// @return whether there is a result
GMREGION_EXPORT bool opened(const RegionSet& source, double radius, Workspace& workspace,
                            Outcome& outcome);

/// What is left when a disc of that radius covers what it can of the outside: an outward offset,
/// then the same inward. Corners that close are rounded, gaps narrower than the disc are filled.
GMREGION_EXPORT bool closed(const RegionSet& source, double radius, Workspace& workspace,
                            Outcome& outcome);

}  // namespace gmregion
