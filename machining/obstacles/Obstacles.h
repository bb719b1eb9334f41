// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "region/search/ElementTree.h"

namespace gmmachining {

/// The contours of a drawing as what the tool must keep away from.
class Obstacles {
public:
    explicit Obstacles(const std::vector<gmregion::Path>& contours);

    /// True when every point of the path keeps `clearance`, positive, from all contours. What is
    /// lacking within the accuracy of offsets, 1e-3 or 1e-6 of the size of the drawing, does not
    /// count. `except` is the index of a contour that does not count either.
    bool keepClear(const gmregion::Path& path, double clearance,
                   std::optional<std::size_t> except = std::nullopt) const;

private:
    /// The obstacles that come within `reach` of the element's box.
    std::vector<const gmregion::ElementTree*> nearby(const gmregion::Element& e, double reach,
                                                     std::optional<std::size_t> except) const;

    std::vector<gmregion::ElementTree> m_obstacles;
    double m_slack;
};

}  // namespace gmmachining
