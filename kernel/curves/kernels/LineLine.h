// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/curves/kernels/Hits.h"

namespace gmkernel_detail {

/// The crossing of two lines, each given by a point and a direction; none for parallel directions,
/// coincident lines included. Planar: z comes from the point of `a`, or of `b` where only `b` is
/// parallel to the y axis.
Hits<1> intersectLineLine(Vec3 const& spA, Vec3 const& dirA, Vec3 const& spB, Vec3 const& dirB);

}  // namespace gmkernel_detail
