// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "drawing/MendReport.h"
#include "part/model/Path.h"

namespace gmdrawing {

/// Contours made from the paths of a drawing, and what was dropped on the way.
struct ChainResult {
    std::vector<gmpart::Path> contours;
    std::size_t shortElements = 0;  ///< dropped
    std::size_t duplicates = 0;     ///< dropped
    MendReport mended;
};

/// Builds contours from paths as drawn: drops elements that are too short and paths drawn twice,
/// then joins open paths of one layer end to end within the tolerance (see `joinEnds`), turns them
/// round where needed and makes their ends meet exactly. What stays open is joined once more
/// without the parts that lie on other elements within the tolerance (`trimOverlaps`).
///
/// A path that nothing was joined to keeps its sense and start point. A joined contour depends on
/// neither the order nor the sense of its pieces: when closed it runs counter-clockwise from its
/// leftmost joint (the lowest of these), when open from the end that lies further left (lower).
/// Contours come in the order of their earliest piece. Throws InputError as `joinEnds` does.
///
/// @param paths as drawn
/// @param tolerance ends that lie at most this far apart are joined, in units of the paths
/// @param shortest elements shorter than this are dropped, in units of the paths
ChainResult buildChains(std::vector<gmpart::Path> paths, double tolerance,
                        double shortest = gmregion::kKernelTolerance);

}  // namespace gmdrawing
