// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

/// Are two unit directions equal or opposite within the tolerance of directions?
bool isParallel(Vec3 const& a, Vec3 const& b);

/// Is the direction (0, 1, 0) or (0, -1, 0) within the tolerance of directions?
bool parallelToYAxis(Vec3 const& dir);

/// A line as y = k x + d; one parallel to the y axis has k = 0 and its x position in d.
struct SlopeForm {
    bool parallelToY;
    double k;
    double d;
};

SlopeForm slopeForm(Vec3 const& sp, Vec3 const& dir);

}  // namespace gmkernel_detail
