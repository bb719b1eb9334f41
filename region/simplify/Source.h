// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "gmregion/Outcome.h"
#include "gmregion/Paths.h"
#include "gmregion/Simplify.h"
#include "region/simplify/Chain.h"

namespace gmregion {

/// Whether a coordinate can be worked with: finite, and up to 1e12. kNone if so.
Reason faultOf(Point p);

/// The limits to work with for coordinates up to `largest`; a refusal of options out of range.
Refusal limitsFor(const SimplifyOptions& options, double largest, Limits& limits);

/// The largest coordinate of the elements of all paths; a refusal of numbers that are no good.
Refusal measure(const Paths& paths, double& largest);

/// The same for the points of a curve; a tangent without length is refused, too.
Refusal measure(const TangentPoint* points, std::size_t count, double& largest);

/// The pieces of a path, without joints: elements shorter than rounding left out, halves of those
/// of more than half a turn, gaps up to the tolerance closed.
/// @param number of the path, for the refusal
Refusal takePath(const PathView& path, std::size_t number, const Limits& limits, Chain& chain);

/// The pieces of a curve: an arc or a biarc from each point to the next, slack by the width of the
/// lens between them.
Refusal takeCurve(const TangentPoint* points, std::size_t count, bool closed, const Limits& limits,
                  Chain& chain);

/// Moves the end of the last element to a point near it.
void endAt(Vec2 p, std::vector<Piece>& pieces);

}  // namespace gmregion
