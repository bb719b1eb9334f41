#pragma once

#include "gmkernel/GmContour.h"
#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

/// The middle point of a segment or an arc; undefined for any other curve and for null.
GmPoint MiddleOf(GmCurve const* element);

/// The start of the chain; the contour must have an element.
inline GmPoint ChainStart(GmContour const& contour) {
    return contour.GetElement(0)->SP();
}

/// The end of the chain; the contour must have an element.
inline GmPoint ChainEnd(GmContour const& contour) {
    return contour.GetElement(static_cast<int>(contour.ElementCount()) - 1)->EP();
}

}  // namespace gmkernel_detail
