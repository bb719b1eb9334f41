// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <limits>

#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/QuickSweep.h"

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
    /// Bounds that are no number change nothing.
    void include(CurveBox const& other) {
        left = std::min(left, other.left);
        right = std::max(right, other.right);
        bottom = std::min(bottom, other.bottom);
        top = std::max(top, other.top);
    }
    /// Holds nothing, and becomes any box that it includes.
    static CurveBox empty() {
        constexpr double kMost = std::numeric_limits<double>::max();
        return {kMost, -kMost, kMost, -kMost};
    }
    void include(PlanePoint p) { include(CurveBox{p.x, p.x, p.y, p.y}); }
    CurveBox grown(double margin) const {
        return {left - margin, right + margin, bottom - margin, top + margin};
    }
};

/// The box of a single point.
inline CurveBox boxOf(PlanePoint p) {
    return {p.x, p.x, p.y, p.y};
}

/// The box of an arc by its ends and stored angles, of its sweep alone also where it counts as a
/// full circle.
CurveBox boundsOf(PlainArc const& arc);

/// The box of every point that the membership tests of a segment or an arc can accept, but for ends
/// of an arc that were moved off its circle: its bounding rectangle, grown by twice the loosest
/// membership tolerance. Curves whose boxes are apart have no
/// intersection.
CurveBox reachOf(GmCurve const& curve);
CurveBox reachOf(PlainSegment const& segment);
CurveBox reachOf(PlainArc const& arc, QuickSweep const& sweep);

}  // namespace gmkernel_detail
