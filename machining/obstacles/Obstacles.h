// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Clearance.h"

#include "part/model/Path.h"

namespace gmmachining {

/// The contours of a drawing as what the tool must keep away from.
class Obstacles {
public:
    explicit Obstacles(const std::vector<gmpart::Path>& contours);

    /// True when every point of the path keeps `clearance`, positive, from all contours, by exact
    /// distances. What is lacking within twice the tolerance of the drawing
    /// (gmpart::partTolerance()) does not count.
    bool keepClear(const gmpart::Path& path, double clearance) const;

private:
    gmregion::ClearanceIndex m_contours;
    double m_slack;
};

}  // namespace gmmachining
