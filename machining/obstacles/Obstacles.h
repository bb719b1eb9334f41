// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Clearance.h"

#include "part/model/Path.h"

namespace gmmachining {

/// The edges of a part as what the tool must keep away from.
class Obstacles {
public:
    /// @param edges the boundary of the part, and contours that bound nothing
    /// @param tolerance within which edges count as where they are
    Obstacles(const std::vector<gmpart::Path>& edges, double tolerance);

    /// True when every point of the path keeps `clearance`, positive, from all edges, by exact
    /// distances. What is lacking within twice the tolerance does not count.
    bool keepClear(const gmpart::Path& path, double clearance) const;

private:
    gmregion::ClearanceIndex m_edges;
    double m_slack;
};

}  // namespace gmmachining
