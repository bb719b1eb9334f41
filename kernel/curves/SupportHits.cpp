// SPDX-License-Identifier: MIT
#include "kernel/curves/SupportHits.h"

#include "kernel/curves/kernels/CircleCircle.h"
#include "kernel/curves/kernels/CircleLine.h"
#include "kernel/curves/kernels/LineLine.h"

namespace gmkernel_detail {

Hits<1> supportHits(GmLine const& a, GmLine const& b) {
    return intersectLineLine(a.SP(), a.Dir(), b.SP(), b.Dir());
}

Hits<2> supportHits(GmCircle const& a, GmLine const& b) {
    return intersectCircleLine(a.M(), a.R(), b.SP(), b.Dir(),
                               [&](GmPoint const& p) { return b.Dist(p); });
}

Hits<2> supportHits(GmCircle const& a, GmCircle const& b) {
    return intersectCircleCircle(a.M(), a.R(), b.M(), b.R());
}

}  // namespace gmkernel_detail
