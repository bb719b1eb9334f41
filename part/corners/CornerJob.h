// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/kernel/CornerBreaker.h"

namespace gmpart {

/// Which corners of a closed contour are done. Of an open one all are: it has no inside.
enum class CornerChoice {
    kAll,
    kConvex,  ///< those that turn with the contour
    kConcave  ///< those that turn against it
};

struct CornerRequest {
    CornerKind kind = CornerKind::kRounding;
    double value = 0.0;  ///< positive, in units of the contours
    CornerChoice choice = CornerChoice::kAll;
    /// Joints that bend by less are no corners, in radians. Drawings are full of arcs that leave
    /// their neighbours not quite smoothly.
    double leastBend = 5.0 / 180.0 * kPi;
};

/// A contour with its corners done.
struct CornerResult {
    Path path;
    std::size_t done = 0;
    std::size_t notDone = 0;  ///< corners without room for the transition; they stay as they are
    KernelRefusal refusal = KernelRefusal::kNone;  ///< a contour that is refused stays as it is
};

/// The joints of a path that are corners to be done: the indices of the elements that end there.
std::vector<std::size_t> cornersOf(const Path& path, const CornerRequest& request);

/// Rounds or chamfers the corners of every contour, from the last corner of a contour to its first.
/// A transition has room where it fits between its two elements and touches nothing else: neither
/// the rest of its contour nor another contour. One result a contour. Cost:
/// near-linear, and what lies near each corner.
std::vector<CornerResult> breakCorners(const std::vector<Path>& contours,
                                       const CornerRequest& request);

}  // namespace gmpart
