// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "part/model/Path.h"

/// Paths for tests.
namespace path_shapes {

using gmregion::kPi;

inline gmpart::Path polygon(const std::vector<gmregion::Vec2>& corners, bool closed = true) {
    gmpart::Path path{{}, closed, "0"};
    for (std::size_t i = 0; i + 1 < corners.size(); ++i) {
        path.elements.push_back({corners[i], corners[i + 1]});
    }
    if (closed) path.elements.push_back({corners.back(), corners.front()});
    return path;
}

/// Counter-clockwise from the lower left corner.
inline gmpart::Path rectangle(gmregion::Vec2 low, gmregion::Vec2 high) {
    return polygon({low, {high.x, low.y}, high, {low.x, high.y}});
}

inline gmpart::Path circle(gmregion::Vec2 m, double r) {
    gmpart::Path path{{}, true, "0"};
    gmpart::appendArc(path.elements, m, r, 0.0, 2.0 * kPi);
    return path;
}

}  // namespace path_shapes
