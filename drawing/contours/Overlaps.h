// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/model/Path.h"

namespace gmdrawing {

/// Cuts off what of the elements of open paths lies on others of their layer, within the tolerance:
/// on those of closed paths, which stay as they are, and on longer ones of open paths. An open path
/// of which something was cut is replaced by its elements, each a path of its own; parts not longer
/// than the tolerance are left out. Cost: near-linear, and the pairs of elements that come near to
/// each other.
/// @return number of elements of which something was cut
std::size_t trimOverlaps(std::vector<gmpart::Path>& paths, double tolerance);

}  // namespace gmdrawing
