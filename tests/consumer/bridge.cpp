// SPDX-License-Identifier: MIT
#include <cmath>
#include <cstdio>

#include "gmbridge/ContourOffset.h"
#include "gmkernel/gmkernel.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Questions.h"

/// Grows a kernel's disc with a square island by 1 and prints the area.
int main() {
    GmContour disc;
    disc.AddElement(GmArc(GmPoint(10, 0), GmPoint(10, 0), GmPoint(0, 0), GmBase::eRotCCW), false,
                    1);
    GmContour island;
    island.AddElement(GmStretch(GmPoint(-2, -2), GmPoint(2, -2)), false, 2);
    island.AddElement(GmStretch(GmPoint(2, -2), GmPoint(2, 2)), false, 3);
    island.AddElement(GmStretch(GmPoint(2, 2), GmPoint(-2, 2)), false, 4);
    island.Close(false);
    const gmbridge::ContourOffset grown = gmbridge::offsetPart(disc, {&island}, 1.0);

    gmbridge::ContourPaths paths;
    for (const gmbridge::LoopContour& loop : grown.contours.loops)
        paths.add(*loop.contour);
    const gmregion::Outcome part = gmregion::cleanUp(paths.paths());
    const double area = gmregion::area(part.regions);
    std::printf("%s: area %.6f\n", gmbridge::textOf(grown.refusal), area);
    return std::fabs(area - (121.0 * std::acos(-1.0) - 4.0)) < 1e-6 ? 0 : 1;
}
