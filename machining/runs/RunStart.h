// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "region/bridge/OffsetByKernel.h"

namespace gmmachining {

/// Where a tool begins along the offset of a contour at the signed distance d, positive to the
/// right: of the offset's elements that come from the earliest element of the contour, the start
/// nearest to the contour's own start moved sideways by the distance. Nothing for an offset without
/// results.
std::optional<gmregion::Vec2> runStart(const gmregion::Path& contour, double d,
                                       const gmregion::KernelOffset& offset);

}  // namespace gmmachining
