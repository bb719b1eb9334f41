// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmContour.h"
#include "kernel/contour/variable_offset/CurveList.h"

namespace gmkernel_detail {

/// Appends the elements of a contour to the list, each moved by +-x and +-y of `v` according to
/// the quadrant of its direction (an arc counts by its chord), so that with positive x and y all
/// move to the right of the direction of travel.
void shiftElements(GmContour const& contour, GmVec const& v, CurveList& curves);

/// Trims neighbours to their crossing, or bridges the gap between them by a segment. Of a closed
/// chain the last and the first curve are neighbours too, and their bridge becomes the first curve.
void closeGaps(CurveList& curves, bool closed);

/// Deletes the curves that end where they start.
void removeCollapsed(CurveList& curves);

}  // namespace gmkernel_detail
