// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

/// Is the direction (0, 1, 0) or (0, -1, 0) within the tolerance of directions?
bool parallelToYAxis(GmDir const& dir);

/// A line as y = k x + d; one parallel to the y axis has k = 0 and its x position in d.
struct SlopeForm {
    bool parallelToY;
    double k;
    double d;
};

SlopeForm slopeForm(GmPoint const& sp, GmDir const& dir);

}  // namespace gmkernel_detail
