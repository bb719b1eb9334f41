#include "kernel/contour/ContourElements.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

GmPoint middleOf(GmCurve const* element) {
    if (element && element->IsStretch()) return static_cast<GmStretch const&>(*element).HP();
    if (element && element->IsArc()) return static_cast<GmArc const&>(*element).HP();
    return GmPoint();
}

GmPoint chainStart(GmContour const& contour) {
    return contour.GetElement(0)->SP();
}

GmPoint chainEnd(GmContour const& contour) {
    return contour.GetElement(static_cast<int>(contour.ElementCount()) - 1)->EP();
}

}  // namespace gmkernel_detail
