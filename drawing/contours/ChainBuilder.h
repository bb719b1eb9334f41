// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "drawing/SkipReport.h"
#include "part/model/Path.h"

namespace gmdrawing {

/// Contours made from the paths of a drawing, and what was dropped on the way.
struct ChainResult {
    std::vector<gmpart::Path> contours;
    SkipReport skipped;
};

/// Builds contours from paths as drawn: drops elements that are too short and paths drawn twice,
/// then joins open paths of one layer end to end within the tolerance (see `joinEnds`), turns them
/// round where needed and makes their ends meet exactly.
///
/// A path that nothing was joined to keeps its sense and start point. A joined contour depends on
/// neither the order nor the sense of its pieces: when closed it runs counter-clockwise from its
/// leftmost joint (the lowest of these), when open from the end that lies further left (lower).
/// Contours come in the order of their earliest piece. Throws InputError as `joinEnds` does.
ChainResult buildChains(std::vector<gmpart::Path> paths, double tolerance);

}  // namespace gmdrawing
