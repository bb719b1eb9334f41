// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "drawing/curves/Bezier.h"

namespace gmdrawing {

/// A spline that is given by points on it.
struct FitPoints {
    std::vector<gmregion::Vec2> points;
    /// Directions at the ends; without them the curve runs out straight.
    std::optional<gmregion::Vec2> startDirection = std::nullopt;
    std::optional<gmregion::Vec2> endDirection = std::nullopt;
    bool closed = false;  ///< the curve goes on from the last point to the first
};

/// The cubic spline through the points whose parameter grows with the chords and which bends
/// without a jump, a piece a chord. Points that repeat the one before are passed over; of fewer
/// than two others there is no curve, and fewer than three others are not closed. Linear in the
/// points.
std::vector<Bezier> splineThrough(const FitPoints& fit);

}  // namespace gmdrawing
