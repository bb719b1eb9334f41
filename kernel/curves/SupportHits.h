// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "kernel/curves/kernels/Hits.h"

namespace gmkernel_detail {

// The kernels applied to the supporting lines of straight curves and the supporting circles of
// round ones: bounds are ignored. Only a stretch that touches a circle has to do so itself.
Hits<1> supportHits(GmLine const& a, GmLine const& b);
Hits<2> supportHits(GmCircle const& a, GmLine const& b);
Hits<2> supportHits(GmCircle const& a, GmCircle const& b);

}  // namespace gmkernel_detail
