// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "part/offset/PartOffset.h"

namespace gmpart {

/// Appends the loops of a result, on the layers of their contours, and its marginal places.
void appendLoops(const gmregion::Outcome& result, std::size_t pass,
                 const std::vector<Path>& contours, PartOffsets& offsets);

}  // namespace gmpart
