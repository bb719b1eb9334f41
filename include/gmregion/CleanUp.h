// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// What a heap of loops covers, by how often they run round a point, counter-clockwise positive.
enum class FillRule : std::uint8_t {
    kNonZero,  ///< not as often one way as the other
    kEvenOdd,  ///< an odd number of times
    kPositive  ///< more often counter-clockwise
};

/// How clean-up works.
struct CleanUpOptions {
    FillRule rule = FillRule::kNonZero;
    /// The distance within which points and curves count as the same, in length units; it goes with
    /// the set. 0 stands for defaultTolerance(). Drawings whose ends and sides miss each other by
    /// more (1e-4 mm is common) need more.
    double tolerance = 0.0;
};

/// The larger of a 2^-30th (1e-9) of the size of the drawing, the longer side of its box, and a
/// 2^-44th of its largest coordinate: far above rounding, far below what anybody draws, in mm and
/// in inches alike. 0 for an empty heap.
GMREGION_EXPORT double defaultTolerance(const Paths& paths);

/// Regions out of any heap of closed loops: of any sense, crossing themselves and each other,
/// doubled, folded, touching.
///
/// Refused are numbers that are not finite or above 1e12, open paths, gaps between elements above
/// the tolerance, and a tolerance that is negative or below a 2^-44th of the largest coordinate.
/// Elements without length are passed over, whatever their bulge. Cost: near-linear in the number
/// of elements and of places where they meet.
/// @param paths the loops
/// @param options fill rule and tolerance
/// @param workspace working memory of the call
/// @param outcome gets the result; its memory is used again
/// @return whether there is a result
GMREGION_EXPORT bool cleanUp(const Paths& paths, const CleanUpOptions& options,
                             Workspace& workspace, Outcome& outcome);

/// The same with a working memory of its own.
GMREGION_EXPORT Outcome cleanUp(const Paths& paths, const CleanUpOptions& options = {});

}  // namespace gmregion
