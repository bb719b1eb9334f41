// SPDX-License-Identifier: MIT
/// @file
/// Line against line.
///
/// Both as y = k x + d, a line parallel to the y axis by its x, so that one division solves for the
/// crossing. Directions that are equal or opposite within the tolerance of directions have none.
/// Steep lines have large k and d, whose difference loses digits: the crossing is less exact there
/// than along the x axis.
#include "kernel/curves/kernels/LineLine.h"

#include "kernel/curves/kernels/SlopeForm.h"

namespace gmkernel_detail {

Hits<1> intersectLineLine(Vec3 const& spA, Vec3 const& dirA, Vec3 const& spB, Vec3 const& dirB) {
    Hits<1> hits;
    if (isParallel(dirA, dirB)) return hits;

    const SlopeForm a = slopeForm(spA, dirA);
    const SlopeForm b = slopeForm(spB, dirB);
    if (a.parallelToY) {
        hits.add({spA.x, b.k * spA.x + b.d, spA.z});
    } else if (b.parallelToY) {
        hits.add({spB.x, a.k * spB.x + a.d, spB.z});
    } else {
        const double x = (b.d - a.d) / (a.k - b.k);
        hits.add({x, a.k * x + a.d, spA.z});
    }
    return hits;
}

}  // namespace gmkernel_detail
