// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "region/model/Path.h"

namespace gmdrawing {

/// Nesting depth of every path: how many of the other closed paths lie round it. Even depths are
/// outlines, odd depths holes. Open paths have no depth.
///
/// A path lies in another when the points looked at, up to a few dozen along it, all lie inside by
/// winding number; points on the other's border do not count. So paths that cross are siblings, and
/// so are two copies of one path. Cost: the pairs whose boxes lie in one another, times their
/// elements.
std::vector<std::optional<int>> nestingDepths(const std::vector<gmregion::Path>& paths);

/// For every path, open ones too, the indices of the closed paths that it lies in, by the same
/// rule; an open path counts as one without area.
std::vector<std::vector<std::size_t>> enclosingPaths(const std::vector<gmregion::Path>& paths);

}  // namespace gmdrawing
