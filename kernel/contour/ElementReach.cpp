// SPDX-License-Identifier: MIT
/// @file
/// Boxes of elements that may be anything.
///
/// A contour takes any curve, and its elements can be changed from outside. So the box of an
/// element is only believed where its class and its state warrant that no membership test accepts a
/// point outside: for segments whose direction is that of their ends, and for arcs, both of
/// moderate size, so that rounding stays far below the margin of the box. For all else the box has
/// no bounds and overlaps every other one; a pair with it is always intersected, and refused where
/// it has to be. Boxes are not kept between calls. Constant cost for each element.
#include "kernel/contour/ElementReach.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <typeinfo>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"
#include "kernel/curves/VerifiedCast.h"

namespace gmkernel_detail {

namespace {

/// Coordinates and radii below this are moderate, in length units.
constexpr double kModerate = 1e8;

/// By how much the end of a segment may miss the line through its start, in length units.
constexpr double kSkew = 0.005;

/// By how much the boxes here exceed an element, more than any membership tolerance (length units).
constexpr double kMargin = 0.02;

CurveBox boundless() {
    constexpr double kInfinity = std::numeric_limits<double>::infinity();
    return {-kInfinity, kInfinity, -kInfinity, kInfinity};
}

/// False also for what is no number.
bool isModerate(double value) {
    return std::fabs(value) < kModerate;
}

bool isModerate(CurveBox const& box) {
    return isModerate(box.left) && isModerate(box.right) && isModerate(box.bottom) &&
           isModerate(box.top);
}

/// Is the curve of this class and not of one derived from it, which may answer otherwise?
template <class T>
T const* exactly(GmCurve const& curve) {
    const bool same = curve.GetType() == kTagOf<T> && typeid(curve) == typeid(T);
    return same ? static_cast<T const*>(&curve) : nullptr;
}

CurveBox boxAbout(GmPoint const& p, GmPoint const& q) {
    return {std::min(p.X(), q.X()), std::max(p.X(), q.X()), std::min(p.Y(), q.Y()),
            std::max(p.Y(), q.Y())};
}

/// Does the line of a segment run from its start to its end?
bool isStraight(GmPoint const& sp, GmPoint const& ep, GmDir const& d) {
    return sp.CreationOK() && ep.CreationOK() &&
           std::fabs((ep.X() - sp.X()) * d.Y() - (ep.Y() - sp.Y()) * d.X()) < kSkew;
}

CurveBox segmentReach(GmStretch const& segment) {
    const GmPoint sp = segment.SP();
    const GmPoint ep = segment.EP();
    return isStraight(sp, ep, segment.Dir()) ? boxAbout(sp, ep).grown(kMargin) : boundless();
}

/// The box about the ends and the whole circle: angles take time.
CurveBox roughArcReach(GmArc const& arc) {
    const GmPoint m = arc.M();
    const double r = arc.R();
    if (!m.CreationOK() || !isModerate(r)) return boundless();
    CurveBox box = boxAbout(arc.SP(), arc.EP());
    box.include({m.X() - r, m.X() + r, m.Y() - r, m.Y() + r});
    return box.grown(kMargin);
}

CurveBox believed(CurveBox const& box) {
    return isModerate(box) ? box : boundless();
}

}  // namespace

CurveBox reachOfElement(GmCurve const& element) {
    if (auto const* const segment = exactly<GmStretch>(element)) {
        return believed(segmentReach(*segment));
    }
    auto const* const arc = exactly<GmArc>(element);
    const bool bounded = arc != nullptr && arc->M().CreationOK() && isModerate(arc->R());
    return bounded ? believed(reachOf(*arc)) : boundless();
}

CurveBox roughReachOfElement(GmCurve const& element) {
    if (auto const* const segment = exactly<GmStretch>(element)) {
        return believed(segmentReach(*segment));
    }
    auto const* const arc = exactly<GmArc>(element);
    return arc != nullptr ? believed(roughArcReach(*arc)) : boundless();
}

BoxLevels reachOfElements(GmContour const& contour) {
    BoxLevels reaches;
    for (int i = 0; i < contour.ElementCount(); ++i)
        reaches.append(reachOfElement(*contour.GetElement(i)));
    return reaches;
}

}  // namespace gmkernel_detail
