// Clearance is tested by marching along the path. The distance to the contours changes by no more
// than the way gone, so from a point with room to spare the march may go on by as much as there is
// to spare. Where there is none, as beside the edge that is being cut, it goes on by a small part
// of the clearance; a corner between two such steps is missed by the square of that part.

#include "Obstacles.h"

#include <algorithm>

namespace gmpath {

namespace {

/// Least step of the march and its slack, in clearances.
constexpr double kLeastStep = 0.02;
constexpr double kRelativeSlack = 5e-5;

/// An element that is not through after so many steps, enormous beside the clearance and near to an
/// obstacle all along, counts as too near.
constexpr int kMostSteps = 100'000;

/// Offsets keep their distance within this, in units of the drawing.
constexpr double kOffsetSlack = 5.0 * kKernelTolerance;

double distanceToBox(const Box& box, Vec2 p) {
    const Vec2 nearest{std::clamp(p.x, box.low.x, box.high.x),
                       std::clamp(p.y, box.low.y, box.high.y)};
    return distance(nearest, p);
}

bool overlap(const Box& a, const Box& b) {
    return a.low.x <= b.high.x && b.low.x <= a.high.x && a.low.y <= b.high.y && b.low.y <= a.high.y;
}

/// March along the element; `distanceAt` tells the distance of a point from all that is near.
template <typename DistanceAt>
bool staysAway(const Element& e, double clearance, const DistanceAt& distanceAt) {
    const double len = length(e);
    const double slack = kOffsetSlack + kRelativeSlack * clearance;
    double along = 0.0;
    for (int step = 0; step < kMostSteps; ++step) {
        const double found = distanceAt(pointAt(e, len > 0.0 ? along / len : 0.0));
        if (found < clearance - slack) return false;
        if (along >= len) return true;
        along = std::min(len, along + std::max(found - clearance, kLeastStep * clearance));
    }
    return false;
}

}  // namespace

Obstacles::Obstacles(const std::vector<Path>& contours) {
    for (const Path& path : contours)
        m_obstacles.push_back({&path, boundingBox(path)});
}

Obstacles::Nearby Obstacles::nearby(const Element& e, double reach,
                                    std::optional<std::size_t> except) const {
    const Box room = boundingBox({{e}, false, {}}).grown(reach);
    Nearby found;
    for (std::size_t i = 0; i < m_obstacles.size(); ++i) {
        if (i != except && overlap(room, m_obstacles[i].box)) found.push_back(&m_obstacles[i]);
    }
    return found;
}

bool Obstacles::keepClear(const Path& path, double clearance,
                          std::optional<std::size_t> except) const {
    const auto keepsClear = [&](const Element& e) {
        const Nearby obstacles = nearby(e, clearance, except);
        const auto room = [&](Vec2 p) {
            double nearest = HUGE_VAL;
            for (const Obstacle* obstacle : obstacles) {
                if (distanceToBox(obstacle->box, p) >= nearest) continue;
                nearest = std::min(nearest, distance(*obstacle->path, p));
            }
            return nearest;
        };
        return staysAway(e, clearance, room);
    };
    return std::all_of(path.elements.begin(), path.elements.end(), keepsClear);
}

}  // namespace gmpath
