// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "kernel/curves/kernels/Hits.h"

namespace gmkernel_detail {

// The kernels applied to the supporting lines of straight curves and the supporting circles of
// round ones: bounds are ignored. Only a stretch that touches a circle has to do so itself.
Hits<1> supportHits(GmLine const& a, GmLine const& b);
Hits<2> supportHits(GmCircle const& a, GmLine const& b);
Hits<2> supportHits(GmCircle const& a, GmCircle const& b);

/// Writes points into a solution list; answers their number.
template <std::size_t N>
int storeHits(Hits<N> const& hits, std::vector<GmPoint>& solutions) {
    solutions.clear();
    for (Vec3 const& hit : hits)
        solutions.push_back(pointOf(hit));
    return static_cast<int>(solutions.size());
}

}  // namespace gmkernel_detail
