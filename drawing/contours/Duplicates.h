// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/model/Path.h"

namespace gmdrawing {

/// Drops paths that run over the same course as an earlier path of the same layer, whichever way
/// they run and wherever a closed one starts, and returns how many. Points count as the same within
/// the kernel's tolerance. Paths that overlap only in part are kept.
std::size_t dropDuplicates(std::vector<gmpart::Path>& paths);

}  // namespace gmdrawing
