#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"

// Inside and outside by the parity of crossings along a segment from the point. The segment is
// aimed at the middle of the first element instead of running along an axis: it then crosses that
// element away from the joints, where a crossing could be counted twice or not at all.

namespace {

enum class Location {
    eOnContour,  // some element contains the point
    eOutside,    // not strictly inside the bounding rectangle, or an even number of crossings
    eInside      // an odd number of crossings
};

Location Locate(GmContour const& contour, GmPoint const& p) {
    if (contour.Element(p)) return Location::eOnContour;
    if (!contour.BoundingRect().In(p)) return Location::eOutside;
    const GmPoint middle = gmkernel_detail::MiddleOf(contour.GetElement(0));
    const GmStretch probe(p, GmPoint(p + 2.0 * (middle - p)));
    return contour.Intersection(&probe) % 2 != 0 ? Location::eInside : Location::eOutside;
}

}  // namespace

GmPoint gmkernel_detail::MiddleOf(GmCurve const* element) {
    if (element && element->IsStretch()) return static_cast<GmStretch const&>(*element).HP();
    if (element && element->IsArc()) return static_cast<GmArc const&>(*element).HP();
    return GmPoint();
}

bool GmContour::In(GmPoint const& p) {
    return Locate(*this, p) == Location::eInside;
}

bool GmContour::Out(GmPoint const& p) {
    return Locate(*this, p) == Location::eOutside;
}

GmPoint GmContour::GetHP(int index) {
    return gmkernel_detail::MiddleOf(GetElement(index));
}
