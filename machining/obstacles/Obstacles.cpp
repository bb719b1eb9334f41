// SPDX-License-Identifier: MIT
/// @file
/// Clearance is tested by marching along the path. The distance to the contours changes by no more
/// than the way gone, so from a point with room to spare the march may go on by as much as there is
/// to spare. Where there is none, as beside the edge that is being cut, it goes on by a step s so
/// small that what lies between two points is hardly nearer: the distance dips by at most s^2/8
/// (1/r + 1/c) there, r the radius of the path and c the clearance, which is how far the centre of
/// the distance's own curve, a corner of the obstacle, is away.

#include "machining/obstacles/Obstacles.h"

#include <algorithm>
#include <cmath>

namespace gmmachining {

using gmregion::boundingBox;
using gmregion::Box;
using gmregion::Element;
using gmregion::ElementTree;
using gmregion::Path;
using gmregion::Vec2;

namespace {

/// An element that is not through after so many steps, enormous beside the clearance and near to an
/// obstacle all along, counts as too near.
constexpr int kMostSteps = 100'000;

/// Half the accuracy of offsets, in units of the drawing and in its sizes: one half for the points
/// of the march, one for what lies between them.
constexpr double kLeastSlack = 5e-4;
constexpr double kSlackOfSize = 5e-7;

double leastStep(const Element& e, double clearance, double slack) {
    return std::sqrt(8.0 * slack / (1.0 / radius(e) + 1.0 / clearance));
}

/// March along the element; `distanceAt` tells the distance of a point from all that is near.
template <typename DistanceAt>
bool staysAway(const Element& e, double clearance, double slack, const DistanceAt& distanceAt) {
    const double len = length(e);
    const double least = leastStep(e, clearance, slack);
    double along = 0.0;
    for (int step = 0; step < kMostSteps; ++step) {
        const double found = distanceAt(pointAt(e, len > 0.0 ? along / len : 0.0));
        if (found < clearance - slack) return false;
        if (along >= len) return true;
        along = std::min(len, along + std::max(found - clearance, least));
    }
    return false;
}

}  // namespace

Obstacles::Obstacles(const std::vector<Path>& contours) {
    Box all;
    for (const Path& path : contours) {
        m_obstacles.emplace_back(path.elements);
        all.include(m_obstacles.back().box());
    }
    m_slack = std::max(kLeastSlack, kSlackOfSize * length(all.size()));
}

std::vector<const ElementTree*> Obstacles::nearby(const Element& e, double reach,
                                                  std::optional<std::size_t> except) const {
    const Box room = boundingBox({{e}, false, {}}).grown(reach);
    std::vector<const ElementTree*> found;
    for (std::size_t i = 0; i < m_obstacles.size(); ++i) {
        if (i != except && room.overlaps(m_obstacles[i].box())) found.push_back(&m_obstacles[i]);
    }
    return found;
}

bool Obstacles::keepClear(const Path& path, double clearance,
                          std::optional<std::size_t> except) const {
    const auto keepsClear = [&](const Element& e) {
        const std::vector<const ElementTree*> obstacles = nearby(e, clearance, except);
        // Twice the clearance is room enough to tell of.
        const auto room = [&](Vec2 p) {
            double nearest = 2.0 * clearance;
            for (const ElementTree* obstacle : obstacles)
                nearest = obstacle->distanceWithin(p, nearest);
            return nearest;
        };
        return obstacles.empty() || staysAway(e, clearance, m_slack, room);
    };
    return std::all_of(path.elements.begin(), path.elements.end(), keepsClear);
}

}  // namespace gmmachining
