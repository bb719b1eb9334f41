// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmContour.h"
#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

/// The middle point of a segment or an arc; undefined for any other curve and for null.
GmPoint middleOf(GmCurve const* element);

/// The start of the chain; the contour must have an element.
GmPoint chainStart(GmContour const& contour);

/// The end of the chain; the contour must have an element.
GmPoint chainEnd(GmContour const& contour);

}  // namespace gmkernel_detail
