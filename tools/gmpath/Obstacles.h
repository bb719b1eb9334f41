#pragma once

#include <optional>
#include <vector>

#include "Measure.h"

namespace gmpath {

/// The contours of a drawing as what the tool must keep away from.
class Obstacles {
public:
    explicit Obstacles(const std::vector<Path>& contours);

    /// True when every point of the path keeps `clearance`, positive, from all contours. What is
    /// lacking within the accuracy of offsets, 5e-4 and 5e-5 of the clearance, does not count.
    /// `except` is the index of a contour that does not count either.
    bool keepClear(const Path& path, double clearance,
                   std::optional<std::size_t> except = std::nullopt) const;

private:
    struct Obstacle {
        const Path* path;
        Box box;
    };

    using Nearby = std::vector<const Obstacle*>;

    /// The obstacles that come within `reach` of the element's box.
    Nearby nearby(const Element& e, double reach, std::optional<std::size_t> except) const;

    std::vector<Obstacle> m_obstacles;
};

}  // namespace gmpath
