// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "part/model/Path.h"

namespace gmpart {

/// Drops the elements of a path that are shorter than `shortest`, or arcs of a radius below it, and
/// returns the indices of those that stay. The element behind a dropped one starts where the
/// dropped one started, so gaps never add up along a row of short elements. Arcs that are straight
/// within a tenth of the tolerance become segments. A path may be left without elements.
std::vector<std::size_t> dropShortElements(Path& path, double shortest);

}  // namespace gmpart
