#pragma once

#include "gmkernel/GmCircle.h"
#include "gmkernel/GmLine.h"
#include "kernel/curves/kernels/Hits.h"

namespace gmkernel_detail {

// The kernels applied to curves, whose bounds are ignored: straight ones as their carriers, round
// ones as full circles. Only a stretch that touches a circle has to do so itself.
Hits<1> carrierHits(GmLine const& a, GmLine const& b);
Hits<2> carrierHits(GmCircle const& a, GmLine const& b);
Hits<2> carrierHits(GmCircle const& a, GmCircle const& b);

}  // namespace gmkernel_detail
