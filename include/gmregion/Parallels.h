// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <vector>

#include "gmregion/Offset.h"
#include "gmregion/Paths.h"
#include "gmregion/RegionSet.h"
#include "gmregion/Workspace.h"
#include "gmregion/export.h"

namespace gmregion {

/// A curve beside a path: a range of elements.
struct ParallelPart {
    std::uint32_t first = 0;
    std::uint32_t last = 0;  ///< behind the last element
    bool closed = false;     ///< comes back to its start
};

/// Curves beside paths, or a refusal and nothing.
struct Parallels {
    /// Path by path, in the order in which they begin along it, each in the path's direction. Each
    /// element starts exactly where the one before ends.
    std::vector<ParallelPart> parts;
    std::vector<Element> elements;
    std::vector<Origin> origins;  ///< of each element
    /// Points where the result hangs on some tolerances, as Outcome says.
    std::vector<Point> marginal;
    Refusal refusal;
};

/// The offset of open paths to one side: all points at that distance from a path that lie beside
/// it, not round its ends. Each path is taken by itself.
///
/// A part of the parallel that comes nearer to another part of the path, or to its ends, is left
/// out, so there may be several curves, or none; a path that crosses itself has closed ones, too. A
/// closed path has closed ones alone. Corners that open are joined as the options say. Cost:
/// near-linear in the number of elements and of places where raw parallels meet.
/// @param paths the paths, open ones as a rule
/// @param distance in length units, positive to the right of the direction of travel; not within
/// half the tolerance of 0
/// @param tolerance as for cleanUp(); 0 for the default
/// @param options joins; ends do not matter
/// @param workspace working memory of the call
/// @param parallels gets the result; its memory is used again
/// @return whether there is a result
GMREGION_EXPORT bool makeParallels(const Paths& paths, double distance, double tolerance,
                                   const OffsetOptions& options, Workspace& workspace,
                                   Parallels& parallels);

/// The same with a working memory of its own.
GMREGION_EXPORT Parallels makeParallels(const Paths& paths, double distance,
                                        const OffsetOptions& options = {});

}  // namespace gmregion
