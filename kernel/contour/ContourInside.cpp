// SPDX-License-Identifier: MIT
/// @file
/// Inside and outside by the parity of crossings along a segment from the point.
///
/// A segment that ends outside crosses the contour an odd number of times when it starts inside. It
/// is aimed at the middle of the first element, and as far beyond, instead of running along an
/// axis: it then crosses that element away from the joints, where a crossing could be counted twice
/// or not at all. Whether its far end lies outside is not tested; where that is inside the contour,
/// the answer is wrong.
#include "gmkernel/GmContour.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"

namespace {

/// Where a point lies.
enum class Location {
    kOnContour,  ///< some element contains the point
    kOutside,    ///< not strictly inside the bounding rectangle, or an even number of crossings
    kInside      ///< an odd number of crossings
};

Location locate(GmContour const& contour, GmPoint const& p) {
    if (contour.Element(p)) return Location::kOnContour;
    if (!contour.BoundingRect().In(p)) return Location::kOutside;
    const GmPoint middle = gmkernel_detail::middleOf(contour.GetElement(0));
    const GmStretch probe(p, GmPoint(p + 2.0 * (middle - p)));
    return contour.Intersection(&probe) % 2 != 0 ? Location::kInside : Location::kOutside;
}

}  // namespace

bool GmContour::In(GmPoint const& p) {
    return locate(*this, p) == Location::kInside;
}

bool GmContour::Out(GmPoint const& p) {
    return locate(*this, p) == Location::kOutside;
}
