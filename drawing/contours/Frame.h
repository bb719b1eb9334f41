// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "part/model/Path.h"

namespace gmdrawing {

/// The contour that is likely a frame about a drawing and no part of it: a rectangle along the axes
/// that holds all other contours, of which there is one at least, and has its layer for itself.
std::optional<std::size_t> frameOf(const std::vector<gmpart::Path>& contours);

}  // namespace gmdrawing
