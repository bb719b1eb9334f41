// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

namespace gmdrawing {

/// What was mended when the pieces of a drawing became contours.
struct MendReport {
    std::size_t gaps = 0;      ///< joints whose ends did not meet exactly
    double largestGap = 0.0;   ///< of these, in units of the result
    std::size_t overlaps = 0;  ///< elements of open paths that others covered, in part or wholly
};

}  // namespace gmdrawing
