// SPDX-License-Identifier: MIT
#include "kernel/curves/SupportHits.h"

#include "kernel/curves/kernels/CircleCircle.h"
#include "kernel/curves/kernels/CircleLine.h"
#include "kernel/curves/kernels/LineLine.h"

namespace gmkernel_detail {

Hits<1> supportHits(GmLine const& a, GmLine const& b) {
    // A line is parallel to itself even where its direction is no number.
    if (&a == &b) return {};
    return intersectLineLine(plain(a.SP()), plain(a.Dir()), plain(b.SP()), plain(b.Dir()));
}

Hits<2> supportHits(GmCircle const& a, GmLine const& b) {
    return intersectCircleLine(plain(a.M()), a.R(), plain(b.SP()), plain(b.Dir()),
                               [&](Vec3 const& p) { return b.Dist(pointOf(p)); });
}

Hits<2> supportHits(GmCircle const& a, GmCircle const& b) {
    return intersectCircleCircle(plain(a.M()), a.R(), plain(b.M()), b.R());
}

}  // namespace gmkernel_detail
