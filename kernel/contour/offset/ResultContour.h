// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <vector>

#include "gmkernel/GmContour.h"
#include "kernel/contour/offset/OffsetElement.h"

namespace gmkernel_detail {

/// The contour over a chain of pieces, whose curves it takes; gaps are bridged by segments that
/// count as inserted.
std::unique_ptr<GmContour> resultContour(std::vector<GmOffsetElement> chain);

}  // namespace gmkernel_detail
