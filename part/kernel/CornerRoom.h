// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

#include "part/kernel/BoxedCurve.h"
#include "part/model/Path.h"
#include "region/search/BoxRow.h"

namespace gmpart {

/// Tells whether the corners of a contour may be cut off without touching the other contours of
/// the drawing.
class CornerRoom {
public:
    explicit CornerRoom(const std::vector<Path>& contours);

    /// False when a curve that takes the place of a corner of the contour `own` meets another
    /// contour, or cuts another contour off with the corner. Cost: logarithmic, and what is near.
    bool allows(const BoxedCurve& made, Vec2 corner, std::size_t own) const;

private:
    struct Obstacle {
        BoxedCurve curve;
        std::size_t contour;
    };

    bool meetsObstacle(const BoxedCurve& made, std::size_t own) const;
    bool cutsOff(const GmCurve& made, Vec2 corner, std::size_t own) const;

    std::vector<Obstacle> m_obstacles;  ///< the elements of all contours
    std::vector<Vec2> m_starts;         ///< a point of each contour
    gmregion::BoxRow m_obstacleBoxes;
    gmregion::BoxRow m_startBoxes;
};

}  // namespace gmpart
