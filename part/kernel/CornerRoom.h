// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <memory>
#include <vector>

#include "gmkernel/GmContour.h"
#include "part/model/Path.h"

namespace gmpart {

/// Tells whether the corners of a contour may be cut off without touching anything else: the rest
/// of the contour and the other contours of the drawing.
class CornerRoom {
public:
    /// The contours other than `own` are what must not be touched.
    CornerRoom(const std::vector<Path>& contours, std::size_t own);

    /// False when the element `index` of a contour, which has taken the place of its corner at
    /// `corner`, meets an element of the contour other than its neighbours, meets another contour,
    /// or cuts another contour off with the corner.
    bool allows(const GmContour& contour, int index, Vec2 corner) const;

private:
    struct Obstacle {
        Box box;
        std::unique_ptr<GmCurve> curve;
    };

    bool meetsObstacle(const GmCurve& element) const;
    bool cutsOff(const GmCurve& element, Vec2 corner) const;

    std::vector<Obstacle> m_obstacles;  ///< the elements of the other contours
    std::vector<Vec2> m_starts;         ///< a point of each of the other contours
};

}  // namespace gmpart
