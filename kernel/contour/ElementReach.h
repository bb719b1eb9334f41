// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmContour.h"
#include "kernel/curves/BoxLevels.h"
#include "kernel/curves/CurveBox.h"

namespace gmkernel_detail {

/// A box that holds every point in which an element of any kind can meet another one: boundless
/// where nothing narrower can be promised. Elements whose boxes are apart can be intersected, and
/// have no point in common.
CurveBox reachOfElement(GmCurve const& element);

/// A box about that one, wider about arcs but quickly made: for a single look at an element.
CurveBox roughReachOfElement(GmCurve const& element);

/// The boxes of all elements of a contour.
BoxLevels reachOfElements(GmContour const& contour);

}  // namespace gmkernel_detail
