#pragma once

#include "gmkernel/GmCurve.h"

namespace gmkernel_detail {

/// An axis-parallel box, the quick answer to "can these two curves meet at all?".
struct CurveBox {
    double left;
    double right;
    double bottom;
    double top;

    /// False also where a bound is no number.
    bool overlaps(CurveBox const& other) const {
        return left <= other.right && other.left <= right && bottom <= other.top &&
               other.bottom <= top;
    }
};

/// The box of every point that the membership tests of a segment or an arc can accept: its bounding
/// rectangle, grown by twice the loosest membership tolerance. Curves whose boxes are apart have no
/// intersection.
CurveBox reachOf(GmCurve const& curve);

}  // namespace gmkernel_detail
