// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "part/model/Path.h"

namespace gmdrawing {

/// An end of an open path: twice the path's index, plus 1 for its end point.
using PathEnd = std::size_t;

inline PathEnd startOf(std::size_t path) {
    return 2 * path;
}
inline PathEnd otherEnd(PathEnd end) {
    return end ^ 1U;
}
inline std::size_t pathOf(PathEnd end) {
    return end / 2;
}
inline bool isStart(PathEnd end) {
    return end % 2 == 0;
}

/// Joins the ends of open paths in pairs. The result holds for every end the end it is joined to,
/// or nothing.
///
/// Ends of one layer that lie within the tolerance, in chains if need be, are at one place. Where
/// more than two meet, the pair that goes on straightest is joined first, then the straightest of
/// those left, and so on; an odd end stays free. Pairs that are equally straight go by their
/// position in the plane. So neither the order nor the sense of the paths has an influence. The two
/// ends of one path are joined when the path is long enough to go round something.
///
/// Throws InputError when more than 200 ends meet at one place: then the tolerance is too wide for
/// the drawing.
std::vector<std::optional<PathEnd>> joinEnds(const std::vector<gmpart::Path>& paths,
                                             double tolerance);

}  // namespace gmdrawing
