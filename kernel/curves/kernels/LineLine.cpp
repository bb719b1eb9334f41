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

Hits<1> intersectLineLine(GmPoint const& spA, GmDir const& dirA, GmPoint const& spB,
                          GmDir const& dirB) {
    Hits<1> hits;
    if (GmParallelDir(dirA, dirB)) return hits;

    const SlopeForm a = slopeForm(spA, dirA);
    const SlopeForm b = slopeForm(spB, dirB);
    if (a.parallelToY) {
        hits.add(GmPoint(spA.X(), b.k * spA.X() + b.d, spA.Z()));
    } else if (b.parallelToY) {
        hits.add(GmPoint(spB.X(), a.k * spB.X() + a.d, spB.Z()));
    } else {
        const double x = (b.d - a.d) / (a.k - b.k);
        hits.add(GmPoint(x, a.k * x + a.d, spA.Z()));
    }
    return hits;
}

}  // namespace gmkernel_detail
