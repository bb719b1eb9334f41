// SPDX-License-Identifier: MIT
/// @file
/// The bounding rectangle of an arc.
///
/// An arc reaches one of the four axis directions when it passes over it. With all angles shifted
/// so that the direction lies on the seam of (-180, 180], a clockwise arc passes it when its start
/// angle is the smaller one, a counter-clockwise arc when its end angle is.
#include <algorithm>
#include <utility>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/CurveBox.h"

namespace {

bool crossesSeam(double start, double end, GmBase::eRotDir rot) {
    switch (rot) {
        case GmBase::eRotCW:
            return start < end;
        case GmBase::eRotCCW:
            return end < start;
        default:
            return false;
    }
}

// Shifts of an angle in (-180, 180] that move an axis direction onto the seam.
double plusXOnSeam(double a) {
    return a > 0.0 ? a - 180.0 : a + 180.0;
}
double minusYOnSeam(double a) {
    return a > -90.0 ? a - 90.0 : a + 270.0;
}
double plusYOnSeam(double a) {
    return a < 90.0 ? a + 90.0 : a - 270.0;
}

}  // namespace

namespace gmkernel_detail {

CurveBox boundsOf(PlainArc const& arc) {
    CurveBox box{std::min(arc.sp.x, arc.ep.x), std::max(arc.sp.x, arc.ep.x),
                 std::min(arc.sp.y, arc.ep.y), std::max(arc.sp.y, arc.ep.y)};
    const double s = arc.startDegrees;
    const double e = arc.endDegrees;
    if (crossesSeam(s, e, arc.sense)) box.left = arc.m.x - arc.r;
    if (crossesSeam(plusXOnSeam(s), plusXOnSeam(e), arc.sense)) box.right = arc.m.x + arc.r;
    if (crossesSeam(minusYOnSeam(s), minusYOnSeam(e), arc.sense)) box.bottom = arc.m.y - arc.r;
    if (crossesSeam(plusYOnSeam(s), plusYOnSeam(e), arc.sense)) box.top = arc.m.y + arc.r;
    // Ends that lie beyond the circle may be beyond the point that the sweep reaches.
    if (box.right < box.left) std::swap(box.left, box.right);
    if (box.top < box.bottom) std::swap(box.bottom, box.top);
    return box;
}

}  // namespace gmkernel_detail

GmRect GmArc::BoundingRect() const {
    return BoundingRect(false);
}

GmRect GmArc::BoundingRect(bool bIgnoreFullCircle) const {
    if (!bIgnoreFullCircle && IsFullCircle()) return GmCircle::BoundingRect();
    const gmkernel_detail::CurveBox box =
        gmkernel_detail::boundsOf(gmkernel_detail::plainOf(*this));
    return GmRect(GmPoint(box.left, box.bottom), GmPoint(box.right, box.top));
}
