// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "drawing/curves/Bezier.h"

namespace gmdrawing {

/// Arcs and segments for a row of curves of which each starts where the one before ends: few, each
/// tangent to the next where the curves are, and within the tolerance of them, both ways. Corners
/// from 33 degrees on stay. The ends of an open row stay exactly where they are.
///
/// Nothing where no fit is found: numbers beyond 1e12 or not finite, a tolerance that is lost in
/// the rounding of coordinates so large, or far more arcs than any drawing needs. Without elements
/// where the curves have no extent.
/// @param curves the row
/// @param closed whether the last ends where the first starts, and both belong together there
/// @param tolerance in length units, above 0
std::optional<std::vector<gmregion::Element>> fitted(const std::vector<Bezier>& curves, bool closed,
                                                     double tolerance);

}  // namespace gmdrawing
