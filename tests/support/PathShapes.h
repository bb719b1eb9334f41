#pragma once

#include <vector>

#include "region/model/Path.h"

/// Paths for tests.
namespace path_shapes {

using gmpath::kPi;

inline gmpath::Path polygon(const std::vector<gmpath::Vec2>& corners, bool closed = true) {
    gmpath::Path path{{}, closed, "0"};
    for (std::size_t i = 0; i + 1 < corners.size(); ++i) {
        path.elements.push_back({corners[i], corners[i + 1]});
    }
    if (closed) path.elements.push_back({corners.back(), corners.front()});
    return path;
}

/// Counter-clockwise from the lower left corner.
inline gmpath::Path rectangle(gmpath::Vec2 low, gmpath::Vec2 high) {
    return polygon({low, {high.x, low.y}, high, {low.x, high.y}});
}

inline gmpath::Path circle(gmpath::Vec2 m, double r) {
    gmpath::Path path{{}, true, "0"};
    gmpath::appendArc(path.elements, m, r, 0.0, 2.0 * kPi);
    return path;
}

}  // namespace path_shapes
