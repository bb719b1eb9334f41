// SPDX-License-Identifier: MIT
#include <cmath>
#include <cstdio>

#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Questions.h"

/// Grows a square with a round hole by 1 and prints its area.
int main() {
    gmregion::Paths paths;
    paths.add({{{0, 0}, {10, 0}, 0},
               {{10, 0}, {10, 10}, 0},
               {{10, 10}, {0, 10}, 0},
               {{0, 10}, {0, 0}, 0}},
              true);
    paths.add({{{3, 5}, {7, 5}, 1}, {{7, 5}, {3, 5}, 1}}, true);
    const gmregion::Outcome part = gmregion::cleanUp(paths, {gmregion::FillRule::kEvenOdd, 0});
    const gmregion::Outcome grown = gmregion::offset(part.regions, 1);
    const double area = gmregion::area(grown.regions);
    std::printf("area %.6f, %zu loops\n", area, grown.regions.loops().size());
    return !grown.refusal && std::fabs(area - 140.0) < 1e-6 ? 0 : 1;
}
