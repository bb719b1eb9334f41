// SPDX-License-Identifier: MIT
/// @file
/// Where a run begins.
///
/// Every element of an offset knows the element of the contour that it comes from. The run begins
/// beside the start of the contour, as drawings are made with a start in mind: on what comes from
/// its first element, or from the first that has an offset. Linear in the elements.

#include "machining/runs/RunStart.h"

#include <algorithm>
#include <limits>

#include "region/bridge/PathConversion.h"

namespace gmmachining {

using gmregion::Element;
using gmregion::KernelOffset;
using gmregion::Path;
using gmregion::Vec2;

namespace {

/// The start of the contour, of what the kernel makes of it, moved sideways.
Vec2 startBeside(const Path& contour, double d) {
    const Path seen = simplifiedForKernel(contour).path;
    const Element& first = seen.elements.front();
    return first.sp + d * rightNormal(tangentStart(first));
}

std::size_t earliestOrigin(const KernelOffset& offset) {
    std::size_t earliest = std::numeric_limits<std::size_t>::max();
    for (const std::vector<std::size_t>& origins : offset.origins) {
        for (const std::size_t origin : origins)
            earliest = std::min(earliest, origin);
    }
    return earliest;
}

}  // namespace

std::optional<Vec2> runStart(const Path& contour, double d, const KernelOffset& offset) {
    const Vec2 wanted = startBeside(contour, d);
    const std::size_t earliest = earliestOrigin(offset);
    std::optional<Vec2> nearest;
    for (std::size_t i = 0; i < offset.results.size(); ++i) {
        for (std::size_t k = 0; k < offset.origins[i].size(); ++k) {
            if (offset.origins[i][k] != earliest) continue;
            const Vec2 start = offset.results[i].elements[k].sp;
            if (!nearest || distance(start, wanted) < distance(*nearest, wanted)) nearest = start;
        }
    }
    return nearest;
}

}  // namespace gmmachining
