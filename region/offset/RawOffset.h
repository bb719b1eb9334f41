// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/model/Path.h"

namespace gmregion {

/// The parallels of a path's elements at the signed distance d (positive: right) and the arcs about
/// the corners that open to that side, which is right of a turn to the left and left of a turn to
/// the right; a corner that turns straight back opens to both. Each stands on its own: nothing is
/// trimmed or cut away. An arc no wider than the distance has no parallel towards its centre. All
/// run with the path, so the path lies on their left for d > 0.
std::vector<Element> rawOffset(const Path& path, double d);

}  // namespace gmregion
